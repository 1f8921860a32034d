// YUV with shared chroma: odd sizes, the forms along a row, and tightly packed images that are taken as one row.
#include "pyxcc/rgb_yuv_subsampled.h"

#include "edge/subsampled.hpp"

#include <gtest/gtest.h>

using namespace edge;

namespace
{

/// Planes of two colours, the second from a column on. The columns of chroma are half of those.
YCbCrPlanes inTwoSpans(Colour first, int count, Colour second, int width)
{
    const int chromaWidth = (width + 1) / 2;
    return {Samples(count, first.y) + Samples(width - count, second.y),
            Samples(count / 2, first.cb) + Samples(chromaWidth - count / 2, second.cb),
            Samples(count / 2, first.cr) + Samples(chromaWidth - count / 2, second.cr)};
}

/// What becomes of a row of equal pixels with chroma of its own, or shared within pairs.
YCbCrPlanes row422(std::initializer_list<u8> pixel, int width)
{
    return toPlanes(pyxiRGBToYUV422_8u_C3P3R, repeated(pixel, width), {width, 1}, block422, pyxOk);
}

/// The conversion from planes, fed from planes of one value each.
PyxStatus fromPlanes422(const u8* src, int, u8* const* dst, const int* dstStep, RoiSize roi)
{
    const Samples r(roi.width, src[0]), g(roi.width, src[1]), b(roi.width, src[2]);
    const u8* const planes[3] = {r.data(), g.data(), b.data()};
    return pyxiRGBToYUV422_8u_P3R(planes, 0, dst, dstStep, roi);
}

PyxStatus fromPlanes420(const u8* src, int, u8* const* dst, const int* dstStep, RoiSize roi)
{
    const Samples r(roi.width, src[0]), g(roi.width, src[1]), b(roi.width, src[2]);
    const u8* const planes[3] = {r.data(), g.data(), b.data()};
    return pyxiRGBToYUV420_8u_P3R(planes, 0, dst, dstStep, roi);
}

/// The interleaved image of what a conversion writes to three planes.
template <PyxStatus (*convert)(const u8* const*, const int*, u8* const*, int, RoiSize)>
PyxStatus interleaving(const u8* const* src, const int* srcStep, u8* dst, int dstStep, RoiSize roi)
{
    Samples planes[3];
    for (Samples& plane : planes) plane.assign(pixelCount(roi), untouched);
    u8* const targets[3] = {planes[0].data(), planes[1].data(), planes[2].data()};
    const PyxStatus status = convert(src, srcStep, targets, roi.width, roi);
    for (int y = 0; y < roi.height; ++y) {
        for (int x = 0; x < roi.width; ++x) {
            for (int k = 0; k < 3; ++k) dst[y * dstStep + 3 * x + k] = planes[k][y * roi.width + x];
        }
    }
    return status;
}

} // namespace

TEST(Yuv420, OnePixelIsNotWritten)
{
    EXPECT_EQ(toPlanes(pyxiRGBToYUV420_8u_C3P3R, {1, 2, 3}, {1, 1}, block420, pyxWarnOddSize),
              untouchedPlanes({1, 1}, block420));
    EXPECT_EQ(fromPlanes(pyxiYUV420ToRGB_8u_P3C3R, {{9}, {9}, {9}}, {1, 1}, block420, pyxWarnOddSize),
              Samples(3, untouched));
}

TEST(Yuv420, ALastOddColumnAndRowAreNotWritten)
{
    const u8 n = untouched;
    const YCbCrPlanes expected = {{255, 255, n, 255, 255, n, n, n, n}, {128, n, n, n}, {128, n, n, n}};
    const Samples white(27, 255), whiteWithAlpha(36, 255);
    EXPECT_EQ(toPlanes(pyxiRGBToYUV420_8u_C3P3R, white, {3, 3}, block420, pyxWarnOddSize), expected);
    EXPECT_EQ(toPlanes(pyxiBGRToYUV420_8u_AC4P3R, whiteWithAlpha, {3, 3}, block420, pyxWarnOddSize), expected);
}

