// Doubles beside floats: eight lanes are one register of floats and two of doubles.
#pragma once

#include "lanes/avx2/floats.hpp"

namespace pyxcc::wide
{

PYXCC_INLINE Two<F64> toF64(F32 x)
{
    return {F64(_mm256_cvtps_pd(_mm256_castps256_ps128(x.v))), F64(_mm256_cvtps_pd(_mm256_extractf128_ps(x.v, 1)))};
}

PYXCC_INLINE F32 toF32(const Two<F64>& x)
{
    return F32(_mm256_set_m128(_mm256_cvtpd_ps(x.b.v), _mm256_cvtpd_ps(x.a.v)));
}

/// To integers towards zero; out of range and NaN give the lowest integer.
PYXCC_INLINE S32 trunc(const Two<F64>& x)
{
    return S32(_mm256_set_m128i(_mm256_cvttpd_epi32(x.b.v), _mm256_cvttpd_epi32(x.a.v)));
}

/// A sum of products in doubles, lane by lane.
PYXCC_INLINE Two<F64> fused(const Two<F64>& x, const Two<F64>& y, const Two<F64>& z)
{
    return {fused(x.a, y.a, z.a), fused(x.b, y.b, z.b)};
}
PYXCC_INLINE Two<F64> operator-(const Two<F64>& x) { return {-x.a, -x.b}; }
PYXCC_INLINE Two<F64> operator+(const Two<F64>& x, const Two<F64>& y) { return {x.a + y.a, x.b + y.b}; }
PYXCC_INLINE Two<F64> operator-(const Two<F64>& x, const Two<F64>& y) { return {x.a - y.a, x.b - y.b}; }
PYXCC_INLINE Two<F64> operator*(const Two<F64>& x, const Two<F64>& y) { return {x.a * y.a, x.b * y.b}; }

/// The same double in all lanes of as many as there are floats.
PYXCC_INLINE Two<F64> doublesBeside(F32, f64 k) { return {F64(k), F64(k)}; }

PYXCC_INLINE F64 sqrt(F64 x) { return F64(_mm256_sqrt_pd(x.v)); }

/// x > y ? x : y, so that a NaN on either side gives y.
PYXCC_INLINE F64 greater(F64 x, F64 y) { return F64(_mm256_max_pd(x.v, y.v)); }

/// x < y ? yes : no, so that a NaN on either side gives `no`.
PYXCC_INLINE F64 whereLess(F64 x, F64 y, F64 yes, F64 no)
{
    return F64(_mm256_blendv_pd(no.v, yes.v, _mm256_cmp_pd(x.v, y.v, _CMP_LT_OQ)));
}

PYXCC_INLINE S32 whereEqual(F32 x, F32 y, S32 yes, S32 no)
{
    return S32(_mm256_blendv_epi8(no.v, yes.v, _mm256_castps_si256(_mm256_cmp_ps(x.v, y.v, _CMP_EQ_OQ))));
}

/// The upper halves of the representation: sign, exponent, and 20 bits of the mantissa.
PYXCC_INLINE S32 upperWords(const Two<F64>& x)
{
    const __m256 mixed = _mm256_shuffle_ps(_mm256_castpd_ps(x.a.v), _mm256_castpd_ps(x.b.v), 0xdd);
    return S32(_mm256_permute4x64_epi64(_mm256_castps_si256(mixed), 0xd8));
}

/// To an integer, ties to even, whatever the rounding mode.
PYXCC_INLINE F32 roundedToEven(F32 x)
{
    return F32(_mm256_round_ps(x.v, _MM_FROUND_TO_NEAREST_INT | _MM_FROUND_NO_EXC));
}

/// x times 2 to the n, which is an integer; neither x nor the result may leave the range of normal numbers.
PYXCC_INLINE F32 timesPowerOf2(F32 x, F32 n)
{
    const __m256i exponent = _mm256_slli_epi32(_mm256_cvtps_epi32(n.v), 23);
    return F32(_mm256_castsi256_ps(_mm256_add_epi32(_mm256_castps_si256(x.v), exponent)));
}

/// Clears the last bits of the mantissa.
PYXCC_INLINE F32 withoutLowBits(F32 x, int count)
{
    return F32(_mm256_and_ps(x.v, _mm256_castsi256_ps(_mm256_set1_epi32(-(1 << count)))));
}

} // namespace pyxcc::wide
