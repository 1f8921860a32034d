// Targets in which neighbouring pixels share their chroma: planes, luma and a plane of chroma pairs, or packed rows.
//
// A partial block ends where its last whole chroma sample does: columns behind it get luma and no chroma. Only a packed
// row has a place for one chroma sample, the first of the two, beside a last odd pixel.
#pragma once

#include "layouts/avx2/chroma.hpp"
#include "layouts/images.hpp"

#include <array>

namespace pyxcc::layouts
{

/// What a block of columns becomes: luma of every pixel, of one row or of two, and the two chroma samples of every
/// `Columns` columns.
template <int Columns, class Luma> struct SharedChroma {
    Luma luma;
    Two<wide::Byte> chroma;
};

/// Rows of two planes of chroma.
template <int Columns> struct ChromaPlanesRow {
    static constexpr int columns = Columns;
    u8 *a, *b;

    PYXCC_INLINE void store(int x, const Two<wide::Byte>& chroma) const
    {
        storeApart<Columns>(a + x / Columns, b + x / Columns, chroma);
    }

    PYXCC_INLINE void store(int x, int count, const Two<wide::Byte>& chroma) const
    {
        u8 bufferA[wide::U8::count / Columns], bufferB[wide::U8::count / Columns];
        storeApart<Columns>(bufferA, bufferB, chroma);
        copyBytes(a + x / Columns, bufferA, count / Columns);
        copyBytes(b + x / Columns, bufferB, count / Columns);
    }
};

/// A row of one plane of chroma pairs.
struct ChromaPairsRow {
    static constexpr int columns = 2;
    SampleRow<wide::U8, u8> pairs;

    PYXCC_INLINE void store(int x, const Two<wide::Byte>& chroma) const { pairs.store(x, narrowInTurn(chroma)); }

    PYXCC_INLINE void store(int x, int count, const Two<wide::Byte>& chroma) const
    {
        pairs.store(x, count & ~1, narrowInTurn(chroma));
    }
};

/// One row of luma, or two, and the row of chroma that goes with it.
template <class LumaRow, class ChromaRow> struct SharedChromaRow {
    static constexpr int block = LumaRow::block;
    LumaRow luma;
    ChromaRow chroma;

    template <int Columns, class Luma> PYXCC_INLINE void store(int x, const SharedChroma<Columns, Luma>& pixels) const
    {
        static_assert(Columns == ChromaRow::columns);
        luma.store(x, pixels.luma);
        chroma.store(x, pixels.chroma);
    }

    template <int Columns, class Luma>
    PYXCC_INLINE void store(int x, int count, const SharedChroma<Columns, Luma>& pixels) const
    {
        static_assert(Columns == ChromaRow::columns);
        luma.store(x, count, pixels.luma);
        chroma.store(x, count, pixels.chroma);
    }
};

template <class LumaRow, class ChromaRow> SharedChromaRow(LumaRow, ChromaRow) -> SharedChromaRow<LumaRow, ChromaRow>;

/// Two planes of chroma, a sample for every `Columns` columns.
template <int Columns> struct ChromaPlanes {
    std::array<u8*, 2> first;
    std::array<std::ptrdiff_t, 2> step;

    PYXCC_INLINE auto row(int y) const
    {
        return ChromaPlanesRow<Columns>{rowAt(first[0], step[0], y), rowAt(first[1], step[1], y)};
    }
};

/// A plane of chroma pairs, one for every two columns.
struct PairedChroma {
    u8* first;
    std::ptrdiff_t step;

    PYXCC_INLINE auto row(int y) const { return ChromaPairsRow{rowAt(first, step, y)}; }
};

/// A plane of luma, and chroma in planes of its own.
template <class Chroma> struct SharedChromaImage {
    u8* first;
    std::ptrdiff_t step;
    Chroma chroma;

    PYXCC_INLINE auto row(int y) const { return SharedChromaRow{luma(y), chroma.row(y)}; }

    /// Rows 2 j and 2 j + 1 of luma and row j of chroma.
    PYXCC_INLINE auto rowPair(int j) const
    {
        return SharedChromaRow{RowPair{luma(2 * j), luma(2 * j + 1)}, chroma.row(j)};
    }

private:
    PYXCC_INLINE auto luma(int y) const { return SampleRow<wide::U8, u8>{rowAt(first, step, y)}; }
};

/// Luma and chroma bytes in turn, luma first.
struct LumaFirst {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE void store(u8* p, const SharedChroma<2, wide::U8>& pixels)
    {
        storeAlternating(p, pixels.luma, narrowInTurn(pixels.chroma));
    }
};

/// Chroma and luma bytes in turn, chroma first.
struct ChromaFirst {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE void store(u8* p, const SharedChroma<2, wide::U8>& pixels)
    {
        storeAlternating(p, narrowInTurn(pixels.chroma), pixels.luma);
    }
};

/// A packing with its two chroma components exchanged.
template <class Packing> struct ChromaExchanged {
    using Samples = typename Packing::Samples;
    static constexpr int pixelBytes = Packing::pixelBytes;
    static constexpr bool readsTarget = Packing::readsTarget;

    static PYXCC_INLINE void store(u8* p, const SharedChroma<2, wide::U8>& pixels)
    {
        Packing::store(p, {pixels.luma, {pixels.chroma.b, pixels.chroma.a}});
    }
};

/// Three planes with a step each: luma, and two of chroma with a sample for every `Columns` columns.
template <int Columns> auto p3(u8* const planes[3], const int steps[3])
{
    using Chroma = ChromaPlanes<Columns>;
    return SharedChromaImage<Chroma>{planes[0], steps[0], Chroma{{planes[1], planes[2]}, {steps[1], steps[2]}}};
}

/// A plane of luma and one of chroma pairs.
inline auto p2(u8* luma, int lumaStep, u8* pairs, int pairsStep)
{
    return SharedChromaImage<PairedChroma>{luma, lumaStep, {pairs, pairsStep}};
}

/// Packed pairs of pixels: Y0 Cb Y1 Cr.
inline auto c2LumaFirst(u8* first, int step) { return InterleavedImage<LumaFirst, u8>{first, step, {}}; }

/// Packed pairs of pixels: Cb Y0 Cr Y1.
inline auto c2ChromaFirst(u8* first, int step) { return InterleavedImage<ChromaFirst, u8>{first, step, {}}; }

/// The same image with its chroma components exchanged, Cr before Cb.
template <int Columns> auto chromaExchanged(const SharedChromaImage<ChromaPlanes<Columns>>& image)
{
    const auto& [first, step] = image.chroma;
    return SharedChromaImage<ChromaPlanes<Columns>>{
        image.first, image.step, {{first[1], first[0]}, {step[1], step[0]}}};
}

template <class Packing> auto chromaExchanged(const InterleavedImage<Packing, u8>& image)
{
    return InterleavedImage<ChromaExchanged<Packing>, u8>{image.first, image.step, {}};
}

} // namespace pyxcc::layouts
