// Floats to bytes by one scale for the whole image.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiToneMapLinear_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiToneMapMean_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

} // namespace reference
