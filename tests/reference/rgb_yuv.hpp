// RGB and YUV at full resolution.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiRGBToYUV_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYUV_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYUV_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiYUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUVToRGB_8u_C3C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiYUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUVToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYUVToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);

} // namespace reference
