// YCbCr with chroma shared by four pixels of a row to BGR: the form and the chroma of the pixels after the last four.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

/// A row of (18, 128, 129), with chroma in the place of a last part of a block that must not be used.
YCbCrPlanes rowOf(int width)
{
    YCbCrPlanes source = filledPlanes({18, 128, 129}, {width, 1}, block411);
    if (width % 4 != 0) source.cb.back() = source.cr.back() = 0;
    return source;
}

} // namespace

// Green of (18, 128, 129). Wide: the high products of 256 * 9536 and 128 * -6660 are 37 and -14, and
// (37 - 14 + 8) >> 4 = 1. Tail: 76294 * 18 - 53281 - 1187936 = 132075, just above 2 * 65536. Red and blue are 4 and 2
// in both.
TEST(YCbCr411ToRgb, ThreePixelsAfterTheLastFourAreWideAndFewerAreNot)
{
    for (const Span span : {Span{4, 4},
                            {5, 4},
                            {6, 4},
                            {7, 7},
                            {8, 8},
                            {9, 8},
                            {10, 8},
                            {11, 11},
                            {12, 12},
                            {29, 28},
                            {30, 28},
                            {31, 31},
                            {32, 32},
                            {33, 32},
                            {34, 32},
                            {35, 35}}) {
        const RoiSize roi = {span.width, 1};
        const int tail = span.width - span.wideColumns;
        EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C3R, rowOf(span.width), roi, block411, pyxOk),
                  repeated({2, 1, 4}, span.wideColumns) + repeated({2, 2, 4}, tail))
            << span.width;
        EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C4R, rowOf(span.width), roi, block411, pyxOk),
                  repeated({2, 1, 4, aval}, span.wideColumns) + repeated({2, 2, 4, aval}, tail))
            << span.width;
    }
}

TEST(YCbCr411ToRgb, EachBlockHasItsChroma)
{
    // Black, then red.
    const YCbCrPlanes source = {Samples(4, 16) + Samples(6, 81), {128, 90, 0}, {128, 240, 0}};
    EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C3R, source, {10, 1}, block411, pyxOk),
              repeated({0, 0, 0}, 4) + repeated({0, 0, 254}, 6));
}

TEST(YCbCr411ToRgb, BlackAndWhiteAreTheSameInEveryForm)
{
    for (const int width : {4, 5, 6, 7, 8, 21, 34}) {
        const RoiSize roi = {width, 1};
        EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C3R, filledPlanes(black, roi, block411), roi, block411, pyxOk),
                  Samples(3 * width, 0));
        EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C3R, filledPlanes(white, roi, block411), roi, block411, pyxOk),
                  Samples(3 * width, 255));
        EXPECT_EQ(fromPlanes(pyxiYCbCr411ToBGR_8u_P3C4R, filledPlanes(white, roi, block411), roi, block411, pyxOk),
                  repeated({255, 255, 255, aval}, width));
    }
}
