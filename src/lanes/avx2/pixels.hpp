// Pixels of bytes as operands of multiply-adds: two channels of a pixel side by side, as the two words of a double
// word. Sums of products so take no more than the multiply-adds and an addition, whose upper halves are the results.
#pragma once

#include "lanes/avx2/exact_sum.hpp"

#include <array>

namespace pyxcc::wide
{

/// Two words of 8 pixels.
struct WordPairs : Integers {
    WordPairs() = default;
    PYXCC_INLINE explicit WordPairs(__m256i value) : Integers(value) {}
    PYXCC_INLINE WordPairs(int lower, int upper)
        : Integers(_mm256_set1_epi32((lower & 0xffff) | static_cast<int>(static_cast<u32>(upper) << 16)))
    {
    }

    friend PYXCC_INLINE WordPairs operator-(WordPairs x, WordPairs y) { return WordPairs(_mm256_sub_epi16(x.v, y.v)); }
    friend PYXCC_INLINE WordPairs operator+(WordPairs x, const Two<int>& k)
    {
        return WordPairs(_mm256_add_epi16(x.v, WordPairs(k.a, k.b).v));
    }
    friend PYXCC_INLINE WordPairs operator-(WordPairs x, const Two<int>& k)
    {
        return WordPairs(_mm256_sub_epi16(x.v, WordPairs(k.a, k.b).v));
    }
    friend PYXCC_INLINE WordPairs operator<<(WordPairs x, int n) { return WordPairs(_mm256_slli_epi16(x.v, n)); }
};

/// High halves of the products of both words.
template <int Lower, int Upper> PYXCC_INLINE WordPairs mulHighS16(WordPairs x)
{
    return WordPairs(_mm256_mulhi_epi16(x.v, WordPairs(Lower, Upper).v));
}

/// Rounded products of both words, of which 15 bits are dropped.
template <int Lower, int Upper> PYXCC_INLINE WordPairs mulRound15(WordPairs x)
{
    return WordPairs(_mm256_mulhrs_epi16(x.v, WordPairs(Lower, Upper).v));
}

/// The products of both words, added up.
template <int Lower, int Upper> PYXCC_INLINE S32 sumOfProducts(WordPairs x)
{
    static_assert(Lower >= -32768 && Lower <= 32767 && Upper >= -32768 && Upper <= 32767);
    return S32(_mm256_madd_epi16(x.v, WordPairs(Lower, Upper).v));
}

/// The lower half in both places.
PYXCC_INLINE WordPairs twice(S32 x)
{
    const __m256i places = _mm256_setr_epi8(0, 1, 0, 1, 4, 5, 4, 5, 8, 9, 8, 9, 12, 13, 12, 13, 0, 1, 0, 1, 4, 5, 4, 5,
                                            8, 9, 8, 9, 12, 13, 12, 13);
    return WordPairs(_mm256_shuffle_epi8(x.v, places));
}

/// High halves of the products of the upper halves.
template <int Weight> PYXCC_INLINE S32 upperMulHighS16(S32 x) { return S32(mulHighS16<0, Weight>(WordPairs(x.v)).v); }

/// 8 pixels of bytes, 3 or 4 each, as a load of them leaves them: those of 3 bytes overlap in the middle, since the
/// upper half ends where the pixels end.
template <int PixelBytes> struct Pixels : Integers {
    static constexpr int count = 8;

    Pixels() = default;
    PYXCC_INLINE explicit Pixels(__m256i value) : Integers(value) {}

    /// The place of a channel of double word i.
    static constexpr int placeOf(int i, int channel)
    {
        const int pixel = i % 4, upperStart = PixelBytes == 3 ? 4 : 0;
        return pixel * PixelBytes + channel + (i < 4 ? 0 : upperStart);
    }

    /// The sources of a shuffle that brings channels to the bytes of double words.
    static constexpr std::array<u8, 32> placesOf(const std::array<int, 4>& channels)
    {
        std::array<u8, 32> places{};
        for (int i = 0; i < 32; ++i) {
            const int channel = channels[i % 4];
            places[i] = channel == none ? 0x80 : static_cast<u8>(placeOf(i / 4, channel));
        }
        return places;
    }

    template <int... Channels> PYXCC_INLINE __m256i bytes() const
    {
        static constexpr std::array<u8, 32> places = placesOf({Channels...});
        return _mm256_shuffle_epi8(v, _mm256_loadu_si256(reinterpret_cast<const __m256i*>(places.data())));
    }
};

/// Two channels as words.
template <int Lower, int Upper, int PixelBytes> PYXCC_INLINE WordPairs wordsOf(const Pixels<PixelBytes>& pixels)
{
    return WordPairs(pixels.template bytes<Lower, none, Upper, none>());
}

/// The weighted sum of the channels, of which the upper half counts, and has to keep within 16 bits. What the weights
/// are beyond 16 bits is added to that half by itself.
template <int A, int B, int C, int PixelBytes> PYXCC_INLINE S32 upperSum(const Pixels<PixelBytes>& pixels)
{
    constexpr detail::SplitWeight a(A, 16), b(B, 16), c(C, 16);
    const WordPairs ab = wordsOf<0, 1>(pixels), upperC = wordsOf<none, 2>(pixels);
    __m256i sum = (sumOfProducts<a.rest, b.rest>(ab) + sumOfProducts<0, c.rest>(upperC)).v;
    if constexpr (a.whole == 0 && b.whole == 1) {
        sum = _mm256_add_epi16(sum, ab.v);
    } else if constexpr (a.whole != 0 || b.whole != 0) {
        constexpr u32 wholes = (static_cast<u32>(a.whole) & 0xff) << 16 | static_cast<u32>(b.whole) << 24;
        const __m256i upperAB = pixels.template bytes<none, none, 0, 1>();
        sum = _mm256_add_epi16(sum, _mm256_maddubs_epi16(upperAB, _mm256_set1_epi32(static_cast<int>(wholes))));
    }
    static_assert(c.whole == 0 || c.whole == 1);
    if constexpr (c.whole == 1) sum = _mm256_add_epi16(sum, upperC.v);
    return S32(sum);
}

/// The samples of 8 pixels, which saturate on their way to bytes: the first ones as upper halves, the others as words.
struct PixelWords {
    S32 upperFirst;
    WordPairs others;
};

PYXCC_INLINE PixelWords pixelWords(S32 upperFirst, WordPairs others) { return {upperFirst, others}; }

PYXCC_INLINE PixelWords asPixelWords(const PixelWords& x) { return x; }
PYXCC_INLINE PixelWords asPixelWords(const Three<S32>& upper)
{
    return {upper.a, WordPairs(_mm256_blend_epi16(_mm256_srli_epi32(upper.b.v, 16), upper.c.v, 0xaa))};
}

} // namespace pyxcc::wide
