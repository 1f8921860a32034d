// RGB and CIE L*a*b*.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToLab_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLabToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLabToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLabToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLabToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLabToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
