// Eight interleaved pixels of bytes as a register of floats a channel, and back: less work than widening all the bytes
// of a register, and fewer registers at a time.
#pragma once

#include "lanes/avx2/fine_levels.hpp"
#include "lanes/avx2/pixels.hpp"
#include "layouts/avx2/interleave.hpp"

#include <type_traits>

namespace pyxcc::layouts
{

namespace detail
{

/// Bytes that were zero-extended to double words, as floats.
template <class Byte> PYXCC_INLINE wide::F32 floatsOfBytes(__m256i x)
{
    if constexpr (std::is_signed_v<Byte>) {
        return wide::lessOffset(wide::S32(_mm256_xor_si256(x, _mm256_set1_epi32(wide::offsetByte))));
    } else {
        return toF32(wide::S32(x));
    }
}

/// The sources of a shuffle that brings bytes to double words and clears the rest: at(i) is that of double word i.
template <class At> constexpr std::array<u8, 32> zeroExtending(At at)
{
    std::array<u8, 32> places{};
    for (int i = 0; i < 32; ++i) places[i] = i % 4 == 0 ? static_cast<u8>(at(i / 4)) : 0x80;
    return places;
}

/// In each half, the four pixels' bytes of the first channel, of the third, and of the second twice; saturated.
template <class Byte> PYXCC_INLINE __m256i foursOfChannels(const Three<wide::S32>& x)
{
    const __m256i ac = _mm256_packs_epi32(x.a.v, x.c.v), bb = _mm256_packs_epi32(x.b.v, x.b.v);
    return std::is_signed_v<Byte> ? _mm256_packs_epi16(ac, bb) : _mm256_packus_epi16(ac, bb);
}

/// Where the four pixels' bytes of each channel start, and how far it is from one to the next.
struct FoursOfChannels {
    std::array<int, 3> first;
    int stride;
};

/// The sources of a shuffle that brings those to pixels of `bytes` bytes each; what is left is cleared.
constexpr Places byPixels(int bytes, const FoursOfChannels& fours = {{0, 8, 4}, 1})
{
    Places places{};
    for (int i = 0; i < 16; ++i) {
        const int pixel = i / bytes, channel = i % bytes;
        const bool used = pixel < 4 && channel < 3;
        places[i] = used ? static_cast<u8>(fours.first[channel] + pixel * fours.stride) : 0x80;
    }
    return places;
}

/// The second and the third channel in turn as bytes, saturated, and the first one with something in between.
inline constexpr FoursOfChannels foursOfPixelWords{{9, 0, 1}, 2};

PYXCC_INLINE __m256i bytesOf(const wide::PixelWords& x) { return _mm256_packus_epi16(x.others.v, x.upperFirst.v); }

/// Writes the first three quarters of each half, one behind the other.
PYXCC_INLINE void storeTwelves(u8* p, __m256i twelves)
{
    const __m256i x = _mm256_permutevar8x32_epi32(twelves, _mm256_setr_epi32(0, 1, 2, 4, 5, 6, 7, 7));
    _mm_storeu_si128(reinterpret_cast<__m128i*>(p), _mm256_castsi256_si128(x));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(p + 16), _mm256_extracti128_si256(x, 1));
}

/// Writes 8 pixels of four bytes, of which the fourth are zero; each fourth byte is put back as it was.
PYXCC_INLINE void storeUnderFourths(u8* p, __m256i pixels)
{
    const __m256i fourths = _mm256_set1_epi32(static_cast<int>(0xff000000u));
    storeWhole(p, _mm256_or_si256(pixels, _mm256_and_si256(loadWhole(p), fourths)));
}

} // namespace detail

/// Reads 8 pixels of three or four bytes as they lie.
template <int PixelBytes> PYXCC_INLINE wide::Pixels<PixelBytes> loadEight(const u8* p)
{
    if constexpr (PixelBytes == 4) {
        return wide::Pixels<4>(detail::loadWhole(p));
    } else {
        // The upper half of the register ends where the pixels end.
        return wide::Pixels<3>(detail::lanesFrom(p, p + 8));
    }
}

namespace detail
{

/// The sources of a shuffle that brings channels to the upper bytes of words, four pixels' words of the one and then of
/// the other.
template <int PixelBytes, int First, int Second>
constexpr std::array<u8, 32> upperBytes = [] {
    std::array<u8, 32> places{};
    for (int i = 0; i < 32; ++i) {
        const int channel = i % 16 < 8 ? First : Second, pixel = i / 16 * 4 + i % 8 / 2;
        const bool used = i % 2 != 0 && channel != none;
        places[i] = used ? static_cast<u8>(wide::Pixels<PixelBytes>::placeOf(pixel, channel)) : 0x80;
    }
    return places;
}();

/// The channels of 16 pixels as words.
template <int PixelBytes> PYXCC_INLINE Three<wide::Sample> loadSixteen(const u8* p)
{
    const __m256i x = loadEight<PixelBytes>(p).v, y = loadEight<PixelBytes>(p + std::ptrdiff_t{8} * PixelBytes).v;
    const auto words = [](__m256i eight, const std::array<u8, 32>& places)
                           PYXCC_INLINE_LAMBDA { return _mm256_shuffle_epi8(eight, loadWhole(places.data())); };
    const auto sample = [](__m256i in256ths) PYXCC_INLINE_LAMBDA {
        return wide::Sample{wide::S16(_mm256_srli_epi16(in256ths, 8)), wide::U16(in256ths)};
    };
    const __m256i abX = words(x, upperBytes<PixelBytes, 0, 1>), abY = words(y, upperBytes<PixelBytes, 0, 1>);
    const __m256i cX = words(x, upperBytes<PixelBytes, 2, none>), cY = words(y, upperBytes<PixelBytes, none, 2>);
    return {sample(_mm256_unpacklo_epi64(abX, abY)), sample(_mm256_unpackhi_epi64(abX, abY)),
            sample(_mm256_or_si256(cX, cY))};
}

} // namespace detail

