// Between samples and lanes of twice their width. Each 128-bit half of a register is widened and narrowed by itself.
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

PYXCC_INLINE Two<S16> toDoubleWidth(U8 x)
{
    const Two<Sample> words = widen(x);
    return {words.a, words.b};
}

PYXCC_INLINE Two<S32> toDoubleWidth(S16 x)
{
    const __m256i sign = _mm256_srai_epi16(x.v, 15);
    return {S32(_mm256_unpacklo_epi16(x.v, sign)), S32(_mm256_unpackhi_epi16(x.v, sign))};
}

/// Clamped at both ends of what the samples can be.
PYXCC_INLINE U8 saturateHalves(const Two<S16>& x) { return U8(_mm256_packus_epi16(x.a.v, x.b.v)); }
PYXCC_INLINE S16 saturateHalves(const Two<S32>& x) { return S16(_mm256_packs_epi32(x.a.v, x.b.v)); }

/// Without the upper 16 bits.
PYXCC_INLINE S16 lowHalves(const Two<S32>& x)
{
    const __m256i low = _mm256_set1_epi32(0xffff);
    return S16(_mm256_packus_epi32(_mm256_and_si256(x.a.v, low), _mm256_and_si256(x.b.v, low)));
}

} // namespace pyxcc::wide
