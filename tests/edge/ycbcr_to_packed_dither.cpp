// YCbCr and YUV to packed pixels, dithered: the pattern of a flat colour, its phase, black and white.
#include "pyxcc/pyxcc.h"

#include "edge/packed.hpp"

using namespace edge;

namespace
{

/// 14336 * 9535 >> 20 = 130 in all channels.
constexpr Colour grey = {128, 128, 128};

/// What 130 becomes in four bits: 7, of which 130 * 256 - 7 * 4352 = 2816 are left over, so that it is 8 wherever the
/// threshold is below that.
constexpr int greyOf4Bits[4][4] = {{8, 8, 8, 7}, {7, 8, 7, 8}, {8, 7, 8, 8}, {7, 8, 7, 8}};

/// The same in five bits: 15 with 33280 - 15 * 2105 = 1705 left over, and then 15 * 2105 >> 11 = 15 or 33680 >> 11
/// = 16.
constexpr int greyOf5Bits[4][4] = {{16, 16, 16, 16}, {16, 16, 15, 16}, {16, 16, 16, 16}, {15, 16, 15, 16}};

/// In six bits: 31 with 33280 - 31 * 1036 = 1164 left over, above all thresholds, so that it is 32 * 1036 >> 10 = 32.
constexpr int greyOf6Bits = 32;

using Pattern = u16 (*)(int row, int column);

u16 grey444(int row, int column)
{
    const int field = greyOf4Bits[row & 3][column & 3];
    return bgr444(field, field, field);
}
u16 grey555(int row, int column)
{
    const int field = greyOf5Bits[row & 3][column & 3];
    return bgr555(field, field, field);
}
u16 grey565(int row, int column)
{
    const int field = greyOf5Bits[row & 3][column & 3];
    return bgr565(field, greyOf6Bits, field);
}

PackedRow patternOf(Pattern pattern, RoiSize roi)
{
    PackedRow pixels;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) pixels.push_back(pattern(row, column));
    }
    return pixels;
}

struct Conversions {
    PackFromPixels c3, c2;
    PackFromPlanes p3;
    PackFromSubsampled p422, p420, yuv420;
    Pattern grey;
};

const Conversions all[] = {
    {pyxiYCbCrToBGR444Dither_8u16u_C3R, pyxiYCbCr422ToBGR444Dither_8u16u_C2C3R, pyxiYCbCrToBGR444Dither_8u16u_P3C3R,
     pyxiYCbCr422ToBGR444Dither_8u16u_P3C3R, pyxiYCbCr420ToBGR444Dither_8u16u_P3C3R,
     pyxiYUV420ToBGR444Dither_8u16u_P3C3R, grey444},
    {pyxiYCbCrToRGB444Dither_8u16u_C3R, pyxiYCbCr422ToRGB444Dither_8u16u_C2C3R, pyxiYCbCrToRGB444Dither_8u16u_P3C3R,
     pyxiYCbCr422ToRGB444Dither_8u16u_P3C3R, pyxiYCbCr420ToRGB444Dither_8u16u_P3C3R,
     pyxiYUV420ToRGB444Dither_8u16u_P3C3R, grey444},
    {pyxiYCbCrToBGR555Dither_8u16u_C3R, pyxiYCbCr422ToBGR555Dither_8u16u_C2C3R, pyxiYCbCrToBGR555Dither_8u16u_P3C3R,
     pyxiYCbCr422ToBGR555Dither_8u16u_P3C3R, pyxiYCbCr420ToBGR555Dither_8u16u_P3C3R,
     pyxiYUV420ToBGR555Dither_8u16u_P3C3R, grey555},
    {pyxiYCbCrToRGB555Dither_8u16u_C3R, pyxiYCbCr422ToRGB555Dither_8u16u_C2C3R, pyxiYCbCrToRGB555Dither_8u16u_P3C3R,
     pyxiYCbCr422ToRGB555Dither_8u16u_P3C3R, pyxiYCbCr420ToRGB555Dither_8u16u_P3C3R,
     pyxiYUV420ToRGB555Dither_8u16u_P3C3R, grey555},
    {pyxiYCbCrToBGR565Dither_8u16u_C3R, pyxiYCbCr422ToBGR565Dither_8u16u_C2C3R, pyxiYCbCrToBGR565Dither_8u16u_P3C3R,
     pyxiYCbCr422ToBGR565Dither_8u16u_P3C3R, pyxiYCbCr420ToBGR565Dither_8u16u_P3C3R,
     pyxiYUV420ToBGR565Dither_8u16u_P3C3R, grey565},
    {pyxiYCbCrToRGB565Dither_8u16u_C3R, pyxiYCbCr422ToRGB565Dither_8u16u_C2C3R, pyxiYCbCrToRGB565Dither_8u16u_P3C3R,
     pyxiYCbCr422ToRGB565Dither_8u16u_P3C3R, pyxiYCbCr420ToRGB565Dither_8u16u_P3C3R,
     pyxiYUV420ToRGB565Dither_8u16u_P3C3R, grey565},
};

