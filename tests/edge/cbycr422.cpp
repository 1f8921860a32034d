// Packed CbYCr 4:2:2: the filter along the row and where it begins, last odd pixels, gamma, and repacking at odd sizes.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

} // namespace

// Cb of the first pair is ((7193 + 3596) * 255 + 0x403FFF) / 32768 = 212.5, of the others, which the odd pixel in front
// of them adds to, ((7193 + 2 * 3596) * 255 + 0x403FFF) / 32768 = 240.4. Cr is
// (-(1164 + 582) * 255 + 0x403FFF) / 32768 = 114.9 and (-(1164 + 2 * 582) * 255 + 0x403FFF) / 32768 = 110.4; Y is
// (3212 * 255 + 0x84000) / 32768 = 41.5.
TEST(RgbToCbYCr422, TheFirstPairOfARowLeansTowards128)
{
    for (const int width : {2, 6, 32, 34, 66, 98}) {
        const Samples row = packedRow(pyxiRGBToCbYCr422_8u_C3C2R, repeated({0, 0, 255}, width), width, 2 * width);
        EXPECT_EQ(row, repeated({212, 41, 114, 41}, 1) + repeated({240, 41, 110, 41}, width / 2 - 1)) << width;
    }
}

// An odd pixel of blue, the rest black: 3596 * 255 + 0x403FFF = 5127667 in its pair and in the one behind it, 156.5
// steps of 32768. Cr loses 582 * 255 there: 4062277, 123.97 steps. Elsewhere chroma is 0x403FFF, 128.5 steps, and
// Y 16.5.
TEST(RgbToCbYCr422, AnOddPixelReachesOverToTheNextPairAndNoFurther)
{
    constexpr int width = 70;
    for (const int pair : {0, 7, 14, 15, 16, 31, 32, 33}) {
        Samples source(3 * width, 0), expected = repeated({128, 16, 128, 16}, width / 2);
        source[3 * (2 * pair + 1) + 2] = 255;
        for (const int changed : {pair, pair + 1}) {
            expected[4 * changed] = 156;
            expected[4 * changed + 2] = 123;
        }
        expected[4 * pair + 3] = 41;
        EXPECT_EQ(packedRow(pyxiRGBToCbYCr422_8u_C3C2R, source, width, 2 * width), expected) << pair;
    }
}

// Blue by itself is Y (6423 * 255 + 0x108000) >> 16 = 41 and Cb (28770 * 255 + 0x808000) >> 16 = 240, without anything
// of the pixel in front of it.
TEST(RgbToCbYCr422, ALastOddPixelStandsByItself)
{
    const Samples one = packedRow(pyxiRGBToCbYCr422_8u_C3C2R, {0, 0, 255}, 1, 4);
    EXPECT_EQ(one, (Samples{240, 41, none, none}));
    const Samples three = packedRow(pyxiRGBToCbYCr422_8u_C3C2R, repeated({0, 0, 255}, 3), 3, 8);
    EXPECT_EQ(three, (Samples{212, 41, 114, 41, 240, 41, none, none}));
}

TEST(RgbToCbYCr422, GammaLeavesBlackAndWhite)
{
    for (const u8 value : {0, 255}) {
        for (const int width : {1, 2, 7, 32, 33, 67}) {
            const Samples source(3 * width, value);
            EXPECT_EQ(packedRow(pyxiRGBToCbYCr422Gamma_8u_C3C2R, source, width, 2 * width),
                      packedRow(pyxiRGBToCbYCr422_8u_C3C2R, source, width, 2 * width));
        }
    }
}

// 4.5 * 1 and 4.5 * 3 are ties, which go to even: 4 and 14.
TEST(RgbToCbYCr422, GammaComesBeforeTheMatrixInAllPixels)
{
    const Samples dark = {0, 1, 2, 3, 4, 5}, brighter = {0, 4, 9, 14, 18, 23};
    for (const int pixels : {1, 2, 17, 18}) {
        Samples source, mapped;
        for (int i = 0; i < pixels; ++i) {
            source = source + Samples{dark[i % 6], dark[(i + 1) % 6], dark[(2 * i + 3) % 6]};
            mapped = mapped + Samples{brighter[i % 6], brighter[(i + 1) % 6], brighter[(2 * i + 3) % 6]};
        }
        EXPECT_EQ(packedRow(pyxiRGBToCbYCr422Gamma_8u_C3C2R, source, pixels, 2 * pixels),
                  packedRow(pyxiRGBToCbYCr422_8u_C3C2R, mapped, pixels, 2 * pixels));
    }
}

// Pure red is Y (16843 * 255 + 0x108000) >> 16 = 82 and Cb (-9699 * 255 + 0x808000) >> 16 = 90.
TEST(BgrToCbYCr422, ALastOddPixelIsTakenForRgb)
{
    EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_8u_AC4C2R, {255, 0, 0, 9}, 1, 4), (Samples{90, 82, none, none}));
}

