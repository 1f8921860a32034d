// Chroma repacking: what becomes of each component, off sizes, and the steps that go astray.
#include "pyxcc/repack.h"

#include "edge/subsampled.hpp"

#include <algorithm>

using namespace edge;

namespace
{

using PlanesToPlanes = PyxStatus (*)(const u8* const*, const int*, u8* const*, const int*, RoiSize);

/// first, first + 1 and so on.
Samples upFrom(int first, int count)
{
    Samples samples(count);
    for (int i = 0; i < count; ++i) samples[i] = static_cast<u8>(first + i);
    return samples;
}

Samples part(const Samples& samples, int from, int to) { return {samples.begin() + from, samples.begin() + to}; }

/// What becomes of untouched planes, all planes without gaps.
YCbCrPlanes planesToPlanes(PlanesToPlanes convert, const YCbCrPlanes& source, Block from, Block to, RoiSize roi)
{
    YCbCrPlanes target = untouchedPlanes(roi, to);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    const int fromStep = chromaSize(roi, from).width, toStep = chromaSize(roi, to).width;
    const int srcStep[3] = {roi.width, fromStep, fromStep}, dstStep[3] = {roi.width, toStep, toStep};
    EXPECT_EQ(convert(src, srcStep, dst, dstStep, roi), pyxOk);
    return target;
}

/// Rows of 200 and rows of 0, by turns.
Samples stripes(int width, int height)
{
    Samples samples;
    for (int y = 0; y < height; ++y) samples = samples + Samples(width, y % 2 == 0 ? 200 : 0);
    return samples;
}

/// Luma, then the second plane from 100 on, then the third from 200 on.
YCbCrPlanes counted(RoiSize roi, Block block)
{
    const RoiSize chroma = chromaSize(roi, block);
    const int samples = chroma.width * chroma.height;
    return {upFrom(1, roi.width * roi.height), upFrom(100, samples), upFrom(200, samples)};
}

} // namespace

TEST(Repack, OddRowsOfChromaAreIgnoredAndNotAveraged)
{
    const RoiSize roi = {70, 6};
    const YCbCrPlanes source = {Samples(pixelCount(roi), 50), stripes(35, 6), stripes(35, 6)};
    EXPECT_EQ(planesToPlanes(pyxiYCbCr422ToYCbCr420_8u_P3R, source, block422, block420, roi),
              filledPlanes({50, 200, 200}, roi, block420));
}

TEST(Repack, OffSizesAreRoundedDownInSilence)
{
    const RoiSize roi = {17, 5};
    const YCbCrPlanes source = filledPlanes({1, 2, 3}, roi, block420);
    const YCbCrPlanes target = planesToPlanes(pyxiYCbCr420ToYCbCr422_8u_P3R, source, block420, block422, roi);
    YCbCrPlanes expected = untouchedPlanes(roi, block422); // chroma rows have a place for the odd column
    for (int y = 0; y < 4; ++y) {
        std::fill_n(expected.y.begin() + 17 * y, 16, u8{1});
        std::fill_n(expected.cb.begin() + 9 * y, 8, u8{2});
        std::fill_n(expected.cr.begin() + 9 * y, 8, u8{3});
    }
    EXPECT_EQ(target, expected);
}

TEST(Repack, APackedRowEndsWithItsLastWholePair)
{
    const Samples row = {10, 90, 11, 240, 12, 91, 13, 241, 14, 92};
    EXPECT_EQ(packedRow(pyxiYCbCr422ToYCrCb422_8u_C2R, row, 5, 10),
              (Samples{10, 240, 11, 90, 12, 241, 13, 91, untouched, untouched}));
}

TEST(Repack, NoRowsAreNoErrorWhereTheHeightIsNotTested)
{
    u8 samples[16] = {};
    Samples target(16, untouched);
    const u8* const src[3] = {samples, samples, samples};
    u8* const dst[3] = {target.data(), target.data(), target.data()};
    const int steps[3] = {4, 2, 2};
    for (const int height : {0, -1}) {
        EXPECT_EQ(pyxiYCbCr411ToYCbCr422_8u_P3R(src, steps, dst, steps, {4, height}), pyxOk);
        EXPECT_EQ(pyxiYCbCr411ToYCbCr422_8u_P3C2R(src, steps, target.data(), 8, {4, height}), pyxOk);
        EXPECT_EQ(pyxiYCbCr422ToYCrCb422_8u_C2R(samples, 4, target.data(), 4, {2, height}), pyxOk);
        EXPECT_EQ(pyxiYCbCr411_8u_P2P3R(samples, 4, samples, 2, dst, steps, {4, height}), pyxOk);
        EXPECT_EQ(pyxiYCbCr422ToYCbCr411_8u_C2P3R(samples, 8, dst, steps, {4, height}), pyxErrSize);
        EXPECT_EQ(pyxiYCbCr422_8u_C2P3R(samples, 8, dst, steps, {4, height}), pyxErrSize);
    }
    EXPECT_EQ(pyxiYCbCr411ToYCbCr422_8u_P3R(src, steps, dst, steps, {3, 0}), pyxErrSize);
    EXPECT_EQ(target, Samples(16, untouched));
}

