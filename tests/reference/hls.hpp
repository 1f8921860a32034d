// Hue, lightness, saturation.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToHLS_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiBGRToHLS_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToBGR_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiHLSToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToHLS_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
