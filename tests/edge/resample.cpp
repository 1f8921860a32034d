// Chroma of a quarter of the width to 4:2:0 and back: what lies between samples, at the ends of rows and columns too.
#include "pyxcc/repack.h"

#include "edge/subsampled.hpp"

#include <utility>

using namespace edge;

namespace
{

using PlanesToPlanes = PyxStatus (*)(const u8* const*, const int*, u8* const*, const int*, RoiSize);

/// The grid of a chroma plane: so many columns and rows of pixels a sample.
constexpr Block block1620 = {4, 4};

/// What becomes of a plane of chroma, without gaps between rows; the other plane has its complement.
Samples resampled(PlanesToPlanes convert, const Samples& chroma, Block from, Block to, RoiSize roi, int rowsBeyond = 0)
{
    const Samples luma(pixelCount(roi), 60);
    Samples other = chroma;
    for (u8& sample : other) sample = static_cast<u8>(255 - sample);
    const RoiSize fromSize = chromaSize(roi, from), toSize = chromaSize(roi, to);
    const std::size_t samples = static_cast<std::size_t>(toSize.width) * (toSize.height + rowsBeyond);
    Samples y(luma.size(), untouched), cb(samples, untouched), cr(samples, untouched);
    const u8* const src[3] = {luma.data(), chroma.data(), other.data()};
    u8* const dst[3] = {y.data(), cb.data(), cr.data()};
    const int srcStep[3] = {roi.width, fromSize.width, fromSize.width};
    const int dstStep[3] = {roi.width, toSize.width, toSize.width};
    EXPECT_EQ(convert(src, srcStep, dst, dstStep, roi), pyxOk);
    EXPECT_EQ(y, luma);
    return cb;
}

Samples row(int width, std::initializer_list<std::pair<int, u8>> samples)
{
    Samples result(width, 0);
    for (const auto& [column, value] : samples) result[column] = value;
    return result;
}

} // namespace

// Sample (3, 1) of 8 by 2. It has 200 itself, 100 half way to what is beside it or above, and 50 half way to both; the
// last row is not interpolated at all.
TEST(Resample, ASingleSampleOf1620SpreadsInBothDirections)
{
    const Samples expected = row(16, {}) + row(16, {{5, 50}, {6, 100}, {7, 50}}) +
                             row(16, {{5, 100}, {6, 200}, {7, 100}}) + row(16, {{6, 200}, {7, 200}});
    EXPECT_EQ(resampled(pyxiYCbCr1620To420_8u_P3R, row(8, {}) + row(8, {{3, 200}}), block1620, block420, {32, 8}),
              expected);
}

// 18 samples of 0 and 1 by turns: halves are rounded up behind the first (18 - 1) & ~15 = 16, and down behind the next.
TEST(Resample, HalvesAlongARowAreRoundedUpInWholeSixteens)
{
    const Samples source = repeated({0, 1}, 9) + Samples(18, 99); // the second row is ignored
    Samples expected = repeated({0, 1, 1, 1}, 8) + Samples{0, 0, 1, 1};
    EXPECT_EQ(resampled(pyxiYCbCr411To420_8u_P3R, source + source, block411, block420, {72, 4}), expected + expected);

    // 17 samples: the last of them has no neighbour. 16: none of them rounds up.
    expected = repeated({0, 1, 1, 1}, 8) + Samples{0, 0};
    const Samples seventeen = repeated({0, 1}, 8) + Samples{0};
    EXPECT_EQ(
        resampled(pyxiYCbCr411To420_8u_P3R, seventeen + seventeen + seventeen + seventeen, block411, block420, {68, 4}),
        expected + expected);
    expected = repeated({0, 0, 1, 0}, 7) + Samples{0, 0, 1, 1};
    EXPECT_EQ(resampled(pyxiYCbCr411To420_8u_P3R, repeated({0, 1}, 32), block411, block420, {64, 4}),
              expected + expected);
}

// Two rows of 18, 0 above 1: between them halves are rounded like those between the columns are.
TEST(Resample, HalvesBetweenRowsOf1620AreRoundedByColumn)
{
    const Samples source = Samples(18, 0) + Samples(18, 1);
    const Samples expected = Samples(36, 0) + Samples(32, 1) + Samples(4, 0) + Samples(72, 1);
    EXPECT_EQ(resampled(pyxiYCbCr1620To420_8u_P3R, source, block1620, block420, {72, 8}), expected);
}

TEST(Resample, OneRowOf1620BecomesItselfInterpolatedAndItselfDoubled)
{
    EXPECT_EQ(resampled(pyxiYCbCr1620To420_8u_P3R, {10, 20, 40}, block1620, block420, {12, 4}),
              (Samples{10, 15, 20, 30, 40, 40, 10, 10, 20, 20, 40, 40}));
}

// 33 samples of two rows, 10 above 13 in the even columns: halves are rounded up in the first 32.
TEST(Resample, HalvesBetweenRowsOf420AreRoundedUpInWholeThirtyTwos)
{
    const Samples source = repeated({10, 99}, 33) + repeated({13, 98}, 33);
    const Samples expected = Samples(33, 10) + Samples(32, 12) + Samples{11} + Samples(66, 13);
    EXPECT_EQ(resampled(pyxiYCbCr420To411_8u_P3R, source, block420, block411, {132, 4}), expected);
}

// The source has a second row behind its one, and the target two behind its two.
TEST(Resample, TwoRowsOfLumaTakeASecondRowOfChromaAndMakeFour)
{
    const Samples source = repeated({10, 99}, 33) + repeated({13, 98}, 33);
    const Samples expected = Samples(33, 10) + Samples(32, 12) + Samples{11} + Samples(66, 13);
    EXPECT_EQ(resampled(pyxiYCbCr420To411_8u_P3R, source, block420, block411, {132, 2}, 2), expected);
}

TEST(Resample, EveryOtherSampleIsKeptOf420)
{
    const Samples source = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16};
    EXPECT_EQ(resampled(pyxiYCbCr420To1620_8u_P3R, source, block420, block1620, {8, 8}), (Samples{1, 3, 9, 11}));
}

TEST(Resample, SizesOffTheirMultiplesAreErrors)
{
    Samples source(256), target(256, untouched);
    const u8* const src[3] = {source.data(), source.data(), source.data()};
    u8* const dst[3] = {target.data(), target.data(), target.data()};
    const int steps[3] = {8, 4, 4};
    struct Case {
        PlanesToPlanes convert;
        int rows;
    };
    for (const auto& [convert, rows] : {Case{pyxiYCbCr420To411_8u_P3R, 2},
                                        {pyxiYCbCr411To420_8u_P3R, 4},
                                        {pyxiYCbCr1620To420_8u_P3R, 4},
                                        {pyxiYCbCr420To1620_8u_P3R, 4}}) {
        for (const int width : {6, 5, 3, 2, 0, -4}) EXPECT_EQ(convert(src, steps, dst, steps, {width, 4}), pyxErrSize);
        for (const int height : {5, 3, 1, 0, -4}) EXPECT_EQ(convert(src, steps, dst, steps, {4, height}), pyxErrSize);
        if (rows == 4) {
            for (const int height : {2, 6}) EXPECT_EQ(convert(src, steps, dst, steps, {4, height}), pyxErrSize);
        }
        EXPECT_EQ(target, Samples(256, untouched));
    }
}
