// YCbCr with chroma shared by pairs of pixels to RGB: the chroma of a last odd pixel, white in each form, and the
// column at which a row passes from the wide form to that of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

using Pixel = std::initializer_list<u8>;
using Packed3 = Packed;
using Packed4 = PackedWithAlpha;
using PackedToPlanes = PyxStatus (*)(const u8*, int, u8* const*, int, RoiSize);

/// A packed row of equal pixels. One of odd width ends after the first chroma sample of its last pair.
Samples packed(Colour stored, int width)
{
    Samples row = repeated({stored.y, stored.cb, stored.y, stored.cr}, width / 2);
    if (width % 2 != 0) row.insert(row.end(), {stored.y, stored.cb});
    return row;
}

Samples row3(Packed3 convert, Colour stored, int width)
{
    return packedRow(convert, packed(stored, width), width, 3 * width);
}

Samples row4(Packed4 convert, Colour stored, int width)
{
    return packedRow(convert, packed(stored, width), width, 4 * width);
}

/// A row of one pixel, which starts at the second byte of the source.
Samples lonePixel(Packed3 convert, const Samples& source)
{
    Samples target(3, none);
    EXPECT_EQ(convert(source.data() + 1, 0, target.data(), 0, {1, 1}), pyxOk);
    return target;
}

Samples lonePixel(Packed4 convert, const Samples& source)
{
    Samples target(4, none);
    EXPECT_EQ(convert(source.data() + 1, 0, target.data(), 0, {1, 1}, aval), pyxOk);
    return target;
}

/// A packed row to planes, whose samples are then put together as pixels.
Samples planesRow(PackedToPlanes convert, const u8* source, int width)
{
    Samples r(width, none), g(width, none), b(width, none);
    u8* const dst[3] = {r.data(), g.data(), b.data()};
    EXPECT_EQ(convert(source, 0, dst, 0, {width, 1}), pyxOk);
    Samples pixels;
    for (int i = 0; i < width; ++i) pixels = pixels + Samples{r[i], g[i], b[i]};
    return pixels;
}

/// A row of equal pixels from planes.
Samples rowOfPlanes(FromPlanes convert, Colour colour, int width)
{
    const RoiSize roi = {width, 1};
    return fromPlanes(convert, filledPlanes(colour, roi, block422), roi, block422, pyxOk);
}

Samples twoSpans(Pixel wide, Pixel tail, Span span)
{
    return repeated(wide, span.wideColumns) + repeated(tail, span.width - span.wideColumns);
}

/// Red in every form, and the same with the chroma samples exchanged.
constexpr Colour red = {81, 90, 240};
constexpr Colour redExchanged = {81, 240, 90};

} // namespace

TEST(YCbCr422ToRgb, BgrFromPlanesLeavesALastOddPixelOut)
{
    const YCbCrPlanes source = {{16, 235, 235, 16, 235, 235}, {128, 128, 128, 128}, {128, 128, 128, 128}};
    EXPECT_EQ(fromPlanes(pyxiYCbCr422ToBGR_8u_P3C3R, source, {3, 2}, block422, pyxOk),
              (Samples{0, 0, 0, 254, 254, 254, none, none, none, 0, 0, 0, 254, 254, 254, none, none, none}));
}

// The third pixel is red by the second chroma sample: 76282 * 81 + 104593 * 112 - 1220512 is 254.4 of 2^16.
TEST(YCbCr422ToRgb, RgbFromPlanesGivesALastOddPixelAChromaSampleOfItsOwn)
{
    const YCbCrPlanes source = {{16, 235, 81}, {128, 90}, {128, 240}};
    EXPECT_EQ(fromPlanes(pyxiYCbCr422ToRGB_8u_P3C3R, source, {3, 1}, block422, pyxOk),
              (Samples{0, 0, 0, 254, 254, 254, 254, 0, 0}));
}

