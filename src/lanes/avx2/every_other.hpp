// Samples of which every other one is of another kind: by turns, or the even lanes and the odd ones apart, in lanes of
// twice the width. Neighbours of the ones are then among the others, in the same place or beside it.
#pragma once

#include "lanes/avx2/choices.hpp"
#include "lanes/avx2/pixels.hpp"
#include "lanes/avx2/rows.hpp"

namespace pyxcc::wide
{

PYXCC_INLINE S16 evenLanes(U8 x) { return S16(_mm256_and_si256(x.v, _mm256_set1_epi16(0xff))); }
PYXCC_INLINE S32 evenLanes(U16 x) { return S32(_mm256_and_si256(x.v, _mm256_set1_epi32(0xffff))); }
PYXCC_INLINE S16 oddLanes(U8 x) { return S16(_mm256_srli_epi16(x.v, 8)); }
PYXCC_INLINE S32 oddLanes(U16 x) { return S32(_mm256_srli_epi32(x.v, 16)); }

/// One lane of x and one of y by turns, each from its own place.
PYXCC_INLINE U8 byTurns(U8 x, U8 y) { return U8(_mm256_blendv_epi8(x.v, y.v, _mm256_set1_epi16(-256))); }
PYXCC_INLINE U16 byTurns(U16 x, U16 y) { return U16(_mm256_blend_epi16(x.v, y.v, 0xaa)); }

/// One of the even lanes and one of the odd ones by turns, clamped at both ends of what samples can be.
PYXCC_INLINE U8 saturateByTurns(S16 even, S16 odd)
{
    const __m256i byTurns = _mm256_setr_epi8(0, 8, 1, 9, 2, 10, 3, 11, 4, 12, 5, 13, 6, 14, 7, 15, 0, 8, 1, 9, 2, 10, 3,
                                             11, 4, 12, 5, 13, 6, 14, 7, 15);
    return U8(_mm256_shuffle_epi8(_mm256_packus_epi16(even.v, odd.v), byTurns));
}
PYXCC_INLINE U16 saturateByTurns(S32 even, S32 odd)
{
    const __m256i byTurns = _mm256_setr_epi8(0, 1, 8, 9, 2, 3, 10, 11, 4, 5, 12, 13, 6, 7, 14, 15, 0, 1, 8, 9, 2, 3, 10,
                                             11, 4, 5, 12, 13, 6, 7, 14, 15);
    return U16(_mm256_shuffle_epi8(_mm256_packus_epi32(even.v, odd.v), byTurns));
}

/// Words out of double words: the lower halves of the even lanes and the upper halves of the odd ones, or of one lane.
PYXCC_INLINE S16 lowerAndUpperHalves(S32 lower, S32 upper) { return S16(_mm256_blend_epi16(lower.v, upper.v, 0xaa)); }

/// The even words of two registers side by side, and their odd ones.
PYXCC_INLINE WordPairs evenPairs(S16 lower, S16 upper)
{
    return WordPairs(_mm256_blend_epi16(lower.v, _mm256_slli_epi32(upper.v, 16), 0xaa));
}
PYXCC_INLINE WordPairs oddPairs(S16 lower, S16 upper)
{
    return WordPairs(_mm256_blend_epi16(_mm256_srli_epi32(lower.v, 16), upper.v, 0xaa));
}

/// The products of the words of both, added up.
PYXCC_INLINE S32 sumOfProducts(WordPairs x, WordPairs y) { return S32(_mm256_madd_epi16(x.v, y.v)); }

/// 128 more, and 128 less.
PYXCC_INLINE U8 raised(S8 x) { return U8(_mm256_xor_si256(x.v, S8(-128).v)); }
PYXCC_INLINE S8 lowered(U8 x) { return S8(_mm256_xor_si256(x.v, S8(-128).v)); }

PYXCC_INLINE S8 addSat(S8 x, S8 y) { return S8(_mm256_adds_epi8(x.v, y.v)); }
PYXCC_INLINE S16 addSat(S16 x, S16 y) { return addSatS16(x, y); }

/// The highest value less x.
PYXCC_INLINE U8 complement(U8 x) { return detail::complement(x); }
PYXCC_INLINE U16 complement(U16 x) { return x ^ U16(-1); }

/// (x + y) >> 1.
PYXCC_INLINE U16 avgDown(U16 x, U16 y) { return complement(avgUp(complement(x), complement(y))); }

PYXCC_INLINE S16 lesser(S16 x, S16 y) { return S16(_mm256_min_epi16(x.v, y.v)); }
PYXCC_INLINE S16 greater(S16 x, S16 y) { return S16(_mm256_max_epi16(x.v, y.v)); }
PYXCC_INLINE S32 lesser(S32 x, S32 y) { return S32(_mm256_min_epi32(x.v, y.v)); }
PYXCC_INLINE S32 greater(S32 x, S32 y) { return S32(_mm256_max_epi32(x.v, y.v)); }

/// All bits where x is above y, otherwise none.
PYXCC_INLINE S16 isAbove(S16 x, S16 y) { return S16(_mm256_cmpgt_epi16(x.v, y.v)); }

PYXCC_INLINE S16 operator|(S16 x, S16 y) { return S16(_mm256_or_si256(x.v, y.v)); }

} // namespace pyxcc::wide
