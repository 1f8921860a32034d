// Shared chroma: what stands between 32 pixels and the 16 samples that pairs of them share, or the 8 samples that fours
// of them share.
#pragma once

#include "lanes/avx2/pixels.hpp"
#include "layouts/avx2/turns.hpp"

namespace pyxcc::layouts
{

/// 16 samples of 8 bits.
struct HalfBlock {
    static constexpr int count = 16;
    __m128i v;
};

PYXCC_INLINE HalfBlock loadHalf(const u8* p) { return {_mm_loadu_si128(reinterpret_cast<const __m128i*>(p))}; }
PYXCC_INLINE void storeHalf(u8* p, HalfBlock x) { _mm_storeu_si128(reinterpret_cast<__m128i*>(p), x.v); }

/// (x + y + 1) >> 1.
PYXCC_INLINE HalfBlock avgUp(HalfBlock x, HalfBlock y) { return {_mm_avg_epu8(x.v, y.v)}; }

/// As words, in order.
PYXCC_INLINE wide::Sample widen(HalfBlock x)
{
    const __m256i words = _mm256_cvtepu8_epi16(x.v);
    return {wide::S16(words), wide::U16(_mm256_slli_epi16(words, 8))};
}

/// The samples of 32 columns that `Columns` columns share, 2 or 4, as a word for each pair of columns.
template <int Columns> PYXCC_INLINE wide::Sample loadForPairs(const u8* p)
{
    static_assert(Columns == 2 || Columns == 4);
    if constexpr (Columns == 2) return widen(loadHalf(p));
    const __m128i samples = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(p));
    return widen(HalfBlock{_mm_unpacklo_epi8(samples, samples)});
}

namespace detail
{

/// Sums of `Columns` neighbours times `scale`.
template <int Columns> PYXCC_INLINE wide::S16 scaledSums(wide::U8 x, int scale)
{
    const __m256i pairs = _mm256_maddubs_epi16(x.v, _mm256_set1_epi8(static_cast<char>(scale)));
    if constexpr (Columns == 2) return wide::S16(pairs);
    return wide::S16(_mm256_madd_epi16(pairs, _mm256_set1_epi16(1)));
}

template <int Columns> PYXCC_INLINE wide::S16 scaledSums(const Two<wide::U8>& rows, int scale)
{
    return scaledSums<Columns>(rows.a, scale) + scaledSums<Columns>(rows.b, scale);
}

} // namespace detail

/// Sums over the bytes that share a chroma sample: `Columns` neighbours, 2 or 4, of one row or of two. Sums of fours
/// stand in the even words, in order, and the odd words are zero. They are at hand 32 and 64 times as large too, since
/// a sum costs the same at any scale; what a form does not use is never computed.
template <int Columns, class Rows> struct Sums : wide::S16 {
    static_assert(Columns == 2 || Columns == 4);
    Rows bytes;

    explicit PYXCC_INLINE Sums(const Rows& rows) : wide::S16(detail::scaledSums<Columns>(rows, 1)), bytes(rows) {}

    friend PYXCC_INLINE wide::S16 operator<<(const Sums& x, int n)
    {
        if (n == 5 || n == 6) return detail::scaledSums<Columns>(x.bytes, 1 << n);
        return static_cast<const wide::S16&>(x) << n;
    }
};

/// Sums of two neighbours, in the order of the sums above, of words in that of widened bytes.
PYXCC_INLINE wide::S16 sumsOfPairs(const Two<wide::S16>& x) { return wide::S16(_mm256_hadd_epi16(x.a.v, x.b.v)); }

/// Each word twice, in the order of widened bytes: what 16 chroma samples give is laid beside 32 luma samples.
PYXCC_INLINE Two<wide::S16> doubled(wide::S16 x)
{
    return {wide::S16(_mm256_unpacklo_epi16(x.v, x.v)), wide::S16(_mm256_unpackhi_epi16(x.v, x.v))};
}

/// What is to be added to each of 32 bytes and what is to be taken off; one of the two is zero.
struct Changes {
    wide::U8 plus, minus;
};

