// Subsampled YCbCr with chroma resampled by filters in the column: across rows, within the fields of a frame, or over
// bands of an image.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi);
PyxStatus pyxiYCbCr420To422_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                             const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                    RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* dst, int dstStep, RoiSize roi, s32 layout);
PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* const dst[3], const int dstStep[3], RoiSize roi, s32 layout);
PyxStatus pyxiYCbCr422To420_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                             const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCrCb420ToBGR_Filter_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                            RoiSize roi, u8 aval);
PyxStatus pyxiYCrCb420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi);

} // namespace reference
