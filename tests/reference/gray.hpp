// Gray of colours, colours of gray.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiColorToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3]);
PyxStatus pyxiColorToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3]);
PyxStatus pyxiColorToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3]);
PyxStatus pyxiColorToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3]);
PyxStatus pyxiColorToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3]);
PyxStatus pyxiColorToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3]);
PyxStatus pyxiColorToGray_64f_AC4C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                     const f64 coeffs[3]);
PyxStatus pyxiColorToGray_64f_C3C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                    const f64 coeffs[3]);
PyxStatus pyxiColorToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32 coeffs[3]);
PyxStatus pyxiColorToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32 coeffs[3]);
PyxStatus pyxiGrayToRGB_16u_C1C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGrayToRGB_16u_C1C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u16 aval);
PyxStatus pyxiGrayToRGB_32f_C1C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGrayToRGB_32f_C1C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 aval);
PyxStatus pyxiGrayToRGB_8u_C1C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGrayToRGB_8u_C1C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval);
PyxStatus pyxiRGBToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiRGBToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToGray_8u_C2C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
