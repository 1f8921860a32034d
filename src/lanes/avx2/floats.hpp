// The arithmetic vocabulary over registers of floats. Every operation rounds singly, in the mode in force.
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

struct F32 {
    static constexpr int count = 8;
    __m256 v;

    F32() = default;
    PYXCC_INLINE explicit F32(__m256 value) : v(value) {}
    PYXCC_INLINE F32(f32 k) : v(_mm256_set1_ps(k)) {}

    friend PYXCC_INLINE F32 operator+(F32 x, F32 y) { return F32(_mm256_add_ps(x.v, y.v)); }
    friend PYXCC_INLINE F32 operator-(F32 x, F32 y) { return F32(_mm256_sub_ps(x.v, y.v)); }
    friend PYXCC_INLINE F32 operator-(F32 x) { return F32(-x.v); }
    friend PYXCC_INLINE F32 operator*(F32 x, F32 y) { return F32(_mm256_mul_ps(x.v, y.v)); }
    friend PYXCC_INLINE F32 operator/(F32 x, F32 y) { return F32(_mm256_div_ps(x.v, y.v)); }
};

struct F64 {
    static constexpr int count = 4;
    __m256d v;

    F64() = default;
    PYXCC_INLINE explicit F64(__m256d value) : v(value) {}
    PYXCC_INLINE F64(f64 k) : v(_mm256_set1_pd(k)) {}

    friend PYXCC_INLINE F64 operator+(F64 x, F64 y) { return F64(_mm256_add_pd(x.v, y.v)); }
    friend PYXCC_INLINE F64 operator-(F64 x, F64 y) { return F64(_mm256_sub_pd(x.v, y.v)); }
    friend PYXCC_INLINE F64 operator-(F64 x) { return F64(-x.v); }
    friend PYXCC_INLINE F64 operator*(F64 x, F64 y) { return F64(_mm256_mul_pd(x.v, y.v)); }
    friend PYXCC_INLINE F64 operator/(F64 x, F64 y) { return F64(_mm256_div_pd(x.v, y.v)); }
};

PYXCC_INLINE F32 fused(F32 x, F32 y, F32 z) { return F32(_mm256_fmadd_ps(x.v, y.v, z.v)); }
PYXCC_INLINE F64 fused(F64 x, F64 y, F64 z) { return F64(_mm256_fmadd_pd(x.v, y.v, z.v)); }

/// x < y ? x : y, so that a NaN on either side gives y; and likewise for the greater.
PYXCC_INLINE F32 lesser(F32 x, F32 y) { return F32(_mm256_min_ps(x.v, y.v)); }
PYXCC_INLINE F32 greater(F32 x, F32 y) { return F32(_mm256_max_ps(x.v, y.v)); }

/// x < y ? yes : no, so that a NaN on either side gives `no`; and likewise for the other comparisons. The compiler's
/// own comparisons let several choices share one.
PYXCC_INLINE F32 whereLess(F32 x, F32 y, F32 yes, F32 no) { return F32(x.v < y.v ? yes.v : no.v); }
PYXCC_INLINE F32 whereAtMost(F32 x, F32 y, F32 yes, F32 no) { return F32(x.v <= y.v ? yes.v : no.v); }
PYXCC_INLINE F32 whereEqual(F32 x, F32 y, F32 yes, F32 no) { return F32(x.v == y.v ? yes.v : no.v); }

/// x < y ? 0 : z.
PYXCC_INLINE F32 zeroWhereLess(F32 x, F32 y, F32 z)
{
    return F32(_mm256_andnot_ps(_mm256_cmp_ps(x.v, y.v, _CMP_LT_OQ), z.v));
}

/// Whether x <= y in any lane.
PYXCC_INLINE bool anyAtMost(F32 x, F32 y) { return _mm256_movemask_ps(_mm256_cmp_ps(x.v, y.v, _CMP_LE_OQ)) != 0; }

/// By the sign bit, which a zero can have as well.
PYXCC_INLINE F32 whereSigned(F32 x, F32 yes, F32 no) { return F32(_mm256_blendv_ps(no.v, yes.v, x.v)); }

/// Without its sign.
PYXCC_INLINE F32 magnitude(F32 x) { return F32(_mm256_andnot_ps(_mm256_set1_ps(-0.f), x.v)); }

/// Sign, exponent, and the first bit of the mantissa.
PYXCC_INLINE S32 halfOctave(F32 x) { return S32(_mm256_castps_si256(x.v)) >> 22; }

PYXCC_INLINE F32 toF32(S32 x) { return F32(_mm256_cvtepi32_ps(x.v)); }

/// To an integer in the rounding mode in force; out of range and NaN give the lowest integer.
PYXCC_INLINE S32 nearest(F32 x) { return S32(_mm256_cvtps_epi32(x.v)); }

