// RGB to YCbCr with chroma shared by 2 by 2 pixels: what odd sizes leave out, and the column at which a row passes from
// the wide forms to those of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

YCbCrPlanes planes420(ToPlanes convert, const Samples& pixels, RoiSize roi, PyxStatus expected = pyxOk)
{
    return toPlanes(convert, pixels, roi, block420, expected);
}

using ToLumaAndPairs = PyxStatus (*)(const u8*, int, u8*, int, u8*, int, RoiSize);

/// A plane of luma and one of chroma pairs, the latter taken apart.
YCbCrPlanes lumaAndPairs(ToLumaAndPairs convert, const Samples& pixels, RoiSize roi, PyxStatus expected = pyxOk)
{
    const int pairs = (roi.width + 1) / 2;
    Samples y(pixelCount(roi), untouched), cbcr(2 * pairs * ((roi.height + 1) / 2), untouched);
    const int srcStep = static_cast<int>(pixels.size()) / roi.height;
    EXPECT_EQ(convert(pixels.data(), srcStep, y.data(), roi.width, cbcr.data(), 2 * pairs, roi), expected);
    YCbCrPlanes target = {y, {}, {}};
    for (std::size_t i = 0; i < cbcr.size(); i += 2) {
        target.cb.push_back(cbcr[i]);
        target.cr.push_back(cbcr[i + 1]);
    }
    return target;
}

} // namespace

TEST(RgbToYCbCr420, WidthOneWritesNothingAndWarns)
{
    const Samples pixels = repeated({1, 2, 3}, 4);
    EXPECT_EQ(planes420(pyxiRGBToYCbCr420_8u_C3P3R, pixels, {1, 4}, pyxWarnOddSize), untouchedPlanes({1, 4}, block420));
    EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C3P2R, pixels, {1, 4}, pyxWarnOddSize),
              untouchedPlanes({1, 4}, block420));
    EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C4P2R, repeated({1, 2, 3, 4}, 4), {1, 4}, pyxWarnOddSize),
              untouchedPlanes({1, 4}, block420));
}

TEST(RgbToYCbCr420, HeightOneWritesNothingAndWarns)
{
    EXPECT_EQ(planes420(pyxiRGBToYCbCr420_8u_C3P3R, repeated({1, 2, 3}, 34), {34, 1}, pyxWarnOddSize),
              untouchedPlanes({34, 1}, block420));
}

TEST(RgbToYCbCr420, LastOddColumnAndRowStay)
{
    constexpr u8 none = untouched;
    const YCbCrPlanes expected = {
        Samples{235, 235, none, 235, 235, none, 235, 235, none, 235, 235, none, none, none, none},
        Samples{128, none, 128, none, none, none},
        Samples{128, none, 128, none, none, none},
    };
    const Samples c3 = repeated({255, 255, 255}, 15), c4 = repeated({255, 255, 255, 9}, 15);
    for (const ToPlanes convert : {pyxiRGBToYCbCr420_8u_C3P3R, pyxiBGRToYCbCr420_8u_C3P3R, pyxiBGRToYCrCb420_8u_C3P3R})
        EXPECT_EQ(planes420(convert, c3, {3, 5}, pyxWarnOddSize), expected);
    for (const ToPlanes convert :
         {pyxiBGRToYCbCr420_8u_AC4P3R, pyxiBGRToYCrCb420_8u_AC4P3R, pyxiRGBToYCrCb420_8u_AC4P3R})
        EXPECT_EQ(planes420(convert, c4, {3, 5}, pyxWarnOddSize), expected);
    EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C3P2R, c3, {3, 5}, pyxWarnOddSize), expected);
    EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C4P2R, c4, {3, 5}, pyxWarnOddSize), expected);
}

TEST(RgbToYCbCr420, BlackAndWhiteAreTheSameInEveryForm)
{
    for (const int width : {2, 14, 16, 18, 30, 32, 34, 48, 62}) {
        const RoiSize roi = {width, 2};
        for (const ToPlanes convert : {pyxiBGRToYCbCr420_8u_C3P3R, pyxiRGBToYCbCr420_8u_C3P3R}) {
            EXPECT_EQ(planes420(convert, repeated({0, 0, 0}, 2 * width), roi), filledPlanes(black, roi, block420));
            EXPECT_EQ(planes420(convert, repeated({255, 255, 255}, 2 * width), roi),
                      filledPlanes(white, roi, block420));
        }
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_AC4P3R, repeated({0, 0, 0, 9}, 2 * width), roi),
                  filledPlanes(black, roi, block420));
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_AC4P3R, repeated({255, 255, 255, 9}, 2 * width), roi),
                  filledPlanes(white, roi, block420));
    }
}

