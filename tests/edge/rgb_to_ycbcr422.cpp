// RGB to YCbCr with chroma shared by pairs of pixels, in planes and packed: what becomes of a last odd pixel, and the
// column at which a row passes from the wide forms to those of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

YCbCrPlanes row422(ToPlanes convert, const Samples& pixels, int width, PyxStatus expected = pyxOk)
{
    return toPlanes(convert, pixels, {width, 1}, block422, expected);
}

/// A row of equal pixels through the conversions from planes.
using FromRgbPlanes = PyxStatus (*)(const u8* const*, int, u8*, int, RoiSize);

Samples packedRowOfPlanes(FromRgbPlanes convert, std::initializer_list<u8> rgb, int width, std::size_t targetSize)
{
    const Samples r(width, rgb.begin()[0]), g(width, rgb.begin()[1]), b(width, rgb.begin()[2]);
    const u8* const src[3] = {r.data(), g.data(), b.data()};
    Samples target(targetSize, untouched);
    EXPECT_EQ(convert(src, 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

} // namespace

// Green of 52, a sum of 104. Wide: the high products of 3328 are 968 for Cb and 1224 for Cr, (8200 - 968) >> 6 = 113
// and (8200 - 1224) >> 6 = 109, both with nothing left over. Tail: Cb is 128.125 - 15.13 and Cr 128.125 - 19.14, just
// below these. Luma is 42 in both.
TEST(RgbToYCbCr422, PlanesAreWideInBlocksOf16Then8)
{
    for (const Span span : {Span{2, 0},
                            {6, 0},
                            {8, 8},
                            {14, 8},
                            {16, 0},
                            {22, 0},
                            {24, 8},
                            {30, 8},
                            {32, 32},
                            {38, 32},
                            {40, 40},
                            {48, 32},
                            {56, 40},
                            {64, 64}}) {
        const YCbCrPlanes expected = twoSpans({42, 113, 109}, {42, 112, 108}, span, block422);
        for (const ToPlanes convert : {pyxiBGRToYCbCr422_8u_C3P3R, pyxiRGBToYCbCr422_8u_C3P3R})
            EXPECT_EQ(row422(convert, repeated({0, 52, 0}, span.width), span.width), expected) << span.width;
        EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_AC4P3R, repeated({0, 52, 0, 9}, span.width), span.width), expected)
            << span.width;
    }
}

// Red is 82, 90, 240 in the tail.
TEST(RgbToYCbCr422, LastOddPixelOfPlanesGetsLumaFromBgrAndNothingFromRgb)
{
    const YCbCrPlanes withLuma = {{82, 82, 82}, {90, none}, {240, none}};
    EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_C3P3R, repeated({0, 0, 255}, 3), 3), withLuma);
    EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_AC4P3R, repeated({0, 0, 255, 9}, 3), 3), withLuma);
    EXPECT_EQ(row422(pyxiRGBToYCbCr422_8u_C3P3R, repeated({255, 0, 0}, 3), 3, pyxWarnOddSize),
              (YCbCrPlanes{{82, 82, none}, {90, none}, {240, none}}));
}

// One pixel of red: 82, 90, 240.
TEST(RgbToYCbCr422, PackedRowOfOnePixelIsTwoBytes)
{
    const Samples red = {255, 0, 0};
    EXPECT_EQ(packedRow(pyxiRGBToYCbCr422_8u_C3C2R, red, 1, 4), (Samples{82, 90, none, none}));
    EXPECT_EQ(packedRow(pyxiRGBToYCrCb422_8u_C3C2R, red, 1, 4), (Samples{82, 240, none, none}));
    EXPECT_EQ(packedRowOfPlanes(pyxiRGBToYCbCr422_8u_P3C2R, {255, 0, 0}, 1, 4), (Samples{82, 90, none, none}));
    EXPECT_EQ(packedRowOfPlanes(pyxiRGBToYCrCb422_8u_P3C2R, {255, 0, 0}, 1, 4), (Samples{82, 240, none, none}));
}

TEST(RgbToYCbCr422, EachPackedRowOfOnePixelIsTwoBytes)
{
    const Samples source = {255, 0, 0, 0, 0, 0};
    Samples target(8, untouched);
    EXPECT_EQ(pyxiRGBToYCbCr422_8u_C3C2R(source.data(), 3, target.data(), 4, {1, 2}), pyxOk);
    EXPECT_EQ(target, (Samples{82, 90, none, none, 16, 128, none, none}));
}

// Blue shares in Cb by 0.439 a level. The lone pixel's Cb is the whole part of 128.125 and that share where it has
// three samples, and of 128.5 where it has four: of 2 that is 129.003 and 129.378, of 4 it is 129.88 and 130.26, of 5
// it is 130.32 and 130.69, and of 6 130.76 and 131.13.
TEST(RgbToYCbCr422, LastOddPixelOfPackedBgrTellsThreeSamplesFromFour)
{
    struct Case {
        u8 blue, three, four;
    };
    for (const Case c : {Case{0, 128, 128}, {2, 129, 129}, {4, 129, 130}, {5, 130, 130}, {6, 130, 131}}) {
        const Samples three = packedRow(pyxiBGRToYCbCr422_8u_C3C2R, repeated({c.blue, 0, 0}, 3), 3, 8);
        const Samples four = packedRow(pyxiBGRToYCbCr422_8u_AC4C2R, repeated({c.blue, 0, 0, 9}, 3), 3, 8);
        EXPECT_EQ(three[5], c.three) << int{c.blue};
        EXPECT_EQ(four[5], c.four) << int{c.blue};
    }
}

