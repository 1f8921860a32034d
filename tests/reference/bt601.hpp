// The 8-bit BT.601 forms: studio-range YCbCr of a colour, and back. Which pixel takes which form is each conversion's
// own.
#pragma once

#include "reference/pixels.hpp"

namespace reference
{

/// From R, G, B to Y, Cb, Cr.
Triple<u8> fwdExact(Triple<u8> rgb);
Triple<u8> fwdHigh(Triple<u8> rgb);
Triple<u8> fwdRound(Triple<u8> rgb);

/// From Y, Cb, Cr to R, G, B.
Triple<u8> invExactA(Triple<u8> ycbcr);
Triple<u8> invExactB(Triple<u8> ycbcr);
Triple<u8> invExactC(Triple<u8> ycbcr);
Triple<u8> invExactD(Triple<u8> ycbcr);
Triple<u8> invHighA(Triple<u8> ycbcr);
Triple<u8> invHighB(Triple<u8> ycbcr);
Triple<u8> invHighC(Triple<u8> ycbcr);
Triple<u8> invHighD(Triple<u8> ycbcr);

} // namespace reference
