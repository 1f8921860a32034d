// Subsampled YCbCr to RGB by the BT.601 matrix.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiYCbCr411ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr411ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval);
PyxStatus pyxiYCbCr420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCr420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval);
PyxStatus pyxiYCbCr420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCr420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCr422ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCr422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCrCb420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCrCb420ToRGB_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval);
PyxStatus pyxiYCrCb422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCrCb422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCrCb422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);

} // namespace reference
