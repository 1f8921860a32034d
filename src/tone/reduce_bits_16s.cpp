// Fewer levels of signed 16-bit samples.
#include "pyxcc/reduce_bits.h"

#include "tone/reduce_bits.hpp"

using namespace pyxcc::tone;

PyxStatus PYXCC_CALL pyxiReduceBits_16s_C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                            u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                            u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                             u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s_C4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                            u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C1R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C3R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_AC4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                               u32 noise, u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                              u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}
