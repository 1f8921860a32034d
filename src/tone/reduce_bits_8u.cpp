// Fewer levels of 8-bit samples.
#include "pyxcc/reduce_bits.h"

#include "tone/reduce_bits.hpp"

using namespace pyxcc::tone;

PyxStatus PYXCC_CALL pyxiReduceBits_8u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                           u32 ditherType, s32 levels)
{
    return reduceBits<C1Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                           u32 ditherType, s32 levels)
{
    return reduceBits<C3Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                            u32 ditherType, s32 levels)
{
    return reduceBits<AC4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}

PyxStatus PYXCC_CALL pyxiReduceBits_8u_C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                           u32 ditherType, s32 levels)
{
    return reduceBits<C4Pixel>(src, srcStep, dst, dstStep, roi, noise, ditherType, levels);
}
