// A mosaic to RGB in one pass.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiCFAToRGB_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst, int dstStep,
                                 s32 grid, s32 interpolation);
PyxStatus pyxiCFAToRGB_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst, int dstStep,
                                s32 grid, s32 interpolation);

} // namespace reference
