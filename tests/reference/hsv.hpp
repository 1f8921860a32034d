// Hue, saturation, value.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiHSVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHSVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHSVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHSVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHSV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHSV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHSV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHSV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