// Sums of 676, 412 and 550 for blue, green and red. Wide: 32 times the sums have the high products 9496, 3836 and 2604
// for Cb, and (9496 - (3836 + 2604) + 16400) >> 7 = 19456 >> 7 = 152, with nothing left over. Tail:
// 28770 * 676 - 19071 * 412 - 9699 * 550 = 6256818, which is 23.87 of 2^18; with an eighth added that is 23, and
// 128 + 23 = 151. Cr is 138 in both: (7726 - (4851 + 1535) + 16400) >> 7, and 10.46 plus an eighth. So is luma 120.
TEST(RgbToYCbCr420, FourSamplesAPixelShowTheirPlaceInTheRow)
{
    const auto source = [](int width) {
        return repeated({169, 103, 137, 9}, width) + repeated({169, 103, 138, 9}, width);
    };
    for (const Span span : {Span{2, 0},
                            {4, 4},
                            {6, 4},
                            {8, 0},
                            {12, 4},
                            {16, 16},
                            {20, 20},
                            {24, 16},
                            {28, 20},
                            {30, 20},
                            {32, 32},
                            {40, 32},
                            {44, 36}}) {
        const YCbCrPlanes expected = twoSpans({120, 152, 138}, {120, 151, 138}, span, block420);
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_AC4P3R, source(span.width), {span.width, 2}), expected) << span.width;
    }
}

// Blue of 4, a sum of 16. Wide: the high products of 512 are 224 for Cb and -37 for Cr, (224 + 16448) >> 7 = 130 and
// (16448 - 37) >> 7 = 128. Tail: 28770 * 16 is 1.76 of 2^18 and -4653 * 16 is -0.28; with an eighth added these are 1
// and -1. Luma is 16 in both.
TEST(RgbToYCbCr420, BgrOfThreeSamplesIsWideInBlocksOf16)
{
    for (const Span span :
         {Span{2, 0}, {14, 0}, {16, 16}, {24, 16}, {30, 16}, {32, 32}, {34, 32}, {46, 32}, {48, 48}}) {
        const Samples pixels = repeated({4, 0, 0}, 2 * span.width);
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_C3P3R, pixels, {span.width, 2}),
                  twoSpans({16, 130, 128}, {16, 129, 127}, span, block420))
            << span.width;
        EXPECT_EQ(planes420(pyxiBGRToYCrCb420_8u_C3P3R, pixels, {span.width, 2}),
                  twoSpans({16, 128, 130}, {16, 127, 129}, span, block420))
            << span.width;
    }
}

// Green of 52, a sum of 208. The high products of 6656 are 1936 for Cb and 2449 for Cr. With four samples a pixel they
// are subtracted: (16400 - 1936) >> 7 = 113 and (16400 - 2449) >> 7 = 108. With three their factors are negative, so
// that they are -1937 and -2450: (16448 - 1937) >> 7 = 113 and (16448 - 2450) >> 7 = 109. Luma is 42 in both.
TEST(RgbToYCbCr420, HighProductsOfThreeSamplesAndOfFourRoundToOtherSides)
{
    EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_AC4P3R, repeated({0, 52, 0, 9}, 32), {16, 2}),
              filledPlanes({42, 113, 108}, {16, 2}, block420));
    EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_C3P3R, repeated({0, 52, 0}, 32), {16, 2}),
              filledPlanes({42, 113, 109}, {16, 2}, block420));
}

