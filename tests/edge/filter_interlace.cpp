// Filtered and interlaced conversions: single samples through each filter, what sizes off the block leave out, and
// bands against the whole image.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"
#include "support/random.hpp"

#include <algorithm>
#include <numeric>

using namespace edge;

namespace
{

constexpr u8 none = untouched;

/// Planes two columns wide, so that chroma is a column of one sample a row.
struct Columns {
    Samples y, cb, cr;
};

Columns columns(int lumaRows, int chromaRows, u8 y, u8 chroma)
{
    return {Samples(2 * lumaRows, y), Samples(chromaRows, chroma), Samples(chromaRows, chroma)};
}

using PlanesToPlanes = PyxStatus (*)(const u8* const*, const int*, u8* const*, const int*, RoiSize);

/// What becomes of untouched planes of so many rows of chroma.
Columns converted(PlanesToPlanes convert, const Columns& source, int height, int chromaRows, PyxStatus expected)
{
    Columns target = columns(height, chromaRows, none, none);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    const int steps[3] = {2, 1, 1};
    EXPECT_EQ(convert(src, steps, dst, steps, {2, height}), expected);
    return target;
}

/// A column of `rows` samples, with one that stands out.
Samples column(int rows, u8 value, int at, u8 other)
{
    Samples samples(rows, value);
    samples[at] = other;
    return samples;
}

} // namespace

TEST(FourTaps, HeightIsRoundedDownToEights)
{
    const Columns target = converted(pyxiYCbCr420ToYCbCr422_Filter_8u_P3R, columns(15, 7, 50, 100), 15, 15, pyxOk);
    EXPECT_EQ(target.y, Samples(2 * 8, 50) + Samples(2 * 7, none));
    EXPECT_EQ(target.cb, Samples(8, 100) + Samples(7, none));
    EXPECT_EQ(target.cr, Samples(8, 100) + Samples(7, none));
}

// With 228 at row 2 of four rows of 100: (9 * 200 - 100 - 228 + 8) / 16 = 92.5, (9 * 328 - 200 + 8) / 16 = 172.5 above
// it and below it, and (17 * 100 - 228 + 8) / 16 = 92.5 in the last row.
TEST(FourTaps, OneSampleAmongEqualOnes)
{
    const Samples expected = {100, 92, 100, 172, 228, 172, 100, 92};
    Columns source = columns(8, 4, 50, 100);
    source.cb = column(4, 100, 2, 228);
    const Columns direct = converted(pyxiYCbCr420ToYCbCr422_Filter_8u_P3R, source, 8, 8, pyxOk);
    EXPECT_EQ(direct.cb, expected);
    EXPECT_EQ(direct.cr, Samples(8, 100));
    const Columns exchanged = converted(pyxiYCrCb420ToYCbCr422_Filter_8u_P3R, source, 8, 8, pyxOk);
    EXPECT_EQ(exchanged.cb, Samples(8, 100));
    EXPECT_EQ(exchanged.cr, expected);

    const Samples pairs = {100, 100, 100, 100, 228, 100, 100, 100};
    Columns target = columns(8, 8, none, none);
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    const int steps[3] = {2, 1, 1};
    EXPECT_EQ(pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(source.y.data(), 2, pairs.data(), 2, dst, steps, {2, 8}), pyxOk);
    EXPECT_EQ(target.y, source.y);
    EXPECT_EQ(target.cb, expected);
    EXPECT_EQ(target.cr, Samples(8, 100));
}

// Beside 255 in rows 1 and 2 lies (18 * 255 + 8) / 16 = 287 with black around it, and black is at least 0.
TEST(FourTaps, ResultsAreClamped)
{
    Columns source = columns(8, 4, 50, 0);
    source.cb = {0, 255, 255, 0};
    source.cr = {255, 0, 0, 255};
    const Columns target = converted(pyxiYCbCr420ToYCbCr422_Filter_8u_P3R, source, 8, 8, pyxOk);
    EXPECT_EQ(target.cb, (Samples{0, 128, 255, 255, 255, 128, 0, 0}));
    EXPECT_EQ(target.cr, (Samples{255, 128, 0, 0, 0, 128, 255, 255}));
}

