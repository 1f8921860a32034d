// Packed pixels of 16 bits from and to RGB, and to YCbCr and YUV.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGR555ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR555ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR555ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGR555ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR555ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR555ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi);
PyxStatus pyxiBGR565ToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGR565ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR565ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR565ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGR565ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR565ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi);
PyxStatus pyxiBGR565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi);
PyxStatus pyxiBGRToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGB565ToRGB_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGB565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi);
PyxStatus pyxiRGB565ToYUV422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi);
PyxStatus pyxiRGBToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

} // namespace reference
