// Fewer levels of float samples.
#include "pyxcc/reduce_bits.h"

#include "tone/reduce_bits.hpp"

using namespace pyxcc::tone;

PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C3R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_AC4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C1R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C3R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_AC4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C1R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C3R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_AC4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}