// A row of (21, 128, 129), whose last pixel is (22, 129, 129) by its own Cb and the Cr of the pair before; the Cr of
// the first pair, which is red, would tell. Wide: with high products of 93 and -14 green is (93 - 14) >> 4 = 4, where
// the tail has 5. Tail: blue of the last pixel is 76284 * 22 + 132186 * 129 - 18140365 = 589877, just above 9 * 65536,
// where the wide form has (111 + 32) >> 4 = 8.
TEST(YCbCr422ToRgb, LastOddPackedPixelTakesChromaFromThePairBefore)
{
    const Samples source = {81, 90, 81, 240, 21, 128, 21, 129, 22, 129};
    const Samples expected = {254, 0, 0, 254, 0, 0, 7, 4, 5, 7, 4, 5, 8, 5, 9};
    EXPECT_EQ(packedRow(pyxiYCbCr422ToRGB_8u_C2C3R, source, 5, 15), expected);
    EXPECT_EQ(planesRow(pyxiYCbCr422ToRGB_8u_C2P3R, source.data(), 5), expected);

    const Samples exchanged = {81, 240, 81, 90, 21, 129, 21, 128, 22, 129};
    EXPECT_EQ(planesRow(pyxiYCrCb422ToRGB_8u_C2P3R, exchanged.data(), 5),
              (Samples{254, 0, 0, 254, 0, 0, 7, 4, 5, 7, 4, 5, 8, 6, 6}));
}

TEST(YCbCr422ToRgb, PackedRowOfOnePixelTakesChromaFromTheByteBeforeIt)
{
    // Red, whose second chroma sample is in front of the row.
    const Samples crBefore = {240, 81, 90}, cbBefore = {90, 81, 240};
    const Samples rgb = {254, 0, 0}, bgr = {0, 0, 254}, rgba = {254, 0, 0, aval}, bgra = {0, 0, 254, aval};
    EXPECT_EQ(lonePixel(pyxiYCbCr422ToRGB_8u_C2C3R, crBefore), rgb);
    EXPECT_EQ(lonePixel(pyxiYCbCr422ToRGB_8u_C2C4R, crBefore), rgba);
    EXPECT_EQ(lonePixel(pyxiYCbCr422ToBGR_8u_C2C3R, crBefore), bgr);
    EXPECT_EQ(lonePixel(pyxiYCbCr422ToBGR_8u_C2C4R, crBefore), bgra);
    EXPECT_EQ(planesRow(pyxiYCbCr422ToRGB_8u_C2P3R, crBefore.data() + 1, 1), rgb);
    EXPECT_EQ(lonePixel(pyxiYCrCb422ToRGB_8u_C2C3R, cbBefore), rgb);
    EXPECT_EQ(lonePixel(pyxiYCrCb422ToRGB_8u_C2C4R, cbBefore), rgba);
    EXPECT_EQ(lonePixel(pyxiYCrCb422ToBGR_8u_C2C3R, cbBefore), bgr);
    EXPECT_EQ(lonePixel(pyxiYCrCb422ToBGR_8u_C2C4R, cbBefore), bgra);
    EXPECT_EQ(planesRow(pyxiYCrCb422ToRGB_8u_C2P3R, cbBefore.data() + 1, 1), rgb);
}

TEST(YCbCr422ToRgb, EachPackedRowOfOnePixelTakesTheByteBeforeIt)
{
    const Samples source = {240, 81, 90, 128, 16, 128};
    Samples target(6, none);
    EXPECT_EQ(pyxiYCbCr422ToRGB_8u_C2C3R(source.data() + 1, 3, target.data(), 3, {1, 2}), pyxOk);
    EXPECT_EQ(target, (Samples{254, 0, 0, 0, 0, 0}));
}

