// Gamma: the transfer curve of video and its inverse on three channels.
//
// A table, where the library makes one for a large 16-bit image, shows in no value. That there may be no memory for it
// is not stated here.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiGammaFwd_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi);

PyxStatus pyxiGammaFwd_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiGammaFwd_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi);

PyxStatus pyxiGammaFwd_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaFwd_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaFwd_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaFwd_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaFwd_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                               f32 vMin, f32 vMax);
PyxStatus pyxiGammaFwd_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

PyxStatus pyxiGammaInv_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaInv_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaInv_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi);

PyxStatus pyxiGammaInv_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaInv_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi);
PyxStatus pyxiGammaInv_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi);
PyxStatus pyxiGammaInv_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi);

PyxStatus pyxiGammaInv_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaInv_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaInv_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaInv_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);
PyxStatus pyxiGammaInv_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                               f32 vMin, f32 vMax);
PyxStatus pyxiGammaInv_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

} // namespace reference