// A green of 200. Rounded: t = 7513, luma 7513 >> 6 = 117; of 15026 for the block U is -3696 >> 6 = -58 and V -6589 >>
// 6 = -103. With weights of 14 bits the difference is -470, and V -470 * 14369 >> 16 = -104; with weights of 16 bits it
// is -468 before the sum is divided, and V -468 * 57475 >> 18 = -103.
TEST(Yuv420, QuadruplesOfPairsAreRounded)
{
    const Colour wide = {117, 70, 25}, tail = {117, 70, 24};
    const auto converted = [](int width) {
        const PyxStatus expected = width % 2 == 0 ? pyxOk : pyxWarnOddSize;
        const Samples rows = repeated({0, 200, 0}, 2 * width);
        YCbCrPlanes target = toPlanes(pyxiRGBToYUV420_8u_C3P3R, rows, {width, 2}, block420, expected);
        target.y.resize(width);
        return target;
    };
    EXPECT_EQ(converted(6), inTwoSpans(tail, 6, tail, 6));
    EXPECT_EQ(converted(8), inTwoSpans(wide, 8, wide, 8));
    EXPECT_EQ(converted(14), inTwoSpans(wide, 8, tail, 14));
    EXPECT_EQ(converted(16), inTwoSpans(wide, 16, wide, 16));
    EXPECT_EQ(converted(38), inTwoSpans(wide, 32, tail, 38));
}

TEST(Yuv420, PlanesAndFourChannelsAreExactThroughout)
{
    const Colour colour = {117, 70, 25};
    for (int width = 2; width <= 70; width += 2) {
        YCbCrPlanes expected = inTwoSpans(colour, width, colour, width);
        expected.y = expected.y + expected.y;
        EXPECT_EQ(toPlanes(fromPlanes420, repeated({0, 200, 0}, 2 * width), {width, 2}, block420, pyxOk), expected);
        EXPECT_EQ(toPlanes(pyxiBGRToYUV420_8u_AC4P3R, repeated({0, 200, 0, 9}, 2 * width), {width, 2}, block420, pyxOk),
                  expected);
    }
}

// Y = 100, U' = -38 and V' = 72: cut, R is 182.07, G 73.14 and B 22.78.
TEST(Yuv420, AFifthColumnIsNotWritten)
{
    const YCbCrPlanes source = filledPlanes({100, 90, 200}, {5, 4}, block420);
    const Samples row = repeated({182, 73, 22}, 4) + Samples(3, untouched);
    EXPECT_EQ(fromPlanes(interleaving<pyxiYUV420ToRGB_8u_P3R>, source, {5, 4}, block420, pyxWarnOddSize),
              row + row + row + row);
}

// The high forms take green down to 145 >> 1 at any width, whatever the last bit of their weights.
TEST(Yuv420, ThreeChannelsTakeOneFormThroughout)
{
    for (int width = 2; width <= 40; width += 2) {
        const YCbCrPlanes source = filledPlanes({100, 90, 200}, {width, 2}, block420);
        EXPECT_EQ(fromPlanes(pyxiYUV420ToRGB_8u_P3C3R, source, {width, 2}, block420, pyxOk),
                  repeated({182, 72, 22}, 2 * width));
        EXPECT_EQ(fromPlanes(pyxiYUV420ToBGR_8u_P3C3R, source, {width, 2}, block420, pyxOk),
                  repeated({22, 72, 182}, 2 * width));
    }
}

// U' = 94 is 1504 in the high forms: by 16645 it is 381.99, by 16646 382.01. Cut and with 20 the halves are 200 and
// 201.
TEST(Yuv420, WhereBlueComesFirstItsWeightIsOneMore)
{
    const YCbCrPlanes source = filledPlanes({10, 222, 128}, {2, 2}, block420);
    EXPECT_EQ(fromPlanes(pyxiYUV420ToRGB_8u_P3C3R, source, {2, 2}, block420, pyxOk), repeated({10, 0, 200}, 4));
    EXPECT_EQ(fromPlanes(pyxiYUV420ToBGR_8u_P3C3R, source, {2, 2}, block420, pyxOk), repeated({201, 0, 10}, 4));
}

