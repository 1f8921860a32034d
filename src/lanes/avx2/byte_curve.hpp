// Curves of bytes over a register.
#pragma once

#include "lanes/avx2/integers.hpp"
#include "lanes/byte_curve.hpp"

namespace pyxcc::wide
{

namespace detail
{

/// Looks up 16 entries by the low four bits of an index; one with bit 7 set gives 0.
PYXCC_INLINE __m256i lookUpSixteen(const ByteCurve::Sixteen& entries, __m256i index)
{
    const __m128i table = _mm_loadu_si128(reinterpret_cast<const __m128i*>(entries.data()));
    return _mm256_shuffle_epi8(_mm256_broadcastsi128_si256(table), index);
}

} // namespace detail

template <const ByteCurve& curve> PYXCC_INLINE U8 lookUp(U8 x)
{
    static constexpr ByteCurve::Sixteen bitOf = {1, 2, 4, 8, 16, 32, 64, 128, 1, 2, 4, 8, 16, 32, 64, 128};
    const __m256i h = _mm256_and_si256(_mm256_srli_epi16(x.v, 4), _mm256_set1_epi8(15));

    // Products of bytes are words: those of the even bytes are shifted down, those of the odd ones are in their place.
    const __m256i slope = detail::lookUpSixteen(curve.slope, h), x4 = _mm256_slli_epi16(x.v, 2);
    const __m256i even = _mm256_maddubs_epi16(slope, _mm256_and_si256(x4, _mm256_set1_epi16(0x007c)));
    const __m256i odd = _mm256_maddubs_epi16(slope, _mm256_and_si256(x4, _mm256_set1_epi16(0x7c00)));
    const __m256i line = _mm256_blendv_epi8(_mm256_srli_epi16(even, 8), odd, _mm256_set1_epi16(-256));

    const __m256i lowHalf = detail::lookUpSixteen(curve.bits[0], x.v);
    const __m256i highHalf = detail::lookUpSixteen(curve.bits[1], _mm256_xor_si256(x.v, _mm256_set1_epi8(-128)));
    const __m256i bit = detail::lookUpSixteen(bitOf, h);
    const __m256i minusOne = _mm256_cmpeq_epi8(_mm256_and_si256(_mm256_or_si256(lowHalf, highHalf), bit), bit);

    __m256i y = _mm256_sub_epi8(_mm256_add_epi8(line, detail::lookUpSixteen(curve.base, h)), minusOne);
    if constexpr (curve.steep) {
        const __m256i j = _mm256_avg_epu8(x.v, _mm256_setzero_si256());
        const __m256i upTo15 = _mm256_adds_epu8(j, _mm256_set1_epi8(112));
        y = _mm256_add_epi8(y, detail::lookUpSixteen(curve.start, upTo15));
    }
    return U8(y);
}

} // namespace pyxcc::wide
