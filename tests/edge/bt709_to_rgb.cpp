// YCbCr to BGR by the BT.709 matrices: the column at which a row passes from the wide form to that of the tail, what
// odd sizes leave out, and the chroma of a last odd pixel.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

constexpr u8 none = untouched;

template <typename Convert> Samples rows420(Convert convert, Colour colour, RoiSize roi, PyxStatus expected = pyxOk)
{
    return fromPlanes(convert, filledPlanes(colour, roi, block420), roi, block420, expected);
}

/// A row of equal pixels from planes of full resolution.
Samples rowOf(PyxStatus (*convert)(const u8* const*, int, u8*, int, RoiSize), Colour colour, int width)
{
    const Samples y(width, colour.y), cb(width, colour.cb), cr(width, colour.cr);
    const u8* const src[3] = {y.data(), cb.data(), cr.data()};
    Samples target(3 * width, none);
    EXPECT_EQ(convert(src, 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

Samples rowOf(PyxStatus (*convert)(const u8* const*, int, u8*, int, RoiSize, u8), Colour colour, int width)
{
    const Samples y(width, colour.y), cb(width, colour.cb), cr(width, colour.cr);
    const u8* const src[3] = {y.data(), cb.data(), cr.data()};
    Samples target(4 * width, none);
    EXPECT_EQ(convert(src, 0, target.data(), 0, {width, 1}, aval), pyxOk);
    return target;
}

/// A packed row of equal pixels. One of odd width ends after the luma of its last pixel.
Samples packed(Colour colour, int width)
{
    Samples row = repeated({colour.cb, colour.y, colour.cr, colour.y}, width / 2);
    if (width % 2 != 0) row.insert(row.end(), {colour.cb, colour.y});
    return row;
}

} // namespace

// White. Wide: 28032 * 9535 >> 16 = 4078, and 4078 >> 4 = 254. Tail: 76284 * 235 - 1187776 is 255.4 of 2^16.
TEST(Bt709ToRgb, StudioRange420IsWideUpToColumn47Of61)
{
    const Samples row = Samples(3 * 48, 254) + Samples(3 * 12, 255) + Samples(3, none);
    EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709CSC_8u_P3C3R, white, {61, 2}, pyxWarnOddSize), row + row);
}

// Green of (16, 128, 127). Wide: the high product of -128 and 3760 is -8, and (16 * 16 + 8 + 8) >> 4 = 17. Tail:
// 65536 * 16 + 30081 + 32768 is 16.96 of 2^16. Red is 14 and blue 16 in both.
TEST(Bt709ToRgb, FullRange422IsWideUpToColumn55Of61)
{
    constexpr Colour colour = {16, 128, 127};
    EXPECT_EQ(packedRow(pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R, packed(colour, 61), 61, 3 * 61),
              repeated({16, 17, 14}, 56) + repeated({16, 16, 14}, 5));
    EXPECT_EQ(packedRow(pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R, packed(colour, 61), 61, 4 * 61),
              repeated({16, 17, 14, aval}, 56) + repeated({16, 16, 14, aval}, 5));
    const Samples row =
        repeated({16, 17, 14, aval}, 48) + repeated({16, 16, 14, aval}, 12) + repeated({none, none, none, none}, 1);
    EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R, colour, {61, 2}, pyxWarnOddSize), row + row);
}

// At full resolution 4 is added to the 4078 of white, and 4082 >> 4 = 255.
TEST(Bt709ToRgb, StudioRangeDiffersBetweenFullResolutionAnd420)
{
    EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C3R, white, 16), Samples(3 * 16, 255));
    EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C4R, white, 16), repeated({255, 255, 255, aval}, 16));
    EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709CSC_8u_P3C3R, white, {16, 2}), Samples(2 * 3 * 16, 254));
}

// A gray of 20. Wide: 512 * 9535 >> 16 = 74, and (74 + 4) >> 4 = 4. Tail: 76284 * 20 - 1187776 is 5.2 of 2^16.
TEST(Bt709ToRgb, StudioRangeAtFullResolutionIsWideInBlocksOf16)
{
    for (const Span span : {Span{1, 0}, {15, 0}, {16, 16}, {17, 16}, {31, 16}, {32, 32}, {47, 32}, {48, 48}}) {
        const int tail = span.width - span.wideColumns;
        EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C3R, {20, 128, 128}, span.width),
                  Samples(3 * span.wideColumns, 4) + Samples(3 * tail, 5))
            << span.width;
        EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C4R, {20, 128, 128}, span.width),
                  repeated({4, 4, 4, aval}, span.wideColumns) + repeated({5, 5, 5, aval}, tail))
            << span.width;
    }
}

// The red of (63, 102, 240) reaches 256 and its green and blue stay below 1.
TEST(Bt709ToRgb, StudioRangeGivesBlueFirst)
{
    for (const int width : {2, 16, 18}) {
        EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C3R, {63, 102, 240}, width), repeated({0, 0, 255}, width));
        EXPECT_EQ(rowOf(pyxiYCbCrToBGR_709CSC_8u_P3C4R, {63, 102, 240}, width), repeated({0, 0, 255, aval}, width));
        EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709CSC_8u_P3C3R, {63, 102, 240}, {width, 2}),
                  repeated({0, 0, 255}, 2 * width));
    }
}

// (16, 127, 127): red is 65536 * 16 - 100925 + 32768, which is 14.96 of 2^16, green gains 11993 and 30081, which makes
// 17.1, and blue is 65536 * 16 - 119013 + 32768, 14.7.
TEST(Bt709ToRgb, PackedRowOfOnePixelUsesItsCbAsCr)
{
    const Samples source = {127, 16};
    EXPECT_EQ(packedRow(pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R, source, 1, 3), (Samples{14, 17, 14}));
    EXPECT_EQ(packedRow(pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R, source, 1, 4), (Samples{14, 17, 14, aval}));
}

// The same colour, by the Cr of the second pair; that of the first one would make it far more red.
TEST(Bt709ToRgb, LastOddPackedPixelTakesCrFromThePairBefore)
{
    const Samples source = {128, 235, 255, 235, 128, 16, 127, 16, 127, 16};
    const Samples target = packedRow(pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R, source, 5, 15);
    EXPECT_EQ(Samples(target.begin() + 6, target.end()), (Samples{16, 16, 14, 16, 16, 14, 14, 17, 14}));
}

TEST(Bt709ToRgb, SizeOfOneWritesNothingAndWarns)
{
    for (const RoiSize roi : {RoiSize{1, 1}, {1, 4}, {34, 1}}) {
        EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709CSC_8u_P3C3R, white, roi, pyxWarnOddSize),
                  Samples(3 * pixelCount(roi), none));
        EXPECT_EQ(rows420(pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R, white, roi, pyxWarnOddSize),
                  Samples(4 * pixelCount(roi), none));
    }
}
