// Layouts with shared chroma for conversions that move samples and leave them as they are. A block is 32 samples of
// each of the two chroma components, with the luma that goes with them where luma and chroma share their bytes.
#pragma once

#include "lanes/several.hpp"
#include "layouts/avx2/turns.hpp"
#include "layouts/bytes.hpp"

#include <array>
#include <cstddef>

namespace pyxcc::layouts
{

/// 32 samples of each component, a register each.
struct ChromaApart {
    wide::U8 a, b;
};

/// The same as pairs, 16 in a register.
struct ChromaInPairs {
    wide::U8 first, second;
};

/// Chroma and the luma of its columns, `Columns` of them a sample.
template <int Columns, class Chroma> struct WithLuma {
    Several<wide::U8, Columns> luma;
    Chroma chroma;
};

PYXCC_INLINE ChromaApart apart(const ChromaApart& x) { return x; }
PYXCC_INLINE ChromaApart apart(const ChromaInPairs& x)
{
    const auto [a, b] = dealt<1>(x.first, x.second);
    return {a, b};
}

PYXCC_INLINE ChromaInPairs inPairs(const ChromaInPairs& x) { return x; }
PYXCC_INLINE ChromaInPairs inPairs(const ChromaApart& x)
{
    const auto [first, second] = alternated<1>(x.a, x.b);
    return {first, second};
}

/// A sample of x, one of y and so on: two blocks.
PYXCC_INLINE Two<ChromaApart> alternated(const ChromaApart& x, const ChromaApart& y)
{
    const Two<wide::U8> a = alternated<1>(x.a, y.a), b = alternated<1>(x.b, y.b);
    return {{a.a, b.a}, {a.b, b.b}};
}
PYXCC_INLINE Two<ChromaInPairs> alternated(const ChromaInPairs& x, const ChromaInPairs& y)
{
    const Two<wide::U8> first = alternated<2>(x.first, y.first), second = alternated<2>(x.second, y.second);
    return {{first.a, first.b}, {second.a, second.b}};
}

/// The even samples of two blocks, and the odd ones.
PYXCC_INLINE Two<ChromaApart> dealt(const ChromaApart& x, const ChromaApart& y)
{
    const Two<wide::U8> a = dealt<1>(x.a, y.a), b = dealt<1>(x.b, y.b);
    return {{a.a, b.a}, {a.b, b.b}};
}
PYXCC_INLINE Two<ChromaInPairs> dealt(const ChromaInPairs& x, const ChromaInPairs& y)
{
    const Two<wide::U8> first = dealt<2>(x.first, x.second), second = dealt<2>(y.first, y.second);
    return {{first.a, second.a}, {first.b, second.b}};
}

/// Each sample twice.
template <class Chroma> PYXCC_INLINE Two<Chroma> doubled(const Chroma& x) { return alternated(x, x); }
template <class Chroma> PYXCC_INLINE Two<WithLuma<2, Chroma>> doubled(const WithLuma<4, Chroma>& x)
{
    const auto& [a, b, c, d] = x.luma.part;
    const auto [first, second] = doubled(x.chroma);
    return {{several(a, b), first}, {several(c, d), second}};
}

/// Every other sample, from the first on.
template <class Chroma> PYXCC_INLINE Chroma everyOther(const Chroma& x, const Chroma& y) { return dealt(x, y).a; }
template <class Chroma>
PYXCC_INLINE WithLuma<4, Chroma> everyOther(const WithLuma<2, Chroma>& x, const WithLuma<2, Chroma>& y)
{
    return {several(x.luma.part[0], x.luma.part[1], y.luma.part[0], y.luma.part[1]), everyOther(x.chroma, y.chroma)};
}

namespace detail
{

template <int Registers> PYXCC_INLINE Several<wide::U8, Registers> loadLuma(const u8* p)
{
    Several<wide::U8, Registers> samples;
    for (int k = 0; k < Registers; ++k) samples.part[k] = loadSamples(p + std::ptrdiff_t{32} * k);
    return samples;
}

template <int Registers> PYXCC_INLINE void storeLuma(u8* p, const Several<wide::U8, Registers>& samples)
{
    for (int k = 0; k < Registers; ++k) storeSamples(p + std::ptrdiff_t{32} * k, samples.part[k]);
}

} // namespace detail

// Rows load and store blocks by their first chroma sample. A target takes chroma apart or in pairs; `taken` gives it as
// the target stores it. `mapped` gives the same row with each of its pointers replaced by what a function makes of it
// and of the bytes that a sample takes there.

/// A row of two planes of chroma.
template <class Byte> struct PlanesRow {
    Byte *a, *b;

    PYXCC_INLINE ChromaApart load(std::ptrdiff_t i) const { return {loadSamples(a + i), loadSamples(b + i)}; }

    template <class Chroma> PYXCC_INLINE void store(std::ptrdiff_t i, const Chroma& chroma) const
    {
        const ChromaApart samples = taken(chroma);
        storeSamples(a + i, samples.a);
        storeSamples(b + i, samples.b);
    }

    template <class Chroma> static PYXCC_INLINE ChromaApart taken(const Chroma& chroma) { return apart(chroma); }
    template <class F> PYXCC_INLINE PlanesRow mapped(const F& f) const { return {f(a, 1), f(b, 1)}; }
};

/// A row of a plane of chroma pairs.
template <class Byte> struct PairsRow {
    Byte* pairs;

    PYXCC_INLINE ChromaInPairs load(std::ptrdiff_t i) const
    {
        return {loadSamples(pairs + 2 * i), loadSamples(pairs + 2 * i + 32)};
    }

    template <class Chroma> PYXCC_INLINE void store(std::ptrdiff_t i, const Chroma& chroma) const
    {
        const ChromaInPairs samples = taken(chroma);
        storeSamples(pairs + 2 * i, samples.first);
        storeSamples(pairs + 2 * i + 32, samples.second);
    }

    template <class Chroma> static PYXCC_INLINE ChromaInPairs taken(const Chroma& chroma) { return inPairs(chroma); }
    template <class F> PYXCC_INLINE PairsRow mapped(const F& f) const { return {f(pairs, 2)}; }
};

/// A row of luma beside the row of chroma that goes with it, a sample for every `Columns` columns.
template <int Columns, class Byte, class ChromaRow> struct BesideLumaRow {
    Byte* luma;
    ChromaRow chroma;

    PYXCC_INLINE auto load(std::ptrdiff_t i) const
    {
        return WithLuma<Columns, decltype(chroma.load(i))>{detail::loadLuma<Columns>(luma + Columns * i),
                                                           chroma.load(i)};
    }

    template <class Chroma> PYXCC_INLINE void store(std::ptrdiff_t i, const WithLuma<Columns, Chroma>& pixels) const
    {
        detail::storeLuma(luma + Columns * i, pixels.luma);
        chroma.store(i, pixels.chroma);
    }

    template <class Chroma> static PYXCC_INLINE auto taken(const WithLuma<Columns, Chroma>& pixels)
    {
        return WithLuma<Columns, decltype(ChromaRow::taken(pixels.chroma))>{pixels.luma,
                                                                            ChromaRow::taken(pixels.chroma)};
    }
    template <class F> PYXCC_INLINE BesideLumaRow mapped(const F& f) const
    {
        return {f(luma, Columns), chroma.mapped(f)};
    }
};

/// Luma alone, of two columns a sample: the chroma that comes with it is left.
template <class Byte> struct LumaRow {
    Byte* luma;

    template <class Chroma> PYXCC_INLINE void store(std::ptrdiff_t i, const WithLuma<2, Chroma>& pixels) const
    {
        detail::storeLuma(luma + 2 * i, pixels.luma);
    }

    template <class F> PYXCC_INLINE LumaRow mapped(const F& f) const { return {f(luma, 2)}; }
};

/// Two rows whose chroma comes from one or makes one.
template <class Row> struct TwoRows {
    Row upper, lower;

    template <class F> PYXCC_INLINE TwoRows mapped(const F& f) const { return {upper.mapped(f), lower.mapped(f)}; }
};

template <class Row> TwoRows(Row, Row) -> TwoRows<Row>;

/// Which byte of a pixel comes first in a packed row.
enum class First { luma, chroma };

/// A packed row: pixels of two bytes, of which the one of chroma belongs to one component and to the other by turns.
/// Stores that go past the cache take whole blocks of rows that lie at multiples of 32.
template <First first, class Byte, Stores stores = Stores::cached> struct PackedRow {
    Byte* pixels;

    PYXCC_INLINE WithLuma<2, ChromaInPairs> load(std::ptrdiff_t i) const
    {
        const auto [lumaA, chromaA] = halves(pixels + 4 * i);
        const auto [lumaB, chromaB] = halves(pixels + 4 * i + 64);
        return {several(lumaA, lumaB), {chromaA, chromaB}};
    }

    template <class Chroma> PYXCC_INLINE void store(std::ptrdiff_t i, const WithLuma<2, Chroma>& block) const
    {
        const ChromaInPairs chroma = inPairs(block.chroma);
        storeHalves(pixels + 4 * i, block.luma.part[0], chroma.first);
        storeHalves(pixels + 4 * i + 64, block.luma.part[1], chroma.second);
    }

    template <int Columns, class Chroma>
    static PYXCC_INLINE WithLuma<Columns, ChromaInPairs> taken(const WithLuma<Columns, Chroma>& pixels)
    {
        return {pixels.luma, inPairs(pixels.chroma)};
    }
    template <class F> PYXCC_INLINE PackedRow mapped(const F& f) const { return {f(pixels, 4)}; }

private:
    static PYXCC_INLINE Two<wide::U8> halves(const u8* p)
    {
        const Two<wide::U8> x = dealt<1>(loadSamples(p), loadSamples(p + 32));
        return first == First::luma ? x : Two<wide::U8>{x.b, x.a};
    }

    static PYXCC_INLINE void storeHalves(u8* p, wide::U8 luma, wide::U8 chroma)
    {
        const Two<wide::U8> x = first == First::luma ? alternated<1>(luma, chroma) : alternated<1>(chroma, luma);
        detail::put<stores>(p, x.a.v);
        detail::put<stores>(p + 32, x.b.v);
    }
};

template <class Row> inline constexpr bool goesPastCache = false;
template <First first, class Byte> inline constexpr bool goesPastCache<PackedRow<first, Byte, Stores::streamed>> = true;

// Images.

/// Luma, and two planes of chroma.
template <class Byte> struct ThreePlanes {
    std::array<Byte*, 3> first;
    std::array<std::ptrdiff_t, 3> step;

    PYXCC_INLINE Byte* luma(int y) const { return rowAt(first[0], step[0], y); }
    PYXCC_INLINE auto chroma(int j) const
    {
        return PlanesRow<Byte>{rowAt(first[1], step[1], j), rowAt(first[2], step[2], j)};
    }
};

/// Luma, and a plane of chroma pairs.
template <class Byte> struct TwoPlanes {
    std::array<Byte*, 2> first;
    std::array<std::ptrdiff_t, 2> step;

    PYXCC_INLINE Byte* luma(int y) const { return rowAt(first[0], step[0], y); }
    PYXCC_INLINE auto chroma(int j) const { return PairsRow<Byte>{rowAt(first[1], step[1], j)}; }
};

/// Packed rows, which have their chroma with them.
template <First order, class Byte, Stores stores = Stores::cached> struct Packed {
    Byte* first;
    std::ptrdiff_t step;

    PYXCC_INLINE auto row(int y, int = 0) const { return PackedRow<order, Byte, stores>{rowAt(first, step, y)}; }
};

} // namespace pyxcc::layouts