TEST(RgbToYCbCr422, PackedBgrOfThreeSamplesAndFourIsTheSameElsewhere)
{
    for (int width = 2; width <= 70; ++width) {
        Samples three, four;
        for (int i = 0; i < width; ++i) {
            const u8 b = static_cast<u8>(37 * i), g = static_cast<u8>(91 * i + 5), r = static_cast<u8>(53 * i + 11);
            three.insert(three.end(), {b, g, r});
            four.insert(four.end(), {b, g, r, 9});
        }
        Samples fromThree = packedRow(pyxiBGRToYCbCr422_8u_C3C2R, three, width, 2 * width + 2);
        Samples fromFour = packedRow(pyxiBGRToYCbCr422_8u_AC4C2R, four, width, 2 * width + 2);
        if (width % 2 != 0) fromThree[2 * width - 1] = fromFour[2 * width - 1] = 0;
        EXPECT_EQ(fromThree, fromFour) << width;
    }
}

// Blue of 4, a sum of 8. Packed, the high products of 512 are 224 for Cb and -37 for Cr, (224 + 16448) >> 7 = 130 and
// (16448 - 37) >> 7 = 128. In planes those of 256 are 112 and 18, (8200 + 112) >> 6 = 129 and (8200 - 18) >> 6 = 127;
// their tail gives the same. Luma is 16.
TEST(RgbToYCbCr422, PackedBgrIsWideInEveryPair)
{
    for (int pairs = 1; pairs <= 35; ++pairs) {
        const Samples expected = repeated({16, 130, 16, 128}, pairs);
        EXPECT_EQ(packedRow(pyxiBGRToYCbCr422_8u_C3C2R, repeated({4, 0, 0}, 2 * pairs), 2 * pairs, 4 * pairs),
                  expected);
        EXPECT_EQ(packedRow(pyxiBGRToYCbCr422_8u_AC4C2R, repeated({4, 0, 0, 9}, 2 * pairs), 2 * pairs, 4 * pairs),
                  expected);
    }
}

TEST(RgbToYCbCr422, PlanesOfBgrDifferFromPackedBgr)
{
    for (const int width : {2, 8, 32}) {
        const YCbCrPlanes expected = filledPlanes({16, 129, 127}, {width, 1}, block422);
        EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_C3P3R, repeated({4, 0, 0}, width), width), expected);
        EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_AC4P3R, repeated({4, 0, 0, 9}, width), width), expected);
    }
}

// Cb is 128.5 + 1.76 and Cr 128.5 - 0.28. The tail of planes, with an eighth in the place of the half, gives 129.
TEST(RgbToYCbCr422, PackedRgbAddsAHalfToChroma)
{
    for (const int width : {2, 8, 14}) {
        EXPECT_EQ(packedRow(pyxiRGBToYCbCr422_8u_C3C2R, repeated({0, 0, 4}, width), width, 2 * width),
                  repeated({16, 130, 16, 128}, width / 2));
        EXPECT_EQ(packedRowOfPlanes(pyxiRGBToYCbCr422_8u_P3C2R, {0, 0, 4}, width, 2 * width),
                  repeated({16, 130, 16, 128}, width / 2));
    }
}

// Luma of red: the high product of 65280 and 16843 is 16777, and (16777 >> 8) + 16 = 81. The tail adds a half to
// 16 + 65.54 for the first pixel of a pair, which is 82, and nothing for the second. Chroma is 90 and 240 in both.
TEST(RgbToYCbCr422, PackedRgbIsWideInBlocksOf8)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}}) {
        const int wide = span.wideColumns / 2, tail = span.width / 2 - wide;
        const std::size_t size = 2 * span.width;
        const Samples ycbcr = repeated({81, 90, 81, 240}, wide) + repeated({82, 90, 81, 240}, tail);
        const Samples ycrcb = repeated({81, 240, 81, 90}, wide) + repeated({82, 240, 81, 90}, tail);
        const Samples pixels = repeated({255, 0, 0}, span.width);
        EXPECT_EQ(packedRow(pyxiRGBToYCbCr422_8u_C3C2R, pixels, span.width, size), ycbcr);
        EXPECT_EQ(packedRow(pyxiRGBToYCrCb422_8u_C3C2R, pixels, span.width, size), ycrcb);
        EXPECT_EQ(packedRowOfPlanes(pyxiRGBToYCbCr422_8u_P3C2R, {255, 0, 0}, span.width, size), ycbcr);
        EXPECT_EQ(packedRowOfPlanes(pyxiRGBToYCrCb422_8u_P3C2R, {255, 0, 0}, span.width, size), ycrcb);
    }
}

TEST(RgbToYCbCr422, AlphaDoesNotMatter)
{
    for (const u8 spare : {0, 1, 128, 255}) {
        const Samples pixels = repeated({255, 255, 255, spare}, 45);
        EXPECT_EQ(row422(pyxiBGRToYCbCr422_8u_AC4P3R, pixels, 45),
                  (YCbCrPlanes{Samples(45, 235), Samples(22, 128) + Samples{none}, Samples(22, 128) + Samples{none}}));
        EXPECT_EQ(packedRow(pyxiBGRToYCbCr422_8u_AC4C2R, pixels, 45, 91), repeated({235, 128}, 45) + Samples{none});
    }
}
