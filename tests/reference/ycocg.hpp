// RGB to YCoCg and back, plainly and reversibly.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiBGRToYCoCg_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCoCg_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCoCg_Rev_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiBGRToYCoCg_Rev_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiRGBToYCoCg_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_Rev_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_Rev_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_Rev_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiSBGRToYCoCg_Rev_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToBGR_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToBGR_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                     u8 alphaValue);
PyxStatus pyxiYCoCgToBGR_Rev_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToBGR_Rev_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                         u8 alphaValue);
PyxStatus pyxiYCoCgToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToSBGR_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToSBGR_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    s16 alphaValue);
PyxStatus pyxiYCoCgToSBGR_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToSBGR_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                       s16 alphaValue);
PyxStatus pyxiYCoCgToSBGR_Rev_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToSBGR_Rev_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                        s16 alphaValue);
PyxStatus pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCoCgToSBGR_Rev_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                           s16 alphaValue);

} // namespace reference
