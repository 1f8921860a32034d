// The 8-bit BT.601 forms: studio-range YCbCr of a colour, and back. Which pixel takes which form is each conversion's
// own.
#pragma once

#include "pyxcc/types.h"

#include <array>

namespace reference
{

/// The three samples of a pixel, in the order of its colour model.
using Triple8 = std::array<u8, 3>;

/// From R, G, B to Y, Cb, Cr.
Triple8 fwdExact(Triple8 rgb);
Triple8 fwdHigh(Triple8 rgb);
Triple8 fwdRound(Triple8 rgb);

/// From Y, Cb, Cr to R, G, B.
Triple8 invExactA(Triple8 ycbcr);
Triple8 invExactB(Triple8 ycbcr);
Triple8 invExactC(Triple8 ycbcr);
Triple8 invExactD(Triple8 ycbcr);
Triple8 invHighA(Triple8 ycbcr);
Triple8 invHighB(Triple8 ycbcr);
Triple8 invHighC(Triple8 ycbcr);
Triple8 invHighD(Triple8 ycbcr);

} // namespace reference
