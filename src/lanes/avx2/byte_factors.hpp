// Bytes as factors of products in floats, which are rounded once, as if the bytes had been converted first.
#pragma once

#include "lanes/avx2/floats.hpp"

namespace pyxcc::wide
{

template <class Byte> struct ByteFactor;

/// 2^23 more than the byte, which takes no conversion: its bits behind those of an exponent. The weight's 2^23rd
/// multiple, which is exact, is taken off the product.
template <> struct ByteFactor<u8> {
    F32 v;
};

/// 2^24 times the byte, which so is the uppermost of an integer: no sign to extend.
template <> struct ByteFactor<s8> {
    F32 v;
};

template <class Byte> struct ByteWeight;

template <> struct ByteWeight<u8> {
    f32 k, less;

    explicit ByteWeight(f32 weight) : k(weight), less(-0x1p23f * weight) {}
};

/// The 2^24th part of a weight, which is not to be so small that it is rounded.
template <> struct ByteWeight<s8> {
    f32 k;

    explicit ByteWeight(f32 weight) : k(0x1p-24f * weight) {}
};

/// The same value, which the compiler is not to load again for its next use: loops over bytes are short of loads, too.
PYXCC_INLINE F32 keptInRegister(F32 x)
{
    asm("" : "+x"(x.v));
    return x;
}

/// What a weight is in registers.
template <class Byte> struct ByteWeightInRegisters;

template <> struct ByteWeightInRegisters<u8> {
    F32 k, less;

    PYXCC_INLINE explicit ByteWeightInRegisters(const ByteWeight<u8>& w)
        : k(keptInRegister(w.k)), less(keptInRegister(w.less))
    {
    }
};

template <> struct ByteWeightInRegisters<s8> {
    F32 k;

    PYXCC_INLINE explicit ByteWeightInRegisters(const ByteWeight<s8>& w) : k(keptInRegister(w.k)) {}
};

PYXCC_INLINE F32 product(const ByteFactor<u8>& x, const ByteWeightInRegisters<u8>& w)
{
    return fused(x.v, w.k, w.less);
}
PYXCC_INLINE F32 product(F32 x, const ByteWeightInRegisters<u8>& w) { return x * w.k; }
PYXCC_INLINE F32 product(const ByteFactor<s8>& x, const ByteWeightInRegisters<s8>& w) { return x.v * w.k; }

/// The bytes of a register, in the order that saturate() takes back.
PYXCC_INLINE Four<ByteFactor<u8>> byteFactors(U8 x)
{
    const __m256i zero = _mm256_setzero_si256(), exponent = _mm256_set1_epi16(0x4b00);
    const __m256i low = _mm256_unpacklo_epi8(x.v, zero), high = _mm256_unpackhi_epi8(x.v, zero);
    const auto factor = [](__m256i bits) PYXCC_INLINE_LAMBDA { return ByteFactor<u8>{F32(_mm256_castsi256_ps(bits))}; };
    return {factor(_mm256_unpacklo_epi16(low, exponent)), factor(_mm256_unpackhi_epi16(low, exponent)),
            factor(_mm256_unpacklo_epi16(high, exponent)), factor(_mm256_unpackhi_epi16(high, exponent))};
}

PYXCC_INLINE Four<ByteFactor<s8>> byteFactors(S8 x)
{
    const auto fours = [x](int q) PYXCC_INLINE_LAMBDA {
        const __m256i uppermost = _mm256_set_epi32(3, 2, 1, 0, 3, 2, 1, 0);
        const __m256i places = _mm256_or_si256(
            _mm256_slli_epi32(_mm256_add_epi32(uppermost, _mm256_set1_epi32(4 * q)), 24), _mm256_set1_epi32(0x808080));
        return ByteFactor<s8>{toF32(S32(_mm256_shuffle_epi8(x.v, places)))};
    };
    return {fours(0), fours(1), fours(2), fours(3)};
}

} // namespace pyxcc::wide
