// Even and odd bytes of a register as words: one operation makes them so many times as large as they are, where
// widening takes one and scaling another.
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

/// The even bytes and the odd ones, `Times` times as large.
template <int Times> PYXCC_INLINE Two<S16> timesByTurns(U8 x)
{
    static_assert(Times >= 1 && Times <= 127);
    return {S16(_mm256_maddubs_epi16(x.v, _mm256_set1_epi16(Times))),
            S16(_mm256_maddubs_epi16(x.v, _mm256_set1_epi16(Times << 8)))};
}

/// Back to bytes: words without their last `Shift` bits, which must leave bytes.
template <int Shift> PYXCC_INLINE U8 bytesByTurns(S16 even, S16 odd)
{
    const __m256i upper = _mm256_and_si256(_mm256_slli_epi16(odd.v, 8 - Shift), _mm256_set1_epi16(-256));
    return U8(_mm256_or_si256(_mm256_srli_epi16(even.v, Shift), upper));
}

} // namespace pyxcc::wide
