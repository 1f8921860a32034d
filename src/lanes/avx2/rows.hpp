// Lanes that are rows of an image, each some columns behind the one above it.
#pragma once

#include "lanes/avx2/floats.hpp"

namespace pyxcc::wide
{

/// Each lane takes the one in front of it, and the first takes `first`.
PYXCC_INLINE F32 fromLaneInFront(F32 x, const f32& first)
{
    const __m256 moved = _mm256_permutevar8x32_ps(x.v, _mm256_setr_epi32(0, 0, 1, 2, 3, 4, 5, 6));
    return F32(_mm256_blend_ps(moved, _mm256_broadcast_ss(&first), 1));
}

PYXCC_INLINE S32 fromLaneInFront(S32 x, const s32& first)
{
    const __m256i moved = _mm256_permutevar8x32_epi32(x.v, _mm256_setr_epi32(0, 0, 1, 2, 3, 4, 5, 6));
    return S32(_mm256_blend_epi32(moved, _mm256_set1_epi32(first), 1));
}

/// Zero in the lanes whose column is not one of 0 to width - 1. Each is `lag` less than that of the lane in front of
/// it.
PYXCC_INLINE S32 zeroOutside(S32 x, int firstColumn, int lag, int width)
{
    const S32 column = S32(firstColumn) - S32(_mm256_setr_epi32(0, 1, 2, 3, 4, 5, 6, 7)) * S32(lag);
    const __m256i inFront = _mm256_cmpgt_epi32(S32(0).v, column.v);
    const __m256i behind = _mm256_cmpgt_epi32(column.v, S32(width - 1).v);
    return S32(_mm256_andnot_si256(_mm256_or_si256(inFront, behind), x.v));
}

PYXCC_INLINE F32 zeroOutside(F32 x, int firstColumn, int lag, int width)
{
    return F32(_mm256_castsi256_ps(zeroOutside(S32(_mm256_castps_si256(x.v)), firstColumn, lag, width).v));
}

/// -1 where x is above y, otherwise 0.
PYXCC_INLINE S32 isAbove(S32 x, S32 y) { return S32(_mm256_cmpgt_epi32(x.v, y.v)); }

PYXCC_INLINE F32 loadLanes(const f32* p, F32) { return F32(_mm256_loadu_ps(p)); }
PYXCC_INLINE S32 loadLanes(const s32* p, S32) { return S32(_mm256_loadu_si256(reinterpret_cast<const __m256i*>(p))); }
PYXCC_INLINE S32 loadLanes(const u8* p, S32)
{
    return S32(_mm256_cvtepu8_epi32(_mm_loadl_epi64(reinterpret_cast<const __m128i*>(p))));
}
PYXCC_INLINE void storeLanes(f32* p, F32 x) { _mm256_storeu_ps(p, x.v); }
PYXCC_INLINE void storeLanes(s32* p, S32 x) { _mm256_storeu_si256(reinterpret_cast<__m256i*>(p), x.v); }

} // namespace pyxcc::wide
