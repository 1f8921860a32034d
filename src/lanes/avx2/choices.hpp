// Samples compared, chosen and looked up as they lie, and in lanes of 32 bits: a register of bytes makes four of those,
// one of words makes two, in the order that saturate() takes back.
#pragma once

#include "lanes/avx2/floats.hpp"
#include "lanes/avx2/means.hpp"
#include "lanes/several.hpp"

#include <array>

namespace pyxcc::wide
{

PYXCC_INLINE U8 operator+(U8 x, U8 y) { return U8(_mm256_add_epi8(x.v, y.v)); }
PYXCC_INLINE U8 operator-(U8 x, U8 y) { return U8(_mm256_sub_epi8(x.v, y.v)); }
PYXCC_INLINE U8 operator&(U8 x, U8 y) { return U8(_mm256_and_si256(x.v, y.v)); }
PYXCC_INLINE U8 operator|(U8 x, U8 y) { return U8(_mm256_or_si256(x.v, y.v)); }
PYXCC_INLINE U8 operator^(U8 x, U8 y) { return U8(_mm256_xor_si256(x.v, y.v)); }

PYXCC_INLINE U8 lesser(U8 x, U8 y) { return U8(_mm256_min_epu8(x.v, y.v)); }
PYXCC_INLINE U8 greater(U8 x, U8 y) { return U8(_mm256_max_epu8(x.v, y.v)); }

/// |x - y|.
PYXCC_INLINE U8 distance(U8 x, U8 y)
{
    return U8(_mm256_or_si256(_mm256_subs_epu8(x.v, y.v), _mm256_subs_epu8(y.v, x.v)));
}

/// 255 where they are equal, otherwise 0.
PYXCC_INLINE U8 equal(U8 x, U8 y) { return U8(_mm256_cmpeq_epi8(x.v, y.v)); }

/// By masks of 255 and 0.
PYXCC_INLINE U8 where(U8 mask, U8 yes, U8 no) { return U8(_mm256_blendv_epi8(no.v, yes.v, mask.v)); }
PYXCC_INLINE U8 exceptWhere(U8 mask, U8 x) { return U8(_mm256_andnot_si256(mask.v, x.v)); }

PYXCC_INLINE U16 operator&(U16 x, U16 y) { return U16(_mm256_and_si256(x.v, y.v)); }
PYXCC_INLINE U16 operator|(U16 x, U16 y) { return U16(_mm256_or_si256(x.v, y.v)); }
PYXCC_INLINE U16 operator^(U16 x, U16 y) { return U16(_mm256_xor_si256(x.v, y.v)); }

PYXCC_INLINE U16 greater(U16 x, U16 y) { return U16(_mm256_max_epu16(x.v, y.v)); }
PYXCC_INLINE U16 distance(U16 x, U16 y)
{
    return U16(_mm256_or_si256(_mm256_subs_epu16(x.v, y.v), _mm256_subs_epu16(y.v, x.v)));
}
PYXCC_INLINE U16 avgUp(U16 x, U16 y) { return U16(_mm256_avg_epu16(x.v, y.v)); }

PYXCC_INLINE U16 equal(U16 x, U16 y) { return U16(_mm256_cmpeq_epi16(x.v, y.v)); }
PYXCC_INLINE U16 where(U16 mask, U16 yes, U16 no) { return U16(_mm256_blendv_epi8(no.v, yes.v, mask.v)); }
PYXCC_INLINE U16 exceptWhere(U16 mask, U16 x) { return U16(_mm256_andnot_si256(mask.v, x.v)); }

/// Entries of a table; an index is below 16.
PYXCC_INLINE U8 lookUp(const std::array<u8, 16>& table, U8 index)
{
    const __m128i entries = _mm_loadu_si128(reinterpret_cast<const __m128i*>(table.data()));
    return U8(_mm256_shuffle_epi8(_mm256_broadcastsi128_si256(entries), index.v));
}

/// The same for masks, which become as wide as the index.
PYXCC_INLINE U16 lookUp(const std::array<u8, 16>& masks, U16 index)
{
    return U16(lookUp(masks, U8((index * U16(0x0101)).v)).v);
}

/// By the lowest bit of an integer.
PYXCC_INLINE F32 whereOdd(S32 x, F32 yes, F32 no)
{
    return whereSigned(F32(_mm256_castsi256_ps((x << 31).v)), yes, no);
}

/// Entries of a table by the last three bits of an index.
PYXCC_INLINE F32 lookUp(const std::array<f32, 8>& table, S32 index)
{
    return F32(_mm256_permutevar8x32_ps(_mm256_loadu_ps(table.data()), index.v));
}

PYXCC_INLINE Several<S32, 4> toS32(U8 x)
{
    const auto quarter = [x](int q) PYXCC_INLINE_LAMBDA {
        const __m256i places = _mm256_set1_epi32(static_cast<int>(0x80808000u) + 4 * q);
        return S32(_mm256_shuffle_epi8(x.v, _mm256_add_epi32(places, _mm256_setr_epi32(0, 1, 2, 3, 0, 1, 2, 3))));
    };
    return several(quarter(0), quarter(1), quarter(2), quarter(3));
}

PYXCC_INLINE Several<S32, 2> toS32(U16 x)
{
    const __m256i zero = _mm256_setzero_si256();
    return several(S32(_mm256_unpacklo_epi16(x.v, zero)), S32(_mm256_unpackhi_epi16(x.v, zero)));
}

/// (x - y) << 16 of bytes, which takes no extending of a sign, and x - y of words.
PYXCC_INLINE Several<S32, 4> scaledDifference(U8 x, U8 y)
{
    const __m256i zero = _mm256_setzero_si256();
    const Two<S16> words = detail::weighted<1, -1>(x, y);
    return several(S32(_mm256_unpacklo_epi16(zero, words.a.v)), S32(_mm256_unpackhi_epi16(zero, words.a.v)),
                   S32(_mm256_unpacklo_epi16(zero, words.b.v)), S32(_mm256_unpackhi_epi16(zero, words.b.v)));
}

PYXCC_INLINE Several<S32, 2> scaledDifference(U16 x, U16 y) { return toS32(x) - toS32(y); }

template <class Samples, int N> PYXCC_INLINE Samples saturate(const Several<S32, N>& x)
{
    if constexpr (N == 2) {
        return saturate<Samples>(Two{x.part[0], x.part[1]});
    } else {
        return saturate<Samples>(Four{x.part[0], x.part[1], x.part[2], x.part[3]});
    }
}

/// (x * k) >> 16.
PYXCC_INLINE U8 mulHighU16(U8 x, int k)
{
    const Two<Sample> words = widen(x);
    return narrow(Byte(mulHighU16(asU16(words.a), k).v), Byte(mulHighU16(asU16(words.b), k).v));
}

} // namespace pyxcc::wide
