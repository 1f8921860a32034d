// Sixteen interleaved pixels of three bytes as two registers of factors a channel, and back. The first register has the
// outer pixels, 0 to 3 and 12 to 15, the second one those in between, so that a load reads the latter as they lie.
#pragma once

#include "lanes/avx2/byte_factors.hpp"
#include "layouts/avx2/interleave.hpp"

#include <type_traits>

namespace pyxcc::layouts
{

/// What these pixels' bytes are multiplied as: unsigned ones as floats, which takes fewer registers than to leave the
/// conversion to the products.
template <class Byte> using Factor = std::conditional_t<std::is_signed_v<Byte>, wide::ByteFactor<s8>, wide::F32>;

namespace detail
{

/// Where the four pixels of each half of a register begin.
using Halves = std::array<int, 2>;

/// The sources of a shuffle that makes double words of a channel's bytes: of unsigned ones the lowest byte, of signed
/// ones the uppermost.
template <class Byte> constexpr std::array<u8, 32> toDoubleWords(const Halves& halves, int channel)
{
    constexpr int place = std::is_signed_v<Byte> ? 3 : 0;
    std::array<u8, 32> places{};
    for (int i = 0; i < 32; ++i)
        places[i] = i % 4 == place ? static_cast<u8>(halves[i / 16] + i % 16 / 4 * 3 + channel) : 0x80;
    return places;
}

template <class Byte, int First, int Second> PYXCC_INLINE auto factorsOf(__m256i x)
{
    const auto channel = [x]<int C>(std::integral_constant<int, C>) PYXCC_INLINE_LAMBDA {
        static constexpr auto places = toDoubleWords<Byte>({First, Second}, C);
        return Factor<Byte>{toF32(wide::S32(_mm256_shuffle_epi8(x, loadWhole(places.data()))))};
    };
    return Three{channel(std::integral_constant<int, 0>{}), channel(std::integral_constant<int, 1>{}),
                 channel(std::integral_constant<int, 2>{})};
}

/// The sources of a shuffle that brings four pixels' bytes in each half to where they go: byte i of the pixels of a
/// half to i + shift of it, around its end. What is left is cleared.
constexpr std::array<u8, 32> toPixels(int second, const std::array<int, 2>& shift)
{
    std::array<u8, 32> places{};
    for (int i = 0; i < 32; ++i) {
        const int byte = (i % 16 - shift[i / 16] + 16) % 16, channel = byte % 3;
        const int first = channel == 0 ? 0 : channel == 1 ? second : 4;
        places[i] = byte < 12 ? static_cast<u8>(first + byte / 3) : 0x80;
    }
    return places;
}

} // namespace detail

/// Reads 16 pixels: the outer ones, and the inner ones.
template <class Byte> PYXCC_INLINE Two<Three<Factor<Byte>>> loadSixteenTriples(const u8* p)
{
    const __m128i low = _mm_loadu_si128(reinterpret_cast<const __m128i*>(p));
    const __m128i high = _mm_loadu_si128(reinterpret_cast<const __m128i*>(p + 32));
    const __m256i outer = _mm256_inserti128_si256(_mm256_castsi128_si256(low), high, 1);
    return {detail::factorsOf<Byte, 0, 4>(outer), detail::factorsOf<Byte, 4, 0>(detail::loadWhole(p + 8))};
}

/// Writes 16 pixels, saturated.
template <class Byte> PYXCC_INLINE void storeSixteenTriples(u8* p, const Two<Three<wide::S32>>& pixels)
{
    const auto& [outer, inner] = pixels;
    const auto narrowed = [](__m256i x, __m256i y) PYXCC_INLINE_LAMBDA {
        return std::is_signed_v<Byte> ? _mm256_packs_epi16(x, y) : _mm256_packus_epi16(x, y);
    };
    // In each half fours of the first channel, the third, the second of the outer pixels and that of the inner ones.
    const __m256i seconds = _mm256_packs_epi32(outer.b.v, inner.b.v);
    const __m256i x = narrowed(_mm256_packs_epi32(outer.a.v, outer.c.v), seconds);
    const __m256i y = narrowed(_mm256_packs_epi32(inner.a.v, inner.c.v), seconds);
    static constexpr auto outerPlaces = detail::toPixels(8, {0, 4}), innerPlaces = detail::toPixels(12, {12, 8});
    const __m256i ofOuter = _mm256_shuffle_epi8(x, detail::loadWhole(outerPlaces.data()));
    const __m256i ofInner = _mm256_shuffle_epi8(y, detail::loadWhole(innerPlaces.data()));
    // The inner pixels reach into the first and the last 16 bytes.
    const __m256i ends = _mm256_blend_epi32(ofOuter, ofInner, 0x18);
    const auto at = [p](int i) PYXCC_INLINE_LAMBDA { return reinterpret_cast<__m128i*>(p + i); };
    _mm_storeu_si128(at(0), _mm256_castsi256_si128(ends));
    _mm_storeu_si128(at(16), _mm256_extracti128_si256(ofInner, 1));
    _mm_storel_epi64(at(16), _mm256_castsi256_si128(ofInner));
    _mm_storeu_si128(at(32), _mm256_extracti128_si256(ends, 1));
}

} // namespace pyxcc::layouts