TEST(Yuv420, TheSmallestSizeIs2By2WhereBlueComesFirst)
{
    const YCbCrPlanes source = filledPlanes({100, 90, 200}, {2, 2}, block420);
    EXPECT_EQ(fromPlanes(pyxiYUV420ToBGR_8u_P3C3R, source, {1, 2}, block420, pyxErrSize), Samples(6, untouched));
    EXPECT_EQ(fromPlanes(pyxiYUV420ToBGR_8u_P3C3R, source, {2, 1}, block420, pyxErrSize), Samples(6, untouched));
    EXPECT_EQ(fromPlanes(pyxiYUV420ToRGB_8u_P3C3R, source, {2, 1}, block420, pyxWarnOddSize), Samples(6, untouched));
}

TEST(Yuv420, AlphaIsZeroWherePixelsAreWritten)
{
    for (const int width : {2, 3, 16, 19, 38}) {
        const PyxStatus expected = width % 2 == 0 ? pyxOk : pyxWarnOddSize;
        const YCbCrPlanes source = filledPlanes({255, 128, 128}, {width, 2}, block420);
        const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
        const int srcStep[3] = {width, 0, 0};
        Samples target(8 * width, untouched);
        EXPECT_EQ(pyxiYUV420ToRGB_8u_P3AC4R(src, srcStep, target.data(), 4 * width, {width, 2}), expected);
        const Samples row = repeated({255, 255, 255, 0}, width & ~1) + Samples(4 * (width & 1), untouched);
        EXPECT_EQ(target, row + row);
    }
}

// A red of 200. With a half, luma is 3951768 >> 16 = 60, the differences of the pixel -60 and of the pair -120, so that
// U is -30 for both; V of the pair 280 * 57475 >> 17 = 122.
TEST(Yuv422, ALonePackedPixelHasNoV)
{
    const u8 n = untouched;
    EXPECT_EQ(packedRow(pyxiRGBToYUV422_8u_C3C2R, {200, 0, 0}, 1, 4), (Samples{60, 98, n, n}));
    EXPECT_EQ(packedRow(pyxiRGBToYUV422_8u_C3C2R, repeated({200, 0, 0}, 3), 3, 8),
              (Samples{60, 98, 60, 250, 60, 98, n, n}));
    EXPECT_EQ(packedRow(pyxiRGBToYUV422_8u_C3C2R, repeated({200, 0, 0}, 32), 32, 64), repeated({60, 98, 60, 250}, 16));
}

// The same red. Rounded, V of the pair is (7869 >> 6) + 128 = 250. The exact pair has a difference of 281, and V is
// 281 * 57475 >> 17 = 123. So has a lone pixel, of 141 * 28737 >> 15 = 123; without its rounding 140, and V 122.
TEST(Yuv422, PairsAndALonePixel)
{
    const Colour rounded = {59, 98, 250}, exact = {59, 98, 251};
    EXPECT_EQ(row422({200, 0, 0}, 1), inTwoSpans(exact, 0, exact, 1));
    EXPECT_EQ(row422({200, 0, 0}, 3), inTwoSpans(exact, 2, exact, 3));
    EXPECT_EQ(row422({200, 0, 0}, 16), inTwoSpans(rounded, 16, rounded, 16));
    EXPECT_EQ(row422({200, 0, 0}, 33), inTwoSpans(rounded, 32, exact, 33));
    EXPECT_EQ(row422({200, 0, 0}, 46), inTwoSpans(rounded, 32, exact, 46));
}

TEST(Yuv422, OfPlanesALonePixelIsCut)
{
    const Colour exact = {59, 98, 251}, lone = {59, 98, 250};
    const auto converted = [](int width) {
        return toPlanes(fromPlanes422, repeated({200, 0, 0}, width), {width, 1}, block422, pyxOk);
    };
    EXPECT_EQ(converted(1), inTwoSpans(lone, 0, lone, 1));
    EXPECT_EQ(converted(3), inTwoSpans(exact, 2, lone, 3));
    EXPECT_EQ(converted(32), inTwoSpans(exact, 32, exact, 32));
    EXPECT_EQ(converted(33), inTwoSpans(exact, 32, lone, 33));
}

