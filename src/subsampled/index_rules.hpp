// Which chroma sample of a source becomes which of a target, and how blocks of samples are taken there. With (i, j) a
// sample of the target, by column and row:
//
//     sameGrid    (i, j)
//     rowDouble   (i, j >> 1)                     4:2:0 to 4:2:2
//     rowSkip     (i, 2 j)                        4:2:2 to 4:2:0
//     colDouble   (i >> 1, j)                     4:1:1 to 4:2:2
//     colSkip     (2 i, j)                        4:2:2 to 4:1:1
//     rowFold     (i >> 1, 2 j + (i & 1))         4:1:1 to 4:2:0
//     rowUnfold   (2 i + (j & 1), j >> 1)         4:2:0 to 4:1:1
//
// A rule goes by so many rows of luma at a time, and takes so many columns a sample where samples are fewer; sizes are
// rounded down to them. `row(y, j)` of a source or a target is the row of luma y and chroma j.
#pragma once

#include "layouts/moved_chroma.hpp"

namespace pyxcc::subsampled
{

inline constexpr int blockSamples = 32;

// Blocks: where one goes whose first sample, counted where samples are fewer, is i.

struct AsItIs {
    static constexpr int sourceSamples = 1, targetSamples = 1;

    template <class Source, class Target>
    static PYXCC_INLINE void take(std::ptrdiff_t i, const Source& source, const Target& target)
    {
        target.store(i, source.load(i));
    }
};

struct EachTwice {
    static constexpr int sourceSamples = 1, targetSamples = 2;

    template <class Source, class Target>
    static PYXCC_INLINE void take(std::ptrdiff_t i, const Source& source, const Target& target)
    {
        const auto [first, second] = doubled(target.taken(source.load(i)));
        target.store(2 * i, first);
        target.store(2 * i + blockSamples, second);
    }
};

struct EveryOther {
    static constexpr int sourceSamples = 2, targetSamples = 1;

    template <class Source, class Target>
    static PYXCC_INLINE void take(std::ptrdiff_t i, const Source& source, const Target& target)
    {
        target.store(i, everyOther(source.load(2 * i), source.load(2 * i + blockSamples)));
    }
};

struct TwoRowsByTurns {
    static constexpr int sourceSamples = 1, targetSamples = 2;

    template <class Source, class Target>
    static PYXCC_INLINE void take(std::ptrdiff_t i, const Source& source, const Target& target)
    {
        const auto [first, second] = alternated(source.upper.load(i), source.lower.load(i));
        target.store(2 * i, first);
        target.store(2 * i + blockSamples, second);
    }
};

struct ByTurnsToTwoRows {
    static constexpr int sourceSamples = 2, targetSamples = 1;

    template <class Source, class Target>
    static PYXCC_INLINE void take(std::ptrdiff_t i, const Source& source, const Target& target)
    {
        const auto [upper, lower] = dealt(source.load(2 * i), source.load(2 * i + blockSamples));
        target.upper.store(i, upper);
        target.lower.store(i, lower);
    }
};

/// Takes less than a block through buffers of a whole one.
template <class Block, class Source, class Target>
void takePart(int samples, const Source& source, const Target& target)
{
    constexpr int mostRows = 8, mostBytes = 4; // four rows of two planes; a packed sample
    using Buffer = u8[2 * blockSamples * mostBytes];
    alignas(32) Buffer from[mostRows] = {}, to[mostRows];
    Buffer* next = from;
    const auto copiedSource = source.mapped([&](const u8* row, int bytes) {
        layouts::copyBytes(*next, row, samples * Block::sourceSamples * bytes);
        return *next++;
    });
    next = to;
    const auto copiedTarget = target.mapped([&](u8*, int) { return *next++; });
    Block::take(0, copiedSource, copiedTarget);
    next = to;
    target.mapped([&](u8* row, int bytes) {
        layouts::copyBytes(row, *next++, samples * Block::targetSamples * bytes);
        return row;
    });
}

/// Hints at a block some distance behind the one of sample i.
template <int Distance, int Samples, class Row> PYXCC_INLINE void expectBlock(std::ptrdiff_t i, const Row& row)
{
    row.mapped([i](auto* p, int bytes) PYXCC_INLINE_LAMBDA {
        const auto* const block = p + i * Samples * bytes;
        for (int at = 0; at < blockSamples * Samples * bytes; at += 64) layouts::expectFrom<Distance, 1>(block + at);
        return p;
    });
}

/// Takes a row by blocks, the last of which begins within the one before it if the samples are not a multiple.
template <class Block, class Source, class Target>
PYXCC_INLINE void takeRow(std::ptrdiff_t samples, const Source& source, const Target& target)
{
    if (samples < blockSamples) return takePart<Block>(static_cast<int>(samples), source, target);
    std::ptrdiff_t i = 0;
    for (; i <= samples - blockSamples; i += blockSamples) {
        expectBlock<layouts::expectedLoads, Block::sourceSamples>(i, source);
        if constexpr (!layouts::goesPastCache<Target>) {
            expectBlock<layouts::expectedStores, Block::targetSamples>(i, target);
        }
        Block::take(i, source, target);
    }
    if (i < samples) Block::take(samples - blockSamples, source, target);
}

// The rules.

template <int Columns, int Rows, int SourceColumns, int TargetColumns> struct IndexRule {
    static constexpr int columns = Columns, rows = Rows;
    static constexpr int sourceColumns = SourceColumns, targetColumns = TargetColumns; ///< that share a sample
};

template <int Columns, int Rows> struct SameGrid : IndexRule<Columns, Rows, Columns, Columns> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<AsItIs>(samples, source.row(Rows * j, j), target.row(Rows * j, j));
    }
};

