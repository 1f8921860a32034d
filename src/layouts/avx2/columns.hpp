// Columns that begin anywhere, each where a place says.
#pragma once

#include "lanes/avx2/floats.hpp"

#include <cstddef>

namespace pyxcc::layouts
{

/// Four floats from each of eight places on: the first ones, the second ones and so on.
PYXCC_INLINE Four<wide::F32> loadColumns(const f32* floats, const u16* places)
{
    const auto fours = [=](int i) PYXCC_INLINE_LAMBDA {
        return _mm256_set_m128(_mm_loadu_ps(floats + places[i + 4]), _mm_loadu_ps(floats + places[i]));
    };
    const __m256 a = fours(0), b = fours(1), c = fours(2), d = fours(3);
    const __m256 lowAB = _mm256_unpacklo_ps(a, b), highAB = _mm256_unpackhi_ps(a, b);
    const __m256 lowCD = _mm256_unpacklo_ps(c, d), highCD = _mm256_unpackhi_ps(c, d);
    return {wide::F32(_mm256_shuffle_ps(lowAB, lowCD, 0x44)), wide::F32(_mm256_shuffle_ps(lowAB, lowCD, 0xee)),
            wide::F32(_mm256_shuffle_ps(highAB, highCD, 0x44)), wide::F32(_mm256_shuffle_ps(highAB, highCD, 0xee))};
}

/// Four floats, and the same again.
PYXCC_INLINE wide::F32 loadFoursTwice(const f32* floats)
{
    return wide::F32(_mm256_broadcast_ps(reinterpret_cast<const __m128*>(floats)));
}

/// Each of eight floats `times` times.
template <int times> PYXCC_INLINE void storeRepeated(f32* to, wide::F32 x)
{
    for (int i = 0; i < times; ++i) {
        const auto source = [i](int lane) { return (8 * i + lane) / times; };
        const __m256i places =
            _mm256_setr_epi32(source(0), source(1), source(2), source(3), source(4), source(5), source(6), source(7));
        const __m256 repeated = times == 1 ? x.v : _mm256_permutevar8x32_ps(x.v, places);
        _mm256_storeu_ps(to + std::ptrdiff_t{8} * i, repeated);
    }
}

/// Eight rows of eight bytes, each `step` bytes behind the one above it, as columns: 64 bytes.
PYXCC_INLINE void turnEights(const u8* from, std::ptrdiff_t step, u8* to)
{
    const auto row = [=](int y) PYXCC_INLINE_LAMBDA {
        return _mm_loadl_epi64(reinterpret_cast<const __m128i*>(from + step * y));
    };
    const auto store = [=](int i, __m128i columns) PYXCC_INLINE_LAMBDA {
        _mm_storeu_si128(reinterpret_cast<__m128i*>(to + std::ptrdiff_t{16} * i), columns);
    };
    const __m128i twos01 = _mm_unpacklo_epi8(row(0), row(1)), twos23 = _mm_unpacklo_epi8(row(2), row(3));
    const __m128i twos45 = _mm_unpacklo_epi8(row(4), row(5)), twos67 = _mm_unpacklo_epi8(row(6), row(7));
    const __m128i low = _mm_unpacklo_epi16(twos01, twos23), high = _mm_unpackhi_epi16(twos01, twos23);
    const __m128i lowBelow = _mm_unpacklo_epi16(twos45, twos67), highBelow = _mm_unpackhi_epi16(twos45, twos67);
    store(0, _mm_unpacklo_epi32(low, lowBelow));
    store(1, _mm_unpackhi_epi32(low, lowBelow));
    store(2, _mm_unpacklo_epi32(high, highBelow));
    store(3, _mm_unpackhi_epi32(high, highBelow));
}

} // namespace pyxcc::layouts