/// Interleaved samples of one colour, as the rows of `roi`.
PackedRow ofPixels(PackFromPixels convert, const Samples& row, RoiSize roi)
{
    PackedRow target(pixelCount(roi), untouchedPixel);
    EXPECT_EQ(convert(row.data(), 0, target.data(), 2 * roi.width, roi), pyxOk);
    return target;
}

/// Even widths only.
Samples pairsOf(Colour colour, int width) { return repeated({colour.y, colour.cb, colour.y, colour.cr}, width / 2); }

Samples pixelsOf(Colour colour, int width) { return repeated({colour.y, colour.cb, colour.cr}, width); }

} // namespace

TEST(YCbCrToPackedDither, GreyIsAPatternOfTwoNeighbouringValues)
{
    for (const Conversions& to : all) {
        for (const RoiSize roi : {RoiSize{4, 4}, RoiSize{8, 5}, RoiSize{22, 7}, RoiSize{46, 9}}) {
            const PackedRow expected = patternOf(to.grey, roi);
            EXPECT_EQ(ofPixels(to.c3, pixelsOf(grey, roi.width), roi), expected);
            EXPECT_EQ(ofPixels(to.c2, pairsOf(grey, roi.width), roi), expected);
        }
        for (const RoiSize roi : {RoiSize{1, 1}, RoiSize{3, 3}, RoiSize{4, 4}, RoiSize{13, 5}, RoiSize{47, 6}}) {
            const PackedRow expected = patternOf(to.grey, roi);
            EXPECT_EQ(packedOf(to.p3, filledPlanes(grey, roi, {1, 1}), roi), expected);
            EXPECT_EQ(packedOf(to.p422, filledPlanes(grey, roi, block422), roi, block422), expected);
            EXPECT_EQ(packedOf(to.p420, filledPlanes(grey, roi, block420), roi, block420), expected);
            EXPECT_EQ(packedOf(to.yuv420, filledPlanes({130, 128, 128}, roi, block420), roi, block420), expected);
        }
    }
}

TEST(YCbCrToPackedDither, BlackIsBlackAtAllPlaces)
{
    const RoiSize roi = {11, 6};
    for (const Conversions& to : all) {
        EXPECT_EQ(ofPixels(to.c3, pixelsOf(black, roi.width), roi), PackedRow(66, 0));
        EXPECT_EQ(packedOf(to.p3, filledPlanes(black, roi, {1, 1}), roi), PackedRow(66, 0));
        EXPECT_EQ(packedOf(to.yuv420, filledPlanes({0, 128, 128}, roi, block420), roi, block420), PackedRow(66, 0));
    }
}