// 18 by 15 is 270 pixels: a row of 256 in blocks and 14 beyond. 17 by 17 and 6 by 42 stay rows of their own.
TEST(Yuv422, ATightImageIsOneRow)
{
    const auto converted = [](RoiSize roi) {
        const int chroma = (roi.width + 1) / 2 * roi.height;
        const Samples source = repeated({200, 0, 0}, roi.width * roi.height);
        YCbCrPlanes target = {Samples(roi.width * roi.height), Samples(chroma), Samples(chroma)};
        u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
        EXPECT_EQ(pyxiRGBToYUV422_8u_C3P3(source.data(), dst, roi), pyxOk);
        EXPECT_EQ(target.y, Samples(roi.width * roi.height, 59));
        EXPECT_EQ(target.cb, Samples(chroma, 98));
        return target.cr;
    };
    EXPECT_EQ(converted({18, 15}), Samples(128, 250) + Samples(7, 251));
    EXPECT_EQ(converted({2, 128}), Samples(128, 250));
    EXPECT_EQ(converted({6, 42}), Samples(126, 251));
    Samples rows;
    for (int i = 0; i < 17; ++i) rows = rows + Samples(8, 250) + Samples(1, 251);
    EXPECT_EQ(converted({17, 17}), rows);
}

// The exact form cuts green to 73, the high form to 145 >> 1 = 72.
TEST(Yuv422, ATightImageIsOneRowBackToo)
{
    const auto converted = [](RoiSize roi) {
        const YCbCrPlanes source = filledPlanes({100, 90, 200}, roi, block422);
        const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
        Samples interleaved(3 * pixelCount(roi)), r(pixelCount(roi)), g(r), b(r);
        u8* const dst[3] = {r.data(), g.data(), b.data()};
        EXPECT_EQ(pyxiYUV422ToRGB_8u_P3C3(src, interleaved.data(), roi), pyxOk);
        EXPECT_EQ(pyxiYUV422ToRGB_8u_P3(src, dst, roi), pyxOk);
        for (std::size_t i = 0; i < pixelCount(roi); ++i) {
            EXPECT_EQ(r[i], 182);
            EXPECT_EQ(b[i], 22);
            EXPECT_EQ(interleaved[3 * i + 1], g[i]);
        }
        return g;
    };
    EXPECT_EQ(converted({18, 15}), Samples(256, 72) + Samples(14, 73));
    EXPECT_EQ(converted({6, 42}), Samples(252, 73));
    Samples rows;
    for (int i = 0; i < 17; ++i) rows = rows + Samples(16, 72) + Samples(1, 73);
    EXPECT_EQ(converted({17, 17}), rows);
}

// Rounded, blue is 23.28. The last pixel of a row has the V of the pair before, and gray without one: G is 114.97 +
// 0.5.
TEST(Yuv422, ALonePackedPixelTakesTheVBefore)
{
    const Samples pair = {100, 90, 100, 200};
    EXPECT_EQ(packedRow(pyxiYUV422ToRGB_8u_C2C3R, {100, 90}, 1, 3), (Samples{100, 115, 23}));
    EXPECT_EQ(packedRow(pyxiYUV422ToRGB_8u_C2C3R, pair + Samples{100, 90}, 3, 9), repeated({182, 73, 23}, 3));
    Samples row;
    for (int i = 0; i < 8; ++i) row = row + pair;
    EXPECT_EQ(packedRow(pyxiYUV422ToRGB_8u_C2C3R, row + Samples{100, 90}, 17, 51),
              repeated({182, 72, 22}, 16) + repeated({182, 73, 23}, 1));
}

// The eighth form rounds: G is 73.7 and B 23.25, which the tail cuts to 22.78.
TEST(Yuv422, FourChannelsInBlocksOf4)
{
    for (const int width : {1, 3, 4, 5, 15, 34}) {
        const YCbCrPlanes source = filledPlanes({100, 90, 200}, {width, 1}, block422);
        const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
        const int srcStep[3] = {};
        Samples target(4 * width, untouched);
        EXPECT_EQ(pyxiYUV422ToRGB_8u_P3AC4R(src, srcStep, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({182, 73, 23, 0}, width & ~3) + repeated({182, 73, 22, 0}, width & 3));
    }
}
