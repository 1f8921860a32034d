// BGR to YCbCr by the BT.709 matrices: black, white, what odd sizes leave out, and the column at which a row passes
// from the wide forms to those of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

YCbCrPlanes planes420(ToPlanes convert, const Samples& pixels, RoiSize roi, PyxStatus expected = pyxOk)
{
    return toPlanes(convert, pixels, roi, block420, expected);
}

} // namespace

// Luma of white: 65536 * 255 + 32768 is 255.5 of 2^16 in the tail; wide, 6952 + 23337 + 2349 + 64 is 255.5 of 2^7.
TEST(RgbToBt709, FullRangeEndsAt1And254)
{
    for (const int width : {2, 6, 8, 10, 16, 30}) {
        const RoiSize roi = {width, 2};
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R, repeated({0, 0, 0, 9}, 2 * width), roi),
                  filledPlanes({1, 128, 128}, roi, block420));
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R, repeated({255, 255, 255, 9}, 2 * width), roi),
                  filledPlanes({254, 128, 128}, roi, block420));
    }
    for (const int width : {1, 2, 15, 16, 17, 31}) {
        const Samples blackRow = repeated({128, 1}, width), whiteRow = repeated({128, 254}, width);
        EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_C3C2R, repeated({0, 0, 0}, width), width, 2 * width),
                  blackRow);
        EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_C3C2R, repeated({255, 255, 255}, width), width, 2 * width),
                  whiteRow);
        EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R, repeated({0, 0, 0, 9}, width), width, 2 * width),
                  blackRow);
        EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R, repeated({255, 255, 255, 9}, width), width, 2 * width),
                  whiteRow);
    }
}

// Red. A pair: (6952 + 64) >> 7 = 54 for luma, (-1910 + 8224) >> 6 = 98 for Cb, and Cr 258 is cut to 254. The pixel
// alone: 54.8 and 98.7. With its channels exchanged, as blue: luma 4719 * 255 + 32768 is 18.9 of 2^16, and Cb 258.8 is
// cut to 254.
TEST(RgbToBt709, LastOddPixelOfFourSamplesHasItsChannelsExchanged)
{
    EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R, repeated({0, 0, 255, 9}, 3), 3, 8),
              (Samples{98, 54, 254, 54, 254, 18, none, none}));
    EXPECT_EQ(packedRow(pyxiBGRToCbYCr422_709HDTV_8u_C3C2R, repeated({0, 0, 255}, 3), 3, 8),
              (Samples{98, 54, 254, 54, 98, 54, none, none}));
}

TEST(RgbToBt709, StudioRangeLeavesALastOddColumnAndRowOut)
{
    const YCbCrPlanes expected = {
        repeated({235, 235, 235, 235, none}, 4) + Samples(5, none),
        Samples{128, 128, none, 128, 128, none, none, none, none},
        Samples{128, 128, none, 128, 128, none, none, none, none},
    };
    const Samples c3 = repeated({255, 255, 255}, 25), c4 = repeated({255, 255, 255, 9}, 25);
    for (const ToPlanes convert : {pyxiBGRToYCbCr420_709CSC_8u_C3P3R, pyxiBGRToYCrCb420_709CSC_8u_C3P3R})
        EXPECT_EQ(planes420(convert, c3, {5, 5}, pyxWarnOddSize), expected);
    for (const ToPlanes convert : {pyxiBGRToYCbCr420_709CSC_8u_AC4P3R, pyxiBGRToYCrCb420_709CSC_8u_AC4P3R})
        EXPECT_EQ(planes420(convert, c4, {5, 5}, pyxWarnOddSize), expected);
}

TEST(RgbToBt709, FullRangeLeavesALastOddColumnAndRowOut)
{
    // Red: luma 54.8, Cb 98.3, and Cr cut to 254.
    EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R, repeated({0, 0, 255, 9}, 15), {3, 5}, pyxWarnOddSize),
              (YCbCrPlanes{
                  repeated({54, 54, none}, 4) + Samples(3, none),
                  Samples{98, none, 98, none, none, none},
                  Samples{254, none, 254, none, none, none},
              }));
}

