// Luma and chroma as bytes, for what moves or filters samples and does not look at colours. A block is 32 columns: luma
// is a register, and so is the chroma of the 16 pairs of columns, both components in turn. A partial block has whole
// pairs.
#pragma once

#include "layouts/avx2/chroma.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

template <class Luma, class Pairs> struct LumaAndPairs {
    Luma luma;
    Pairs pairs;
};

template <class Luma, class Pairs> LumaAndPairs(Luma, Pairs) -> LumaAndPairs<Luma, Pairs>;

/// A row of each of two planes of chroma, as pairs. Columns are counted as those of luma.
template <class Byte> struct SplitPairsRow {
    static constexpr int block = wide::U8::count;
    Byte *a, *b;

    PYXCC_INLINE wide::U8 load(int x) const { return joinPairs({loadHalf(a + x / 2), loadHalf(b + x / 2)}); }

    PYXCC_INLINE wide::U8 load(int x, int count) const
    {
        u8 bufferA[block / 2] = {}, bufferB[block / 2] = {};
        copyBytes(bufferA, a + x / 2, count / 2);
        copyBytes(bufferB, b + x / 2, count / 2);
        return joinPairs({loadHalf(bufferA), loadHalf(bufferB)});
    }

    PYXCC_INLINE void store(int x, wide::U8 pairs) const
    {
        const ChromaPairs apart = splitPairs(pairs);
        storeHalf(a + x / 2, apart.a);
        storeHalf(b + x / 2, apart.b);
    }

    PYXCC_INLINE void store(int x, int count, wide::U8 pairs) const
    {
        u8 bufferA[block / 2], bufferB[block / 2];
        SplitPairsRow<u8>{bufferA, bufferB}.store(0, pairs);
        copyBytes(a + x / 2, bufferA, count / 2);
        copyBytes(b + x / 2, bufferB, count / 2);
    }
};

/// Rows of luma and rows of chroma that are read or written together.
template <class LumaRow, class PairsRow> struct LumaAndPairsRow {
    static constexpr int block = wide::U8::count;
    LumaRow luma;
    PairsRow pairs;

    PYXCC_INLINE auto load(int x) const { return LumaAndPairs{luma.load(x), pairs.load(x)}; }
    PYXCC_INLINE auto load(int x, int count) const { return LumaAndPairs{luma.load(x, count), pairs.load(x, count)}; }

    template <class Luma, class Pairs> PYXCC_INLINE void store(int x, const LumaAndPairs<Luma, Pairs>& samples) const
    {
        luma.store(x, samples.luma);
        pairs.store(x, samples.pairs);
    }

    template <class Luma, class Pairs>
    PYXCC_INLINE void store(int x, int count, const LumaAndPairs<Luma, Pairs>& samples) const
    {
        luma.store(x, count, samples.luma);
        pairs.store(x, count, samples.pairs);
    }
};

template <class LumaRow, class PairsRow> LumaAndPairsRow(LumaRow, PairsRow) -> LumaAndPairsRow<LumaRow, PairsRow>;

/// Luma and chroma bytes in turn.
template <bool LumaFirst> struct PackedPairs {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE LumaAndPairs<wide::U8, wide::U8> load(const u8* p)
    {
        const auto [even, odd] = loadAlternating(p);
        return LumaFirst ? LumaAndPairs{even, odd} : LumaAndPairs{odd, even};
    }

    static PYXCC_INLINE void store(u8* p, const LumaAndPairs<wide::U8, wide::U8>& samples)
    {
        const auto& [luma, pairs] = samples;
        LumaFirst ? storeAlternating(p, luma, pairs) : storeAlternating(p, pairs, luma);
    }
};

/// Two packed rows that are read or written together.
template <class Row> struct PackedRowPair {
    static constexpr int block = Row::block;
    Row upper, lower;

    PYXCC_INLINE auto load(int x) const { return together(upper.load(x), lower.load(x)); }
    PYXCC_INLINE auto load(int x, int count) const { return together(upper.load(x, count), lower.load(x, count)); }

    template <class Rows> PYXCC_INLINE void store(int x, const LumaAndPairs<Rows, Rows>& samples) const
    {
        upper.store(x, LumaAndPairs{samples.luma.a, samples.pairs.a});
        lower.store(x, LumaAndPairs{samples.luma.b, samples.pairs.b});
    }

    template <class Rows> PYXCC_INLINE void store(int x, int count, const LumaAndPairs<Rows, Rows>& samples) const
    {
        upper.store(x, count, LumaAndPairs{samples.luma.a, samples.pairs.a});
        lower.store(x, count, LumaAndPairs{samples.luma.b, samples.pairs.b});
    }

private:
    template <class Samples> static PYXCC_INLINE auto together(const Samples& a, const Samples& b)
    {
        return LumaAndPairs{Two{a.luma, b.luma}, Two{a.pairs, b.pairs}};
    }
};

template <class Row> PackedRowPair(Row, Row) -> PackedRowPair<Row>;

/// Rows that are read together.
template <class Row, int N> struct RowsTogether {
    static constexpr int block = Row::block;
    std::array<Row, N> rows;

    PYXCC_INLINE auto load(int x) const
    {
        return loadEach([x](const Row& row) PYXCC_INLINE_LAMBDA { return row.load(x); });
    }
    PYXCC_INLINE auto load(int x, int count) const
    {
        return loadEach([x, count](const Row& row) PYXCC_INLINE_LAMBDA { return row.load(x, count); });
    }

private:
    template <class Load> PYXCC_INLINE auto loadEach(const Load& loadFrom) const
    {
        Several<decltype(loadFrom(rows[0])), N> samples;
        for (int i = 0; i < N; ++i) samples.part[i] = loadFrom(rows[i]);
        return samples;
    }
};

template <class Row, class... Rows> PYXCC_INLINE auto together(const Row& first, const Rows&... rest)
{
    return RowsTogether<Row, 1 + sizeof...(Rows)>{{first, rest...}};
}

/// A plane of bytes: luma, one component of chroma, or pairs of both.
template <class Byte> struct BytePlane {
    Byte* first;
    std::ptrdiff_t step;

    PYXCC_INLINE auto row(int y) const { return SampleRow<wide::U8, Byte>{rowAt(first, step, y)}; }
};

/// Two planes of chroma whose samples are taken for pairs.
template <class Byte> struct SplitPairsImage {
    BytePlane<Byte> a, b;

    PYXCC_INLINE auto row(int y) const
    {
        return SplitPairsRow<Byte>{rowAt(a.first, a.step, y), rowAt(b.first, b.step, y)};
    }
};

template <class Byte> auto plane(Byte* first, std::ptrdiff_t step) { return BytePlane<Byte>{first, step}; }

template <class Byte> auto pairsOf(const BytePlane<Byte>& a, const BytePlane<Byte>& b)
{
    return SplitPairsImage<Byte>{a, b};
}

/// Packed pairs of pixels, Y0 Cb Y1 Cr or Cb Y0 Cr Y1, as luma and chroma pairs.
template <bool LumaFirst, class Byte> auto packedPairs(Byte* first, std::ptrdiff_t step)
{
    return InterleavedImage<PackedPairs<LumaFirst>, Byte>{first, step, {}};
}

} // namespace pyxcc::layouts
