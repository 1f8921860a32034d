// RGB and YCbCr by the BT.709 matrices: CSC of the studio range, HDTV of the full one.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToCbYCr422_709HDTV_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                             RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_709CSC_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                            int dstCbCrStep, RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi);
PyxStatus pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                              RoiSize roi);
PyxStatus pyxiBGRToYCrCb420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                             RoiSize roi);
PyxStatus pyxiBGRToYCrCb420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi);
PyxStatus pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCr420ToBGR_709CSC_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                            RoiSize roi);
PyxStatus pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                             RoiSize roi, u8 aval);
PyxStatus pyxiYCbCrToBGR_709CSC_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR_709CSC_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                         u8 aval);

} // namespace reference
