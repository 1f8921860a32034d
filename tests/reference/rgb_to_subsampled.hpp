// RGB to subsampled YCbCr by the BT.601 matrix.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToYCbCr411_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCbCr411_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCbCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCbCr422_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiBGRToYCrCb420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYCbCr420_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr, int dstCbCrStep,
                                     RoiSize roi);
PyxStatus pyxiRGBToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYCbCr420_8u_C4P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr, int dstCbCrStep,
                                     RoiSize roi);
PyxStatus pyxiRGBToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYCbCr422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiRGBToYCrCb422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCrCb422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
