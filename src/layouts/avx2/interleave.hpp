// Between 32 interleaved pixels of bytes in memory and a register a channel.
#pragma once

#include "lanes/avx2/integers.hpp"

#include <array>

namespace pyxcc::layouts
{

namespace detail
{

PYXCC_INLINE __m256i loadWhole(const u8* p) { return _mm256_loadu_si256(reinterpret_cast<const __m256i*>(p)); }
PYXCC_INLINE void storeWhole(u8* p, __m256i v) { _mm256_storeu_si256(reinterpret_cast<__m256i*>(p), v); }

using Places = std::array<u8, 16>;

/// The same places in both 128-bit lanes, as a shuffle takes them.
PYXCC_INLINE __m256i inBothLanes(const Places& places)
{
    return _mm256_broadcastsi128_si256(_mm_loadu_si128(reinterpret_cast<const __m128i*>(places.data())));
}

/// Entry i is factor * (i - start) modulo 16.
constexpr Places stride(int factor, int start)
{
    Places places{};
    for (int i = 0; i < 16; ++i) places[i] = static_cast<u8>((factor * (i - start)) & 15);
    return places;
}

// 16 pixels of three channels are 48 bytes, or three registers. Channel c has its sample i at byte 3 i + c. Modulo 16
// these places do not clash, so that one register can hold the whole channel, each sample at its place: `mixed` is that
// register, made by taking every third byte of each of the three. 3 and 11 are inverse to each other modulo 16.
constexpr Places gather0 = stride(3, 0), gather1 = stride(3, 5), gather2 = stride(3, 10);   // place 3 i + c to i
constexpr Places spread0 = stride(11, 0), spread1 = stride(11, 1), spread2 = stride(11, 2); // i to place 3 i + c

constexpr Places everyThird(int start)
{
    Places places{};
    for (int i = start; i < 16; i += 3) places[i] = 0xff;
    return places;
}
constexpr Places secondThird = everyThird(1), lastThird = everyThird(2);

/// In each lane, the bytes whose place modulo 3 is 0 from x, 1 from y and 2 from z.
PYXCC_INLINE __m256i byThirds(__m256i x, __m256i y, __m256i z)
{
    return _mm256_blendv_epi8(_mm256_blendv_epi8(x, y, inBothLanes(secondThird)), z, inBothLanes(lastThird));
}

PYXCC_INLINE __m256i shuffle(__m256i x, const Places& places) { return _mm256_shuffle_epi8(x, inBothLanes(places)); }

} // namespace detail

/// Reads 32 pixels, 96 bytes.
PYXCC_INLINE Three<wide::U8> loadTriples(const u8* p)
{
    const __m256i first = detail::loadWhole(p), second = detail::loadWhole(p + 32), third = detail::loadWhole(p + 64);
    // x, y, z: 16 pixels in the low lanes, 16 in the high ones.
    const __m256i x = _mm256_blend_epi32(first, second, 0xf0);
    const __m256i y = _mm256_permute2x128_si256(first, third, 0x21);
    const __m256i z = _mm256_blend_epi32(second, third, 0xf0);
    return {wide::U8(detail::shuffle(detail::byThirds(x, z, y), detail::gather0)),
            wide::U8(detail::shuffle(detail::byThirds(y, x, z), detail::gather1)),
            wide::U8(detail::shuffle(detail::byThirds(z, y, x), detail::gather2))};
}

/// Writes 32 pixels, 96 bytes.
PYXCC_INLINE void storeTriples(u8* p, const Three<wide::U8>& pixels)
{
    const __m256i a = detail::shuffle(pixels.a.v, detail::spread0);
    const __m256i b = detail::shuffle(pixels.b.v, detail::spread1);
    const __m256i c = detail::shuffle(pixels.c.v, detail::spread2);
    const __m256i x = detail::byThirds(a, b, c), y = detail::byThirds(b, c, a), z = detail::byThirds(c, a, b);
    detail::storeWhole(p, _mm256_permute2x128_si256(x, y, 0x20));
    detail::storeWhole(p + 32, _mm256_blend_epi32(z, x, 0xf0));
    detail::storeWhole(p + 64, _mm256_permute2x128_si256(y, z, 0x31));
}

/// Reads 32 pixels, 128 bytes.
PYXCC_INLINE Four<wide::U8> loadQuadruples(const u8* p)
{
    // Four bytes of a channel side by side, then eight, then sixteen; the lanes come out interleaved by fours.
    constexpr detail::Places byChannel = {0, 4, 8, 12, 1, 5, 9, 13, 2, 6, 10, 14, 3, 7, 11, 15};
    const __m256i x0 = detail::shuffle(detail::loadWhole(p), byChannel);
    const __m256i x1 = detail::shuffle(detail::loadWhole(p + 32), byChannel);
    const __m256i x2 = detail::shuffle(detail::loadWhole(p + 64), byChannel);
    const __m256i x3 = detail::shuffle(detail::loadWhole(p + 96), byChannel);
    const __m256i ab0 = _mm256_unpacklo_epi32(x0, x1), ab1 = _mm256_unpacklo_epi32(x2, x3);
    const __m256i cd0 = _mm256_unpackhi_epi32(x0, x1), cd1 = _mm256_unpackhi_epi32(x2, x3);
    const __m256i inOrder = _mm256_setr_epi32(0, 4, 1, 5, 2, 6, 3, 7);
    const auto channel = [&](__m256i lanes) { return wide::U8(_mm256_permutevar8x32_epi32(lanes, inOrder)); };
    return {channel(_mm256_unpacklo_epi64(ab0, ab1)), channel(_mm256_unpackhi_epi64(ab0, ab1)),
            channel(_mm256_unpacklo_epi64(cd0, cd1)), channel(_mm256_unpackhi_epi64(cd0, cd1))};
}

namespace detail
{

/// The four registers of 8 interleaved pixels each.
PYXCC_INLINE Four<wide::U8> interleave(const Four<wide::U8>& pixels)
{
    const __m256i ab0 = _mm256_unpacklo_epi8(pixels.a.v, pixels.b.v),
                  ab1 = _mm256_unpackhi_epi8(pixels.a.v, pixels.b.v);
    const __m256i cd0 = _mm256_unpacklo_epi8(pixels.c.v, pixels.d.v),
                  cd1 = _mm256_unpackhi_epi8(pixels.c.v, pixels.d.v);
    const __m256i x0 = _mm256_unpacklo_epi16(ab0, cd0), x1 = _mm256_unpackhi_epi16(ab0, cd0);
    const __m256i x2 = _mm256_unpacklo_epi16(ab1, cd1), x3 = _mm256_unpackhi_epi16(ab1, cd1);
    return {wide::U8(_mm256_permute2x128_si256(x0, x1, 0x20)), wide::U8(_mm256_permute2x128_si256(x2, x3, 0x20)),
            wide::U8(_mm256_permute2x128_si256(x0, x1, 0x31)), wide::U8(_mm256_permute2x128_si256(x2, x3, 0x31))};
}

} // namespace detail

/// Writes 32 pixels, 128 bytes.
PYXCC_INLINE void storeQuadruples(u8* p, const Four<wide::U8>& pixels)
{
    const Four<wide::U8> x = detail::interleave(pixels);
    detail::storeWhole(p, x.a.v);
    detail::storeWhole(p + 32, x.b.v);
    detail::storeWhole(p + 64, x.c.v);
    detail::storeWhole(p + 96, x.d.v);
}

/// Writes the first three bytes of 32 pixels; each fourth byte is put back as it was.
PYXCC_INLINE void storeTriplesOfQuadruples(u8* p, const Three<wide::U8>& pixels)
{
    const Four<wide::U8> x = detail::interleave({pixels.a, pixels.b, pixels.c, wide::U8(0)});
    const __m256i fourth = _mm256_set1_epi32(static_cast<int>(0xff000000u));
    const auto store = [fourth](u8* at, wide::U8 pixels8) {
        detail::storeWhole(at, _mm256_blendv_epi8(pixels8.v, detail::loadWhole(at), fourth));
    };
    store(p, x.a);
    store(p + 32, x.b);
    store(p + 64, x.c);
    store(p + 96, x.d);
}

PYXCC_INLINE wide::U8 loadSamples(const u8* p) { return wide::U8(detail::loadWhole(p)); }
PYXCC_INLINE void storeSamples(u8* p, wide::U8 samples) { detail::storeWhole(p, samples.v); }

} // namespace pyxcc::layouts
