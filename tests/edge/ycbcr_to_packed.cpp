// YCbCr and YUV to packed pixels: fields and their order, the chroma of a last odd column and row, and the column at
// which a row passes from the wide form to that of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/packed.hpp"

using namespace edge;

namespace
{

/// (254, 0, 0) in the forms that do not round: with high products of 1210, 2859, -239, 1456 and -1227 the sums are
/// 4069, -7 and -17 of 16.
constexpr Colour red = {81, 90, 240};

/// Without chroma the luma of red.
constexpr int grey = 1210 >> 4;

YCbCrPlanes redOf(RoiSize roi, Block block) { return filledPlanes(red, roi, block); }

Samples pairsOf(Colour colour, int width)
{
    Samples row = repeated({colour.y, colour.cb, colour.y, colour.cr}, width / 2);
    if (width % 2 != 0) row = row + Samples{colour.y, colour.cb, 0, colour.cr};
    return row;
}

PackedRow twoSpans(u16 wide, u16 tail, Span span)
{
    return PackedRow(static_cast<std::size_t>(span.wideColumns), wide) +
           PackedRow(static_cast<std::size_t>(span.width - span.wideColumns), tail);
}

} // namespace

TEST(YCbCrToPacked, WhiteFillsAllFields)
{
    // 28032 * 9535 >> 20 is 254, whose high bits are all set.
    const RoiSize roi = {9, 1};
    const YCbCrPlanes source = filledPlanes(white, roi, {1, 1});
    EXPECT_EQ(packedOf(pyxiYCbCrToBGR565_8u16u_P3C3R, source, roi), PackedRow(9, 0xffff));
    EXPECT_EQ(packedOf(pyxiYCbCrToRGB565_8u16u_P3C3R, source, roi), PackedRow(9, 0xffff));
    EXPECT_EQ(packedOf(pyxiYCbCrToBGR555_8u16u_P3C3R, source, roi), PackedRow(9, 0x7fff));
    EXPECT_EQ(packedOf(pyxiYCbCrToRGB555_8u16u_P3C3R, source, roi), PackedRow(9, 0x7fff));
    EXPECT_EQ(packedOf(pyxiYCbCrToBGR444_8u16u_P3C3R, source, roi), PackedRow(9, 0x0fff));
    EXPECT_EQ(packedOf(pyxiYCbCrToRGB444_8u16u_P3C3R, source, roi), PackedRow(9, 0x0fff));
}

TEST(YCbCrToPacked, RedStandsWhereTheModelHasIt)
{
    const struct {
        u16 pixel;
        PackFromPixels c3, c2;
        PackFromPlanes p3;
        PackFromSubsampled p422, p420;
    } cases[] = {
        {0x0f00, pyxiYCbCrToBGR444_8u16u_C3R, pyxiYCbCr422ToBGR444_8u16u_C2C3R, pyxiYCbCrToBGR444_8u16u_P3C3R,
         pyxiYCbCr422ToBGR444_8u16u_P3C3R, pyxiYCbCr420ToBGR444_8u16u_P3C3R},
        {0x000f, pyxiYCbCrToRGB444_8u16u_C3R, pyxiYCbCr422ToRGB444_8u16u_C2C3R, pyxiYCbCrToRGB444_8u16u_P3C3R,
         pyxiYCbCr422ToRGB444_8u16u_P3C3R, pyxiYCbCr420ToRGB444_8u16u_P3C3R},
        {0x7c00, pyxiYCbCrToBGR555_8u16u_C3R, pyxiYCbCr422ToBGR555_8u16u_C2C3R, pyxiYCbCrToBGR555_8u16u_P3C3R,
         pyxiYCbCr422ToBGR555_8u16u_P3C3R, pyxiYCbCr420ToBGR555_8u16u_P3C3R},
        {0x001f, pyxiYCbCrToRGB555_8u16u_C3R, pyxiYCbCr422ToRGB555_8u16u_C2C3R, pyxiYCbCrToRGB555_8u16u_P3C3R,
         pyxiYCbCr422ToRGB555_8u16u_P3C3R, pyxiYCbCr420ToRGB555_8u16u_P3C3R},
        {0xf800, pyxiYCbCrToBGR565_8u16u_C3R, pyxiYCbCr422ToBGR565_8u16u_C2C3R, pyxiYCbCrToBGR565_8u16u_P3C3R,
         pyxiYCbCr422ToBGR565_8u16u_P3C3R, pyxiYCbCr420ToBGR565_8u16u_P3C3R},
        {0x001f, pyxiYCbCrToRGB565_8u16u_C3R, pyxiYCbCr422ToRGB565_8u16u_C2C3R, pyxiYCbCrToRGB565_8u16u_P3C3R,
         pyxiYCbCr422ToRGB565_8u16u_P3C3R, pyxiYCbCr420ToRGB565_8u16u_P3C3R},
    };
    for (const auto& [pixel, c3, c2, p3, p422, p420] : cases) {
        for (const int width : {1, 3, 8, 17, 40}) {
            const PackedRow expected(static_cast<std::size_t>(width), pixel);
            const RoiSize roi = {width, 1};
            EXPECT_EQ(packedRowOf(c3, repeated({red.y, red.cb, red.cr}, width), width), expected) << width;
            EXPECT_EQ(packedRowOf(c2, pairsOf(red, width), width), expected) << width;
            EXPECT_EQ(packedOf(p3, redOf(roi, {1, 1}), roi), expected) << width;
            EXPECT_EQ(packedOf(p422, redOf(roi, block422), roi, block422), expected) << width;
            EXPECT_EQ(packedOf(p420, redOf(roi, block420), roi, block420), expected) << width;
        }
    }
}

