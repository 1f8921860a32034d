// Between interleaved pixels in memory and a register a channel, for samples of 1, 2, 4 and 8 bytes: a block is as many
// pixels as a register has samples. Registers here are what they are in memory, 32 bytes.
#pragma once

#include "lanes/avx2/samples.hpp"

#include <array>
#include <utility>

namespace pyxcc::layouts
{

template <class Samples> inline constexpr int sampleBytes = 32 / Samples::count;

/// The order of a block's pixels in a register: that of memory, or whatever is the least work for pixels of four
/// samples, which never need to cross the halves of a register; or that of two registers of words that are narrowed,
/// for words in the order of memory. The stores take each back.
enum class Order { ofMemory, any, ofWords };

/// Stores go to the cache, or past it at addresses that are multiples of 32.
enum class Stores { cached, streamed };

namespace detail
{

PYXCC_INLINE __m256i loadWhole(const u8* p) { return _mm256_loadu_si256(reinterpret_cast<const __m256i*>(p)); }
PYXCC_INLINE void storeWhole(u8* p, __m256i v) { _mm256_storeu_si256(reinterpret_cast<__m256i*>(p), v); }
PYXCC_INLINE void storeLane(u8* p, __m128i v) { _mm_storeu_si128(reinterpret_cast<__m128i*>(p), v); }

/// 16 bytes from p and as many from q, a lane each.
PYXCC_INLINE __m256i lanesFrom(const u8* p, const u8* q)
{
    const __m128i low = _mm_loadu_si128(reinterpret_cast<const __m128i*>(p));
    const __m128i high = _mm_loadu_si128(reinterpret_cast<const __m128i*>(q));
    return _mm256_inserti128_si256(_mm256_castsi128_si256(low), high, 1);
}

template <Stores stores> PYXCC_INLINE void put(u8* p, __m256i v)
{
    if constexpr (stores == Stores::streamed) {
        _mm256_stream_si256(reinterpret_cast<__m256i*>(p), v);
    } else {
        storeWhole(p, v);
    }
}

template <class Samples> PYXCC_INLINE Samples as(__m256i v) { return Samples(v); }
template <> PYXCC_INLINE wide::F32 as<wide::F32>(__m256i v) { return wide::F32(_mm256_castsi256_ps(v)); }
template <> PYXCC_INLINE wide::F64 as<wide::F64>(__m256i v) { return wide::F64(_mm256_castsi256_pd(v)); }

template <class Samples> PYXCC_INLINE __m256i raw(Samples x) { return x.v; }
PYXCC_INLINE __m256i raw(wide::F32 x) { return _mm256_castps_si256(x.v); }
PYXCC_INLINE __m256i raw(wide::F64 x) { return _mm256_castpd_si256(x.v); }

using Places = std::array<u8, 16>;

/// The places of samples in a 128-bit lane as those of their bytes.
template <int Bytes, class PlaceOf> constexpr Places placesOfBytes(PlaceOf placeOf)
{
    Places places{};
    for (int i = 0; i < 16; ++i) places[i] = static_cast<u8>(placeOf(i / Bytes) * Bytes + i % Bytes);
    return places;
}

/// The same places in both 128-bit lanes, as a shuffle takes them.
PYXCC_INLINE __m256i inBothLanes(const Places& places)
{
    return _mm256_broadcastsi128_si256(_mm_loadu_si128(reinterpret_cast<const __m128i*>(places.data())));
}

PYXCC_INLINE __m256i shuffle(__m256i x, const Places& places) { return _mm256_shuffle_epi8(x, inBothLanes(places)); }

// As many pixels of three channels as a 128-bit lane has samples fill three lanes. Channel c has its sample i at place
// 3 i + c of them. Modulo the number of samples in a lane, which is a power of two, these places do not clash, so that
// one lane can hold the whole channel, each sample at its place: it is made by taking every third sample of each of the
// three, and a shuffle brings the samples into order.
template <int Bytes> struct Thirds {
    static constexpr int samples = 16 / Bytes;
    static constexpr int inverseOf3 = 3; // modulo `samples`

    /// Place 3 i + c to place i.
    template <int C> static PYXCC_INLINE __m256i gather(__m256i x)
    {
        return rearrange([](int i) { return (3 * i + C) % samples; }, x);
    }
    /// Place i to place 3 i + c.
    template <int C> static PYXCC_INLINE __m256i spread(__m256i x)
    {
        return rearrange([](int i) { return inverseOf3 * (i - C + samples) % samples; }, x);
    }

    /// In each lane, the samples whose place modulo 3 is 0 from x, 1 from y and 2 from z.
    static PYXCC_INLINE __m256i blend(__m256i x, __m256i y, __m256i z)
    {
        if constexpr (Bytes == 8) {
            return _mm256_blend_epi32(x, y, 0xcc);
        } else if constexpr (Bytes == 4) {
            return _mm256_blend_epi32(_mm256_blend_epi32(x, y, 0x22), z, 0x44);
        } else {
            static_assert(Bytes == 2);
            return _mm256_blend_epi16(_mm256_blend_epi16(x, y, 0x92), z, 0x24);
        }
    }

private:
    /// Brings place placeOf(i) to place i.
    template <class PlaceOf> static PYXCC_INLINE __m256i rearrange(PlaceOf placeOf, __m256i x)
    {
        if constexpr (Bytes == 8) {
            return placeOf(0) == 0 ? x : _mm256_shuffle_epi32(x, 0x4e);
        } else if constexpr (Bytes == 4) {
            constexpr int places = placeOf(0) | placeOf(1) << 2 | placeOf(2) << 4 | placeOf(3) << 6;
            return _mm256_shuffle_epi32(x, places);
        } else {
            return shuffle(x, placesOfBytes<Bytes>(placeOf));
        }
    }
};

/// Pixels of three units in their lanes: the first lanes of a, b and c make three, and so do the second ones.
template <int Bytes> PYXCC_INLINE Three<wide::U8> triplesInLanes(__m256i a, __m256i b, __m256i c)
{
    using Thirds = detail::Thirds<Bytes>;
    a = Thirds::template spread<0>(a);
    b = Thirds::template spread<1>(b);
    c = Thirds::template spread<2>(c);
    constexpr bool afterFirst = Thirds::samples % 3 == 1;
    const wide::U8 y(Thirds::blend(b, c, a)), z(Thirds::blend(c, a, b));
    return {wide::U8(Thirds::blend(a, b, c)), afterFirst ? y : z, afterFirst ? z : y};
}

/// Low or high halves of the 128-bit lanes, interleaved by elements of `Bytes`.
template <int Bytes> PYXCC_INLINE __m256i unpackLow(__m256i x, __m256i y)
{
    if constexpr (Bytes == 1) return _mm256_unpacklo_epi8(x, y);
    if constexpr (Bytes == 2) return _mm256_unpacklo_epi16(x, y);
    if constexpr (Bytes == 4) return _mm256_unpacklo_epi32(x, y);
    if constexpr (Bytes == 8) return _mm256_unpacklo_epi64(x, y);
}
template <int Bytes> PYXCC_INLINE __m256i unpackHigh(__m256i x, __m256i y)
{
    if constexpr (Bytes == 1) return _mm256_unpackhi_epi8(x, y);
    if constexpr (Bytes == 2) return _mm256_unpackhi_epi16(x, y);
    if constexpr (Bytes == 4) return _mm256_unpackhi_epi32(x, y);
    if constexpr (Bytes == 8) return _mm256_unpackhi_epi64(x, y);
}

/// Where the bytes of a channel go in a third of 48 bytes; the others are zero.
template <int Third, int Channel>
constexpr Places placesInThird = [] {
    Places places{};
    for (int i = 0; i < 16; ++i) {
        const int at = 16 * Third + i;
        places[i] = static_cast<u8>(at % 3 == Channel ? at / 3 : 0x80);
    }
    return places;
}();

/// Writes the low lanes of N registers one after the other, then the high ones: stores instead of the shuffles that it
/// takes to write whole registers. This is register `i`.
template <int N> PYXCC_INLINE void storeLanes(u8* p, int i, __m256i x)
{
    storeLane(p + std::ptrdiff_t{16} * i, _mm256_castsi256_si128(x));
    storeLane(p + std::ptrdiff_t{16} * (N + i), _mm256_extracti128_si256(x, 1));
}

/// The same with whole registers, which are what goes past the cache.
template <Stores stores> PYXCC_INLINE void putThirds(u8* p, __m256i x, __m256i y, __m256i z)
{
    put<stores>(p, _mm256_permute2x128_si256(x, y, 0x20));
    put<stores>(p + 32, _mm256_blend_epi32(z, x, 0xf0));
    put<stores>(p + 64, _mm256_permute2x128_si256(y, z, 0x31));
}

/// Four bytes of each channel side by side, of pixels of three that start at byte `Start` of a lane.
template <int Start>
constexpr Places foursOfTriples = placesOfBytes<1>([](int i) { return Start + i % 4 * 3 + i / 4; });

/// Four registers with four bytes of each channel in a lane to a register a channel, in which each lane has those of
/// the first register, then those of the second and so on.
PYXCC_INLINE Four<wide::U8> channelsOfFours(__m256i x0, __m256i x1, __m256i x2, __m256i x3)
{
    const __m256i ab0 = _mm256_unpacklo_epi32(x0, x1), ab1 = _mm256_unpacklo_epi32(x2, x3);
    const __m256i cd0 = _mm256_unpackhi_epi32(x0, x1), cd1 = _mm256_unpackhi_epi32(x2, x3);
    return {wide::U8(_mm256_unpacklo_epi64(ab0, ab1)), wide::U8(_mm256_unpackhi_epi64(ab0, ab1)),
            wide::U8(_mm256_unpacklo_epi64(cd0, cd1)), wide::U8(_mm256_unpackhi_epi64(cd0, cd1))};
}

} // namespace detail

/// Reads a block of pixels of three samples, 96 bytes.
template <class Samples> PYXCC_INLINE Three<Samples> loadTriples(const u8* p)
{
    using Thirds = detail::Thirds<sampleBytes<Samples>>;
    const __m256i first = detail::loadWhole(p), second = detail::loadWhole(p + 32), third = detail::loadWhole(p + 64);
    // x, y, z: half of the block in the low lanes, the other half in the high ones.
    const __m256i x = _mm256_blend_epi32(first, second, 0xf0);
    const __m256i middle = _mm256_permute2x128_si256(first, third, 0x21);
    const __m256i end = _mm256_blend_epi32(second, third, 0xf0);
    // A lane ends within a pixel, after its first sample or its second: two lanes change their parts.
    constexpr bool afterFirst = Thirds::samples % 3 == 1;
    const __m256i y = afterFirst ? middle : end, z = afterFirst ? end : middle;
    return {detail::as<Samples>(Thirds::template gather<0>(Thirds::blend(x, z, y))),
            detail::as<Samples>(Thirds::template gather<1>(Thirds::blend(y, x, z))),
            detail::as<Samples>(Thirds::template gather<2>(Thirds::blend(z, y, x)))};
}

/// Bytes come four pixels to a lane, as those of four samples do.
template <class Samples>
requires(sampleBytes<Samples> == 1) PYXCC_INLINE Three<Samples> loadTriples(const u8* p)
{
    // The last four end where the block does.
    const auto lanes = [p](int at) PYXCC_INLINE_LAMBDA { return detail::lanesFrom(p + at, p + 48 + at); };
    const Four<wide::U8> pixels = detail::channelsOfFours(
        detail::shuffle(lanes(0), detail::foursOfTriples<0>), detail::shuffle(lanes(12), detail::foursOfTriples<0>),
        detail::shuffle(lanes(24), detail::foursOfTriples<0>), detail::shuffle(lanes(32), detail::foursOfTriples<4>));
    return {detail::as<Samples>(pixels.a.v), detail::as<Samples>(pixels.b.v), detail::as<Samples>(pixels.c.v)};
}

/// Writes a block of pixels of three samples, 96 bytes.
template <Stores stores = Stores::cached, class Samples>
PYXCC_INLINE void storeTriples(u8* p, const Three<Samples>& pixels)
{
    const auto [x, y, z] = detail::triplesInLanes<sampleBytes<Samples>>(detail::raw(pixels.a), detail::raw(pixels.b),
                                                                        detail::raw(pixels.c));
    detail::putThirds<stores>(p, x.v, y.v, z.v);
}

/// Bytes: each third takes its own of every channel.
template <Stores stores = Stores::cached, class Samples>
requires(sampleBytes<Samples> == 1) PYXCC_INLINE void storeTriples(u8* p, const Three<Samples>& pixels)
{
    const auto third = [&]<int T>(std::integral_constant<int, T>) PYXCC_INLINE_LAMBDA {
        const __m256i a = detail::shuffle(detail::raw(pixels.a), detail::placesInThird<T, 0>);
        const __m256i b = detail::shuffle(detail::raw(pixels.b), detail::placesInThird<T, 1>);
        const __m256i c = detail::shuffle(detail::raw(pixels.c), detail::placesInThird<T, 2>);
        return _mm256_or_si256(_mm256_or_si256(a, b), c);
    };
    const __m256i x = third(std::integral_constant<int, 0>{});
    const __m256i y = third(std::integral_constant<int, 1>{});
    const __m256i z = third(std::integral_constant<int, 2>{});
    if constexpr (stores == Stores::streamed) {
        detail::putThirds<stores>(p, x, y, z);
    } else {
        detail::storeLanes<3>(p, 0, x);
        detail::storeLanes<3>(p, 1, y);
        detail::storeLanes<3>(p, 2, z);
    }
}

/// Reads a block of pixels of four samples, 128 bytes.
template <class Samples, Order order = Order::ofMemory> PYXCC_INLINE Four<Samples> loadQuadruples(const u8* p)
{
    // The lanes come out interleaved by fours.
    const auto fours = [p](int at) PYXCC_INLINE_LAMBDA {
        constexpr int bytes = sampleBytes<Samples>;
        const __m256i x = detail::loadWhole(p + at);
        if constexpr (bytes == 4) {
            return x;
        } else {
            constexpr int pixels = 4 / bytes;
            return detail::shuffle(x, detail::placesOfBytes<bytes>([](int i) { return i % pixels * 4 + i / pixels; }));
        }
    };
    const __m256i x0 = fours(0), x1 = fours(32), x2 = fours(64), x3 = fours(96);
    const Four<wide::U8> lanes = detail::channelsOfFours(x0, x1, x2, x3);
    const __m256i inOrder = _mm256_setr_epi32(0, 4, 1, 5, 2, 6, 3, 7);
    const auto channel = [&](const wide::U8& x) PYXCC_INLINE_LAMBDA {
        return detail::as<Samples>(order == Order::any ? x.v : _mm256_permutevar8x32_epi32(x.v, inOrder));
    };
    return {channel(lanes.a), channel(lanes.b), channel(lanes.c), channel(lanes.d)};
}

/// Pixels of four doubles come in the order of memory, which takes no work.
template <class Samples, Order order = Order::ofMemory>
requires(sampleBytes<Samples> == 8) PYXCC_INLINE Four<Samples> loadQuadruples(const u8* p)
{
    // Half a pixel, and the same half of the next but one.
    const auto halves = [p](int at) PYXCC_INLINE_LAMBDA { return detail::lanesFrom(p + at, p + at + 64); };
    const __m256i ab0 = halves(0), cd0 = halves(16), ab1 = halves(32), cd1 = halves(48);
    return {detail::as<Samples>(_mm256_unpacklo_epi64(ab0, ab1)), detail::as<Samples>(_mm256_unpackhi_epi64(ab0, ab1)),
            detail::as<Samples>(_mm256_unpacklo_epi64(cd0, cd1)), detail::as<Samples>(_mm256_unpackhi_epi64(cd0, cd1))};
}

namespace detail
{

/// The four registers of interleaved pixels, in the order of memory if that of the samples is any.
template <class Samples> PYXCC_INLINE Four<wide::U8> interleave(const Four<Samples>& pixels)
{
    constexpr int bytes = sampleBytes<Samples>;
    const __m256i a = raw(pixels.a), b = raw(pixels.b), c = raw(pixels.c), d = raw(pixels.d);
    const __m256i ab0 = unpackLow<bytes>(a, b), ab1 = unpackHigh<bytes>(a, b);
    const __m256i cd0 = unpackLow<bytes>(c, d), cd1 = unpackHigh<bytes>(c, d);
    const __m256i x0 = unpackLow<2 * bytes>(ab0, cd0), x1 = unpackHigh<2 * bytes>(ab0, cd0);
    const __m256i x2 = unpackLow<2 * bytes>(ab1, cd1), x3 = unpackHigh<2 * bytes>(ab1, cd1);
    return {wide::U8(x0), wide::U8(x1), wide::U8(x2), wide::U8(x3)};
}

/// The same for samples in either order.
template <Order order, class Samples> PYXCC_INLINE Four<wide::U8> interleaveInOrder(const Four<Samples>& pixels)
{
    const Four<wide::U8> x = interleave(pixels);
    if constexpr (order == Order::any) return x;
    return {wide::U8(_mm256_permute2x128_si256(x.a.v, x.b.v, 0x20)),
            wide::U8(_mm256_permute2x128_si256(x.c.v, x.d.v, 0x20)),
            wide::U8(_mm256_permute2x128_si256(x.a.v, x.b.v, 0x31)),
            wide::U8(_mm256_permute2x128_si256(x.c.v, x.d.v, 0x31))};
}

} // namespace detail

/// Writes a block of pixels of four samples, 128 bytes.
template <Order order = Order::ofMemory, Stores stores = Stores::cached, class Samples>
PYXCC_INLINE void storeQuadruples(u8* p, const Four<Samples>& pixels)
{
    if constexpr (order == Order::ofWords) {
        static_assert(sampleBytes<Samples> == 1 && stores == Stores::cached);
        const Four<wide::U8> x = detail::interleave(pixels);
        detail::storeLanes<2>(p, 0, x.a.v);
        detail::storeLanes<2>(p, 1, x.b.v);
        detail::storeLanes<2>(p + 64, 0, x.c.v);
        detail::storeLanes<2>(p + 64, 1, x.d.v);
    } else if constexpr (sampleBytes<Samples> == 1 && order == Order::ofMemory && stores == Stores::cached) {
        const Four<wide::U8> x = detail::interleave(pixels);
        detail::storeLanes<4>(p, 0, x.a.v);
        detail::storeLanes<4>(p, 1, x.b.v);
        detail::storeLanes<4>(p, 2, x.c.v);
        detail::storeLanes<4>(p, 3, x.d.v);
    } else {
        const Four<wide::U8> x = detail::interleaveInOrder<order>(pixels);
        detail::put<stores>(p, x.a.v);
        detail::put<stores>(p + 32, x.b.v);
        detail::put<stores>(p + 64, x.c.v);
        detail::put<stores>(p + 96, x.d.v);
    }
}

/// Writes 32 bytes of pixels of four samples; each fourth sample is put back as it was.
template <class Samples> PYXCC_INLINE void storeButFourths(u8* p, Samples samples)
{
    constexpr int bytes = sampleBytes<Samples>;
    const __m256i v = detail::raw(samples), old = detail::loadWhole(p);
    if constexpr (bytes == 4) {
        detail::storeWhole(p, _mm256_blend_epi32(v, old, 0x88));
    } else if constexpr (bytes == 2) {
        detail::storeWhole(p, _mm256_blend_epi16(v, old, 0x88));
    } else {
        const __m256i fourth = _mm256_set1_epi32(static_cast<int>(0xff000000u));
        detail::storeWhole(p, _mm256_blendv_epi8(v, old, fourth));
    }
}

/// Writes the first three samples of a block of pixels of four; each fourth sample is put back as it was.
template <Order order = Order::ofMemory, class Samples>
PYXCC_INLINE void storeTriplesOfQuadruples(u8* p, const Three<Samples>& pixels)
{
    const Four<wide::U8> x = detail::interleaveInOrder<order>(
        Four<Samples>{pixels.a, pixels.b, pixels.c, detail::as<Samples>(_mm256_setzero_si256())});
    const auto store = [p](int at, __m256i v) PYXCC_INLINE_LAMBDA {
        if constexpr (sampleBytes<Samples> == 1) { // less work than a variable blend
            const __m256i fourth = _mm256_set1_epi32(static_cast<int>(0xff000000u));
            const __m256i old = _mm256_and_si256(detail::loadWhole(p + at), fourth);
            detail::storeWhole(p + at, _mm256_or_si256(v, old));
        } else {
            storeButFourths(p + at, detail::as<Samples>(v));
        }
    };
    store(0, x.a.v);
    store(32, x.b.v);
    store(64, x.c.v);
    store(96, x.d.v);
}

/// Samples that stand where loadQuadruples() puts them, brought to the order of memory.
template <Order order, class Samples> PYXCC_INLINE Samples inMemoryOrder(Samples x)
{
    if constexpr (order == Order::ofMemory || sampleBytes<Samples> == 8) return x;
    const __m256i inOrder = _mm256_setr_epi32(0, 4, 1, 5, 2, 6, 3, 7);
    return detail::as<Samples>(_mm256_permutevar8x32_epi32(detail::raw(x), inOrder));
}

template <class Samples = wide::U8> PYXCC_INLINE Samples loadSamples(const u8* p)
{
    return detail::as<Samples>(detail::loadWhole(p));
}
template <class Samples> PYXCC_INLINE void storeSamples(u8* p, Samples samples)
{
    detail::storeWhole(p, detail::raw(samples));
}

} // namespace pyxcc::layouts
