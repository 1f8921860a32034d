// Means of bytes, by bytes where they allow it: a word of room for each byte is twice the work.
#pragma once

#include "lanes/avx2/integers.hpp"

#include <algorithm>

namespace pyxcc::wide
{

/// (x + y + 1) >> 1.
PYXCC_INLINE U8 avgUp(U8 x, U8 y) { return U8(_mm256_avg_epu8(x.v, y.v)); }

namespace detail
{

/// 255 - x. The mean of two complements, rounded up, is the complement of the mean rounded down.
PYXCC_INLINE U8 complement(U8 x) { return U8(_mm256_xor_si256(x.v, _mm256_set1_epi8(-1))); }

/// The complement of (Weight * x + ((1 << Shift) - Weight) * y) >> Shift, by halving: bit i of the weight tells which
/// of the two the mean so far is halved with at step i. What a step rounds down the next steps do not miss.
template <int Shift, int Weight> PYXCC_INLINE U8 complementOfMean(U8 x, U8 y)
{
    static_assert(Shift >= 0 && Weight >= 0 && Weight < 1 << Shift);
    if constexpr (Shift == 0) {
        return complement(y);
    } else {
        constexpr int last = Weight >> (Shift - 1), rest = Weight - (last << (Shift - 1));
        return avgUp(complementOfMean<Shift - 1, rest>(x, y), complement(last ? x : y));
    }
}

/// What two lanes add to a sum of words, in the order that narrow() takes back.
template <int WeightOfX, int WeightOfY> PYXCC_INLINE Two<S16> weighted(U8 x, U8 y)
{
    const __m256i weights = _mm256_set1_epi16(static_cast<short>((WeightOfX & 255) | WeightOfY * 256));
    return {S16(_mm256_maddubs_epi16(_mm256_unpacklo_epi8(x.v, y.v), weights)),
            S16(_mm256_maddubs_epi16(_mm256_unpackhi_epi8(x.v, y.v), weights))};
}

template <int... Weights> PYXCC_INLINE void addWeighted(Two<S16>&) { static_assert(sizeof...(Weights) == 0); }

template <int WeightOfX, int WeightOfY, int... Weights, class... Lanes>
PYXCC_INLINE void addWeighted(Two<S16>& sums, U8 x, U8 y, const Lanes&... rest)
{
    const Two<S16> more = weighted<WeightOfX, WeightOfY>(x, y);
    sums = {sums.a + more.a, sums.b + more.b};
    addWeighted<Weights...>(sums, rest...);
}

template <int Shift, int Addend> PYXCC_INLINE Byte shifted(S16 sum)
{
    if constexpr (Addend == 1 << (Shift - 1)) return sat8(roundedShift<Shift>(sum));
    return sat8((sum + Addend) >> Shift);
}

} // namespace detail

/// (x + y) >> 1.
PYXCC_INLINE U8 avgDown(U8 x, U8 y) { return detail::complement(detail::complementOfMean<1, 1>(x, y)); }

/// avgUp() in the first `lanes` lanes, avgDown() in the others.
PYXCC_INLINE U8 avgUpBelow(int lanes, U8 x, U8 y)
{
    const __m256i lane = _mm256_setr_epi8(0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19, 20, 21,
                                          22, 23, 24, 25, 26, 27, 28, 29, 30, 31);
    const __m256i up = _mm256_cmpgt_epi8(_mm256_set1_epi8(static_cast<char>(std::clamp(lanes, 0, U8::count))), lane);
    const __m256i odd = _mm256_and_si256(_mm256_xor_si256(x.v, y.v), _mm256_set1_epi8(1));
    return U8(_mm256_sub_epi8(avgUp(x, y).v, _mm256_andnot_si256(up, odd)));
}

/// (Weights * lanes + ... + Addend) >> Shift of an even number of lanes, clamped to a byte. The weights are bytes with
/// a sign, and no sum leaves 16 bits.
template <int Shift, int Addend, int WeightOfX, int WeightOfY, int... Weights, class... Lanes>
PYXCC_INLINE U8 exactMean(U8 x, U8 y, const Lanes&... rest)
{
    constexpr bool mean = sizeof...(rest) == 0 && WeightOfX > 0 && WeightOfY > 0 && WeightOfX + WeightOfY == 1 << Shift;
    if constexpr (mean && Addend == 1 << (Shift - 1)) {
        constexpr int last = WeightOfX >> (Shift - 1), weight = WeightOfX - (last << (Shift - 1));
        return avgUp(detail::complement(detail::complementOfMean<Shift - 1, weight>(x, y)), last ? x : y);
    } else {
        Two<S16> sums = detail::weighted<WeightOfX, WeightOfY>(x, y);
        detail::addWeighted<Weights...>(sums, rest...);
        return narrow(detail::shifted<Shift, Addend>(sums.a), detail::shifted<Shift, Addend>(sums.b));
    }
}

} // namespace pyxcc::wide
