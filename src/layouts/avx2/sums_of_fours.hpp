// Exact weighted sums over sums of fours.
#pragma once

#include "layouts/avx2/chroma.hpp"

namespace pyxcc::layouts
{

/// (Weights * sums + ... + Addend) >> Shift with exact products. A sum of four has two words to itself, so that two of
/// them go into a multiply-add side by side, without being interleaved. The result must keep within 0 to 32767.
template <int Shift, int Addend, int WeightOfA, int WeightOfB, int WeightOfC, class Rows>
PYXCC_INLINE wide::S16 exactSumOfFours(const Sums<4, Rows>& a, const Sums<4, Rows>& b, const Sums<4, Rows>& c)
{
    constexpr auto pair = [](int low, int high) { return (low & 0xffff) | static_cast<int>(high * 0x10000u); };
    const __m256i ab = _mm256_or_si256(a.v, _mm256_slli_epi32(b.v, 16));
    const __m256i sumOfAB = _mm256_madd_epi16(ab, _mm256_set1_epi32(pair(WeightOfA, WeightOfB)));
    const __m256i sumOfC = _mm256_madd_epi16(c.v, _mm256_set1_epi32(pair(WeightOfC, 0)));
    const __m256i sum = _mm256_add_epi32(_mm256_add_epi32(sumOfAB, sumOfC), _mm256_set1_epi32(Addend));
    return wide::S16(_mm256_srai_epi32(sum, Shift));
}

} // namespace pyxcc::layouts
