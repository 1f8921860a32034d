// BGR to YCbCr with chroma shared by four pixels of a row: what becomes of the pixels after the last four, and the
// column at which a row passes from the wide forms to those of the tail.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

using namespace edge;

namespace
{

YCbCrPlanes row411(ToPlanes convert, const Samples& pixels, int width)
{
    return toPlanes(convert, pixels, {width, 1}, block411, width % 4 == 0 ? pyxOk : pyxWarnOddSize);
}

} // namespace

// Red is 82, 90, 240 in the tail.
TEST(RgbToYCbCr411, PixelsAfterTheLastFourGetLumaOfFourSamplesOnly)
{
    constexpr u8 none = untouched;
    for (const int rest : {1, 2, 3}) {
        const int width = 4 + rest;
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_AC4P3R, repeated({0, 0, 255, 9}, width), width),
                  (YCbCrPlanes{Samples(width, 82), {90, none}, {240, none}}));
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_C3P3R, repeated({0, 0, 255}, width), width),
                  (YCbCrPlanes{Samples(4, 82) + Samples(rest, none), {90, none}, {240, none}}));
    }
}

TEST(RgbToYCbCr411, BlackAndWhiteAreTheSameInEveryForm)
{
    for (const int width : {4, 16, 20, 32, 48, 60}) {
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_AC4P3R, repeated({0, 0, 0, 9}, width), width),
                  filledPlanes(black, {width, 1}, block411));
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_C3P3R, repeated({255, 255, 255}, width), width),
                  filledPlanes(white, {width, 1}, block411));
    }
}

// Blue of 100, a sum of 400. Wide: the rounded products of 12800 are 627 for luma, 2810 for Cb and 454 for Cr, and
// (627 >> 6) + 16 = 25, (2810 >> 6) + 128 = 171, (-454 >> 6) + 128 = 120. Tail: luma is 16.5 + 9.8, Cb 128.125 + 43.9
// and Cr 128.125 - 7.1.
TEST(RgbToYCbCr411, ThreeSamplesAPixelAreWideInBlocksOf16)
{
    for (const Span span : {Span{4, 0}, {12, 0}, {16, 16}, {28, 16}, {32, 32}, {44, 32}, {48, 48}}) {
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_C3P3R, repeated({100, 0, 0}, span.width), span.width),
                  twoSpans({25, 171, 120}, {26, 172, 121}, span, block411))
            << span.width;
    }
}

// Luma of red of 31: the rounded product of 3968 is 510, and (510 >> 6) + 16 = 23. Cb of red of 34: the rounded product
// of 4352 is 322, and (-322 >> 6) + 128 = 122.
TEST(RgbToYCbCr411, ThreeSamplesAPixelRoundWithTheBiasAlone)
{
    EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_C3P3R, repeated({0, 0, 31}, 16), 16),
              filledPlanes({23, 123, 141}, {16, 1}, block411));
    EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_C3P3R, repeated({0, 0, 34}, 16), 16),
              filledPlanes({24, 122, 142}, {16, 1}, block411));
}

// Green of 52, a sum of 208. Wide: the high products of 6656 are 1936 for Cb and 2449 for Cr, (16400 - 1936) >> 7 = 113
// and (16400 - 2449) >> 7 = 108. Tail: Cb is 128.125 - 15.13, which is just below 113, and Cr 128.125 - 19.14. Luma is
// 42 in both.
TEST(RgbToYCbCr411, FourSamplesAPixelAreWideInBlocksOf32)
{
    for (const Span span : {Span{4, 0}, {16, 0}, {28, 0}, {32, 32}, {48, 32}, {60, 32}, {64, 64}}) {
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_AC4P3R, repeated({0, 52, 0, 9}, span.width), span.width),
                  twoSpans({42, 113, 108}, {42, 112, 108}, span, block411))
            << span.width;
    }
}

TEST(RgbToYCbCr411, AlphaDoesNotMatter)
{
    for (const u8 spare : {0, 1, 128, 255})
        EXPECT_EQ(row411(pyxiBGRToYCbCr411_8u_AC4P3R, repeated({255, 255, 255, spare}, 44), 44),
                  filledPlanes(white, {44, 1}, block411));
}
