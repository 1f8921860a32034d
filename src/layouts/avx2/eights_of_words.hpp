// Eight interleaved pixels of three words as a register of 32-bit lanes a channel, and back.
#pragma once

#include "layouts/avx2/interleave.hpp"

namespace pyxcc::layouts
{

namespace detail
{

/// Where a shuffle finds the words of channel `c`: of four pixels in a half of a register, two begin it, and two end it
/// 8 bytes on. Lanes of the others are cleared.
constexpr Places wordsOfPixels(int c, bool atTheEnd)
{
    Places places{};
    for (int i = 0; i < 16; ++i) {
        const int pixel = i / 4, byte = pixel * 6 + c * 2 + i % 4 - (atTheEnd ? 8 : 0);
        places[i] = i % 4 < 2 && (pixel >= 2) == atTheEnd ? static_cast<u8>(byte) : 0x80;
    }
    return places;
}

/// The other way round: where the bytes of four pixels, from `first` on, lie among the words of a register that begins
/// with those of channel `channel` and goes on with those of the next, if that is one of `channels`.
constexpr Places pixelsOfWords(int first, int channel, int channels)
{
    Places places{};
    for (int i = 0; i < 16; ++i) {
        const int word = (first + i) / 2, pixel = word / 3, of = word % 3 - channel;
        const bool here = of >= 0 && of < channels && pixel < 4;
        places[i] = here ? static_cast<u8>(8 * of + 2 * pixel + i % 2) : 0x80;
    }
    return places;
}

} // namespace detail

/// Reads 8 pixels of three unsigned words.
PYXCC_INLINE Three<wide::S32> loadEightTriplesOfWords(const u8* p)
{
    const __m256i begin = detail::lanesFrom(p, p + 24), end = detail::lanesFrom(p + 8, p + 32);
    const auto channel = [&]<int C>(std::integral_constant<int, C>) PYXCC_INLINE_LAMBDA {
        static constexpr detail::Places first = detail::wordsOfPixels(C, false), last = detail::wordsOfPixels(C, true);
        return wide::S32(_mm256_or_si256(detail::shuffle(begin, first), detail::shuffle(end, last)));
    };
    return {channel(std::integral_constant<int, 0>{}), channel(std::integral_constant<int, 1>{}),
            channel(std::integral_constant<int, 2>{})};
}

/// Writes 8 pixels of three unsigned words, saturated.
PYXCC_INLINE void storeEightTriplesOfWords(u8* p, const Three<wide::S32>& pixels)
{
    static constexpr detail::Places beginAB = detail::pixelsOfWords(0, 0, 2), beginC = detail::pixelsOfWords(0, 2, 1);
    static constexpr detail::Places endAB = detail::pixelsOfWords(16, 0, 2), endC = detail::pixelsOfWords(16, 2, 1);
    const __m256i ab = _mm256_packus_epi32(pixels.a.v, pixels.b.v), cc = _mm256_packus_epi32(pixels.c.v, pixels.c.v);
    const __m256i begin = _mm256_or_si256(detail::shuffle(ab, beginAB), detail::shuffle(cc, beginC));
    const __m256i end = _mm256_or_si256(detail::shuffle(ab, endAB), detail::shuffle(cc, endC));
    _mm_storeu_si128(reinterpret_cast<__m128i*>(p), _mm256_castsi256_si128(begin));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(p + 16), _mm256_castsi256_si128(end));
    _mm_storeu_si128(reinterpret_cast<__m128i*>(p + 24), _mm256_extracti128_si256(begin, 1));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(p + 40), _mm256_extracti128_si256(end, 1));
}

} // namespace pyxcc::layouts
