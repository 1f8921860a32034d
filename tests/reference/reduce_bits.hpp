// Images at fewer levels, by the nearest level, by diffusion of the error or by an ordered matrix.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiReduceBits_16s8u_AC4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s8u_C1R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s8u_C3R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s8u_C4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                  u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s_C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16s_C4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u8u_AC4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u8u_C1R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u8u_C4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                  u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u_C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_16u_C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16s_AC4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                     u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16s_C1R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16s_C3R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16s_C4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16u_AC4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                     u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16u_C1R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16u_C3R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f16u_C4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f8u_AC4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f8u_C3R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_32f8u_C4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_8u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels);
PyxStatus pyxiReduceBits_8u_C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels);

} // namespace reference
