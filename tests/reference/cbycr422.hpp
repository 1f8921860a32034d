// Packed 4:2:2 with chroma first, Cb Y0 Cr Y1: from RGB, to RGB, and to and from the other chroma grids and layouts.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToCbYCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiCbYCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiCbYCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiCbYCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiCbYCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi);
PyxStatus pyxiCbYCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiCbYCr422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiCbYCr422ToYCbCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiCbYCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiRGBToCbYCr422Gamma_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToCbYCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToCbYCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToCbYCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);
PyxStatus pyxiYCrCb420ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);

} // namespace reference
