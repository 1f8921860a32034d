// RGB and CIE L*u*v*.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiLUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
