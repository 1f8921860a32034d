// The arithmetic vocabulary over 256-bit registers: 32 bytes, 16 words, 8 double words.
#pragma once

#include "lanes/groups.hpp"
#include "lanes/inline.hpp"
#include "pyxcc/types.h"

#include <immintrin.h>

namespace pyxcc::wide
{

/// A register of integers. Its copies are spelled out for the compiler's sake: groups of registers are then copied one
/// by one and stay in registers, while a group that can be copied as bytes goes through memory.
// NOLINTBEGIN(cppcoreguidelines-special-member-functions, modernize-use-equals-default)
struct Integers {
    __m256i v;

    Integers() = default;
    PYXCC_INLINE explicit Integers(__m256i value) : v(value) {}
    PYXCC_INLINE Integers(const Integers& other) : v(other.v) {}
    PYXCC_INLINE Integers& operator=(const Integers& other)
    {
        v = other.v;
        return *this;
    }
};
// NOLINTEND(cppcoreguidelines-special-member-functions, modernize-use-equals-default)

/// 32 samples of 8 bits, as they lie in memory.
struct U8 : Integers {
    static constexpr int count = 32;

    U8() = default;
    PYXCC_INLINE explicit U8(__m256i value) : Integers(value) {}
    PYXCC_INLINE U8(int k) : Integers(_mm256_set1_epi8(static_cast<char>(k))) {}
};

/// 32 signed samples of 8 bits, as they lie in memory.
struct S8 : Integers {
    static constexpr int count = 32;

    S8() = default;
    PYXCC_INLINE explicit S8(__m256i value) : Integers(value) {}
    PYXCC_INLINE S8(int k) : Integers(_mm256_set1_epi8(static_cast<char>(k))) {}
};

struct S16 : Integers {
    static constexpr int count = 16;

    S16() = default;
    PYXCC_INLINE explicit S16(__m256i value) : Integers(value) {}
    PYXCC_INLINE S16(int k) : Integers(_mm256_set1_epi16(static_cast<short>(k))) {}

    friend PYXCC_INLINE S16 operator+(S16 x, S16 y) { return S16(_mm256_add_epi16(x.v, y.v)); }
    friend PYXCC_INLINE S16 operator-(S16 x, S16 y) { return S16(_mm256_sub_epi16(x.v, y.v)); }
    friend PYXCC_INLINE S16 operator*(S16 x, S16 y) { return S16(_mm256_mullo_epi16(x.v, y.v)); }
    friend PYXCC_INLINE S16 operator<<(S16 x, int n) { return S16(_mm256_slli_epi16(x.v, n)); }
    friend PYXCC_INLINE S16 operator>>(S16 x, int n) { return S16(_mm256_srai_epi16(x.v, n)); }
};

struct U16 : Integers {
    static constexpr int count = 16;

    U16() = default;
    PYXCC_INLINE explicit U16(__m256i value) : Integers(value) {}
    PYXCC_INLINE U16(int k) : Integers(_mm256_set1_epi16(static_cast<short>(k))) {}

    friend PYXCC_INLINE U16 operator+(U16 x, U16 y) { return U16(_mm256_add_epi16(x.v, y.v)); }
    friend PYXCC_INLINE U16 operator-(U16 x, U16 y) { return U16(_mm256_sub_epi16(x.v, y.v)); }
    friend PYXCC_INLINE U16 operator*(U16 x, U16 y) { return U16(_mm256_mullo_epi16(x.v, y.v)); }
    friend PYXCC_INLINE U16 operator<<(U16 x, int n) { return U16(_mm256_slli_epi16(x.v, n)); }
    friend PYXCC_INLINE U16 operator>>(U16 x, int n) { return U16(_mm256_srli_epi16(x.v, n)); }
};

struct S32 : Integers {
    static constexpr int count = 8;

    S32() = default;
    PYXCC_INLINE explicit S32(__m256i value) : Integers(value) {}
    PYXCC_INLINE S32(int k) : Integers(_mm256_set1_epi32(k)) {}