/// Reads 32 pixels of three or four bytes, the first three channels of which come as words. Narrowed to bytes they
/// stand where loadQuadruples() puts them.
template <int PixelBytes> PYXCC_INLINE Two<Three<wide::Sample>> loadAsWords(const u8* p)
{
    return {detail::loadSixteen<PixelBytes>(p), detail::loadSixteen<PixelBytes>(p + std::ptrdiff_t{16} * PixelBytes)};
}

/// Writes 8 pixels of three bytes, saturated.
PYXCC_INLINE void storeEightTriples(u8* p, const wide::PixelWords& pixels)
{
    using namespace detail;
    storeTwelves(p, shuffle(bytesOf(pixels), byPixels(3, foursOfPixelWords)));
}

/// Writes the first three bytes of 8 pixels of four, saturated; each fourth byte is put back as it was.
PYXCC_INLINE void storeEightQuadruples(u8* p, const wide::PixelWords& pixels)
{
    using namespace detail;
    storeUnderFourths(p, shuffle(bytesOf(pixels), byPixels(4, foursOfPixelWords)));
}

/// Reads 8 pixels of three bytes.
template <class Byte> PYXCC_INLINE Three<wide::F32> loadEightTriples(const u8* p)
{
    const __m256i x = loadEight<3>(p).v;
    const auto channel = [x]<int C>(std::integral_constant<int, C>) PYXCC_INLINE_LAMBDA {
        static constexpr auto places = detail::zeroExtending([](int i) { return 3 * i + C - (i < 4 ? 0 : 8); });
        return detail::floatsOfBytes<Byte>(_mm256_shuffle_epi8(x, detail::loadWhole(places.data())));
    };
    return {channel(std::integral_constant<int, 0>{}), channel(std::integral_constant<int, 1>{}),
            channel(std::integral_constant<int, 2>{})};
}

/// Writes 8 pixels of three bytes, saturated.
template <class Byte> PYXCC_INLINE void storeEightTriples(u8* p, const Three<wide::S32>& pixels)
{
    detail::storeTwelves(p, detail::shuffle(detail::foursOfChannels<Byte>(pixels), detail::byPixels(3)));
}

namespace detail
{

/// The sources of a shuffle that brings the levels of channel `c` to where they go in pixels of three bytes.
constexpr Places ofFineLevels(int c)
{
    Places places{};
    for (int i = 0; i < 16; ++i) places[i] = i < 12 && i % 3 == c ? static_cast<u8>(i / 3 * 4 + 2) : 0x80;
    return places;
}

} // namespace detail

/// The same with what is behind the point cut off.
template <class Byte> PYXCC_INLINE void storeEightTriples(u8* p, const Three<FineLevel<wide::S32>>& pixels)
{
    using namespace detail;
    static constexpr Places a = ofFineLevels(0), b = ofFineLevels(1), c = ofFineLevels(2);
    const __m256i ab = _mm256_or_si256(shuffle(pixels.a.in65536ths.v, a), shuffle(pixels.b.in65536ths.v, b));
    storeTwelves(p, _mm256_or_si256(ab, shuffle(pixels.c.in65536ths.v, c)));
}

/// Reads the first three bytes of 8 pixels of four.
template <class Byte> PYXCC_INLINE Three<wide::F32> loadEightQuadruples(const u8* p)
{
    const __m256i x = detail::loadWhole(p);
    const auto channel = [x]<int C>(std::integral_constant<int, C>) PYXCC_INLINE_LAMBDA {
        static constexpr auto places = detail::zeroExtending([](int i) { return i % 4 * 4 + C; });
        return detail::floatsOfBytes<Byte>(_mm256_shuffle_epi8(x, detail::loadWhole(places.data())));
    };
    return {detail::floatsOfBytes<Byte>(_mm256_and_si256(x, _mm256_set1_epi32(0xff))),
            channel(std::integral_constant<int, 1>{}), channel(std::integral_constant<int, 2>{})};
}

/// Writes the first three bytes of 8 pixels of four, saturated; each fourth byte is put back as it was.
template <class Byte> PYXCC_INLINE void storeEightQuadruples(u8* p, const Three<wide::S32>& pixels)
{
    detail::storeUnderFourths(p, detail::shuffle(detail::foursOfChannels<Byte>(pixels), detail::byPixels(4)));
}

} // namespace pyxcc::layouts