/// A word for two neighbours each, as changes.
PYXCC_INLINE Changes inBytes(wide::S16 x)
{
    const __m256i both = _mm256_packus_epi16(x.v, (wide::S16(0) - x).v);
    return {wide::U8(_mm256_unpacklo_epi8(both, both)), wide::U8(_mm256_unpackhi_epi8(both, both))};
}

PYXCC_INLINE wide::U8 addTo(wide::U8 x, const Changes& changes)
{
    return wide::U8(_mm256_subs_epu8(_mm256_adds_epu8(x.v, changes.plus.v), changes.minus.v));
}

/// Each byte twice, in order.
PYXCC_INLINE wide::U8 doubled(HalfBlock x)
{
    const __m128i low = _mm_unpacklo_epi8(x.v, x.v), high = _mm_unpackhi_epi8(x.v, x.v);
    return wide::U8(_mm256_inserti128_si256(_mm256_castsi128_si256(low), high, 1));
}

namespace detail
{

/// The low half of a lane interleaved with the high one.
constexpr Places halvesInTurn = {0, 8, 1, 9, 2, 10, 3, 11, 4, 12, 5, 13, 6, 14, 7, 15};

} // namespace detail

namespace detail
{

/// Where the chroma samples of a component are, in order, once its words are narrowed to 8 bytes from each lane. Sums
/// of fours have every other word to themselves.
template <int Columns, Order order>
constexpr Places chromaPlaces = [] {
    Places places{};
    for (int i = 0; i != wide::U8::count / Columns; ++i) {
        const int column = i * Columns, four = column / 4;
        const int four8 = order == Order::ofMemory ? four : four / 2 + four % 2 * 4; // 8 fours in 16 bytes
        places[i] = static_cast<u8>(2 * four8 + column % 4 / 2);
    }
    return places;
}();

} // namespace detail

/// The samples of two chroma components that forms make of sums, narrowed together: in each half eight words' of the
/// one and then eight words' of the other.
struct NarrowedPairs {
    wide::U8 v;
};

template <class Byte> PYXCC_INLINE NarrowedPairs narrowPairs(const Two<Byte>& x) { return {narrow(x.a, x.b)}; }

PYXCC_INLINE NarrowedPairs exchanged(NarrowedPairs x) { return {wide::U8(_mm256_shuffle_epi32(x.v.v, 0x4e))}; }

/// Writes the samples of each component of sums of `Columns` neighbours, 32 / Columns of them.
template <int Columns, Order order = Order::ofMemory> PYXCC_INLINE void storeApart(u8* a, u8* b, NarrowedPairs x)
{
    __m256i apart = detail::swapMiddle(x.v.v);
    if constexpr (Columns != 2 || order != Order::ofMemory) {
        apart = detail::shuffle(apart, detail::chromaPlaces<Columns, order>);
    }
    const __m128i first = _mm256_castsi256_si128(apart), second = _mm256_extracti128_si256(apart, 1);
    if constexpr (Columns == 2) {
        storeHalf(a, {first});
        storeHalf(b, {second});
    } else {
        _mm_storel_epi64(reinterpret_cast<__m128i*>(a), first);
        _mm_storel_epi64(reinterpret_cast<__m128i*>(b), second);
    }
}

/// The samples of both components of sums of two neighbours, interleaved.
PYXCC_INLINE wide::U8 inTurn(NarrowedPairs x) { return wide::U8(detail::shuffle(x.v.v, detail::halvesInTurn)); }

/// The bytes of pairs under the taps 1, 2, 1 around each even one: it comes twice, the odd one behind it and the one in
/// front of it once. `before` is in front of the first.
PYXCC_INLINE wide::S16 tapSums(wide::U8 x, u8 before)
{
    const __m256i lowHalf =
        _mm256_inserti128_si256(_mm256_set1_epi8(static_cast<char>(before)), _mm256_castsi256_si128(x.v), 1);
    const __m256i inFront = _mm256_and_si256(_mm256_alignr_epi8(x.v, lowHalf, 15), _mm256_set1_epi16(255));
    return wide::S16(_mm256_add_epi16(_mm256_maddubs_epi16(x.v, _mm256_set1_epi16(0x0102)), inFront));
}

/// The even bytes of one block and the odd ones of another.
PYXCC_INLINE wide::U8 inTurn(wide::U8 even, wide::U8 odd)
{
    return wide::U8(_mm256_blendv_epi8(even.v, odd.v, _mm256_set1_epi16(static_cast<short>(0xff00))));
}