// Row pair 0 of 4:1:1 has 1, 2 above 3, 4, which is 1, 3, 2, 4 in a row of 4:2:0.
TEST(Repack, FoldedRowsTakeTheirSamplesByTurns)
{
    const RoiSize roi = {8, 2};
    const YCbCrPlanes source = {upFrom(1, 16), {1, 2, 3, 4}, {5, 6, 7, 8}};
    const YCbCrPlanes expected = {upFrom(1, 16), {1, 3, 2, 4}, {5, 7, 6, 8}};
    EXPECT_EQ(planesToPlanes(pyxiYCbCr411ToYCbCr420_8u_P3R, source, block411, block420, roi), expected);
}

TEST(Repack, UnfoldingUndoesFolding)
{
    for (const RoiSize roi : {RoiSize{4, 2}, {100, 4}, {128, 2}, {300, 2}}) {
        const YCbCrPlanes source = counted(roi, block411);
        const YCbCrPlanes folded = planesToPlanes(pyxiYCbCr411ToYCbCr420_8u_P3R, source, block411, block420, roi);
        const u8* const src[3] = {folded.y.data(), folded.cb.data(), folded.cr.data()};
        const int srcStep[3] = {roi.width, roi.width / 2, roi.width / 2};
        Samples luma(pixelCount(roi), untouched), pairs(pixelCount(roi) / 2, untouched);
        EXPECT_EQ(
            pyxiYCbCr420ToYCbCr411_8u_P3P2R(src, srcStep, luma.data(), roi.width, pairs.data(), roi.width / 2, roi),
            pyxOk);
        EXPECT_EQ(luma, source.y);
        for (std::size_t i = 0; i < source.cb.size(); ++i) {
            ASSERT_EQ(int{pairs[2 * i]}, int{source.cb[i]}) << "Cb " << i << " of width " << roi.width;
            ASSERT_EQ(int{pairs[2 * i + 1]}, int{source.cr[i]}) << "Cr " << i << " of width " << roi.width;
        }
    }
}

// Cb is 1 and 2, Cr 3 and 4, whatever the order that a name has them in.
TEST(Repack, EachComponentKeepsItsName)
{
    const Samples luma = {10, 11, 12, 13};
    const Samples cbFirst = {10, 1, 11, 3, 12, 2, 13, 4}, crFirst = {10, 3, 11, 1, 12, 4, 13, 2};
    const RoiSize roi = {4, 1};
    const YCbCrPlanes cbCr = {luma, {1, 2}, {3, 4}}, crCb = {luma, {3, 4}, {1, 2}};
    const auto toPacked = [&](FromPlanes convert, const YCbCrPlanes& source) {
        const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
        const int srcStep[3] = {4, 2, 2};
        Samples target(8, untouched);
        EXPECT_EQ(convert(src, srcStep, target.data(), 8, roi), pyxOk);
        return target;
    };
    EXPECT_EQ(toPlanes(pyxiYCbCr422_8u_C2P3R, cbFirst, roi, block422, pyxOk), cbCr);
    EXPECT_EQ(toPlanes(pyxiYCrCb422ToYCbCr422_8u_C2P3R, crFirst, roi, block422, pyxOk), cbCr);
    EXPECT_EQ(toPacked(pyxiYCbCr422_8u_P3C2R, cbCr), cbFirst);
    EXPECT_EQ(toPacked(pyxiYCbCr422ToYCrCb422_8u_P3C2R, cbCr), crFirst);
    EXPECT_EQ(packedRow(pyxiYCbCr422ToYCrCb422_8u_C2R, cbFirst, 4, 8), crFirst);

    const RoiSize two = {4, 2};
    const YCbCrPlanes tall = {luma + luma, {1, 2}, {3, 4}}, tallCrCb = {luma + luma, {3, 4}, {1, 2}};
    EXPECT_EQ(toPlanes(pyxiYCbCr422ToYCbCr420_8u_C2P3R, cbFirst + cbFirst, two, block420, pyxOk), tall);
    EXPECT_EQ(toPlanes(pyxiYCbCr422ToYCrCb420_8u_C2P3R, cbFirst + cbFirst, two, block420, pyxOk), tallCrCb);
    EXPECT_EQ(toPlanes(pyxiYCrCb422ToYCbCr420_8u_C2P3R, crFirst + crFirst, two, block420, pyxOk), tall);
    EXPECT_EQ(toPlanes(pyxiYCrCb422ToYCbCr411_8u_C2P3R, crFirst, roi, block411, pyxOk), (YCbCrPlanes{luma, {1}, {3}}));
}

