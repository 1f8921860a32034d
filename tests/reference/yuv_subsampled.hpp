// RGB to YUV with shared chroma, and back.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToYUV420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYUV420_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi);
PyxStatus pyxiRGBToYUV420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYUV420_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);
PyxStatus pyxiRGBToYUV420_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                 RoiSize roi);
PyxStatus pyxiRGBToYUV422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYUV422_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi);
PyxStatus pyxiRGBToYUV422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYUV422_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);
PyxStatus pyxiRGBToYUV422_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                 RoiSize roi);
PyxStatus pyxiYUV420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV420ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);
PyxStatus pyxiYUV420ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV420ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi);
PyxStatus pyxiYUV420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV420ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                 RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV422ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                 RoiSize roi);

} // namespace reference
