// Look-ups in a table whose rows are two floats.
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

/// The same for an index that has a row.
template <std::size_t Rows> Two<F32> lookUpWithin(const PairsOfFloats<Rows>& table, S32 index)
{
    return lookUp(table, index);
}

} // namespace scalar

namespace wide
{

namespace detail
{

/// The floats at `stride` times each index. The gather writes into a register that holds nothing: as the compiler would
/// have it, it would wait for what the register held before.
template <int stride> PYXCC_INLINE F32 gather(const f32* floats, S32 index)
{
    __m256 all = _mm256_castsi256_ps(_mm256_set1_epi32(-1));
    asm("" : "+x"(all)); // else the compiler knows that all lanes are written
    return F32(_mm256_mask_i32gather_ps(_mm256_setzero_ps(), floats, index.v, all, stride * int{sizeof(f32)}));
}

} // namespace detail

/// Two gathers of floats, which are less work than gathers of rows and the shuffles behind them.
template <std::size_t Rows> PYXCC_INLINE Two<F32> lookUpWithin(const PairsOfFloats<Rows>& table, S32 index)
{
    const f32* const floats = &table[0].a;
    return {detail::gather<2>(floats, index), detail::gather<2>(floats + 1, index)};
}

template <std::size_t Rows> PYXCC_INLINE Two<F32> lookUp(const PairsOfFloats<Rows>& table, S32 index)
{
    const __m256i last = _mm256_set1_epi32(Rows - 1);
    return lookUpWithin(table, S32(_mm256_min_epi32(_mm256_max_epi32(index.v, _mm256_setzero_si256()), last)));
}

} // namespace wide

} // namespace pyxcc