TEST(YCbCrToPacked, TheOrdersOf444DifferInTheOuterFieldsOnly)
{
    const RoiSize roi = {37, 1};
    YCbCrPlanes source = untouchedPlanes(roi, {1, 1});
    for (std::size_t i = 0; i < 37; ++i) {
        source.y[i] = static_cast<u8>(7 * i);
        source.cb[i] = static_cast<u8>(11 * i + 60);
        source.cr[i] = static_cast<u8>(200 - 5 * i);
    }
    PackedRow exchanged = packedOf(pyxiYCbCrToRGB444_8u16u_P3C3R, source, roi);
    for (u16& pixel : exchanged) pixel = static_cast<u16>((pixel & 0xf0) | pixel >> 8 | (pixel & 15) << 8);
    EXPECT_EQ(packedOf(pyxiYCbCrToBGR444_8u16u_P3C3R, source, roi), exchanged);
}

TEST(YCbCrToPacked, ALastOddColumnAndRowHaveChromaOfTheirOwn)
{
    // Of the four chroma samples the second and the third are red.
    const YCbCrPlanes source = {Samples(9, 81), {128, 90, 90, 128}, {128, 240, 240, 128}};
    const u16 r = 0xf800, n = bgr565(grey >> 3, grey >> 2, grey >> 3);
    EXPECT_EQ(packedOf(pyxiYCbCr420ToBGR565_8u16u_P3C3R, source, {3, 3}, block420),
              (PackedRow{n, n, r, n, n, r, r, r, n}));
}

TEST(YCbCrToPacked, ALastOddColumnOfPlanesHasChromaOfItsOwn)
{
    const YCbCrPlanes source = {Samples(3, 81), {128, 90}, {128, 240}};
    const u16 r = 0x7c00, n = bgr555(grey >> 3, grey >> 3, grey >> 3);
    EXPECT_EQ(packedOf(pyxiYCbCr422ToBGR555_8u16u_P3C3R, source, {3, 1}, block422), (PackedRow{n, n, r}));
}

TEST(YCbCrToPacked, ALastOddPackedPixelTakesTheByteAfterItsRow)
{
    const Samples source = {81, 128, 81, 128, 81, 90, 0, 240};
    const u16 r = 0x0f00, n = bgr444(grey >> 4, grey >> 4, grey >> 4);
    EXPECT_EQ(packedRowOf(pyxiYCbCr422ToBGR444_8u16u_C2C3R, source, 3), (PackedRow{n, n, r}));
}

// U of 255 is 127 * 128 = 16256, of which 16646 / 65536 are 4129: blue is 4129 >> 4 = 258, green -(16256 * 3227 >> 16)
// = -800. V of 255 gives red 16256 * 9338 >> 20 = 144.
TEST(YCbCrToPacked, YuvHasNoOffsetOfLuma)
{
    const RoiSize roi = {3, 3};
    EXPECT_EQ(packedOf(pyxiYUV420ToBGR565_8u16u_P3C3R, filledPlanes({255, 128, 128}, roi, block420), roi, block420),
              PackedRow(9, 0xffff));
    EXPECT_EQ(packedOf(pyxiYUV420ToBGR565_8u16u_P3C3R, filledPlanes({16, 128, 128}, roi, block420), roi, block420),
              PackedRow(9, bgr565(2, 4, 2)));
    EXPECT_EQ(packedOf(pyxiYUV420ToBGR444_8u16u_P3C3R, filledPlanes({0, 255, 128}, roi, block420), roi, block420),
              PackedRow(9, bgr444(0, 0, 15)));
    EXPECT_EQ(packedOf(pyxiYUV420ToRGB555_8u16u_P3C3R, filledPlanes({0, 128, 255}, roi, block420), roi, block420),
              PackedRow(9, rgb555(144 >> 3, 0, 0)));
}

