// Levels of bytes with what they have behind the point.
#pragma once

#include "lanes/avx2/floats.hpp"
#include "lanes/scalar.hpp"

namespace pyxcc
{

/// Of 0 to 255. What is behind the point is cut off on the way to a byte.
template <class S32> struct FineLevel {
    S32 in65536ths;
};

template <class S32> PYXCC_INLINE FineLevel<S32> fineLevel(const S32& in65536ths) { return {in65536ths}; }
template <class S32> PYXCC_INLINE Three<FineLevel<S32>> fineLevels(const Three<S32>& whole)
{
    return {{whole.a << 16}, {whole.b << 16}, {whole.c << 16}};
}

namespace scalar
{

/// Whether any has less than so many 65536ths behind the point.
inline bool anyFractionBelow(const Three<FineLevel<S32>>& x, int limit)
{
    const auto below = [limit](FineLevel<S32> of) { return (of.in65536ths.v & 0xffff) < limit; };
    return below(x.a) || below(x.b) || below(x.c);
}

} // namespace scalar

namespace wide
{

PYXCC_INLINE bool anyFractionBelow(const Three<FineLevel<S32>>& x, int limit)
{
    const __m256i ab = _mm256_min_epu16(x.a.in65536ths.v, x.b.in65536ths.v);
    const __m256i least = _mm256_min_epu16(ab, x.c.in65536ths.v);
    const __m256i below = _mm256_subs_epu16(_mm256_set1_epi32(limit), least); // 0 in front of the point
    return _mm256_testz_si256(below, below) == 0;
}

} // namespace wide

} // namespace pyxcc