// Red: R (76282 * 81 + 104593 * 112 - 1187744) >> 16 = 254, G (76282 * 81 + 25689 * 38 - 53279 * 112 - 1187744) >> 16 =
// 0 and B (76282 * 81 - 132184 * 38 - 1187744) >> 16 = -1.
TEST(CbYCr422ToRgb, ALastOddPixelHasTheCrInFrontOfIt)
{
    const Samples three = {90, 81, 240, 81, 90, 81};
    EXPECT_EQ(packedRow(pyxiCbYCr422ToRGB_8u_C2C3R, three, 3, 9), repeated({254, 0, 0}, 3));
    EXPECT_EQ(packedRow(pyxiCbYCr422ToBGR_8u_C2C4R, three, 3, 12), repeated({0, 0, 254, aval}, 3));

    // In a row of one pixel it is two bytes in front of the row.
    const Samples withTwoInFront = {240, 0, 90, 81};
    Samples target(4, none);
    EXPECT_EQ(pyxiCbYCr422ToRGB_8u_C2C3R(withTwoInFront.data() + 2, 0, target.data(), 0, {1, 1}), pyxOk);
    EXPECT_EQ(target, (Samples{254, 0, 0, none}));
    EXPECT_EQ(pyxiCbYCr422ToBGR_8u_C2C4R(withTwoInFront.data() + 2, 0, target.data(), 0, {1, 1}, aval), pyxOk);
    EXPECT_EQ(target, (Samples{0, 0, 254, aval}));
}

TEST(CbYCr422Repacks, AnOddColumnStaysInSilence)
{
    const Samples source = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10};
    const Samples expected = {2, 1, 4, 3, 6, 5, 8, 7, none, none};
    EXPECT_EQ(packedRow(pyxiCbYCr422ToYCbCr422_8u_C2R, source, 5, 10), expected);
    EXPECT_EQ(packedRow(pyxiYCbCr422ToCbYCr422_8u_C2R, source, 5, 10), expected);

    const RoiSize roi = {5, 1};
    const YCbCrPlanes planes = {{2, 4, 6, 8, 10}, {1, 5, 9}, {3, 7, 11}};
    const u8* const src[3] = {planes.y.data(), planes.cb.data(), planes.cr.data()};
    const int steps[3] = {5, 3, 3};
    Samples target(10, none);
    EXPECT_EQ(pyxiYCbCr422ToCbYCr422_8u_P3C2R(src, steps, target.data(), 10, roi), pyxOk);
    EXPECT_EQ(target, (Samples{1, 2, 3, 4, 5, 6, 7, 8, none, none}));
    EXPECT_EQ(toPlanes(pyxiCbYCr422ToYCbCr422_8u_C2P3R, source, roi, block422, pyxOk),
              (YCbCrPlanes{{2, 4, 6, 8, none}, {1, 5, none}, {3, 7, none}}));
}

// Two pairs of rows; the rows of Cr are as far apart as Cb's step says, and the reverse.
TEST(CbYCr422Repacks, StepsOfChromaAreCrossed)
{
    const Samples y = {10, 11, 12, 13, 14, 15, 16, 17}, cr = {20, 21, 22, 23, 24}, cb = {30, 31, 32, 33, 34};
    const u8* const src[3] = {y.data(), cr.data(), cb.data()};
    const int steps[3] = {2, 3, 4};
    Samples target(4 * 4, none);
    EXPECT_EQ(pyxiYCrCb420ToCbYCr422_8u_P3C2R(src, steps, target.data(), 4, {2, 4}), pyxOk);
    EXPECT_EQ(target, (Samples{30, 10, 20, 11, 30, 12, 20, 13, 33, 14, 24, 15, 33, 16, 24, 17}));
}

TEST(CbYCr422Repacks, OddRowsOfChromaAreDropped)
{
    const Samples source = {1, 2, 3, 4, 5, 6, 7, 8};
    EXPECT_EQ(toPlanes(pyxiCbYCr422ToYCbCr420_8u_C2P3R, source, {2, 2}, block420, pyxOk),
              (YCbCrPlanes{{2, 4, 6, 8}, {1}, {3}}));
    EXPECT_EQ(toPlanes(pyxiCbYCr422ToYCrCb420_8u_C2P3R, source, {2, 2}, block420, pyxOk),
              (YCbCrPlanes{{2, 4, 6, 8}, {3}, {1}}));
}

TEST(CbYCr422Repacks, AHeightBelowOneRunsNoRows)
{
    u8 samples[16] = {};
    u8* const planes[3] = {samples, samples, samples};
    const int steps[3] = {4, 1, 1};
    EXPECT_EQ(pyxiCbYCr422ToYCbCr411_8u_C2P3R(samples, 8, planes, steps, {4, 0}), pyxOk);
    EXPECT_EQ(pyxiCbYCr422ToYCbCr411_8u_C2P3R(samples, 8, planes, steps, {4, -3}), pyxOk);
    EXPECT_EQ(pyxiCbYCr422ToYCbCr411_8u_C2P3R(samples, 8, planes, steps, {3, 1}), pyxErrSize);
}
