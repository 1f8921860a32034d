// YCbCr with chroma shared by 2 by 2 pixels to RGB: what odd sizes leave out, white in each form, and the column at
// which a row passes from the wide form to that of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

using FromLumaAndPairs = PyxStatus (*)(const u8*, int, const u8*, int, u8*, int, RoiSize);
using FromLumaAndPairsWithAlpha = PyxStatus (*)(const u8*, int, const u8*, int, u8*, int, RoiSize, u8);

/// Two rows of equal pixels from planes, converted.
template <typename Convert> Samples rows(Convert convert, Colour colour, int width)
{
    const RoiSize roi = {width, 2};
    return fromPlanes(convert, filledPlanes(colour, roi, block420), roi, block420, pyxOk);
}

/// The same from a plane of luma and one of chroma pairs, which are stored as the colour's Cb and Cr.
Samples pairRows(FromLumaAndPairs convert, Colour colour, int width)
{
    const Samples y(2 * width, colour.y), pairs = repeated({colour.cb, colour.cr}, width / 2);
    Samples target(3 * 2 * width, none);
    EXPECT_EQ(convert(y.data(), width, pairs.data(), width, target.data(), 3 * width, {width, 2}), pyxOk);
    return target;
}

Samples pairRows(FromLumaAndPairsWithAlpha convert, Colour colour, int width)
{
    const Samples y(2 * width, colour.y), pairs = repeated({colour.cb, colour.cr}, width / 2);
    Samples target(4 * 2 * width, none);
    EXPECT_EQ(convert(y.data(), width, pairs.data(), width, target.data(), 4 * width, {width, 2}, aval), pyxOk);
    return target;
}

using Pixel = std::initializer_list<u8>;

/// Two rows, wide and then tail.
Samples twoRows(Pixel wide, Pixel tail, Span span)
{
    const Samples row = repeated(wide, span.wideColumns) + repeated(tail, span.width - span.wideColumns);
    return row + row;
}

/// Red in every form, and the same with the chroma samples exchanged.
constexpr Colour red = {81, 90, 240};
constexpr Colour redExchanged = {81, 240, 90};

} // namespace

TEST(YCbCr420ToRgb, OddSizeOfThreeGivesOneBlock)
{
    const RoiSize roi = {3, 3};
    const YCbCrPlanes source = {{16, 235, 1, 235, 16, 2, 3, 4, 5}, {128, 6, 7, 8}, {128, 9, 10, 11}};
    EXPECT_EQ(fromPlanes(pyxiYCbCr420ToBGR_8u_P3C4R, source, roi, block420, pyxWarnOddSize),
              repeated({0, 0, 0, aval}, 1) + repeated({255, 255, 255, aval}, 1) + Samples(4, none) +
                  repeated({255, 255, 255, aval}, 1) + repeated({0, 0, 0, aval}, 1) + Samples(4 + 12, none));
}

TEST(YCbCr420ToRgb, SizeOfOneWritesNothingAndWarns)
{
    for (const RoiSize roi : {RoiSize{1, 1}, {1, 4}, {34, 1}}) {
        const YCbCrPlanes source = filledPlanes(white, roi, block420);
        const Samples c3(3 * pixelCount(roi), none), c4(4 * pixelCount(roi), none);
        EXPECT_EQ(fromPlanes(pyxiYCbCr420ToRGB_8u_P3C3R, source, roi, block420, pyxWarnOddSize), c3);
        EXPECT_EQ(fromPlanes(pyxiYCbCr420ToBGR_8u_P3C3R, source, roi, block420, pyxWarnOddSize), c3);
        EXPECT_EQ(fromPlanes(pyxiYCbCr420ToBGR_8u_P3C4R, source, roi, block420, pyxWarnOddSize), c4);
        EXPECT_EQ(fromPlanes(pyxiYCrCb420ToRGB_8u_P3C4R, source, roi, block420, pyxWarnOddSize), c4);
    }
}

