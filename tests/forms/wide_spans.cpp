// How far the wide forms reach, for every width from 1 to 140: the loops that lay the blocks, counted out.
#include "subsampled/wide_spans.hpp"

#include <gtest/gtest.h>

#include <tuple>

using namespace pyxcc::subsampled;

namespace
{

constexpr int widest = 140;

/// Columns that blocks of `block` cover, laid one after the other while a whole one fits in front of `end`.
int laid(int block, int end)
{
    int columns = 0;
    while (columns + block <= end) columns += block;
    return columns;
}

} // namespace

TEST(WideSpans, WholeBlocks)
{
    for (int width = 1; width <= widest; ++width) {
        EXPECT_EQ(blocksOf<8>(width), laid(8, width)) << width;
        EXPECT_EQ(blocksOf<16>(width), laid(16, width)) << width;
        EXPECT_EQ(blocksOf<32>(width), laid(32, width)) << width;
        EXPECT_EQ(wholePairs(width), laid(2, width)) << width;
        EXPECT_EQ(wholeFours(width), laid(4, width)) << width;
        EXPECT_EQ(everyColumn(width), width);
    }
}

TEST(WideSpans, BlocksOf32AndThenOneOf16AreWholeBlocksOf16)
{
    for (int width = 1; width <= widest; ++width) {
        int columns = laid(32, width);
        if (columns + 16 <= width) columns += 16;
        EXPECT_EQ(blocksOf<16>(width), columns) << width;
    }
}

TEST(WideSpans, EightChromaColumnsAndThenFourAreWholeBlocksOf8)
{
    for (int width = 1; width <= widest; ++width) {
        const int chromaColumns = width / 2;
        int columns = laid(8, chromaColumns);
        if (columns + 4 <= chromaColumns) columns += 4;
        EXPECT_EQ(blocksOf<8>(width), 2 * columns) << width;
    }
}

TEST(WideSpans, BlocksOf8ByTwosThenFourColumns)
{
    for (int width = 1; width <= widest; ++width) {
        int columns = laid(8, laid(16, width));
        if (width % 8 >= 4) columns += 4;
        EXPECT_EQ(blocksByTwosThenHalf<8>(width), columns) << width;
    }
    for (const auto& [width, columns] : {std::tuple{3, 0},
                                         {4, 4},
                                         {8, 0},
                                         {11, 0},
                                         {12, 4},
                                         {16, 16},
                                         {19, 16},
                                         {20, 20},
                                         {24, 16},
                                         {27, 16},
                                         {28, 20},
                                         {31, 20},
                                         {32, 32},
                                         {60, 52}}) {
        EXPECT_EQ(blocksByTwosThenHalf<8>(width), columns) << width;
    }
}

TEST(WideSpans, BlocksOf16ByTwosThenEightColumns)
{
    for (int width = 1; width <= widest; ++width) {
        int columns = laid(16, laid(32, width));
        if (width % 16 >= 8) columns += 8;
        EXPECT_EQ(blocksByTwosThenHalf<16>(width), columns) << width;
    }
    for (const auto& [width, columns] : {std::tuple{7, 0},
                                         {8, 8},
                                         {16, 0},
                                         {23, 0},
                                         {24, 8},
                                         {31, 8},
                                         {32, 32},
                                         {40, 40},
                                         {48, 32},
                                         {55, 32},
                                         {56, 40},
                                         {63, 40},
                                         {64, 64}}) {
        EXPECT_EQ(blocksByTwosThenHalf<16>(width), columns) << width;
    }
}

TEST(WideSpans, FoursAndThreeLeftOver)
{
    for (int width = 1; width <= widest; ++width) {
        int columns = laid(4, width);
        if (width - columns == 3) columns += 3;
        EXPECT_EQ(wholeFoursOrThree(width), columns) << width;
    }
}

TEST(WideSpans, ARuleIsOneEndForEachForm)
{
    constexpr auto rule = upTo<blocksByTwosThenHalf<8>, wholePairs, everyColumn>;
    EXPECT_EQ(rule(29), (std::array{20, 28, 29}));
}
