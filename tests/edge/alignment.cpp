// The one conversion whose results follow from the alignment of the image: with all pointers and all steps at multiples
// of 16 it takes another wide form.
#include "pyxcc/pyxcc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <algorithm>

using namespace edge;

namespace
{

constexpr int step = 64;

/// How far each pointer and each step is from a multiple of 16, and how many columns there are.
struct Layout {
    int pointer[3] = {0, 0, 0}, target = 0;
    int sourceStep[3] = {0, 0, 0}, targetStep = 0;
};

/// Two rows of white of that layout, which have to be whole ones.
Samples whiteRows(const Layout& layout, int width)
{
    alignas(16) u8 y[4 * step], cb[4 * step], cr[4 * step], target[8 * step];
    std::ranges::fill(y, u8{235});
    std::ranges::fill(cb, u8{128});
    std::ranges::fill(cr, u8{128});
    const u8* const src[3] = {y + layout.pointer[0], cb + layout.pointer[1], cr + layout.pointer[2]};
    const int srcStep[3] = {step + layout.sourceStep[0], step + layout.sourceStep[1], step + layout.sourceStep[2]};
    u8* const dst = target + layout.target;
    const int dstStep = 3 * step + layout.targetStep;
    EXPECT_EQ(pyxiYCbCr422ToRGB_8u_P3C3R(src, srcStep, dst, dstStep, {width, 2}), pyxOk);
    return Samples(dst, dst + 3 * width) + Samples(dst + dstStep, dst + dstStep + 3 * width);
}

// White. On the aligned path 28032 * 4769 >> 16 = 2039, and 2039 >> 3 = 254. On the other one 28032 * 9535 >> 16 =
// 4078, and (4078 + 8) >> 4 = 255.
const Samples aligned(2 * 3 * 16, 254);
const Samples unaligned(2 * 3 * 16, 255);

} // namespace

TEST(Alignment, AllAtMultiplesOf16) { EXPECT_EQ(whiteRows({}, 16), aligned); }

TEST(Alignment, AnyPointerOffMultiplesOf16)
{
    for (const int offset : {1, 2, 4, 8, 15}) {
        EXPECT_EQ(whiteRows({.pointer = {offset, 0, 0}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.pointer = {0, offset, 0}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.pointer = {0, 0, offset}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.target = offset}, 16), unaligned) << offset;
    }
}

TEST(Alignment, AnyStepOffMultiplesOf16)
{
    for (const int offset : {1, 2, 4, 8, 15}) {
        EXPECT_EQ(whiteRows({.sourceStep = {offset, 0, 0}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.sourceStep = {0, offset, 0}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.sourceStep = {0, 0, offset}}, 16), unaligned) << offset;
        EXPECT_EQ(whiteRows({.targetStep = offset}, 16), unaligned) << offset;
    }
}

TEST(Alignment, EachAtAnotherMultipleOf16)
{
    EXPECT_EQ(whiteRows({.pointer = {16, 0, 0}}, 16), aligned);
    EXPECT_EQ(whiteRows({.pointer = {0, 16, 0}}, 16), aligned);
    EXPECT_EQ(whiteRows({.pointer = {0, 0, 16}}, 16), aligned);
    EXPECT_EQ(whiteRows({.target = 16}, 16), aligned);
    EXPECT_EQ(whiteRows({.sourceStep = {16, 0, 0}}, 16), aligned);
    EXPECT_EQ(whiteRows({.sourceStep = {0, 16, 0}}, 16), aligned);
    EXPECT_EQ(whiteRows({.sourceStep = {0, 0, -16}}, 16), aligned);
    EXPECT_EQ(whiteRows({.targetStep = 16}, 16), aligned);
}

// White of the tail is 254.9 and does not round.
TEST(Alignment, TheTailIsTheSame)
{
    for (const int width : {1, 5, 7, 8, 9, 13, 15}) {
        const int wide = width / 8 * 8;
        const Samples row = Samples(3 * wide, 255) + Samples(3 * (width - wide), 254);
        EXPECT_EQ(whiteRows({}, width), Samples(2 * 3 * width, 254)) << width;
        EXPECT_EQ(whiteRows({.target = 1}, width), row + row) << width;
    }
}

// A gray of 83: 8576 * 4769 >> 16 = 624, which is 78 * 8, where the tail has 77.98.
TEST(Alignment, TheAlignedPathIsWideInBlocksOf8)
{
    alignas(16) u8 y[32], chroma[32], target[96];
    std::ranges::fill(y, u8{83});
    std::ranges::fill(chroma, u8{128});
    const u8* const src[3] = {y, chroma, chroma};
    const int srcStep[3] = {0, 0, 0};
    for (const int width : {1, 7, 8, 15, 16, 23, 24, 31}) {
        const int wide = width / 8 * 8;
        EXPECT_EQ(pyxiYCbCr422ToRGB_8u_P3C3R(src, srcStep, target, 0, {width, 1}), pyxOk);
        EXPECT_EQ(Samples(target, target + 3 * width), Samples(3 * wide, 78) + Samples(3 * (width - wide), 77))
            << width;
    }
}
