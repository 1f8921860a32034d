// How far the spans of a row reach, as functions of its width. The wide forms take whole blocks; how the blocks are
// laid is a school's own way, and the results show it.
#pragma once

#include <array>

namespace pyxcc::subsampled
{

/// As many whole blocks of `Block` columns as there are.
template <int Block> constexpr int blocksOf(int width)
{
    static_assert((Block & (Block - 1)) == 0);
    return width & ~(Block - 1);
}

/// Blocks of `Block` columns two at a time, then half a block if what is left of the last one has room for it. A block
/// that is left over without a second one is passed over, and half a block comes in its place or nothing does: by
/// blocks of 8, 24 columns give 16 and 28 give 20.
template <int Block> constexpr int blocksByTwosThenHalf(int width)
{
    constexpr int half = Block / 2;
    return blocksOf<2 * Block>(width) + (width % Block >= half ? half : 0);
}

/// Columns whose chroma sample is whole.
constexpr int wholePairs(int width) { return blocksOf<2>(width); }
constexpr int wholeFours(int width) { return blocksOf<4>(width); }

/// Fours, and three columns that are left over as well.
constexpr int wholeFoursOrThree(int width) { return width % 4 == 3 ? width : wholeFours(width); }

constexpr int everyColumn(int width) { return width; }

/// The rule of a plan whose spans end as these functions of the width tell.
template <auto... Ends> constexpr auto upTo = [](int width) { return std::array{Ends(width)...}; };

} // namespace pyxcc::subsampled