/// To an integer towards zero; out of range and NaN give the lowest integer.
PYXCC_INLINE S32 trunc(F32 x) { return S32(_mm256_cvttps_epi32(x.v)); }

/// x < y ? n + 1 : n.
PYXCC_INLINE S32 oneMoreWhereLess(F32 x, F32 y, S32 n)
{
    return S32(_mm256_sub_epi32(n.v, _mm256_castps_si256(_mm256_cmp_ps(x.v, y.v, _CMP_LT_OQ))));
}

namespace detail
{

/// Words and their upper halves, all zeros or all ones, as floats.
PYXCC_INLINE Two<F32> floatsOfWords(__m256i words, __m256i upper)
{
    return {toF32(S32(_mm256_unpacklo_epi16(words, upper))), toF32(S32(_mm256_unpackhi_epi16(words, upper)))};
}

} // namespace detail

/// Samples as floats, exactly, in the order that saturate() takes back: each 128-bit lane is widened by itself.
PYXCC_INLINE Two<F32> toF32(U16 x) { return detail::floatsOfWords(x.v, _mm256_setzero_si256()); }
PYXCC_INLINE Two<F32> toF32(S16 x)
{
    return detail::floatsOfWords(x.v, _mm256_cmpgt_epi16(_mm256_setzero_si256(), x.v));
}
PYXCC_INLINE Four<F32> toF32(U8 x)
{
    const __m256i zero = _mm256_setzero_si256();
    const Two<F32> low = toF32(U16(_mm256_unpacklo_epi8(x.v, zero)));
    const Two<F32> high = toF32(U16(_mm256_unpackhi_epi8(x.v, zero)));
    return {low.a, low.b, high.a, high.b};
}

/// The same by a difference in place of a conversion, for loops that are short of the units for conversions and
/// products. Where the mode is to round down, a zero becomes -0.
PYXCC_INLINE Two<F32> toF32ByDifference(U16 x)
{
    const __m256i exponent = _mm256_set1_epi16(0x4b00); // of 2^23
    const auto floats = [](__m256i offset)
                            PYXCC_INLINE_LAMBDA { return F32(_mm256_castsi256_ps(offset)) - F32(0x1p23f); };
    return {floats(_mm256_unpacklo_epi16(x.v, exponent)), floats(_mm256_unpackhi_epi16(x.v, exponent))};
}

/// What zero-extended signed bytes are to differ by, bit by bit, to be floats 2^23 + 128 greater than they.
inline constexpr int offsetByte = 0x4b000080;

/// Takes the 2^23 + 128 away: no more work than a conversion, which would need the sign extended in front of it. Exact;
/// a zero becomes -0 where the mode is to round down.
PYXCC_INLINE F32 lessOffset(S32 x) { return F32(_mm256_castsi256_ps(x.v)) - F32(0x1p23f + 128); }

PYXCC_INLINE Four<F32> toF32(S8 x)
{
    const __m256i zero = _mm256_setzero_si256(), exponent = _mm256_set1_epi16(offsetByte >> 16);
    const __m256i offset = _mm256_xor_si256(x.v, _mm256_set1_epi8(static_cast<char>(offsetByte)));
    const __m256i low = _mm256_unpacklo_epi8(offset, zero), high = _mm256_unpackhi_epi8(offset, zero);
    return {
        lessOffset(S32(_mm256_unpacklo_epi16(low, exponent))), lessOffset(S32(_mm256_unpackhi_epi16(low, exponent))),
        lessOffset(S32(_mm256_unpacklo_epi16(high, exponent))), lessOffset(S32(_mm256_unpackhi_epi16(high, exponent)))};
}

/// Integers narrowed to samples, clamped at both ends.
template <class Samples> Samples saturate(const Two<S32>& x);
template <class Samples> Samples saturate(const Four<S32>& x);

template <> PYXCC_INLINE U16 saturate(const Two<S32>& x) { return U16(_mm256_packus_epi32(x.a.v, x.b.v)); }
template <> PYXCC_INLINE S16 saturate(const Two<S32>& x) { return S16(_mm256_packs_epi32(x.a.v, x.b.v)); }
template <> PYXCC_INLINE U8 saturate(const Four<S32>& x)
{
    return U8(_mm256_packus_epi16(_mm256_packs_epi32(x.a.v, x.b.v), _mm256_packs_epi32(x.c.v, x.d.v)));
}
template <> PYXCC_INLINE S8 saturate(const Four<S32>& x)
{
    return S8(_mm256_packs_epi16(_mm256_packs_epi32(x.a.v, x.b.v), _mm256_packs_epi32(x.c.v, x.d.v)));
}

} // namespace pyxcc::wide