// Blue of 100, a sum of 400. Wide: the rounded products of 12800 are 627 for luma, 2810 for Cb and 454 for Cr, and
// (627 + 1026) >> 6 = 25, (2810 + 8194) >> 6 = 171, (8194 - 454) >> 6 = 120. Tail: luma is 16.5 + 9.8, Cb 128.125
// + 43.9 and Cr 128.125 - 7.1.
TEST(RgbToYCbCr420, RgbIsWideInBlocksOf8ChromaColumnsThen4)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}, {30, 24}, {32, 32}}) {
        const YCbCrPlanes expected = twoSpans({25, 171, 120}, {26, 172, 121}, span, block420);
        const RoiSize roi = {span.width, 2};
        EXPECT_EQ(planes420(pyxiRGBToYCbCr420_8u_C3P3R, repeated({0, 0, 100}, 2 * span.width), roi), expected);
        EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C3P2R, repeated({0, 0, 100}, 2 * span.width), roi), expected);
        EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C4P2R, repeated({0, 0, 100, 9}, 2 * span.width), roi), expected);
    }
}

// Luma of red of 31: the rounded product of 3968 is 510, and (510 + 1026) >> 6 = 24 with nothing left over. Cb of red
// of 34: the rounded product of 4352 is 322, and (8194 - 322) >> 6 = 123, likewise.
TEST(RgbToYCbCr420, RgbRoundsWithABitMoreThanTheBias)
{
    EXPECT_EQ(planes420(pyxiRGBToYCbCr420_8u_C3P3R, repeated({31, 0, 0}, 16), {8, 2}),
              filledPlanes({24, 123, 141}, {8, 2}, block420));
    EXPECT_EQ(planes420(pyxiRGBToYCbCr420_8u_C3P3R, repeated({34, 0, 0}, 16), {8, 2}),
              filledPlanes({24, 123, 142}, {8, 2}, block420));
}

// Red is 82, 90, 240 in the tail.
TEST(RgbToYCbCr420, ChromaPlanesStandInTheOrderOfTheName)
{
    const Samples rgba = repeated({255, 0, 0, 9}, 4), bgra = repeated({0, 0, 255, 9}, 4);
    const YCbCrPlanes ycbcr = filledPlanes({82, 90, 240}, {2, 2}, block420);
    const YCbCrPlanes ycrcb = filledPlanes({82, 240, 90}, {2, 2}, block420);
    EXPECT_EQ(planes420(pyxiBGRToYCbCr420_8u_AC4P3R, bgra, {2, 2}), ycbcr);
    EXPECT_EQ(planes420(pyxiBGRToYCrCb420_8u_AC4P3R, bgra, {2, 2}), ycrcb);
    EXPECT_EQ(planes420(pyxiRGBToYCrCb420_8u_AC4P3R, rgba, {2, 2}), ycrcb);
    EXPECT_EQ(planes420(pyxiBGRToYCrCb420_8u_C3P3R, repeated({0, 0, 255}, 4), {2, 2}), ycrcb);
}

TEST(RgbToYCbCr420, ChromaStepsGoWithTheirPlanes)
{
    // Two blocks, one above the other, white and then red, with a distance of its own in each plane.
    const Samples pixels = repeated({255, 255, 255, 9}, 4) + repeated({0, 0, 255, 9}, 4);
    Samples y(8), second(4, untouched), third(4, untouched);
    u8* const dst[3] = {y.data(), second.data(), third.data()};
    const int dstStep[3] = {2, 1, 3};
    EXPECT_EQ(pyxiBGRToYCrCb420_8u_AC4P3R(pixels.data(), 8, dst, dstStep, {2, 4}), pyxOk);
    EXPECT_EQ(second, (Samples{128, 240, untouched, untouched}));
    EXPECT_EQ(third, (Samples{128, untouched, untouched, 90}));
}

TEST(RgbToYCbCr420, AlphaDoesNotMatter)
{
    const RoiSize roi = {44, 2};
    for (const ToPlanes convert :
         {pyxiBGRToYCbCr420_8u_AC4P3R, pyxiBGRToYCrCb420_8u_AC4P3R, pyxiRGBToYCrCb420_8u_AC4P3R}) {
        for (const u8 spare : {0, 1, 128, 255})
            EXPECT_EQ(planes420(convert, repeated({255, 255, 255, spare}, 88), roi),
                      filledPlanes(white, roi, block420));
    }
    for (const u8 spare : {0, 1, 128, 255})
        EXPECT_EQ(lumaAndPairs(pyxiRGBToYCbCr420_8u_C4P2R, repeated({255, 255, 255, spare}, 88), roi),
                  filledPlanes(white, roi, block420));
}