/// The even and the odd bytes of 64: luma and chroma of packed 4:2:2.
PYXCC_INLINE Two<wide::U8> loadAlternating(const u8* p)
{
    return dealt<1>(wide::U8(detail::loadWhole(p)), wide::U8(detail::loadWhole(p + 32)));
}

namespace detail
{

/// 128 times what the bytes at `Place` of each word are below 16.
template <int Place> PYXCC_INLINE wide::S16 belowBlack(wide::U8 x)
{
    const __m256i times = _mm256_set1_epi16(static_cast<short>(Place == 0 ? 128 : 128 * 256)); // -128
    return wide::S16(_mm256_maddubs_epi16(x.v, times)) + (16 << 7);
}

} // namespace detail

/// The even bytes as words, and the odd ones.
PYXCC_INLINE wide::Sample lowBytes(wide::U8 x)
{
    return {wide::S16(_mm256_and_si256(x.v, _mm256_set1_epi16(255))), wide::U16(_mm256_slli_epi16(x.v, 8)),
            detail::belowBlack<0>(x)};
}
PYXCC_INLINE wide::Sample highBytes(wide::U8 x)
{
    return {wide::S16(_mm256_srli_epi16(x.v, 8)), wide::U16(_mm256_andnot_si256(_mm256_set1_epi16(255), x.v)),
            detail::belowBlack<1>(x)};
}

/// Reads 32 pixels of two bytes. Their even bytes, or their odd ones, come as those of a block do that is widened: the
/// first and the third quarter, the second and the fourth. Or they come as they are.
template <Order order> PYXCC_INLINE Two<wide::U8> loadForWidening(const u8* p)
{
    if constexpr (order == Order::ofWords) return {wide::U8(detail::loadWhole(p)), wide::U8(detail::loadWhole(p + 32))};
    return {wide::U8(detail::lanesFrom(p, p + 32)), wide::U8(detail::lanesFrom(p + 16, p + 48))};
}

namespace detail
{

/// Of every four bytes of a lane, those at `First` and two behind, each component by itself. `Byte` is where in a word
/// they are put; the rest is zero.
template <int First, int Byte>
constexpr Places everyFourth = [] {
    Places places{};
    places.fill(0x80);
    for (int i = 0; i < 8; ++i) places[2 * i + Byte] = static_cast<u8>(First + 4 * (i % 4) + 2 * (i / 4));
    return places;
}();

template <int First, int Byte> PYXCC_INLINE Two<wide::U16> everyOther(const Two<wide::U8>& x)
{
    const __m256i a = shuffle(x.a.v, everyFourth<First, Byte>), b = shuffle(x.b.v, everyFourth<First, Byte>);
    return {wide::U16(_mm256_unpacklo_epi64(a, b)), wide::U16(_mm256_unpackhi_epi64(a, b))};
}

} // namespace detail

/// The two chroma components of pixels in which each byte of luma is preceded or followed by one of chroma, by turns
/// one of each component: a word of each for every pair.
template <int First> PYXCC_INLINE Two<wide::Sample> chromaOfPairs(const Two<wide::U8>& pixels)
{
    const Two<wide::U16> words = detail::everyOther<First, 0>(pixels);
    const Two<wide::U16> in256ths = detail::everyOther<First, 1>(pixels);
    return {{asS16(words.a), in256ths.a}, {asS16(words.b), in256ths.b}};
}

/// 16 pixels of two bytes, one of which is chroma: of one component at byte `First` of every four and of the other two
/// behind, Cr before Cb if `Exchanged`.
template <int First, bool Exchanged> struct ChromaInPlace {
    wide::U8 pixels;
};

/// A word of each component for two pixels, in the order of the bytes.
template <bool Exchanged> struct ChromaWords {
    wide::WordPairs v;

    friend PYXCC_INLINE ChromaWords operator-(const ChromaWords& x, const Two<int>& k)
    {
        return {x.v - (Exchanged ? Two{k.b, k.a} : k)};
    }
};

