// Exact weighted sums over registers of words, by multiply-add pairs.
#pragma once

#include "lanes/avx2/integers.hpp"

#include <algorithm>

namespace pyxcc::wide
{

namespace detail
{

/// A weight beyond 16 bits is taken apart as (whole << shift) + rest, of which a multiply-add takes the rest. The whole
/// part adds multiples of the lane to the shifted sum; nothing is rounded by that, since before the shift they are
/// multiples of 1 << shift. A shift of 17 or 18 can leave a rest beyond 16 bits still: the excess takes a multiply-add
/// more.
struct SplitWeight {
    int whole;
    int rest;
    int excess;

    constexpr SplitWeight(int weight, int shift)
        : whole(weight >= -32768 && weight <= 32767 ? 0 : (weight + (1 << (shift - 1))) >> shift)
    {
        const int remainder = weight - whole * (1 << shift);
        rest = std::clamp(remainder, -32768, 32767);
        excess = remainder - rest;
    }
};

/// A power of two of which the addend is a multiple by a factor of 16 bits, or 0 if there is none. The addend can then
/// ride in the free half of the last pair.
constexpr int unitOf(int addend)
{
    for (int unit = 1 << 14; unit > 1; unit >>= 1) {
        const int factor = addend / unit;
        if (addend % unit == 0 && factor >= -32768 && factor <= 32767) return unit;
    }
    return 0;
}

/// Running sums of the low and of the high half of the words.
struct Sums {
    __m256i low, high;

    template <int WeightOfX, int WeightOfY> PYXCC_INLINE void add(const S16& x, const S16& y)
    {
        static_assert(WeightOfX >= -32768 && WeightOfX <= 32767 && WeightOfY >= -32768 && WeightOfY <= 32767);
        const __m256i weights = _mm256_set1_epi32((WeightOfX & 0xffff) | static_cast<int>(WeightOfY * 0x10000u));
        low = _mm256_add_epi32(low, _mm256_madd_epi16(_mm256_unpacklo_epi16(x.v, y.v), weights));
        high = _mm256_add_epi32(high, _mm256_madd_epi16(_mm256_unpackhi_epi16(x.v, y.v), weights));
    }
};

template <int Shift, int Addend, int Weight> PYXCC_INLINE void addTerms(Sums& sums, const S16& x)
{
    constexpr SplitWeight weight(Weight, Shift);
    constexpr int unit = unitOf(Addend);
    if constexpr (unit == 0) {
        sums.add<weight.rest, 0>(x, S16(0));
    } else {
        sums.add<weight.rest, Addend / unit>(x, S16(unit));
    }
}

template <int Shift, int Addend, int WeightOfX, int WeightOfY, int... Weights, class... Lanes>
PYXCC_INLINE void addTerms(Sums& sums, const S16& x, const S16& y, const Lanes&... rest)
{
    constexpr SplitWeight first(WeightOfX, Shift), second(WeightOfY, Shift);
    sums.add<first.rest, second.rest>(x, y);
    if constexpr (sizeof...(rest) > 0) addTerms<Shift, Addend, Weights...>(sums, rest...);
}

template <int Shift, int Weight> PYXCC_INLINE void addExcess(Sums& sums, const S16& x)
{
    constexpr int excess = SplitWeight(Weight, Shift).excess;
    if constexpr (excess != 0) sums.add<excess, 0>(x, S16(0));
}

/// What the whole part of a weight adds to the shifted sum.
template <int Shift, int Weight> PYXCC_INLINE void addWhole(S16& sum, const S16& x)
{
    constexpr int whole = SplitWeight(Weight, Shift).whole;
    if constexpr (whole == 1) sum = sum + x;
    if constexpr (whole == -1) sum = sum - x;
    if constexpr (whole == 2) sum = sum + (x + x);
    if constexpr (whole > 2 || whole < -1) sum = sum + x * S16(whole);
}

} // namespace detail

/// (Weights * lanes + ... + Addend) >> Shift with exact products and sums. The sum must keep within 32 bits and the
/// shifted sum within 16.
template <int Shift, int Addend, int... Weights, class... Lanes> PYXCC_INLINE S16 exactSum(const Lanes&... lanes)
{
    static_assert(sizeof...(Weights) == sizeof...(Lanes));
    // An addend that finds no free half starts the sums.
    constexpr bool rides = sizeof...(Weights) % 2 == 1 && detail::unitOf(Addend) != 0;
    const __m256i start = _mm256_set1_epi32(rides ? 0 : Addend);
    detail::Sums sums{start, start};
    detail::addTerms<Shift, rides ? Addend : 0, Weights...>(sums, lanes...);
    (detail::addExcess<Shift, Weights>(sums, lanes), ...);
    S16 result(_mm256_packs_epi32(_mm256_srai_epi32(sums.low, Shift), _mm256_srai_epi32(sums.high, Shift)));
    (detail::addWhole<Shift, Weights>(result, lanes), ...);
    return result;
}

} // namespace pyxcc::wide
