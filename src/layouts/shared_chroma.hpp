// Layouts in which neighbouring pixels share their chroma: planes, luma and a plane of chroma pairs, or packed rows.
//
// As a target, a partial block ends where its last whole chroma sample does: columns behind it get luma and no chroma.
// Only a packed row has a place for one chroma sample, the first of the two, beside a last odd pixel; and planes can be
// such that a part of a block has samples of its own.
//
// As a source, every pixel of a partial block has chroma: a pair whose second column is missing has a sample of its own
// in a plane, three columns or less of a four take the sample of the four before, and in a packed row a last odd pixel
// takes the sample that it lacks from the pair before.
#pragma once

#include "layouts/avx2/chroma.hpp"
#include "layouts/images.hpp"

#include <array>
#include <cstring>
#include <type_traits>

namespace pyxcc::layouts
{

/// A block of columns: luma of every pixel, of one row or of two, and the two chroma samples of every `Columns`
/// columns.
template <int Columns, class Luma, class Chroma> struct SharedChroma {
    Luma luma;
    Chroma chroma;
};

/// What a target takes.
template <int Columns, class Luma> using ChromaOfSums = SharedChroma<Columns, Luma, NarrowedPairs>;

/// What a source gives: chroma as words, a sample for every pair. Samples of fours come twice.
template <class Luma> using ChromaOfPairs = SharedChroma<2, Luma, Two<wide::Sample>>;

/// The same of packed pixels: chroma is at hand as it lies beside luma, too, 16 pixels each.
template <int First, bool Exchanged> struct PixelsInTurn : ChromaOfPairs<Two<wide::Sample>> {
    Two<ChromaInPlace<First, Exchanged>> inPlace;
};

template <class T> PYXCC_INLINE Two<T> exchanged(const Two<T>& x) { return {x.b, x.a}; }

template <int First, bool Exchanged>
PYXCC_INLINE PixelsInTurn<First, !Exchanged> exchanged(const PixelsInTurn<First, Exchanged>& x)
{
    return {{x.luma, exchanged(x.chroma)}, {{x.inPlace.a.pixels}, {x.inPlace.b.pixels}}};
}

/// Whether columns that do not fill a block have chroma in a target of planes.
enum class Rest { lumaOnly, withChroma };

/// Rows of two planes of chroma.
template <int Columns, class Byte, Order Within = Order::ofMemory, Rest rest = Rest::lumaOnly> struct ChromaPlanesRow {
    static constexpr int columns = Columns;
    static constexpr Order order = Within;
    static constexpr bool loadedAtOnce = Columns == 2;
    Byte *a, *b;

    PYXCC_INLINE Two<wide::Sample> load(int x) const
    {
        return {loadForPairs<Columns>(a + x / Columns), loadForPairs<Columns>(b + x / Columns)};
    }

    PYXCC_INLINE Two<wide::Sample> load(int x, int count) const
    {
        return {loadPart(a + x / Columns, count), loadPart(b + x / Columns, count)};
    }

    PYXCC_INLINE void store(int x, NarrowedPairs chroma) const
    {
        storeApart<Columns, order>(a + x / Columns, b + x / Columns, chroma);
    }

    PYXCC_INLINE void store(int x, int count, NarrowedPairs chroma) const
    {
        u8 bufferA[wide::U8::count / Columns], bufferB[wide::U8::count / Columns];
        storeApart<Columns, order>(bufferA, bufferB, chroma);
        const int samples = (count + (rest == Rest::withChroma ? Columns - 1 : 0)) / Columns;
        copyBytes(a + x / Columns, bufferA, samples);
        copyBytes(b + x / Columns, bufferB, samples);
    }

private:
    static PYXCC_INLINE wide::Sample loadPart(const u8* samples, int count)
    {
        u8 buffer[wide::U8::count / Columns] = {};
        if constexpr (Columns == 2) {
            copyBytes(buffer, samples, (count + 1) / Columns);
        } else {
            const int whole = count / Columns;
            std::memset(buffer, samples[whole - 1], sizeof buffer);
            copyBytes(buffer, samples, whole);
        }
        return loadForPairs<Columns>(buffer);
    }
};

/// A row of one plane of chroma pairs, the second component first if `Exchanged`.
template <class Byte, bool Exchanged, Order Within = Order::ofMemory> struct ChromaPairsRow {
    static constexpr int columns = 2;
    static constexpr Order order = Within;
    static constexpr bool loadedAtOnce = true;
    SampleRow<wide::U8, Byte> pairs;

    PYXCC_INLINE Two<wide::Sample> load(int x) const { return apart(pairs.load(x)); }
    PYXCC_INLINE Two<wide::Sample> load(int x, int count) const { return apart(pairs.load(x, count + (count & 1))); }

    PYXCC_INLINE void store(int x, NarrowedPairs chroma) const { pairs.store(x, inMemoryOrder<order>(inTurn(chroma))); }

    PYXCC_INLINE void store(int x, int count, NarrowedPairs chroma) const
    {
        pairs.store(x, count & ~1, inMemoryOrder<order>(inTurn(chroma)));
    }

private:
    static PYXCC_INLINE Two<wide::Sample> apart(wide::U8 pairs)
    {
        const Two<wide::Sample> components{lowBytes(pairs), highBytes(pairs)};
        return Exchanged ? exchanged(components) : components;
    }
};

/// One row of luma, or two, and the row of chroma that goes with it.
template <class LumaRow, class ChromaRow> struct SharedChromaRow {
    static constexpr int block = LumaRow::block;
    static constexpr bool loadedAtOnce = loadsAtOnce<ChromaRow>;
    LumaRow luma;
    ChromaRow chroma;

    PYXCC_INLINE auto load(int x) const
    {
        const auto samples = luma.load(x);
        return ChromaOfPairs<std::remove_const_t<decltype(samples)>>{samples, chroma.load(x)};
    }

    PYXCC_INLINE auto load(int x, int count) const
    {
        const auto samples = luma.load(x, count);
        return ChromaOfPairs<std::remove_const_t<decltype(samples)>>{samples, chroma.load(x, count)};
    }

    template <int Columns, class Luma> PYXCC_INLINE void store(int x, const ChromaOfSums<Columns, Luma>& pixels) const
    {
        static_assert(Columns == ChromaRow::columns);
        luma.store(x, ordered(pixels.luma));
        chroma.store(x, pixels.chroma);
    }

    template <int Columns, class Luma>
    PYXCC_INLINE void store(int x, int count, const ChromaOfSums<Columns, Luma>& pixels) const
    {
        static_assert(Columns == ChromaRow::columns);
        luma.store(x, count, ordered(pixels.luma));
        chroma.store(x, count, pixels.chroma);
    }

private:
    static PYXCC_INLINE wide::U8 ordered(wide::U8 row) { return inMemoryOrder<ChromaRow::order>(row); }
    static PYXCC_INLINE Two<wide::U8> ordered(const Two<wide::U8>& rows) { return {ordered(rows.a), ordered(rows.b)}; }
};

template <class LumaRow, class ChromaRow> SharedChromaRow(LumaRow, ChromaRow) -> SharedChromaRow<LumaRow, ChromaRow>;

/// Two planes of chroma, a sample for every `Columns` columns.
template <int Columns, class Byte, Order order = Order::ofMemory, Rest rest = Rest::lumaOnly> struct ChromaPlanes {
    std::array<Byte*, 2> first;
    std::array<std::ptrdiff_t, 2> step;

    PYXCC_INLINE auto row(int y) const
    {
        return ChromaPlanesRow<Columns, Byte, order, rest>{rowAt(first[0], step[0], y), rowAt(first[1], step[1], y)};
    }
};

/// A plane of chroma pairs, one for every two columns.
template <class Byte, bool Exchanged, Order order = Order::ofMemory> struct PairedChroma {
    Byte* first;
    std::ptrdiff_t step;

    PYXCC_INLINE auto row(int y) const { return ChromaPairsRow<Byte, Exchanged, order>{{rowAt(first, step, y)}}; }
};

/// A plane of luma, and chroma in planes of its own.
template <class Chroma, class Byte> struct SharedChromaImage {
    Byte* first;
    std::ptrdiff_t step;
    Chroma chroma;

    PYXCC_INLINE auto row(int y) const { return SharedChromaRow{luma(y), chroma.row(y)}; }

    /// Rows 2 j and 2 j + 1 of luma and row j of chroma.
    PYXCC_INLINE auto rowPair(int j) const
    {
        return SharedChromaRow{RowPair{luma<true>(2 * j), luma<true>(2 * j + 1)}, chroma.row(j)};
    }

    /// The same pair where it has no second row.
    PYXCC_INLINE auto halfPair(int j) const { return SharedChromaRow{luma(2 * j), chroma.row(j)}; }

private:
    template <bool oneOfTwo = false> PYXCC_INLINE auto luma(int y) const
    {
        return SampleRow<wide::U8, Byte, oneOfTwo>{rowAt(first, step, y)};
    }
};

/// Luma and chroma bytes in turn, luma first.
template <Order order> struct LumaFirst {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;
    static constexpr bool loadedAtOnce = true;

    static PYXCC_INLINE PixelsInTurn<1, false> load(const u8* p)
    {
        const Two<wide::U8> pixels = loadForWidening<order>(p);
        return {{{lowBytes(pixels.a), lowBytes(pixels.b)}, chromaOfPairs<1>(pixels)}, {{pixels.a}, {pixels.b}}};
    }

    static PYXCC_INLINE void store(u8* p, const ChromaOfSums<2, wide::U8>& pixels)
    {
        storeAlternating<order>(p, pixels.luma, inTurn(pixels.chroma));
    }

    /// A last odd pixel has one chroma sample of its own; the other one is that of the pair before, right in front of
    /// the pixel's luma. In a row of one pixel this is the byte before the row.
    static PYXCC_INLINE void completeLastPair(u8* end, const u8* row, int width) { end[1] = row[2 * width - 3]; }
};

/// The same as a source that reads nothing in front of a row: the only pixel of a row has a chroma sample of its own,
/// and the other one is that of gray.
struct LumaFirstAlone : LumaFirst<Order::ofMemory> {
    static PYXCC_INLINE void completeLastPair(u8* end, const u8* row, int width)
    {
        if (width > 1) return LumaFirst::completeLastPair(end, row, width);
        end[1] = 128;
    }
};

/// The same as a source whose rows go on to the end of a last pair: there, where it would be if the pair were whole, a
/// last odd pixel has its second chroma sample. Of the luma in front of it nothing is read.
struct LumaFirstWholePairs : LumaFirst<Order::ofMemory> {
    static PYXCC_INLINE void completeLastPair(u8* end, const u8* row, int width) { end[1] = row[2 * width + 1]; }
};

/// Chroma and luma bytes in turn, chroma first.
template <Order order> struct ChromaFirst {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;
    static constexpr bool loadedAtOnce = true;

    static PYXCC_INLINE PixelsInTurn<0, false> load(const u8* p)
    {
        const Two<wide::U8> pixels = loadForWidening<order>(p);
        return {{{highBytes(pixels.a), highBytes(pixels.b)}, chromaOfPairs<0>(pixels)}, {{pixels.a}, {pixels.b}}};
    }

    static PYXCC_INLINE void store(u8* p, const ChromaOfSums<2, wide::U8>& pixels)
    {
        storeAlternating<order>(p, inTurn(pixels.chroma), pixels.luma);
    }

    /// A last odd pixel has one chroma sample of its own; the other one is that of the pair before. In a row of one
    /// pixel its own serves for both.
    static PYXCC_INLINE void completeLastPair(u8* end, const u8* row, int width)
    {
        end[0] = row[width > 1 ? 2 * width - 4 : 0];
    }
};

/// The same, but in a row of one pixel as well the sample that it lacks is two bytes in front of the one that it has,
/// which is in front of the row.
template <Order order> struct ChromaFirstFromBefore : ChromaFirst<order> {
    static PYXCC_INLINE void completeLastPair(u8* end, const u8* row, int width) { end[0] = row[2 * width - 4]; }
};

/// A packing with its two chroma components exchanged.
template <class Packing> struct ChromaExchanged : Packing {
    static PYXCC_INLINE auto load(const u8* p) { return exchanged(Packing::load(p)); }

    static PYXCC_INLINE void store(u8* p, const ChromaOfSums<2, wide::U8>& pixels)
    {
        Packing::store(p, {pixels.luma, exchanged(pixels.chroma)});
    }
};

// Targets with an order other than that of memory are for sources that load pixels in it.

/// Three planes with a step each: luma, and two of chroma with a sample for every `Columns` columns.
template <int Columns, Order order = Order::ofMemory, Rest rest = Rest::lumaOnly, class Byte>
auto p3(Byte* const planes[3], const int steps[3])
{
    using Chroma = ChromaPlanes<Columns, Byte, order, rest>;
    return SharedChromaImage<Chroma, Byte>{planes[0], steps[0], Chroma{{planes[1], planes[2]}, {steps[1], steps[2]}}};
}

/// A plane of luma and one of chroma pairs.
template <Order order = Order::ofMemory, class Byte> auto p2(Byte* luma, int lumaStep, Byte* pairs, int pairsStep)
{
    return SharedChromaImage<PairedChroma<Byte, false, order>, Byte>{luma, lumaStep, {pairs, pairsStep}};
}

/// Packed pairs of pixels: Y0 Cb Y1 Cr.
template <Order order = Order::ofMemory, class Byte> auto c2LumaFirst(Byte* first, int step)
{
    return InterleavedImage<LumaFirst<order>, Byte>{first, step, {}};
}

/// The same for a source, of which nothing in front of a row is read.
template <class Byte> auto c2LumaFirstAlone(Byte* first, int step)
{
    return InterleavedImage<LumaFirstAlone, Byte>{first, step, {}};
}

/// The same as a source whose rows end with a whole pair.
inline auto c2WholePairs(const u8* first, int step)
{
    return InterleavedImage<LumaFirstWholePairs, const u8>{first, step, {}};
}

/// Packed pairs of pixels: Cb Y0 Cr Y1.
template <Order order = Order::ofMemory, class Byte> auto c2ChromaFirst(Byte* first, int step)
{
    return InterleavedImage<ChromaFirst<order>, Byte>{first, step, {}};
}

/// The same as a source whose rows of one pixel have a byte of chroma two bytes in front of them.
template <Order order = Order::ofMemory, class Byte> auto c2ChromaFirstFromBefore(Byte* first, int step)
{
    return InterleavedImage<ChromaFirstFromBefore<order>, Byte>{first, step, {}};
}

/// The same image with its chroma components exchanged, Cr before Cb.
template <int Columns, Order order, Rest rest, class Byte>
auto chromaExchanged(const SharedChromaImage<ChromaPlanes<Columns, Byte, order, rest>, Byte>& image)
{
    const auto& [first, step] = image.chroma;
    return SharedChromaImage<ChromaPlanes<Columns, Byte, order, rest>, Byte>{
        image.first, image.step, {{first[1], first[0]}, {step[1], step[0]}}};
}

template <class Byte, Order order>
auto chromaExchanged(const SharedChromaImage<PairedChroma<Byte, false, order>, Byte>& image)
{
    const auto& [first, step] = image.chroma;
    return SharedChromaImage<PairedChroma<Byte, true, order>, Byte>{image.first, image.step, {first, step}};
}

template <class Packing, class Byte> auto chromaExchanged(const InterleavedImage<Packing, Byte>& image)
{
    return InterleavedImage<ChromaExchanged<Packing>, Byte>{image.first, image.step, {}};
}

} // namespace pyxcc::layouts
