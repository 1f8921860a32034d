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

/// Whether x <= y in any lane.
PYXCC_INLINE bool anyAtMost(U16 x, U16 y)
{
    return _mm256_movemask_epi8(_mm256_cmpeq_epi16(_mm256_min_epu16(x.v, y.v), x.v)) != 0;
}

} // namespace pyxcc::wide