// The first one does not: it is the one export that leaves the samples where they are, under the other's name.
TEST(Repack, PairsGoToThePlanesOfTheirNamesButForOneExport)
{
    using Convert = PyxStatus (*)(const u8*, int, const u8*, int, u8* const*, const int*, RoiSize);
    const auto toPlanesFrom = [](Convert convert, const Samples& luma, const Samples& pairs, int pairsStep) {
        YCbCrPlanes target = untouchedPlanes({4, 2}, block420);
        u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
        const int dstStep[3] = {4, 2, 2};
        EXPECT_EQ(convert(luma.data(), 4, pairs.data(), pairsStep, dst, dstStep, {4, 2}), pyxOk);
        return target;
    };
    const Samples luma = upFrom(10, 8);
    const Samples row = {1, 3, 2, 4}; // of 4:2:0, or two rows of 4:1:1
    EXPECT_EQ(toPlanesFrom(pyxiYCbCr420ToYCrCb420_8u_P2P3R, luma, row, 4), (YCbCrPlanes{luma, {1, 2}, {3, 4}}));
    EXPECT_EQ(toPlanesFrom(pyxiYCbCr420_8u_P2P3R, luma, row, 4), (YCbCrPlanes{luma, {1, 2}, {3, 4}}));
    EXPECT_EQ(toPlanesFrom(pyxiYCbCr411ToYCbCr420_8u_P2P3R, luma, row, 2), (YCbCrPlanes{luma, {1, 2}, {3, 4}}));
    EXPECT_EQ(toPlanesFrom(pyxiYCbCr411ToYCrCb420_8u_P2P3R, luma, row, 2), (YCbCrPlanes{luma, {3, 4}, {1, 2}}));
}