TEST(YCbCrToPacked, YuvOfOneColumnOrRowIsConverted)
{
    for (const RoiSize roi : {RoiSize{1, 1}, RoiSize{1, 5}, RoiSize{5, 1}, RoiSize{19, 1}})
        EXPECT_EQ(packedOf(pyxiYUV420ToRGB565_8u16u_P3C3R, filledPlanes({16, 128, 128}, roi, block420), roi, block420),
                  PackedRow(pixelCount(roi), rgb565(2, 4, 2)));
}

// Blue of (83, 129, 128). Wide: the high products are 1247 and 32, and 1279 >> 4 = 79. Tail: 76284 * 83 + 132186 -
// 1220544 = 5243214, just above 80 * 65536. The others are 77 in both.
TEST(YCbCrToPacked, PixelsOfThreeSamplesAreWideInBlocksOf8)
{
    const struct {
        PackFromPixels convert;
        u16 wide, tail;
    } cases[] = {
        {pyxiYCbCrToBGR444_8u16u_C3R, bgr444(4, 4, 4), bgr444(4, 4, 5)},
        {pyxiYCbCrToRGB444_8u16u_C3R, rgb444(4, 4, 4), rgb444(4, 4, 5)},
        {pyxiYCbCrToBGR555_8u16u_C3R, bgr555(9, 9, 9), bgr555(9, 9, 10)},
        {pyxiYCbCrToRGB555_8u16u_C3R, rgb555(9, 9, 9), rgb555(9, 9, 10)},
        {pyxiYCbCrToBGR565_8u16u_C3R, bgr565(9, 19, 9), bgr565(9, 19, 10)},
        {pyxiYCbCrToRGB565_8u16u_C3R, rgb565(9, 19, 9), rgb565(9, 19, 10)},
    };
    for (const auto& [convert, wide, tail] : cases) {
        for (const Span span : {Span{1, 0}, {7, 0}, {8, 8}, {9, 8}, {15, 8}, {16, 16}, {31, 24}, {45, 40}})
            EXPECT_EQ(packedRowOf(convert, repeated({83, 129, 128}, span.width), span.width),
                      twoSpans(wide, tail, span))
                << span.width;
    }
}

TEST(YCbCrToPacked, PairsAreWideInBlocksOf8)
{
    const struct {
        PackFromPixels convert;
        u16 wide, tail;
    } cases[] = {
        {pyxiYCbCr422ToBGR444_8u16u_C2C3R, bgr444(4, 4, 4), bgr444(4, 4, 5)},
        {pyxiYCbCr422ToRGB444_8u16u_C2C3R, rgb444(4, 4, 4), rgb444(4, 4, 5)},
        {pyxiYCbCr422ToRGB555_8u16u_C2C3R, rgb555(9, 9, 9), rgb555(9, 9, 10)},
        {pyxiYCbCr422ToRGB565_8u16u_C2C3R, rgb565(9, 19, 9), rgb565(9, 19, 10)},
    };
    for (const auto& [convert, wide, tail] : cases) {
        for (const Span span : {Span{1, 0}, {7, 0}, {8, 8}, {9, 8}, {15, 8}, {16, 16}, {31, 24}, {45, 40}})
            EXPECT_EQ(packedRowOf(convert, pairsOf({83, 129, 128}, span.width), span.width), twoSpans(wide, tail, span))
                << span.width;
    }
}