// 255 leaves 65280 - 14 * 4352 = 4352 in four bits and 65280 - 30 * 2105 = 2130 in five, above all thresholds. In six
// it leaves 65280 - 62 * 1036 = 1048, which is the threshold 2097 >> 1 at the first column of the fourth row.
TEST(YCbCrToPackedDither, WhiteIsWhiteButForOnePlaceInSixBits)
{
    const RoiSize roi = {22, 8};
    const Colour brightest = {255, 128, 128};
    for (const Conversions& to : all) {
        PackedRow expected;
        for (int row = 0; row < roi.height; ++row) {
            for (int column = 0; column < roi.width; ++column) {
                const int green = row % 4 == 3 && column % 4 == 0 ? 62 : 63;
                expected.push_back(to.grey == grey444   ? u16{0x0fff}
                                   : to.grey == grey555 ? u16{0x7fff}
                                                        : bgr565(31, green, 31));
            }
        }
        EXPECT_EQ(ofPixels(to.c3, pixelsOf(brightest, roi.width), roi), expected);
        EXPECT_EQ(ofPixels(to.c2, pairsOf(brightest, roi.width), roi), expected);
        EXPECT_EQ(packedOf(to.p3, filledPlanes(brightest, roi, {1, 1}), roi), expected);
        EXPECT_EQ(packedOf(to.p422, filledPlanes(brightest, roi, block422), roi, block422), expected);
        EXPECT_EQ(packedOf(to.p420, filledPlanes(brightest, roi, block420), roi, block420), expected);
        EXPECT_EQ(packedOf(to.yuv420, filledPlanes(brightest, roi, block420), roi, block420), expected);
    }
}

TEST(YCbCrToPackedDither, ThePatternBeginsWithTheRegion)
{
    // An image of 12 by 12, from its fifth row and column on, and from its second column on.
    const Samples image = pixelsOf(grey, 144);
    PackedRow whole(144), part(64), shifted(64);
    ASSERT_EQ(pyxiYCbCrToBGR444Dither_8u16u_C3R(image.data(), 36, whole.data(), 24, {12, 12}), pyxOk);
    ASSERT_EQ(pyxiYCbCrToBGR444Dither_8u16u_C3R(image.data() + 4 * 36 + 12, 36, part.data(), 16, {8, 8}), pyxOk);
    ASSERT_EQ(pyxiYCbCrToBGR444Dither_8u16u_C3R(image.data() + 3, 36, shifted.data(), 16, {8, 8}), pyxOk);
    for (int row = 0; row < 8; ++row) {
        for (int column = 0; column < 8; ++column)
            EXPECT_EQ(part[8 * row + column], whole[12 * (row + 4) + column + 4]) << row << ", " << column;
    }
    EXPECT_EQ(shifted, part);
    EXPECT_NE(shifted[2], whole[3]);
}

// Red is (254, 0, 0): in four bits 14, of which 65024 - 14 * 4352 = 4096 are left over, above all thresholds but 4335.
TEST(YCbCrToPackedDither, RedStandsWhereTheModelHasIt)
{
    const Samples row = pixelsOf({81, 90, 240}, 4);
    const RoiSize roi = {4, 4};
    PackedRow bgr(16, 0x0f00), rgb(16, 0x000f);
    bgr[12] = 0x0e00, rgb[12] = 0x000e;
    EXPECT_EQ(ofPixels(pyxiYCbCrToBGR444Dither_8u16u_C3R, row, roi), bgr);
    EXPECT_EQ(ofPixels(pyxiYCbCrToRGB444Dither_8u16u_C3R, row, roi), rgb);
}

// Blue of (83, 129, 128) is 79 in the form that does not round and 80 in the exact one: 79 * 256 - 9 * 2105 = 1279, and
// 80 * 256 - 9 * 2105 = 1535. The threshold 1398 at the fourth column lies between them.
TEST(YCbCrToPackedDither, AllPixelsOfARowTakeOneForm)
{
    for (const int width : {7, 8, 13, 36}) {
        const PackedRow target = packedRowOf(pyxiYCbCrToBGR555Dither_8u16u_C3R, pixelsOf({83, 129, 128}, width), width);
        for (std::size_t i = 3; i < target.size(); i += 4) EXPECT_EQ(target[i] & 31, 9) << width << ", " << i;
    }
}

TEST(YCbCrToPackedDither, AnOddStepLosesItsLowBit)
{
    const Samples source = pixelsOf({255, 128, 128}, 2);
    PackedRow target(4, untouchedPixel);
    EXPECT_EQ(pyxiYCbCrToBGR555Dither_8u16u_C3R(source.data(), 3, target.data(), 5, {1, 2}), pyxOk);
    EXPECT_EQ(target, (PackedRow{0x7fff, untouchedPixel, 0x7fff, untouchedPixel}));
}
