// Exact sums over registers of words, by multiply-add pairs.
#pragma once

#include "lanes/avx2/integers.hpp"
#include "lanes/exact_sum.hpp"

namespace pyxcc::wide
{

namespace detail
{

/// A weight beyond 16 bits is taken apart as whole << shift plus a rest that a multiply-add takes: the whole part
/// adds multiples of the lane to the shifted sum, without rounding, since they are multiples of 1 << shift before it.
struct SplitWeight {
    int whole;
    int rest;

    PYXCC_INLINE SplitWeight(int weight, int shift)
    {
        const bool fits = weight >= -32768 && weight <= 32767;
        whole = fits ? 0 : (weight + (1 << (shift - 1))) >> shift;
        rest = weight - whole * (1 << shift);
    }
};

PYXCC_INLINE S16 times(S16 x, int whole)
{
    if (whole == 1) return x;
    if (whole == 2) return x + x;
    if (whole == -1) return S16(0) - x;
    return x * S16(whole);
}

/// A power of two whose multiple the addend is by a factor of 16 bits, or 0: the addend then rides on the free half of
/// the last pair.
PYXCC_INLINE int unitOf(int addend)
{
    if (addend == 0) return 0;
    const int zeros = __builtin_ctz(static_cast<unsigned>(addend));
    const int unit = 1 << (zeros < 14 ? zeros : 14);
    const int factor = addend / unit;
    return factor >= -32768 && factor <= 32767 ? unit : 0;
}

PYXCC_INLINE __m256i weightPair(int even, int odd)
{
    return _mm256_set1_epi32(static_cast<int>((static_cast<u32>(odd) << 16) | (static_cast<u32>(even) & 0xffff)));
}

} // namespace detail

PYXCC_INLINE Exact<S16> exact(const Sample& x) { return {x}; }

template <std::size_t N> PYXCC_INLINE S16 shiftedSum(const ExactSum<S16, N>& sum, int shift)
{
    const int unit = N % 2 == 1 ? detail::unitOf(sum.addend) : 0;
    __m256i low = _mm256_set1_epi32(unit ? 0 : sum.addend);
    __m256i high = low;
    S16 whole = 0;
    for (std::size_t i = 0; i < N; i += 2) {
        const bool paired = i + 1 < N;
        const detail::SplitWeight even(sum.terms[i].weight, shift);
        const detail::SplitWeight odd(paired ? sum.terms[i + 1].weight : 0, shift);
        const int oddFactor = paired ? odd.rest : unit ? sum.addend / unit : 0;
        const __m256i partner = paired ? sum.terms[i + 1].x.v : _mm256_set1_epi16(static_cast<short>(unit));
        const __m256i weights = detail::weightPair(even.rest, oddFactor);
        const __m256i x = sum.terms[i].x.v;
        low = _mm256_add_epi32(low, _mm256_madd_epi16(_mm256_unpacklo_epi16(x, partner), weights));
        high = _mm256_add_epi32(high, _mm256_madd_epi16(_mm256_unpackhi_epi16(x, partner), weights));
        if (even.whole) whole = whole + detail::times(sum.terms[i].x, even.whole);
        if (paired && odd.whole) whole = whole + detail::times(sum.terms[i + 1].x, odd.whole);
    }
    return S16(_mm256_packs_epi32(_mm256_srai_epi32(low, shift), _mm256_srai_epi32(high, shift))) + whole;
}

} // namespace pyxcc::wide