TEST(Repack, OneExportTestsTheSizeInFrontOfThePlanesAndBehindThem)
{
    u8 samples[16] = {};
    const int steps[3] = {4, 2, 2};
    u8* const whole[3] = {samples, samples, samples};
    u8* const withNull[3] = {samples, samples, nullptr};
    const auto status = [&](const u8* luma, u8* const* dst, RoiSize roi) {
        return pyxiYCbCr420ToYCrCb420_8u_P2P3R(luma, 4, samples, 4, dst, steps, roi);
    };
    EXPECT_EQ(status(nullptr, withNull, {0, 2}), pyxErrNullPtr);
    EXPECT_EQ(status(samples, nullptr, {0, 2}), pyxErrNullPtr);
    EXPECT_EQ(status(samples, withNull, {0, 2}), pyxErrSize);
    EXPECT_EQ(status(samples, withNull, {2, 0}), pyxErrSize);
    EXPECT_EQ(status(samples, withNull, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(status(samples, whole, {1, 2}), pyxErrSize);
    EXPECT_EQ(status(samples, whole, {2, 1}), pyxErrSize);
    EXPECT_EQ(pyxiYCbCr420_8u_P2P3R(samples, 4, samples, 4, withNull, steps, {0, 2}), pyxErrNullPtr);
}

// The second plane has its rows at 0 and 3, the third at 0 and 5, and each is walked by the other's step.
TEST(Repack, CrossedStepsOfPlanarYCrCb)
{
    const Samples luma(8, 7);
    const Samples cr = {1, 0, 0, 9, 0, 2}, cb = {3, 0, 0, 4, 0, 9};
    const u8* const src[3] = {luma.data(), cr.data(), cb.data()};
    const int srcStep[3] = {2, 3, 5};
    Samples target(8, untouched), pairs(4, untouched), packed(16, untouched);
    EXPECT_EQ(pyxiYCrCb420ToYCbCr420_8u_P3P2R(src, srcStep, target.data(), 2, pairs.data(), 2, {2, 4}), pyxOk);
    EXPECT_EQ(pairs, (Samples{3, 1, 4, 2}));
    EXPECT_EQ(target, luma);
    EXPECT_EQ(pyxiYCrCb420ToYCbCr422_8u_P3C2R(src, srcStep, packed.data(), 4, {2, 4}), pyxOk);
    EXPECT_EQ(packed, (Samples{7, 3, 7, 1, 7, 3, 7, 1, 7, 4, 7, 2, 7, 4, 7, 2}));

    // Others walk each plane by its own step.
    const Samples crInStep = {1, 0, 0, 2}, cbInStep = {3, 0, 0, 0, 0, 4};
    const u8* const inStep[3] = {luma.data(), crInStep.data(), cbInStep.data()};
    EXPECT_EQ(pyxiYCbCr420_8u_P3P2R(inStep, srcStep, target.data(), 2, pairs.data(), 2, {2, 4}), pyxOk);
    EXPECT_EQ(pairs, (Samples{1, 3, 2, 4}));
}

namespace
{

/// Third planes of 4:2:2 that come of 4:2:0 with one row of chroma. Second planes have rows `step1` apart.
struct SecondCopies {
    Samples row;
    int step1, step2;

    Samples thirdOfPlanes(PlanesToPlanes convert) const
    {
        const Samples luma(2 * width(), 7), other(row.size(), 5);
        const bool crFirst = convert == pyxiYCrCb420ToYCbCr422_8u_P3R;
        const u8* const src[3] = {luma.data(), crFirst ? row.data() : other.data(),
                                  crFirst ? other.data() : row.data()};
        const int srcStep[3] = {width(), 0, 0};
        return third([&](u8* const* dst, const int* dstStep) {
            return convert(src, srcStep, dst, dstStep, {width(), 2});
        });
    }

    Samples thirdOfPairs() const
    {
        const Samples luma(2 * width(), 7);
        Samples pairs;
        for (const u8 sample : row) pairs = pairs + Samples{5, sample};
        return third([&](u8* const* dst, const int* dstStep) {
            return pyxiYCbCr420ToYCbCr422_8u_P2P3R(luma.data(), width(), pairs.data(), 0, dst, dstStep, {width(), 2});
        });
    }

private:
    int width() const { return 2 * static_cast<int>(row.size()); }

    template <class Convert> Samples third(const Convert& convert) const
    {
        Samples y(2 * width()), cb(step1 + row.size(), untouched), cr(std::max(step1, step2) + row.size(), untouched);
        u8* const dst[3] = {y.data(), cb.data(), cr.data()};
        const int dstStep[3] = {width(), step1, step2};
        EXPECT_EQ(convert(dst, dstStep), pyxOk);
        return cr;
    }
};

Samples gap(int count) { return Samples(count, untouched); }

} // namespace

// Of 75 samples the first 64 and the last 3 have their second copy where it belongs, 100 bytes behind, and 8 have it
// 150 bytes behind.
TEST(Repack, APartOfTheSecondCopiesInTheThirdPlaneIsMisplaced)
{
    const Samples row = upFrom(1, 75);
    const SecondCopies copies{row, 150, 100};
    const Samples expected =
        row + gap(25) + part(row, 0, 64) + gap(8) + part(row, 72, 75) + gap(39) + part(row, 64, 72) + gap(3);
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCbCr420ToYCbCr422_8u_P3R), expected);
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCrCb420ToYCbCr422_8u_P3R), expected);
    EXPECT_EQ(copies.thirdOfPairs(), expected);
}

// Of 45 samples no 64 are whole: planes have their first 40 misplaced. Pairs go by 32, so that it is the 8 behind.
TEST(Repack, PairsMisplaceLess)
{
    const Samples row = upFrom(1, 45);
    const SecondCopies copies{row, 60, 120};
    const Samples ofPlanes = row + gap(15) + part(row, 0, 40) + gap(60) + part(row, 40, 45);
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCbCr420ToYCbCr422_8u_P3R), ofPlanes);
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCrCb420ToYCbCr422_8u_P3R), ofPlanes);
    const Samples ofPairs = row + gap(47) + part(row, 32, 40) + gap(20) + part(row, 0, 32) + gap(8) + part(row, 40, 45);
    EXPECT_EQ(copies.thirdOfPairs(), ofPairs);
}

// A whole first copy, and then the second one across it, a byte behind.
TEST(Repack, AMisplacedSecondCopyCountsWhereItMeetsTheFirst)
{
    const Samples row = upFrom(1, 42);
    const SecondCopies copies{row, 1, 50};
    const Samples ofPlanes = Samples{1} + part(row, 0, 40) + Samples{42} + gap(48) + part(row, 40, 42);
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCbCr420ToYCbCr422_8u_P3R), ofPlanes);
    const Samples ofPairs =
        part(row, 0, 33) + part(row, 32, 40) + Samples{42} + gap(8) + part(row, 0, 32) + gap(8) + part(row, 40, 42);
    EXPECT_EQ(copies.thirdOfPairs(), ofPairs);
}

TEST(Repack, NothingIsMisplacedBetweenEqualSteps)
{
    const Samples row = upFrom(1, 75);
    const SecondCopies copies{row, 80, 80};
    EXPECT_EQ(copies.thirdOfPlanes(pyxiYCbCr420ToYCbCr422_8u_P3R), row + gap(5) + row);
    EXPECT_EQ(copies.thirdOfPairs(), row + gap(5) + row);
}
