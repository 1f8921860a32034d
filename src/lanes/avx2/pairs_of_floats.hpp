// Look-ups in a table whose rows are two floats: one load brings both.
#pragma once

#include "lanes/avx2/floats.hpp"
#include "lanes/scalar.hpp"

#include <array>

namespace pyxcc
{

template <std::size_t Rows> using PairsOfFloats = std::array<Two<f32>, Rows>;

namespace scalar
{

/// The row of that index, or the first or last one if there is none.
template <std::size_t Rows> Two<F32> lookUp(const PairsOfFloats<Rows>& table, S32 index)
{
    const Two<f32>& row = table[static_cast<std::size_t>(std::clamp<s32>(index.v, 0, Rows - 1))];
    return {row.a, row.b};
}

} // namespace scalar

namespace wide
{

template <std::size_t Rows> PYXCC_INLINE Two<F32> lookUp(const PairsOfFloats<Rows>& table, S32 index)
{
    const __m256i bounded =
        _mm256_min_epi32(_mm256_max_epi32(index.v, _mm256_setzero_si256()), _mm256_set1_epi32(Rows - 1));
    const __m128i low = _mm256_castsi256_si128(bounded), high = _mm256_extracti128_si256(bounded, 1);
    const auto rows = [&table](__m128i at) PYXCC_INLINE_LAMBDA {
        const auto* const first = reinterpret_cast<const double*>(table.data());
        const __m256d all = _mm256_castsi256_pd(_mm256_set1_epi64x(-1));
        return _mm256_castpd_ps(_mm256_mask_i32gather_pd(_mm256_setzero_pd(), first, at, all, 8));
    };
    // Rows 0 1 4 5 and 2 3 6 7, so that they come into order within the halves of a register.
    const __m256 even = rows(_mm_unpacklo_epi64(low, high)), odd = rows(_mm_unpackhi_epi64(low, high));
    return {F32(_mm256_shuffle_ps(even, odd, 0x88)), F32(_mm256_shuffle_ps(even, odd, 0xdd))};
}

} // namespace wide

} // namespace pyxcc
