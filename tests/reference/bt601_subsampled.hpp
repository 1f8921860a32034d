// The 8-bit BT.601 forms that the subsampled formats add to those of full resolution. Which pixel takes which form is
// each conversion's own.
#pragma once

#include "reference/subsampled.hpp"

namespace reference
{

/// From R, G, B to Y. The first two are those of fwdExact and fwdRound.
u8 lumaExact(Triple<u8> rgb);
u8 lumaRound(Triple<u8> rgb);
u8 lumaExactOdd(Triple<u8> rgb);
u8 lumaHigh7(Triple<u8> rgb);
u8 lumaHigh8(Triple<u8> rgb);
u8 lumaRoundPlain(Triple<u8> rgb);

/// From the sums of R, G, B over four pixels, over two (scale 64) or over one.
Chroma chromaHighS(Triple<s32> sums, s32 scale);
Chroma chromaHighU(Triple<s32> sums, s32 add, int shift);
Chroma chromaRound(Triple<s32> sums);
Chroma chromaRoundPlain(Triple<s32> sums);
Chroma chromaExact(Triple<s32> sums, int shift, s32 subtract);
Chroma chromaMadd(Triple<s32> sums);

/// From Y, Cb, Cr to R, G, B.
Triple<u8> invExactE(Triple<u8> ycbcr);
Triple<u8> invExactF(Triple<u8> ycbcr);
Triple<u8> inv3A(Triple<u8> ycbcr);
Triple<u8> inv3B(Triple<u8> ycbcr);
Triple<u8> inv3C(Triple<u8> ycbcr);
Triple<u8> inv3D(Triple<u8> ycbcr);

} // namespace reference