/// Chroma from 128, so many times as large as it is.
template <int TimesCb, int TimesCr = TimesCb, int First, bool Exchanged>
PYXCC_INLINE ChromaWords<Exchanged> chromaFrom128(const ChromaInPlace<First, Exchanged>& chroma)
{
    static_assert(TimesCb >= 1 && TimesCb <= 255 && TimesCr >= 1 && TimesCr <= 255);
    constexpr int inOrder = Exchanged ? TimesCr | TimesCb << 16 : TimesCb | TimesCr << 16;
    const __m256i times = _mm256_set1_epi32(static_cast<int>(static_cast<u32>(inOrder) << 8 * First));
    const __m256i from128 = _mm256_xor_si256(chroma.pixels.v, _mm256_set1_epi8(-128));
    return {wide::WordPairs(_mm256_maddubs_epi16(times, from128))};
}

/// Chroma as it is, `Times` times as large.
template <int Times, int First, bool Exchanged>
PYXCC_INLINE ChromaWords<Exchanged> chromaFrom0(const ChromaInPlace<First, Exchanged>& chroma)
{
    static_assert(Times >= 1 && Times <= 127);
    return {wide::WordPairs(_mm256_maddubs_epi16(chroma.pixels.v, _mm256_set1_epi16(Times << 8 * First)))};
}

template <int Cb, int Cr, bool Exchanged>
PYXCC_INLINE ChromaWords<Exchanged> mulHighS16(const ChromaWords<Exchanged>& x)
{
    return {wide::mulHighS16 < Exchanged ? Cr : Cb, Exchanged ? Cb : Cr > (x.v)};
}
template <int Cb, int Cr, bool Exchanged>
PYXCC_INLINE ChromaWords<Exchanged> mulRound15(const ChromaWords<Exchanged>& x)
{
    return {wide::mulRound15 < Exchanged ? Cr : Cb, Exchanged ? Cb : Cr > (x.v)};
}
template <bool Exchanged> PYXCC_INLINE ChromaWords<Exchanged> operator>>(const ChromaWords<Exchanged>& x, int n)
{
    return {wide::WordPairs(_mm256_srai_epi16(x.v.v, n))};
}

template <int Shift, bool Exchanged> PYXCC_INLINE ChromaWords<Exchanged> roundedShift(const ChromaWords<Exchanged>& x)
{
    return mulRound15<1 << (15 - Shift), 1 << (15 - Shift)>(x);
}

namespace detail
{

/// Bytes of every four of a lane.
template <int A, int B, int C, int D>
constexpr Places placesInFours = placesOfBytes<1>([](int i) {
    return i / 4 * 4 + std::array{A, B, C, D}[static_cast<std::size_t>(i % 4)];
});

} // namespace detail

/// A component, or the sum of both, as words of each of the pixels.
template <bool Exchanged> PYXCC_INLINE wide::S16 cbOfPixels(const ChromaWords<Exchanged>& x)
{
    constexpr int at = Exchanged ? 2 : 0;
    return wide::S16(detail::shuffle(x.v.v, detail::placesInFours<at, at + 1, at, at + 1>));
}
template <bool Exchanged> PYXCC_INLINE wide::S16 crOfPixels(const ChromaWords<Exchanged>& x)
{
    return cbOfPixels(ChromaWords<!Exchanged>{x.v});
}
template <bool Exchanged> PYXCC_INLINE wide::S16 sumOfPixels(const ChromaWords<Exchanged>& x)
{
    return wide::S16(x.v.v) + wide::S16(detail::shuffle(x.v.v, detail::placesInFours<2, 3, 0, 1>));
}

/// Writes 64 bytes, the even ones from `even`.
template <Order order = Order::ofMemory> PYXCC_INLINE void storeAlternating(u8* p, wide::U8 even, wide::U8 odd)
{
    if constexpr (order == Order::ofMemory) {
        const Two<wide::U8> bytes = alternated<1>(even, odd);
        detail::storeWhole(p, bytes.a.v);
        detail::storeWhole(p + 32, bytes.b.v);
    } else {
        detail::storeWhole(p, detail::swapMiddle(_mm256_unpacklo_epi8(even.v, odd.v)));
        detail::storeWhole(p + 32, detail::swapMiddle(_mm256_unpackhi_epi8(even.v, odd.v)));
    }
}

} // namespace pyxcc::layouts