// Blue of (184, 126, 128). Wide: the high products are 3128 and -65, and (3063 + 8) >> 4 = 191. Tail: 76282 * 184 -
// 2 * 132184 - 1187744 = 12583776, just above 192 * 65536. The others are 196 in both.
TEST(YCbCrToPacked, PairsRoundInTwoModelsOfBgrOnly)
{
    for (const Span span : {Span{1, 0}, {7, 0}, {8, 8}, {9, 8}, {15, 8}, {16, 16}, {31, 24}, {45, 40}}) {
        const Samples source = pairsOf({184, 126, 128}, span.width);
        EXPECT_EQ(packedRowOf(pyxiYCbCr422ToBGR555_8u16u_C2C3R, source, span.width),
                  twoSpans(bgr555(24, 24, 23), bgr555(24, 24, 24), span))
            << span.width;
        EXPECT_EQ(packedRowOf(pyxiYCbCr422ToBGR565_8u16u_C2C3R, source, span.width),
                  twoSpans(bgr565(24, 49, 23), bgr565(24, 49, 24), span))
            << span.width;
    }
    // Grey of 174: 20224 * 9535 >> 16 is 2942, which makes 183, and 184 with the half that rounds.
    const Samples source = pairsOf({174, 128, 128}, 8);
    EXPECT_EQ(packedRowOf(pyxiYCbCr422ToBGR555_8u16u_C2C3R, source, 8), PackedRow(8, bgr555(23, 23, 23)));
    EXPECT_EQ(packedRowOf(pyxiYCbCr422ToRGB555_8u16u_C2C3R, source, 8), PackedRow(8, rgb555(22, 22, 22)));
}

// Grey of 112: 12288 * 9535 >> 20 = 111 in the wide form, 76284 * 112 - 1187776 = 112.2 * 65536 in the tail.
TEST(YCbCrToPacked, ChromaOfFourIsWideInBlocksOf4AndServesWhatFollows)
{
    for (const Span span : {Span{4, 4}, {5, 4}, {7, 4}, {8, 8}, {11, 8}, {33, 32}, {38, 36}}) {
        const RoiSize roi = {span.width, 1};
        const YCbCrPlanes source = filledPlanes({112, 128, 128}, roi, block411);
        const PyxStatus status = span.width % 4 == 0 ? pyxOk : pyxWarnOddSize;
        EXPECT_EQ(packedOf(pyxiYCbCr411ToBGR555_8u16u_P3C3R, source, roi, block411, status),
                  twoSpans(bgr555(13, 13, 13), bgr555(14, 14, 14), span))
            << span.width;
        EXPECT_EQ(packedOf(pyxiYCbCr411ToBGR565_8u16u_P3C3R, source, roi, block411, status),
                  twoSpans(bgr565(13, 27, 13), bgr565(14, 28, 14), span))
            << span.width;
    }
    // The second chroma sample is one past the last whole block, and of another colour.
    const YCbCrPlanes source = {Samples(6, 81), {90, 200}, {240, 10}};
    EXPECT_EQ(packedOf(pyxiYCbCr411ToBGR565_8u16u_P3C3R, source, {6, 1}, block411, pyxWarnOddSize),
              PackedRow(6, 0xf800));
}

TEST(YCbCrToPacked, AnOddStepLosesItsLowBit)
{
    const Samples source = repeated({red.y, red.cb, red.cr}, 2);
    PackedRow target(4, untouchedPixel);
    EXPECT_EQ(pyxiYCbCrToBGR565_8u16u_C3R(source.data(), 3, target.data(), 5, {1, 2}), pyxOk);
    EXPECT_EQ(target, (PackedRow{0xf800, untouchedPixel, 0xf800, untouchedPixel}));
}

TEST(YCbCrToPacked, TheSizeOutranksAnElementButNotAnArray)
{
    const Samples source(16, 128);
    PackedRow target(4, untouchedPixel);
    const u8* const planes[3] = {source.data(), nullptr, source.data()};
    const int steps[3] = {4, 4, 4};
    EXPECT_EQ(pyxiYCbCrToBGR565_8u16u_P3C3R(planes, 4, target.data(), 8, {0, 1}), pyxErrSize);
    EXPECT_EQ(pyxiYCbCrToBGR565_8u16u_P3C3R(planes, 4, target.data(), 8, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCrToBGR565_8u16u_P3C3R(nullptr, 4, target.data(), 8, {0, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr420ToRGB444_8u16u_P3C3R(planes, steps, target.data(), 8, {1, 0}), pyxErrSize);
    EXPECT_EQ(pyxiYCbCr420ToRGB444_8u16u_P3C3R(planes, steps, target.data(), 8, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr420ToRGB444_8u16u_P3C3R(planes, steps, nullptr, 8, {1, 0}), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr411ToBGR555_8u16u_P3C3R(planes, steps, target.data(), 8, {3, 1}), pyxErrSize);
    EXPECT_EQ(pyxiYCbCr411ToBGR555_8u16u_P3C3R(planes, steps, target.data(), 8, {4, 1}), pyxErrNullPtr);
    EXPECT_EQ(target, PackedRow(4, untouchedPixel));
}