TEST(YCbCr420ToRgb, PairsOfSizeOneWriteNothingAndWarn)
{
    const Samples y(4, 235), pairs(4, 128);
    Samples target(16, none);
    for (const auto convert : {pyxiYCbCr420ToBGR_8u_P2C3R, pyxiYCbCr420ToRGB_8u_P2C3R, pyxiYCrCb420ToBGR_8u_P2C3R,
                               pyxiYCrCb420ToRGB_8u_P2C3R}) {
        EXPECT_EQ(convert(y.data(), 1, pairs.data(), 2, target.data(), 3, {1, 4}), pyxWarnOddSize);
        EXPECT_EQ(convert(y.data(), 4, pairs.data(), 4, target.data(), 12, {4, 1}), pyxWarnOddSize);
    }
    for (const auto convert : {pyxiYCbCr420ToBGR_8u_P2C4R, pyxiYCbCr420ToRGB_8u_P2C4R, pyxiYCrCb420ToBGR_8u_P2C4R,
                               pyxiYCrCb420ToRGB_8u_P2C4R}) {
        EXPECT_EQ(convert(y.data(), 1, pairs.data(), 2, target.data(), 4, {1, 4}, aval), pyxWarnOddSize);
        EXPECT_EQ(convert(y.data(), 4, pairs.data(), 4, target.data(), 16, {4, 1}, aval), pyxWarnOddSize);
    }
    EXPECT_EQ(target, Samples(16, none));
}

TEST(YCbCr420ToRgb, BlackIsBlackInEveryForm)
{
    for (const int width : {2, 8, 14, 16, 18, 48, 62}) {
        const Samples c3(3 * 2 * width, 0), c4 = repeated({0, 0, 0, aval}, 2 * width);
        for (const FromPlanes convert : {pyxiYCbCr420ToBGR_8u_P3C3R, pyxiYCbCr420ToRGB_8u_P3C3R})
            EXPECT_EQ(rows(convert, black, width), c3);
        for (const FromPlanesWithAlpha convert : {pyxiYCbCr420ToBGR_8u_P3C4R, pyxiYCrCb420ToRGB_8u_P3C4R})
            EXPECT_EQ(rows(convert, black, width), c4);
        for (const FromLumaAndPairs convert : {pyxiYCbCr420ToBGR_8u_P2C3R, pyxiYCbCr420ToRGB_8u_P2C3R,
                                               pyxiYCrCb420ToBGR_8u_P2C3R, pyxiYCrCb420ToRGB_8u_P2C3R})
            EXPECT_EQ(pairRows(convert, black, width), c3);
        for (const FromLumaAndPairsWithAlpha convert : {pyxiYCbCr420ToBGR_8u_P2C4R, pyxiYCbCr420ToRGB_8u_P2C4R,
                                                        pyxiYCrCb420ToBGR_8u_P2C4R, pyxiYCrCb420ToRGB_8u_P2C4R})
            EXPECT_EQ(pairRows(convert, black, width), c4);
    }
}

// The luma term of 235 is 30080 * 4769 >> 16 = 2188, the terms of Cr and Cb are 16384 * 6537 >> 16 = 1634 and
// 16384 * 8263 >> 16 = 2065: (2188 + 1634 - 1779) >> 3 = 255 and (2188 + 2065 - 2211) >> 3 = 255. Those of green are
// 401 and 832: (2188 - (401 + 832 - 1089)) >> 3 = 255.
TEST(YCbCr420ToRgb, WhiteOfCbCrPairsIsWhite)
{
    for (const int width : {2, 8, 14, 62}) {
        for (const FromLumaAndPairs convert : {pyxiYCbCr420ToBGR_8u_P2C3R, pyxiYCbCr420ToRGB_8u_P2C3R})
            EXPECT_EQ(pairRows(convert, white, width), Samples(3 * 2 * width, 255));
        for (const FromLumaAndPairsWithAlpha convert : {pyxiYCbCr420ToBGR_8u_P2C4R, pyxiYCbCr420ToRGB_8u_P2C4R})
            EXPECT_EQ(pairRows(convert, white, width), repeated({255, 255, 255, aval}, 2 * width));
        EXPECT_EQ(rows(pyxiYCbCr420ToBGR_8u_P3C4R, white, width), repeated({255, 255, 255, aval}, 2 * width));
    }
}

// With a luma factor of 4768 the luma term stays 2188. Green takes off 401 + 832 - 1084 = 149, which leaves 2039, one
// short of 255 * 8.
TEST(YCbCr420ToRgb, WhiteOfCrCbPairsLacksALevelOfGreen)
{
    for (const int width : {2, 8, 14, 62}) {
        for (const FromLumaAndPairs convert : {pyxiYCrCb420ToBGR_8u_P2C3R, pyxiYCrCb420ToRGB_8u_P2C3R})
            EXPECT_EQ(pairRows(convert, white, width), repeated({255, 254, 255}, 2 * width));
        for (const FromLumaAndPairsWithAlpha convert : {pyxiYCrCb420ToBGR_8u_P2C4R, pyxiYCrCb420ToRGB_8u_P2C4R})
            EXPECT_EQ(pairRows(convert, white, width), repeated({255, 254, 255, aval}, 2 * width));
    }
}

