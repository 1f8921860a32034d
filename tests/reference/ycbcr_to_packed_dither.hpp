// YCbCr and YUV to packed pixels of 16 bits, dithered in order.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiYCbCr420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi);
PyxStatus pyxiYCbCrToBGR444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUV420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);
PyxStatus pyxiYUV420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);
PyxStatus pyxiYUV420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);
PyxStatus pyxiYUV420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);
PyxStatus pyxiYUV420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);
PyxStatus pyxiYUV420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi);

} // namespace reference