TEST(YCbCr422ToRgb, BlackIsBlackInEveryForm)
{
    for (const int width : {2, 4, 7, 8, 15, 45}) {
        const Samples c3(3 * width, 0), c4 = repeated({0, 0, 0, aval}, width);
        for (const Packed3 convert : {pyxiYCbCr422ToBGR_8u_C2C3R, pyxiYCbCr422ToRGB_8u_C2C3R,
                                      pyxiYCrCb422ToBGR_8u_C2C3R, pyxiYCrCb422ToRGB_8u_C2C3R})
            EXPECT_EQ(row3(convert, black, width), c3);
        for (const Packed4 convert : {pyxiYCbCr422ToBGR_8u_C2C4R, pyxiYCbCr422ToRGB_8u_C2C4R,
                                      pyxiYCrCb422ToBGR_8u_C2C4R, pyxiYCrCb422ToRGB_8u_C2C4R})
            EXPECT_EQ(row4(convert, black, width), c4);
        for (const PackedToPlanes convert : {pyxiYCbCr422ToRGB_8u_C2P3R, pyxiYCrCb422ToRGB_8u_C2P3R})
            EXPECT_EQ(planesRow(convert, packed(black, width).data(), width), c3);
        EXPECT_EQ(rowOfPlanes(pyxiYCbCr422ToRGB_8u_P3C3R, black, width), c3);
    }
}

// White. Wide: the luma term is 30080 * 4768 >> 16 = 2188, the terms of Cr and Cb are 1634 and 2065, and
// (2188 + 1634 - 1783) >> 3 = (2188 + 2065 - 2214) >> 3 = 254; green is (2188 - (401 + 832 - 1085)) >> 3 = 255. Tail:
// 255.4 in all.
TEST(YCbCr422ToRgb, WhiteIsWideInBlocksOf8)
{
    for (const Span span : {Span{2, 0}, {7, 0}, {8, 8}, {9, 8}, {15, 8}, {16, 16}, {23, 16}, {24, 24}}) {
        const Samples c3 = twoSpans({254, 255, 254}, {255, 255, 255}, span);
        const Samples c4 = twoSpans({254, 255, 254, aval}, {255, 255, 255, aval}, span);
        for (const Packed3 convert : {pyxiYCrCb422ToBGR_8u_C2C3R, pyxiYCrCb422ToRGB_8u_C2C3R})
            EXPECT_EQ(row3(convert, white, span.width), c3) << span.width;
        for (const Packed4 convert :
             {pyxiYCbCr422ToRGB_8u_C2C4R, pyxiYCrCb422ToBGR_8u_C2C4R, pyxiYCrCb422ToRGB_8u_C2C4R})
            EXPECT_EQ(row4(convert, white, span.width), c4) << span.width;
    }
}

// White is 255 throughout. Of (19, 129, 128) blue is (55 + 32 + 8) >> 4 = 5 in the wide form, the high products being
// 384 * 9535 and 128 * 16523, and 76282 * 19 + 132184 - 1187744 = 393798 in the tail, just above 6 * 65536.
TEST(YCbCr422ToRgb, BgrOfCbCrIsWideInBlocksOf8)
{
    for (const Span span : {Span{2, 0}, {7, 0}, {8, 8}, {9, 8}, {15, 8}, {16, 16}, {23, 16}, {24, 24}}) {
        EXPECT_EQ(row3(pyxiYCbCr422ToBGR_8u_C2C3R, white, span.width), Samples(3 * span.width, 255));
        EXPECT_EQ(row3(pyxiYCbCr422ToBGR_8u_C2C3R, {19, 129, 128}, span.width), twoSpans({5, 3, 3}, {6, 3, 3}, span))
            << span.width;
        EXPECT_EQ(row4(pyxiYCbCr422ToBGR_8u_C2C4R, {19, 129, 128}, span.width),
                  twoSpans({5, 3, 3, aval}, {6, 3, 3, aval}, span))
            << span.width;
    }
}

// Green of (18, 128, 129): the high product of 128 and 6660 is 13, and (37 - 13 + 8) >> 4 = 2. Of planes it is that of
// 128 and -6660, which is -14, and (37 - 14 + 8) >> 4 = 1.
TEST(YCbCr422ToRgb, GreenRoundsTheOtherWayWhenItIsSubtracted)
{
    EXPECT_EQ(row3(pyxiYCbCr422ToBGR_8u_C2C3R, {18, 128, 129}, 8), repeated({2, 2, 4}, 8));
    EXPECT_EQ(row4(pyxiYCbCr422ToBGR_8u_C2C4R, {18, 128, 129}, 8), repeated({2, 2, 4, aval}, 8));
    EXPECT_EQ(rowOfPlanes(pyxiYCbCr422ToBGR_8u_P3C3R, {18, 128, 129}, 8), repeated({2, 1, 4}, 8));
}

