// YCbCr to RGB: known colours, and the column at which a row passes from the wide form to that of the tail.
#include "pyxcc/rgb_ycbcr.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <algorithm>

using namespace edge;

namespace
{

struct Colour {
    u8 y, cb, cr;
};

constexpr Colour black = {16, 128, 128};
constexpr Colour white = {235, 128, 128};
constexpr Colour red = {81, 90, 240};

/// A row of equal pixels, converted. With 3 samples a pixel:
Samples c3(Colour colour, int width)
{
    const Samples source = repeated({colour.y, colour.cb, colour.cr}, width);
    Samples target(source.size());
    EXPECT_EQ(pyxiYCbCrToRGB_8u_C3R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// With 4 samples a pixel, alpha being 99 in the source and 77 in the target:
Samples ac4(Colour colour, int width)
{
    const Samples source = repeated({colour.y, colour.cb, colour.cr, 99}, width);
    Samples target(source.size(), 77);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_AC4R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// The three planes of a row of equal pixels.
struct PlanarRow {
    Samples y, cb, cr;
    const u8* planes[3];

    PlanarRow(Colour colour, int width)
        : y(width, colour.y), cb(width, colour.cb), cr(width, colour.cr), planes{y.data(), cb.data(), cr.data()}
    {
    }
};

/// From planes to planes, the row of R before those of G and B:
Samples p3(Colour colour, int width)
{
    const PlanarRow source(colour, width);
    Samples target(3 * width);
    u8* const dst[3] = {target.data(), target.data() + width, target.data() + 2 * width};
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3R(source.planes, 0, dst, 0, {width, 1}), pyxOk);
    return target;
}

/// From planes to 3 samples a pixel:
using ToPixels = PyxStatus (*)(const u8* const*, int, u8*, int, RoiSize);

Samples p3c3(ToPixels convert, Colour colour, int width)
{
    const PlanarRow source(colour, width);
    Samples target(3 * width);
    EXPECT_EQ(convert(source.planes, 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// From planes to 4 samples a pixel, the fourth being 200:
using ToPixelsWithAlpha = PyxStatus (*)(const u8* const*, int, u8*, int, RoiSize, u8);

Samples p3c4(ToPixelsWithAlpha convert, Colour colour, int width)
{
    const PlanarRow source(colour, width);
    Samples target(4 * width, 77);
    EXPECT_EQ(convert(source.planes, 0, target.data(), 0, {width, 1}, 200), pyxOk);
    return target;
}

} // namespace

TEST(YCbCrToRgb, BlackIsBlackInEveryForm)
{
    for (const int width : {3, 4, 7, 8, 15, 16, 17}) {
        EXPECT_EQ(c3(black, width), Samples(3 * width, 0));
        EXPECT_EQ(ac4(black, width), repeated({0, 0, 0, 77}, width));
        EXPECT_EQ(p3(black, width), Samples(3 * width, 0));
        EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, black, width), Samples(3 * width, 0));
        EXPECT_EQ(p3c3(pyxiYCbCrToBGR_8u_P3C3R, black, width), Samples(3 * width, 0));
        EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, black, width), repeated({0, 0, 0, 200}, width));
        EXPECT_EQ(p3c4(pyxiYCbCrToBGR_8u_P3C4R, black, width), repeated({0, 0, 0, 200}, width));
    }
}

// White is 255 in invHighA, which rounds, and 254 in invExactA, which truncates.
TEST(YCbCrToRgb, InterleavedRowOf3IsExact) { EXPECT_EQ(c3(white, 3), Samples(9, 254)); }

TEST(YCbCrToRgb, InterleavedRowOf4IsHigh) { EXPECT_EQ(c3(white, 4), Samples(12, 255)); }

TEST(YCbCrToRgb, InterleavedRowOf5EndsExact) { EXPECT_EQ(c3(white, 5), Samples(12, 255) + Samples(3, 254)); }

TEST(YCbCrToRgb, InterleavedRowsOfSeveralBlocksEndExact)
{
    EXPECT_EQ(c3(white, 15), Samples(3 * 12, 255) + Samples(9, 254));
    EXPECT_EQ(c3(white, 39), Samples(3 * 36, 255) + Samples(9, 254));
}

TEST(YCbCrToRgb, WithAlphaEveryPixelIsExactAndTheTargetsAlphaStays)
{
    for (const int width : {1, 4, 8, 16, 33}) EXPECT_EQ(ac4(white, width), repeated({254, 254, 254, 77}, width));
}

// White is 254 in invHighB, the one wide form without rounding, and 255 in invExactB.
TEST(YCbCrToRgb, PlanesTakeTheHighFormInBlocksOf4)
{
    EXPECT_EQ(p3(white, 3), Samples(9, 255));
    EXPECT_EQ(p3(white, 4), Samples(12, 254));
    const Samples row = Samples(4, 254) + Samples(1, 255);
    EXPECT_EQ(p3(white, 5), row + row + row);
    EXPECT_EQ(p3(white, 16), Samples(48, 254));
}

TEST(YCbCrToRgb, AlignedPlanesTakeTheHighFormThroughout)
{
    // Pointers, steps and width are multiples of 16 here, in the other tests only by chance.
    alignas(16) u8 y[32], chroma[32];
    alignas(16) u8 target[3][32];
    std::fill_n(y, 32, white.y);
    std::fill_n(chroma, 32, white.cb);
    const u8* const src[3] = {y, chroma, chroma};
    u8* const dst[3] = {target[0], target[1], target[2]};
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3R(src, 16, dst, 16, {16, 2}), pyxOk);
    EXPECT_EQ(Samples(target[0], target[0] + 3 * 32), Samples(3 * 32, 254));
}

