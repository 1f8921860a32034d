// Two rows of samples made one by turns, and one taken apart into two.
#pragma once

#include "layouts/avx2/interleave.hpp"

namespace pyxcc::layouts
{

namespace detail
{

/// 64-bit quarters 0 2 1 3: brings what both lanes hold of two things together.
PYXCC_INLINE __m256i swapMiddle(__m256i x) { return _mm256_permute4x64_epi64(x, 0xd8); }

/// Even units of a lane, then odd ones.
template <int Bytes>
constexpr Places evenUnitsThenOdd = placesOfBytes<Bytes>([](int i) {
    constexpr int half = 8 / Bytes;
    return i < half ? 2 * i : 2 * (i - half) + 1;
});

} // namespace detail

/// Units of `Bytes` bytes, one of x, one of y and so on: 64 bytes.
template <int Bytes> PYXCC_INLINE Two<wide::U8> alternated(wide::U8 x, wide::U8 y)
{
    const __m256i low = detail::unpackLow<Bytes>(x.v, y.v), high = detail::unpackHigh<Bytes>(x.v, y.v);
    return {wide::U8(_mm256_permute2x128_si256(low, high, 0x20)), wide::U8(_mm256_permute2x128_si256(low, high, 0x31))};
}

/// The even units of 64 bytes, and the odd ones.
template <int Bytes> PYXCC_INLINE Two<wide::U8> dealt(wide::U8 first, wide::U8 second)
{
    const __m256i x = detail::shuffle(first.v, detail::evenUnitsThenOdd<Bytes>);
    const __m256i y = detail::shuffle(second.v, detail::evenUnitsThenOdd<Bytes>);
    return {wide::U8(detail::swapMiddle(_mm256_unpacklo_epi64(x, y))),
            wide::U8(detail::swapMiddle(_mm256_unpackhi_epi64(x, y)))};
}

/// Byte `Places` of every four bytes at places 0, 1 and so on of them.
template <int... Places> PYXCC_INLINE wide::U8 foursRearranged(wide::U8 x)
{
    static_assert(sizeof...(Places) == 4);
    static constexpr int places[] = {Places...};
    static constexpr auto ofLane = detail::placesOfBytes<1>([](int i) { return i / 4 * 4 + places[i % 4]; });
    return wide::U8(detail::shuffle(x.v, ofLane));
}

} // namespace pyxcc::layouts