// White is 254 throughout. Green of (21, 128, 129) is (93 - 14) >> 4 = 4 in the wide form, and
// 76284 * 21 - 53281 * 129 - 25690 * 128 + 8887730 = 328125 in the tail, just above 5 * 65536.
TEST(YCbCr422ToRgb, RgbOfThreeSamplesIsWideInBlocksOf4)
{
    for (const Span span : {Span{2, 0}, {3, 0}, {4, 4}, {7, 4}, {8, 8}, {11, 8}, {12, 12}}) {
        EXPECT_EQ(row3(pyxiYCbCr422ToRGB_8u_C2C3R, white, span.width), Samples(3 * span.width, 254));
        const Samples expected = twoSpans({7, 4, 5}, {7, 5, 5}, span);
        EXPECT_EQ(row3(pyxiYCbCr422ToRGB_8u_C2C3R, {21, 128, 129}, span.width), expected) << span.width;
        EXPECT_EQ(planesRow(pyxiYCbCr422ToRGB_8u_C2P3R, packed({21, 128, 129}, span.width).data(), span.width),
                  expected)
            << span.width;
        EXPECT_EQ(planesRow(pyxiYCrCb422ToRGB_8u_C2P3R, packed({21, 129, 128}, span.width).data(), span.width),
                  expected)
            << span.width;
    }
}

// White: 28032 * 9535 >> 16 = 4078, and (4078 + 8) >> 4 = 255. The tail is 254.9 and does not round.
TEST(YCbCr422ToRgb, BgrFromPlanesIsWideInBlocksOf8)
{
    for (const Span span : {Span{2, 0}, {6, 0}, {8, 8}, {14, 8}, {16, 16}, {22, 16}, {24, 24}})
        EXPECT_EQ(rowOfPlanes(pyxiYCbCr422ToBGR_8u_P3C3R, white, span.width),
                  twoSpans({255, 255, 255}, {254, 254, 254}, span))
            << span.width;
}

TEST(YCbCr422ToRgb, ChannelsAndChromaStandInTheOrderOfTheName)
{
    for (const int width : {2, 8, 11, 15}) {
        const Samples rgb = repeated({254, 0, 0}, width), rgba = repeated({254, 0, 0, aval}, width);
        const Samples bgr = repeated({0, 0, 254}, width), bgra = repeated({0, 0, 254, aval}, width);
        EXPECT_EQ(row3(pyxiYCbCr422ToRGB_8u_C2C3R, red, width), rgb);
        EXPECT_EQ(row4(pyxiYCbCr422ToRGB_8u_C2C4R, red, width), rgba);
        EXPECT_EQ(row3(pyxiYCbCr422ToBGR_8u_C2C3R, red, width), bgr);
        EXPECT_EQ(row4(pyxiYCbCr422ToBGR_8u_C2C4R, red, width), bgra);
        EXPECT_EQ(row3(pyxiYCrCb422ToRGB_8u_C2C3R, redExchanged, width), rgb);
        EXPECT_EQ(row4(pyxiYCrCb422ToRGB_8u_C2C4R, redExchanged, width), rgba);
        EXPECT_EQ(row3(pyxiYCrCb422ToBGR_8u_C2C3R, redExchanged, width), bgr);
        EXPECT_EQ(row4(pyxiYCrCb422ToBGR_8u_C2C4R, redExchanged, width), bgra);
        EXPECT_EQ(rowOfPlanes(pyxiYCbCr422ToRGB_8u_P3C3R, red, width), rgb);
    }
    EXPECT_EQ(rowOfPlanes(pyxiYCbCr422ToBGR_8u_P3C3R, red, 14), repeated({0, 0, 254}, 14));
}