struct RowDouble : IndexRule<2, 2, 2, 2> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<AsItIs>(samples, source.row(2 * j, j), target.row(2 * j, 2 * j));
        takeRow<AsItIs>(samples, source.row(2 * j + 1, j), target.row(2 * j + 1, 2 * j + 1));
    }
};

/// rowDouble into planes, whose second copies come to lie elsewhere: in the third plane a part of each, samples of
/// whole eights behind the last whole `WideBlock`, is as far behind the first copy as rows of the second plane are
/// apart. The whole of the first copy is made before the second, which counts where they overlap.
template <int WideBlock> struct RowDoubleMisplaced : IndexRule<2, 2, 2, 2> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        const auto from = source.row(2 * j, j);
        const auto first = target.row(2 * j, 2 * j), second = target.row(2 * j + 1, 2 * j + 1);
        auto misplaced = second;
        misplaced.b = first.b + target.image.step[1];
        takeRow<AsItIs>(samples, from, first);
        if (misplaced.b == second.b) return takeRow<AsItIs>(samples, from, second);
        const int wide = samples & ~(WideBlock - 1), eights = samples & ~7;
        takePiece(0, wide, from, second);
        takePiece(wide, eights, from, misplaced);
        takePiece(eights, samples, from, second);
    }

private:
    template <class Source, class Target>
    static void takePiece(std::ptrdiff_t from, std::ptrdiff_t to, const Source& source, const Target& target)
    {
        const auto behind = [from](auto* row, int bytes) { return row + from * bytes; };
        if (from < to) takeRow<AsItIs>(to - from, source.mapped(behind), target.mapped(behind));
    }
};

struct RowSkip : IndexRule<2, 2, 2, 2> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<AsItIs>(samples, source.row(2 * j, 2 * j), target.row(2 * j, j));
        if constexpr (requires { target.luma(0); }) {
            takeRow<AsItIs>(samples, source.row(2 * j + 1, 2 * j + 1), target.luma(2 * j + 1));
        }
    }
};

struct ColDouble : IndexRule<4, 1, 4, 2> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<EachTwice>(samples, source.row(j, j), target.row(j, j));
    }
};

struct ColSkip : IndexRule<4, 1, 2, 4> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<EveryOther>(samples, source.row(j, j), target.row(j, j));
    }
};

struct RowFold : IndexRule<4, 2, 4, 2> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<TwoRowsByTurns>(samples, layouts::TwoRows{source.row(2 * j, 2 * j), source.row(2 * j + 1, 2 * j + 1)},
                                target.row(2 * j, j));
    }
};

struct RowUnfold : IndexRule<4, 2, 2, 4> {
    template <class Source, class Target>
    static void step(int j, int samples, const Source& source, const Target& target)
    {
        takeRow<ByTurnsToTwoRows>(samples, source.row(2 * j, j),
                                  layouts::TwoRows{target.row(2 * j, 2 * j), target.row(2 * j + 1, 2 * j + 1)});
    }
};

} // namespace pyxcc::subsampled