// White is 255 in invHighC and 254 in invExactC.
TEST(YCbCrToRgb, PlanesToPixelsTakeTheHighFormInBlocksOf8)
{
    EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, white, 7), Samples(21, 254));
    EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, white, 8), Samples(24, 255));
    EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, white, 9), Samples(24, 255) + Samples(3, 254));
}

// Blue of (19, 129, 128). In invHighD the luma term is 384 * 9535 >> 16 = 55 and that of Cb 128 * 16523 >> 16 = 32, so
// that (55 + 32 + 8) >> 4 = 5; in invExactD 76282 * 19 + 132184 - 1187744 = 393798 is 6 * 65536 and a little. Red and
// green are 3 in both.
TEST(YCbCrToRgb, PlanesToPixelsWithAlphaTakeTheHighFormInBlocksOf8)
{
    constexpr Colour colour = {19, 129, 128};
    EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, colour, 7), repeated({3, 3, 6, 200}, 7));
    EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, colour, 8), repeated({3, 3, 5, 200}, 8));
    EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, colour, 9), repeated({3, 3, 5, 200}, 8) + repeated({3, 3, 6, 200}, 1));
}

TEST(YCbCrToRgb, BgrWithAlphaIsOfTheHighFormAtEveryWidth)
{
    for (int width = 1; width <= 40; ++width)
        EXPECT_EQ(p3c4(pyxiYCbCrToBGR_8u_P3C4R, {19, 129, 128}, width), repeated({5, 3, 3, 200}, width)) << width;
}

TEST(YCbCrToRgb, AvalIsInEveryFourthByteOfTheTailToo)
{
    for (const int width : {1, 7, 8, 9, 16, 23}) {
        EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, white, width), repeated({255, 255, 255, 200}, width));
        EXPECT_EQ(p3c4(pyxiYCbCrToBGR_8u_P3C4R, white, width), repeated({255, 255, 255, 200}, width));
    }
}

TEST(YCbCrToRgb, BgrIsOfTheHighFormAtEveryWidth)
{
    for (int width = 1; width <= 40; ++width)
        EXPECT_EQ(p3c3(pyxiYCbCrToBGR_8u_P3C3R, white, width), Samples(3 * width, 255)) << width;
}

// Red comes back as 254, 0, 0. In the C and D forms, for instance: the luma term is 8320 * 9535 >> 16 = 1210, that of
// Cr 14336 * 13074 >> 16 = 2859, and (1210 + 2859 + 8) >> 4 = 254; green and blue end at or just below zero.
TEST(YCbCrToRgb, ChannelsStandInTheOrderOfTheName)
{
    for (const int width : {1, 8, 9, 17}) {
        EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, red, width), repeated({254, 0, 0}, width));
        EXPECT_EQ(p3c3(pyxiYCbCrToBGR_8u_P3C3R, red, width), repeated({0, 0, 254}, width));
        EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, red, width), repeated({254, 0, 0, 200}, width));
        EXPECT_EQ(p3c4(pyxiYCbCrToBGR_8u_P3C4R, red, width), repeated({0, 0, 254, 200}, width));
    }
}

// Green of (18, 128, 129): the luma term is 256 * 9535 >> 16 = 37. The product of 128 and 6660 is 13 * 65536 and a bit,
// so that its negative has the high word -14: invHighC adds that, (37 - 14 + 8) >> 4 = 1, and invHighD subtracts 13,
// (37 - 13 + 8) >> 4 = 2. Red is (37 + 25 + 8) >> 4 = 4 and blue (37 + 8) >> 4 = 2 in both.
TEST(YCbCrToRgb, GreenRoundsTheOtherWayWhenItIsSubtracted)
{
    constexpr Colour colour = {18, 128, 129};
    EXPECT_EQ(p3c3(pyxiYCbCrToRGB_8u_P3C3R, colour, 8), repeated({4, 1, 2}, 8));
    EXPECT_EQ(p3c3(pyxiYCbCrToBGR_8u_P3C3R, colour, 9), repeated({2, 1, 4}, 9));
    EXPECT_EQ(p3c4(pyxiYCbCrToRGB_8u_P3C4R, colour, 8), repeated({4, 2, 2, 200}, 8));
    EXPECT_EQ(p3c4(pyxiYCbCrToBGR_8u_P3C4R, colour, 9), repeated({2, 2, 4, 200}, 9));
}
