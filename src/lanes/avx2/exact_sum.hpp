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
        add(x, y, WeightOfX, WeightOfY);
    }

    /// The low 16 bits of the weights count.
    PYXCC_INLINE void add(const S16& x, const S16& y, int weightOfX, int weightOfY)
    {
        const __m256i weights =
            _mm256_set1_epi32((weightOfX & 0xffff) | static_cast<int>(static_cast<u32>(weightOfY) << 16));
        low = _mm256_add_epi32(low, _mm256_madd_epi16(_mm256_unpacklo_epi16(x.v, y.v), weights));
        high = _mm256_add_epi32(high, _mm256_madd_epi16(_mm256_unpackhi_epi16(x.v, y.v), weights));
    }

    template <int Shift> PYXCC_INLINE S16 shifted() const
    {
        return S16(_mm256_packs_epi32(_mm256_srai_epi32(low, Shift), _mm256_srai_epi32(high, Shift)));
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
    S16 result = sums.shifted<Shift>();
    (detail::addWhole<Shift, Weights>(result, lanes), ...);
    return result;
}

/// (Weight x) >> Shift for a weight of 16 bits, signed or not, and a shift of 16 or more: the upper half of the product
/// is all that is needed.
template <int Shift, int Weight> PYXCC_INLINE S16 scaledDown(const S16& x)
{
    static_assert(Shift >= 16 && Weight > -32768 && Weight < 65536);
    constexpr detail::SplitWeight weight(Weight, 16);
    S16 high = mulHighS16(x, weight.rest);
    detail::addWhole<16, Weight>(high, x);
    return Shift == 16 ? high : high >> (Shift - 16);
}

namespace detail
{

/// Whether half the weight, rounded down, gives the rounded products of a sample: what is lost shows nowhere.
template <int Zero, int Weight>
constexpr bool halfServes = [] {
    for (int x = -Zero; x != 256 - Zero; ++x) {
        if ((x * (Weight >> 1) + 0x4000) >> 15 != (x * Weight + 0x8000) >> 16) return false;
    }
    return true;
}();

} // namespace detail

/// (Weight (x - Zero) + Addend) >> 16 with an exact product, in words where the addend allows.
template <int Zero, int Weight, int Addend> PYXCC_INLINE S16 exactShare(const Sample& x)
{
    const S16 fromZero = x - Zero;
    constexpr detail::SplitWeight weight(Weight, 16);
    if constexpr (Addend == 0) {
        S16 result = mulHighS16(fromZero, weight.rest);
        detail::addWhole<16, Weight>(result, fromZero);
        return result;
    } else if constexpr (Addend == 0x8000 && detail::halfServes<Zero, weight.rest>) {
        S16 result = mulRound15(fromZero, weight.rest >> 1);
        detail::addWhole<16, Weight>(result, fromZero);
        return result;
    } else {
        return exactSum<16, Addend, Weight>(fromZero);
    }
}

/// An exact sum with weights of the caller's, of which 15 bits go into multiply-adds and the rest adds multiples of the
/// lanes: lanes of bytes so keep every sum within 32 bits, whatever the weights, and what is kept of it is exact.
template <int Shift, int Addend>
PYXCC_INLINE S16 exactSumBy(const Three<int>& weights, const S16& x, const S16& y, const S16& z)
{
    static_assert(Shift == 15 && Addend >= 0 && Addend <= 32767);
    const auto rest = [](int weight) { return weight & 0x7fff; };
    const auto whole = [](int weight) { return S16(weight >> 15); };
    detail::Sums sums{_mm256_setzero_si256(), _mm256_setzero_si256()};
    sums.add(x, y, rest(weights.a), rest(weights.b));
    sums.add(z, S16(1), rest(weights.c), Addend);
    return sums.shifted<Shift>() + x * whole(weights.a) + y * whole(weights.b) + z * whole(weights.c);
}

} // namespace pyxcc::wide