// White: the wide form gives 28032 * 4769 >> 16 = 2039, and 2039 >> 3 = 254. The tail gives 255.3.
TEST(YCbCr420ToRgb, BgrFromPlanesIsWideInBlocksOf8ChromaColumns)
{
    for (const Span span : {Span{2, 0}, {14, 0}, {16, 16}, {18, 16}, {30, 16}, {32, 32}, {46, 32}, {48, 48}, {62, 48}})
        EXPECT_EQ(rows(pyxiYCbCr420ToBGR_8u_P3C3R, white, span.width), twoRows({254, 254, 254}, {255, 255, 255}, span))
            << span.width;
}

// Green of (18, 128, 129). Wide: (37 - 14 + 8) >> 4 = 1, the high products being 256 * 9535 and 128 * -6660. Tail:
// 76284 * 18 - 53281 - 1187776 = 132055, just above 2 * 65536. Red and blue are 4 and 2 in both.
TEST(YCbCr420ToRgb, RgbOfThreeSamplesIsWideInBlocksOf4ChromaColumns)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}})
        EXPECT_EQ(rows(pyxiYCbCr420ToRGB_8u_P3C3R, {18, 128, 129}, span.width), twoRows({4, 1, 2}, {4, 2, 2}, span))
            << span.width;
}

// Blue of (19, 129, 128), the planes being Y, Cr, Cb. Wide: (55 + 32 + 8) >> 4 = 5, the high products being 384 * 9535
// and 128 * 16523. Tail: 76284 * 19 + 132186 - 1187776 = 393806, just above 6 * 65536. Red and green are 3 in both.
TEST(YCbCr420ToRgb, RgbOfFourSamplesIsWideInBlocksOf4ChromaColumns)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}})
        EXPECT_EQ(rows(pyxiYCrCb420ToRGB_8u_P3C4R, {19, 128, 129}, span.width),
                  twoRows({3, 3, 5, aval}, {3, 3, 6, aval}, span))
            << span.width;
}

// Green of (18, 128, 129) once more: the product of four samples a pixel is 13, which is subtracted, and
// (37 - 13 + 8) >> 4 = 2.
TEST(YCbCr420ToRgb, GreenRoundsTheOtherWayWhenItIsSubtracted)
{
    EXPECT_EQ(rows(pyxiYCrCb420ToRGB_8u_P3C4R, {18, 129, 128}, 8), repeated({4, 2, 2, aval}, 16));
}

TEST(YCbCr420ToRgb, ChannelsAndChromaStandInTheOrderOfTheName)
{
    for (const int width : {2, 8, 14, 16}) {
        const int count = 2 * width;
        const Samples rgb = repeated({254, 0, 0}, count), rgba = repeated({254, 0, 0, aval}, count);
        const Samples bgr = repeated({0, 0, 254}, count), bgra = repeated({0, 0, 254, aval}, count);
        EXPECT_EQ(pairRows(pyxiYCbCr420ToBGR_8u_P2C3R, red, width), bgr);
        EXPECT_EQ(pairRows(pyxiYCbCr420ToBGR_8u_P2C4R, red, width), bgra);
        EXPECT_EQ(pairRows(pyxiYCbCr420ToRGB_8u_P2C3R, red, width), rgb);
        EXPECT_EQ(pairRows(pyxiYCbCr420ToRGB_8u_P2C4R, red, width), rgba);
        EXPECT_EQ(pairRows(pyxiYCrCb420ToBGR_8u_P2C3R, redExchanged, width), bgr);
        EXPECT_EQ(pairRows(pyxiYCrCb420ToBGR_8u_P2C4R, redExchanged, width), bgra);
        EXPECT_EQ(pairRows(pyxiYCrCb420ToRGB_8u_P2C3R, redExchanged, width), rgb);
        EXPECT_EQ(pairRows(pyxiYCrCb420ToRGB_8u_P2C4R, redExchanged, width), rgba);
        EXPECT_EQ(rows(pyxiYCbCr420ToBGR_8u_P3C3R, red, width), bgr);
        EXPECT_EQ(rows(pyxiYCbCr420ToBGR_8u_P3C4R, red, width), bgra);
        EXPECT_EQ(rows(pyxiYCbCr420ToRGB_8u_P3C3R, red, width), rgb);
        EXPECT_EQ(rows(pyxiYCrCb420ToRGB_8u_P3C4R, redExchanged, width), rgba);
    }
}
