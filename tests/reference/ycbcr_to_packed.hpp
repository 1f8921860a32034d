// YCbCr and YUV to packed pixels of 16 bits, the low bits of each sample cut off.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiYCbCr411ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr411ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi);
PyxStatus pyxiYCbCrToBGR444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);
PyxStatus pyxiYUV420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);
PyxStatus pyxiYUV420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);
PyxStatus pyxiYUV420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);
PyxStatus pyxiYUV420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);
PyxStatus pyxiYUV420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi);

} // namespace reference
