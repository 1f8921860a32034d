// RGB and YCbCr at full resolution.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiRGBToYCbCr_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCbCr_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCbCr_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCbCr_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCbCr_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToRGB_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYCbCrToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCrToBGR_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);

} // namespace reference