// Green of 52, a sum of 208. Wide: the high products of 6656 are -1312 for Cb and -1545 for Cr, (8224 - 1312) >> 6 =
// 108 with nothing left over and (8224 - 1545) >> 6 = 104. Tail: 128.125 - 20.5 and 128.125 - 24.13. Luma is 37 in
// both.
TEST(RgbToBt709, FullRangeIsWideInBlocksOf8)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}})
        EXPECT_EQ(
            planes420(pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R, repeated({0, 52, 0, 9}, 2 * span.width), {span.width, 2}),
            twoSpans({37, 108, 104}, {37, 107, 103}, span, block420))
            << span.width;
}

// Red of 104, a sum of 416. The high products of 13312 are 5843 for Cr and 1344 for Cb: (5843 + 16448) >> 7 = 174 and
// (16448 - 1344) >> 7 = 118 with nothing left over. Where the factor of Cb is negative its product is -1345, which
// gives 117. Tail: Cb is 128.125 - 10.5 and Cr 128.125 + 45.66. Luma is 35 in all.
TEST(RgbToBt709, StudioRangeIsWideInBlocksOf16AndOf8)
{
    for (const Span span : {Span{2, 0}, {14, 0}, {16, 16}, {30, 16}, {32, 32}, {34, 32}, {46, 32}, {48, 48}}) {
        const Samples pixels = repeated({0, 0, 104}, 2 * span.width);
        const RoiSize roi = {span.width, 2};
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709CSC_8u_C3P3R, pixels, roi),
                  twoSpans({35, 118, 174}, {35, 117, 173}, span, block420))
            << span.width;
        EXPECT_EQ(planes420(pyxiBGRToYCrCb420_709CSC_8u_C3P3R, pixels, roi),
                  twoSpans({35, 174, 118}, {35, 173, 117}, span, block420))
            << span.width;
    }
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}}) {
        const Samples pixels = repeated({0, 0, 104, 9}, 2 * span.width);
        const RoiSize roi = {span.width, 2};
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709CSC_8u_AC4P3R, pixels, roi),
                  twoSpans({35, 117, 174}, {35, 117, 173}, span, block420))
            << span.width;
        EXPECT_EQ(planes420(pyxiBGRToYCrCb420_709CSC_8u_AC4P3R, pixels, roi),
                  twoSpans({35, 174, 117}, {35, 173, 117}, span, block420))
            << span.width;
    }
}

TEST(RgbToBt709, SemiPlanarTargetHoldsCbCrPairs)
{
    const Samples pixels = repeated({0, 0, 104}, 2 * 18);
    Samples y(2 * 18, none), pairs(18, none);
    EXPECT_EQ(pyxiBGRToYCbCr420_709CSC_8u_C3P2R(pixels.data(), 3 * 18, y.data(), 18, pairs.data(), 18, {18, 2}), pyxOk);
    EXPECT_EQ(y, Samples(2 * 18, 35));
    EXPECT_EQ(pairs, repeated({118, 174}, 8) + repeated({117, 173}, 1));
}

TEST(RgbToBt709, SemiPlanarTargetKeepsALastOddColumnAndRow)
{
    const Samples pixels = repeated({255, 255, 255}, 9);
    Samples y(9, none), pairs(8, none);
    EXPECT_EQ(pyxiBGRToYCbCr420_709CSC_8u_C3P2R(pixels.data(), 9, y.data(), 3, pairs.data(), 4, {3, 3}),
              pyxWarnOddSize);
    EXPECT_EQ(y, (Samples{235, 235, none, 235, 235, none, none, none, none}));
    EXPECT_EQ(pairs, (Samples{128, 128, none, none, none, none, none, none}));
}

TEST(RgbToBt709, AlphaDoesNotMatter)
{
    for (const u8 spare : {0, 1, 128, 255}) {
        const Samples pixels = repeated({255, 255, 255, spare}, 2 * 22);
        for (const ToPlanes convert : {pyxiBGRToYCbCr420_709CSC_8u_AC4P3R, pyxiBGRToYCrCb420_709CSC_8u_AC4P3R})
            EXPECT_EQ(planes420(convert, pixels, {22, 2}), filledPlanes(white, {22, 2}, block420));
        EXPECT_EQ(planes420(pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R, pixels, {22, 2}),
                  filledPlanes({254, 128, 128}, {22, 2}, block420));
    }
}
