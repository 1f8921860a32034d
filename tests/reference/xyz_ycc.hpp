// RGB to XYZ and to YCC, and back.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiRGBToXYZ_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToXYZ_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCC_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiXYZToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCCToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