    friend PYXCC_INLINE S32 operator+(S32 x, S32 y) { return S32(_mm256_add_epi32(x.v, y.v)); }
    friend PYXCC_INLINE S32 operator-(S32 x, S32 y) { return S32(_mm256_sub_epi32(x.v, y.v)); }
    friend PYXCC_INLINE S32 operator*(S32 x, S32 y) { return S32(_mm256_mullo_epi32(x.v, y.v)); }
    friend PYXCC_INLINE S32 operator&(S32 x, S32 y) { return S32(_mm256_and_si256(x.v, y.v)); }
    friend PYXCC_INLINE S32 operator<<(S32 x, int n) { return S32(_mm256_slli_epi32(x.v, n)); }
    friend PYXCC_INLINE S32 operator>>(S32 x, int n) { return S32(_mm256_srai_epi32(x.v, n)); }
};

/// Samples in 16-bit lanes that narrow() stores as bytes. Clamping is left to narrow(), which does it at no cost.
struct Byte : Integers {
    Byte() = default;
    PYXCC_INLINE Byte(__m256i value) : Integers(value) {}
};

/// The same for samples that narrow() clamps to Low..High, once they are bytes, which is half of the work.
template <int Low, int High> struct ByteWithin : Byte {
    using Byte::Byte;
};

PYXCC_INLINE U16 asU16(S16 x) { return U16(x.v); }
PYXCC_INLINE S16 asS16(U16 x) { return S16(x.v); }

/// 32768 more, and 32768 less.
PYXCC_INLINE U16 raised(S16 x) { return U16(_mm256_xor_si256(x.v, S16(-32768).v)); }
PYXCC_INLINE S16 lowered(U16 x) { return S16(_mm256_xor_si256(x.v, S16(-32768).v)); }

PYXCC_INLINE Byte sat8(S16 x) { return {x.v}; }
PYXCC_INLINE Byte sat8(U16 x) { return {_mm256_min_epu16(x.v, _mm256_set1_epi16(255))}; }
template <int Low, int High> PYXCC_INLINE ByteWithin<Low, High> clampTo(S16 x) { return {x.v}; }
PYXCC_INLINE Byte low8(S16 x) { return {_mm256_and_si256(x.v, _mm256_set1_epi16(255))}; }

PYXCC_INLINE S16 mulRound15(S16 x, int k) { return S16(_mm256_mulhrs_epi16(x.v, S16(k).v)); }
PYXCC_INLINE S16 mulHighS16(S16 x, int k) { return S16(_mm256_mulhi_epi16(x.v, S16(k).v)); }
PYXCC_INLINE U16 mulHighU16(U16 x, U16 y) { return U16(_mm256_mulhi_epu16(x.v, y.v)); }
PYXCC_INLINE U16 mulHighU16(U16 x, int k) { return mulHighU16(x, U16(k)); }
PYXCC_INLINE U16 lesser(U16 x, U16 y) { return U16(_mm256_min_epu16(x.v, y.v)); }

template <int Shift> PYXCC_INLINE S16 roundedShift(S16 x) { return mulRound15(x, 1 << (15 - Shift)); }

PYXCC_INLINE S16 addSatS16(S16 x, S16 y) { return S16(_mm256_adds_epi16(x.v, y.v)); }
PYXCC_INLINE S16 subSatS16(S16 x, S16 y) { return S16(_mm256_subs_epi16(x.v, y.v)); }
PYXCC_INLINE U16 addSatU16(U16 x, U16 y) { return U16(_mm256_adds_epu16(x.v, y.v)); }

/// Bytes that were just widened to words. They are at hand 256 times as large too, since a byte can be put in the upper
/// half of a word as cheaply as in the lower one, and so is 128 times what they are below 16, the black of studio
/// range; what a form does not use is never computed.
struct Sample : S16 {
    U16 in256ths;
    S16 belowBlack;

    PYXCC_INLINE Sample(S16 words, U16 wordsIn256ths, S16 wordsBelowBlack)
        : S16(words), in256ths(wordsIn256ths), belowBlack(wordsBelowBlack)
    {
    }
    PYXCC_INLINE Sample(S16 words, U16 wordsIn256ths)
        : Sample(words, wordsIn256ths, S16(16 << 7) - asS16(wordsIn256ths >> 1))
    {
    }

    /// 7 and 8 are the scales of the high-product forms.
    friend PYXCC_INLINE S16 operator<<(const Sample& x, int n)
    {
        if (n == 8) return asS16(x.in256ths);
        if (n == 7) return asS16(x.in256ths >> 1);
        return static_cast<const S16&>(x) << n;
    }
};

/// What differs from Zero is taken 256 times where that comes to the same, since it is at hand: the weight takes up
/// what is too large. So do unsigned products, if what they give for Zero is whole.
template <int Zero, int Weight, int Bits = 7> PYXCC_INLINE S16 highShare(const Sample& x)
{
    constexpr int excess = 1 << (8 - Bits);
    constexpr int atZero = (Zero << Bits) * Weight;
    if constexpr (Zero == 128) {
        const S16 fromZero = lowered(x.in256ths);
        return Weight % excess == 0 ? mulHighS16(fromZero, Weight / excess)
                                    : mulHighS16(fromZero >> (8 - Bits), Weight);
    } else if constexpr (Weight > 0 && Weight % excess == 0 && atZero % 65536 == 0) {
        return asS16(mulHighU16(x.in256ths, Weight / excess)) - atZero / 65536;
    } else if constexpr (Zero == 16 && Bits == 7) {
        return mulHighS16(x.belowBlack, -Weight);
    } else {
        return mulHighS16((x << Bits) - (Zero << Bits), Weight);
    }
}

namespace detail
{

/// 128 times what samples are below 16, by words of each beside 32.
PYXCC_INLINE S16 belowBlack(__m256i pairs)
{
    return S16(_mm256_maddubs_epi16(pairs, _mm256_set1_epi16(64 * 256 + 128))); // 64 and -128
}

} // namespace detail

/// The bytes as words, zero-extended, in the order that narrow() takes back: each 128-bit lane is widened by itself.
PYXCC_INLINE Two<Sample> widen(U8 x)
{
    const __m256i zero = _mm256_setzero_si256(), beside = _mm256_set1_epi8(32);
    return {{S16(_mm256_unpacklo_epi8(x.v, zero)), U16(_mm256_unpacklo_epi8(zero, x.v)),
             detail::belowBlack(_mm256_unpacklo_epi8(x.v, beside))},
            {S16(_mm256_unpackhi_epi8(x.v, zero)), U16(_mm256_unpackhi_epi8(zero, x.v)),
             detail::belowBlack(_mm256_unpackhi_epi8(x.v, beside))}};
}

PYXCC_INLINE U8 narrow(Byte low, Byte high) { return U8(_mm256_packus_epi16(low.v, high.v)); }

template <int Low, int High> PYXCC_INLINE U8 narrow(ByteWithin<Low, High> low, ByteWithin<Low, High> high)
{
    const __m256i bytes = _mm256_packus_epi16(low.v, high.v);
    return U8(_mm256_min_epu8(_mm256_max_epu8(bytes, U8(Low).v), U8(High).v));
}

} // namespace pyxcc::wide
