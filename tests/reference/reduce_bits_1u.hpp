// Bytes to one bit a pixel.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiReduceBits_8u1u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, s32 dstBitOffset, RoiSize roi,
                                  s32 unused0, s32 unused1, s32 ditherType, u8 threshold);

} // namespace reference