TEST(Interlaced, OneSampleStaysInItsField)
{
    Columns source = columns(12, 6, 50, 0);
    source.cb[0] = 200; // of the top field
    source.cr[1] = 200; // of the bottom field
    const Columns target = converted(pyxiYCbCr420To422_Interlace_8u_P3R, source, 12, 12, pyxOk);
    EXPECT_EQ(target.y, source.y);
    EXPECT_EQ(target.cb, (Samples{200, 0, 125, 0, 25, 0, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(target.cr, (Samples{0, 200, 0, 175, 0, 75, 0, 0, 0, 0, 0, 0}));
}

// The same frame as packed rows of Cb, Y, Cr, Y.
TEST(Interlaced, PackedRowsHaveTheSameChroma)
{
    Columns source = columns(8, 4, 50, 0);
    source.cb[0] = 200;
    source.cr[1] = 200;
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    const int steps[3] = {2, 1, 1};
    Samples target(8 * 4, none);
    EXPECT_EQ(pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(src, steps, target.data(), 4, {2, 8}), pyxOk);
    const Samples cb = {200, 0, 125, 0, 25, 0, 0, 0}, cr = {0, 200, 0, 175, 0, 75, 0, 0};
    Samples expected;
    for (int y = 0; y < 8; ++y) expected = expected + Samples{cb[y], 50, cr[y], 50};
    EXPECT_EQ(target, expected);
}

// Of each four rows: (3 a + c + 2) / 4 and (b + 3 d + 2) / 4.
TEST(Interlaced, FourRowsOfChromaGiveTwo)
{
    struct Case {
        int row;
        Samples expected;
    };
    for (const auto& [row, expected] : {Case{0, {150, 0}}, {1, {0, 50}}, {2, {50, 0}}, {3, {0, 150}}}) {
        Columns source = columns(4, 4, 50, 0);
        source.cb = column(4, 0, row, 200);
        const Columns target = converted(pyxiYCbCr422To420_Interlace_8u_P3R, source, 4, 2, pyxOk);
        EXPECT_EQ(target.cb, expected) << row;
        EXPECT_EQ(target.cr, Samples(2, 0)) << row;

        Samples packed;
        for (int y = 0; y < 4; ++y) packed = packed + Samples{source.cr[y], 50, source.cb[y], 51};
        Columns planes = columns(4, 2, none, none);
        u8* const dst[3] = {planes.y.data(), planes.cb.data(), planes.cr.data()};
        const int steps[3] = {2, 1, 1};
        EXPECT_EQ(pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(packed.data(), 4, dst, steps, {2, 4}), pyxOk);
        EXPECT_EQ(planes.y, repeated({50, 51}, 4)) << row;
        EXPECT_EQ(planes.cb, Samples(2, 0)) << row;
        EXPECT_EQ(planes.cr, expected) << row;
    }
}

TEST(Interlaced, HeightOffTheFourIsRoundedDownAndWarns)
{
    const Columns target = converted(pyxiYCbCr422To420_Interlace_8u_P3R, columns(6, 6, 50, 100), 6, 3, pyxWarnOddSize);
    EXPECT_EQ(target.y, Samples(2 * 4, 50) + Samples(2 * 2, none));
    EXPECT_EQ(target.cb, Samples(2, 100) + Samples(1, none));
    EXPECT_EQ(target.cr, Samples(2, 100) + Samples(1, none));
}

namespace
{

using LumaAndPairsToPacked = PyxStatus (*)(const u8*, int, const u8*, int, u8*, int, RoiSize, s32);

/// Images of 4:2:0 with chroma pairs, and what two conversions make of them: rows of packed pixels, or planes.
struct Source {
    RoiSize size;
    Samples y = Samples(pixelCount(size)), pairs = Samples(static_cast<std::size_t>(size.width) * (size.height / 2));

    const u8* luma(int row) const { return y.data() + row * size.width; }
    const u8* chroma(int row) const { return pairs.data() + row * size.width; }
};

struct Targets {
    RoiSize size;
    Samples packed = Samples(2 * pixelCount(size), untouched), y = Samples(pixelCount(size), untouched),
            first = Samples(pixelCount(size) / 4, untouched), second = first;
    bool operator==(const Targets& other) const
    {
        return packed == other.packed && y == other.y && first == other.first && second == other.second;
    }
};

/// The rows [from, from + height) as a band.
void convertBand(const Source& source, Targets& target, int from, int height, s32 layout)
{
    const int width = source.size.width;
    u8* const dst[3] = {target.y.data() + from * width, target.first.data() + from / 2 * (width / 2),
                        target.second.data() + from / 2 * (width / 2)};
    const int steps[3] = {width, width / 2, width / 2};
    const RoiSize roi = {width, height};
    EXPECT_EQ(pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(source.luma(from), width, source.chroma(from / 2), width,
                                                     target.packed.data() + 2 * from * width, 2 * width, roi, layout),
              pyxOk);
    EXPECT_EQ(pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(source.luma(from), width, source.chroma(from / 2), width, dst,
                                                     steps, roi, layout),
              pyxOk);
}

constexpr s32 whole = 21, top = 1, middle = 4, bottom = 16;

Targets converted(const Source& source, s32 layout)
{
    Targets target{source.size};
    convertBand(source, target, 0, source.size.height, layout);
    return target;
}

} // namespace

TEST(Bands, UnknownLayoutsWriteNothing)
{
    const Source source{{4, 8}};
    for (const s32 layout : {2, 0, 5, 17, 20, 64, 32 + 1, 8 + 4})
        EXPECT_EQ(converted(source, layout), Targets{source.size}) << layout;
}

TEST(Bands, ValuesWithAllThreeBitsAreTheWhole)
{
    Source source{{4, 8}};
    std::iota(source.y.begin(), source.y.end(), u8{3});
    for (const s32 layout : {31, 53, -1}) EXPECT_EQ(converted(source, layout), converted(source, whole)) << layout;
}

// Where one neighbour stands for two, one of the conversions adds a whole step and the other rounds: a flat area of 100
// is raised in the first and in the last row of the one alone.
TEST(Bands, AFlatAreaIsRaisedAtTheEdgesOfPackedRows)
{
    Source source{{2, 6}};
    std::ranges::fill(source.y, u8{100});
    std::ranges::fill(source.pairs, u8{60});
    const Targets target = converted(source, whole);
    EXPECT_EQ(target.packed, repeated({101, 60}, 2) + repeated({100, 60}, 2 * 4) + repeated({101, 60}, 2));
    EXPECT_EQ(target.y, Samples(2 * 6, 100));
    EXPECT_EQ(target.first, Samples(3, 60));
}

// (3 * 100 + 200 + 4) / 4 = 126 and (100 + 3 * 200 + 4) / 4 = 176; means of means without the step: of 100 and 150, and
// of 200 and 150.
TEST(Bands, AHeightOfTwoHasEdgesOnly)
{
    Source source{{2, 2}};
    source.y = {100, 100, 200, 200};
    source.pairs = {7, 9};
    const Targets target = converted(source, whole);
    EXPECT_EQ(target.packed, (Samples{126, 7, 126, 9, 176, 7, 176, 9}));
    EXPECT_EQ(target.y, (Samples{125, 125, 175, 175}));
    EXPECT_EQ(target.first, Samples{7});
    EXPECT_EQ(target.second, Samples{9});
}

// Luma 0, 0, 0, 101, 0, 0, 0: means of (0, 51) = 26, of (51, 51) = 51 and of (51, 0) = 26. Chroma 10, 21, 40: means of
// two neighbours, 16 and 31, and then the last row as it is. A last odd row has the last row of chroma.
TEST(Bands, MeansOfMeansAreRoundedUp)
{
    Source source{{2, 7}};
    source.y = {0, 0, 0, 0, 0, 0, 101, 101, 0, 0, 0, 0, 0, 0};
    source.pairs = {10, 110, 21, 121, 40, 140};
    const Targets target = converted(source, whole);
    EXPECT_EQ(target.packed, (Samples{1,  16,  1,  116, 0,  16,  0, 116, 26, 31,  26, 131, 51, 31,
                                      51, 131, 26, 40,  26, 140, 0, 40,  0,  140, 1,  40,  1,  140}));
    EXPECT_EQ(target.y, (Samples{0, 0, 0, 0, 26, 26, 51, 51, 26, 26, 0, 0, 0, 0}));
    EXPECT_EQ(target.first, (Samples{16, 31, 40}));
    EXPECT_EQ(target.second, (Samples{116, 131, 140}));
}

TEST(Bands, CutsOfAnImageGiveTheWhole)
{
    support::Random random(2135);
    for (int trial = 0; trial < 200; ++trial) {
        std::vector<int> cuts = {0};
        for (int bands = random.between(2, 5); bands > 0; --bands)
            cuts.push_back(cuts.back() + 2 * random.between(4, 9));
        Source source{{2 * random.between(1, 40), cuts.back()}};
        random.fill(source.y);
        random.fill(source.pairs);

        std::vector<int> order(cuts.size() - 1);
        std::iota(order.begin(), order.end(), 0);
        const bool downwards = random.oneIn(2);
        for (std::size_t i = order.size(); !downwards && i > 1; --i) {
            std::swap(order[i - 1], order[random.between(0, static_cast<int>(i) - 1)]);
        }
        Targets target{source.size};
        for (const int band : order) {
            const bool first = band == 0, last = band == static_cast<int>(order.size()) - 1;
            const s32 layout = first ? top : last ? bottom : middle;
            convertBand(source, target, cuts[band], cuts[band + 1] - cuts[band], layout);
        }
        ASSERT_EQ(target, converted(source, whole)) << "trial " << trial;
    }
}

TEST(Bands, PlanesAreTestedBetweenTheSizes)
{
    u8 samples[16] = {};
    u8* const planes[3] = {samples, nullptr, samples};
    const int steps[3] = {2, 1, 1};
    const auto statusOf = [&](RoiSize roi) {
        return pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(samples, 2, samples, 2, planes, steps, roi, whole);
    };
    EXPECT_EQ(statusOf({0, 2}), pyxErrSize);
    EXPECT_EQ(statusOf({2, 0}), pyxErrSize);
    EXPECT_EQ(statusOf({1, 2}), pyxErrNullPtr);
    EXPECT_EQ(statusOf({2, 1}), pyxErrNullPtr);
    u8* const good[3] = {samples, samples, samples};
    EXPECT_EQ(pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(samples, 2, samples, 2, good, steps, {1, 2}, whole), pyxErrSize);
    EXPECT_EQ(pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(samples, 2, samples, 2, good, steps, {2, 1}, whole), pyxErrSize);
}

// Cr is 128 and 130: the mean is 129 in the first two rows, and the last two have 130. Red is 128 * 6537 / 65536 = 12
// and 256 * 6537 / 65536 = 25, in eighths 1 and 3; luma is black, green and blue are below that.
TEST(FilteredToBgr, ChromaIsTheMeanWithTheRowBelow)
{
    const RoiSize roi = {2, 4};
    YCbCrPlanes source = filledPlanes(black, roi, block420); // the second plane is Cr
    source.cb = {128, 130};
    EXPECT_EQ(fromPlanes(pyxiYCrCb420ToBGR_Filter_8u_P3C4R, source, roi, block420, pyxOk),
              repeated({0, 0, 1, aval}, 2 * 2) + repeated({0, 0, 3, aval}, 2 * 2));
}

TEST(FilteredToBgr, OddColumnsAndRowsAreLeftAlone)
{
    const RoiSize roi = {3, 3};
    const Samples pair = repeated({0, 0, 0, aval}, 2) + Samples(4, none);
    EXPECT_EQ(fromPlanes(pyxiYCrCb420ToBGR_Filter_8u_P3C4R, filledPlanes(black, roi, block420), roi, block420,
                         pyxWarnOddSize),
              pair + pair + Samples(12, none));
    const RoiSize one = {1, 1};
    EXPECT_EQ(fromPlanes(pyxiYCrCb420ToBGR_Filter_8u_P3C4R, filledPlanes(black, one, block420), one, block420,
                         pyxWarnOddSize),
              Samples(4, none));
}
