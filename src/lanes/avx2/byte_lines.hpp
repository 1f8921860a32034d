// What lines over bytes take: words of two bytes each, and differences that stop at zero.
#pragma once

#include "lanes/avx2/choices.hpp"

namespace pyxcc::wide
{

/// Bytes as the lower and the upper ones of words, in the order of widening.
PYXCC_INLINE Two<U16> joined(U8 low, U8 high)
{
    return {U16(_mm256_unpacklo_epi8(low.v, high.v)), U16(_mm256_unpackhi_epi8(low.v, high.v))};
}

PYXCC_INLINE U16 subSatU16(U16 x, U16 y) { return U16(_mm256_subs_epu16(x.v, y.v)); }

} // namespace pyxcc::wide
