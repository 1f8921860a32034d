// One bit a sample.
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

namespace detail
{

PYXCC_INLINE __m256i reversedEights()
{
    return _mm256_setr_epi8(7, 6, 5, 4, 3, 2, 1, 0, 15, 14, 13, 12, 11, 10, 9, 8, 7, 6, 5, 4, 3, 2, 1, 0, 15, 14, 13,
                            12, 11, 10, 9, 8);
}

} // namespace detail

/// A bit for each sample above the threshold, that of the first sample highest.
PYXCC_INLINE u32 bitsAbove(U8 x, U8 threshold)
{
    // Eights are reversed before their bits are taken, and the bytes of bits then: what is stored is reversed back.
    const __m256i excess = _mm256_shuffle_epi8(_mm256_subs_epu8(x.v, threshold.v), detail::reversedEights());
    const __m256i isNone = _mm256_cmpeq_epi8(excess, _mm256_setzero_si256());
    return __builtin_bswap32(~static_cast<u32>(_mm256_movemask_epi8(isNone)));
}

/// The uppermost bit of each byte, that of the first one lowest, and bytes of all bits or none out of such bits.
PYXCC_INLINE u32 bitsOf(U8 bytes) { return static_cast<u32>(_mm256_movemask_epi8(bytes.v)); }
PYXCC_INLINE U8 maskOf(u32 bits)
{
    const __m256i eighths = _mm256_setr_epi8(0, 0, 0, 0, 0, 0, 0, 0, 1, 1, 1, 1, 1, 1, 1, 1, 2, 2, 2, 2, 2, 2, 2, 2, 3,
                                             3, 3, 3, 3, 3, 3, 3);
    const __m256i ofPlace = _mm256_set1_epi64x(static_cast<long long>(0x8040201008040201));
    const __m256i around = _mm256_shuffle_epi8(_mm256_set1_epi32(static_cast<int>(bits)), eighths);
    return U8(_mm256_cmpeq_epi8(_mm256_and_si256(around, ofPlace), ofPlace));
}

/// The lowest bit of each of 32 bytes for `bit` 0, and so on, that of the first byte highest.
PYXCC_INLINE u32 bitOfEach(U8 bytes, int bit)
{
    const __m256i reversed = _mm256_shuffle_epi8(bytes.v, detail::reversedEights());
    const __m256i uppermost = _mm256_sll_epi16(reversed, _mm_cvtsi32_si128(7 - bit));
    return __builtin_bswap32(static_cast<u32>(_mm256_movemask_epi8(uppermost)));
}

/// A bit for each lane that is below zero, that of the first lane lowest.
PYXCC_INLINE u8 signsOf(S32 x) { return static_cast<u8>(_mm256_movemask_ps(_mm256_castsi256_ps(x.v))); }

} // namespace pyxcc::wide
