// ColorTwist: an affine matrix of the caller's on three channels, and a linear one on four.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiColorTwist32f_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                   const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi,
                                   const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);

PyxStatus pyxiColorTwist32f_8s_C3R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                   const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8s_C3IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8s_AC4R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8s_AC4IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8s_P3R(const s8* const src[3], int srcStep, s8* const dst[3], int dstStep, RoiSize roi,
                                   const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_8s_IP3R(s8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);

PyxStatus pyxiColorTwist32f_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                     const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);

PyxStatus pyxiColorTwist32f_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16s_C3IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                     const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16s_AC4IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16s_P3R(const s16* const src[3], int srcStep, s16* const dst[3], int dstStep, RoiSize roi,
                                    const f32 twist[3][4]);
PyxStatus pyxiColorTwist32f_16s_IP3R(s16* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);

PyxStatus pyxiColorTwist_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                 const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                  const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                                 const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);
PyxStatus pyxiColorTwist_32f_C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                 const f32 twist[4][4]);

} // namespace reference
