// Where the blocks of a demosaiced region begin and end, beyond the region and the mosaic as well.
#include "pyxcc/demosaic_ahd.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

using namespace edge;

namespace
{

constexpr s32 bggr = 0, rggb = 1;

/// A target with room around it, at first 77 everywhere.
struct Target {
    static constexpr int width = 48, height = 40, step = 3 * width;
    Samples samples = Samples(step * height, 77);

    /// The pixel at (4, 4) is the target's first.
    u8* first() { return pixel(0, 0); }
    u8* pixel(int x, int y) { return &samples[(y + 4) * step + 3 * (x + 4)]; }

    /// Fills pixels up to `right` and `bottom` in front of their last with gray.
    Target& fill(int left, int top, int right, int bottom, u8 gray)
    {
        for (int y = top; y < bottom; ++y) std::fill(pixel(left, y), pixel(right, y), gray);
        return *this;
    }
};

struct Mosaic {
    int width, height;
    Samples samples;

    /// A mosaic of gray objects is gray itself, whatever the grid.
    template <class Gray> Mosaic(int w, int h, Gray gray) : width(w), height(h)
    {
        for (int y = 0; y < h; ++y) {
            for (int x = 0; x < w; ++x) samples.push_back(static_cast<u8>(gray(x, y)));
        }
    }

    PyxStatus convert(RoiRect region, s32 grid, Target& target) const
    {
        return convert(samples.data(), {width, height}, region, grid, target);
    }

    /// A part of these samples as the mosaic.
    PyxStatus convert(const u8* first, RoiSize size, RoiRect region, s32 grid, Target& target) const
    {
        Samples workspace(30 * 64, 99);
        return pyxiDemosaicAHD_8u_C1C3R(first, region, size, width, target.first(), Target::step, grid,
                                        workspace.data(), 64);
    }
};

int flat(int, int) { return 100; }
int noise(int x, int y) { return x * x * 37 + y * y * 91 + x * y * 53; }

} // namespace

TEST(DemosaicAhdBlocks, SmallRegionsAreWrittenDownToTheInside)
{
    const Mosaic mosaic(40, 30, flat);
    Target target;
    EXPECT_EQ(mosaic.convert({0, 0, 2, 2}, bggr, target), pyxOk); // (5, 5) is red
    EXPECT_EQ(target.samples, Target().fill(0, 0, 2, 5, 100).samples);
    target = {};
    EXPECT_EQ(mosaic.convert({0, 0, 2, 2}, rggb, target), pyxOk); // but here (6, 6) is
    EXPECT_EQ(target.samples, Target().fill(0, 0, 2, 6, 100).samples);
}

TEST(DemosaicAhdBlocks, NarrowRegionsAreWrittenAsFarAsTheInside)
{
    const Mosaic mosaic(40, 30, flat);
    Target target;
    EXPECT_EQ(mosaic.convert({0, 0, 2, 20}, bggr, target), pyxOk);
    // The inside would be 14 rows from (5, 5) on: the strip on its left goes up to there.
    EXPECT_EQ(target.samples, Target().fill(0, 0, 2, 20, 100).fill(0, 5, 5, 19, 100).samples);
}

// The last row of red samples that is inside is at 24 or 25, so that the inside of a region from row 28 on is less than
// empty: the bottom strip begins where it would end.
TEST(DemosaicAhdBlocks, RegionsAtTheLowerEdgeAreWrittenInFront)
{
    const Mosaic mosaic(40, 30, flat);
    Target target;
    EXPECT_EQ(mosaic.convert({10, 28, 4, 2}, rggb, target), pyxOk); // (10, 28) is red: -3 rows are -4
    EXPECT_EQ(target.samples, Target().fill(0, -4, 4, 2, 100).samples);
    target = {};
    EXPECT_EQ(mosaic.convert({10, 28, 4, 2}, bggr, target), pyxOk); // (11, 29) is red: -4 rows
    EXPECT_EQ(target.samples, Target().fill(0, -3, 4, 2, 100).samples);
}

TEST(DemosaicAhdBlocks, RegionsAtTheRightEdgeAreWrittenInFront)
{
    const Mosaic mosaic(40, 30, flat);
    Target target;
    EXPECT_EQ(mosaic.convert({38, 6, 2, 10}, rggb, target), pyxOk); // (38, 6) is red: -3 columns are -4
    EXPECT_EQ(target.samples, Target().fill(-4, 0, 2, 10, 100).samples);
    target = {};
    EXPECT_EQ(mosaic.convert({38, 6, 2, 10}, bggr, target), pyxOk); // (39, 7) is red: -4 columns, and 8 rows
    EXPECT_EQ(target.samples, Target().fill(0, 0, 2, 10, 100).fill(-3, 1, 2, 9, 100).samples);
}

// Of a region of two columns the strip on its left is five wide, and six where (5, 5) is not red.
TEST(DemosaicAhdBlocks, TheWorkspaceIsThirtyRowsOfTheWidestBlock)
{
    const Mosaic mosaic(40, 30, noise);
    for (const auto& [grid, strip] : {std::pair{bggr, 5}, std::pair{rggb, 6}}) {
        const int step = strip + 6;
        Samples workspace(30 * step + 64, 99);
        Target target;
        EXPECT_EQ(pyxiDemosaicAHD_8u_C1C3R(mosaic.samples.data(), {0, 0, 2, 20}, {40, 30}, 40, target.first(),
                                           Target::step, grid, &workspace[32], step),
                  pyxOk);
        EXPECT_EQ(Samples(workspace.begin(), workspace.begin() + 32), Samples(32, 99));
        EXPECT_EQ(Samples(workspace.end() - 32, workspace.end()), Samples(32, 99));
    }
}

TEST(DemosaicAhdBlocks, AtASizeOfFiveARowMoreIsWritten)
{
    // The samples around the mosaic of 5 by 5 are read as well, and are alike.
    const Mosaic mosaic(9, 9, flat);
    Target target;
    EXPECT_EQ(mosaic.convert(&mosaic.samples[2 * 9 + 2], {5, 5}, {0, 0, 5, 5}, bggr, target), pyxOk);
    EXPECT_EQ(target.samples, Target().fill(0, -1, 5, 5, 100).samples);
    target = {};
    EXPECT_EQ(mosaic.convert(&mosaic.samples[2 * 9 + 2], {5, 5}, {0, 0, 5, 5}, rggb, target), pyxOk);
    EXPECT_EQ(target.samples, Target().fill(0, 0, 5, 6, 100).samples);
}

TEST(DemosaicAhdBlocks, AtAWidthOfFiveTheMirrorReachesBeyondTheRow)
{
    // Column -5 is read at 5, behind the row, and has a say in which candidates are taken at the row's ends.
    Mosaic mosaic(9, 20, noise);
    Target alike, other;
    EXPECT_EQ(mosaic.convert(&mosaic.samples[2], {5, 20}, {0, 0, 5, 20}, bggr, alike), pyxOk);
    for (int y = 0; y < 20; ++y) mosaic.samples[y * 9 + 7] ^= 255;
    EXPECT_EQ(mosaic.convert(&mosaic.samples[2], {5, 20}, {0, 0, 5, 20}, bggr, other), pyxOk);
    EXPECT_NE(alike.samples, other.samples);
}

TEST(DemosaicAhdBlocks, AtAWidthOfSixTheStripOnTheRightStands)
{
    // It begins at column 1 and the one on the left ends with column 4. Regions of the first column alone and of all
    // but the first show each by itself; the former is written as far as the strip goes.
    const Mosaic mosaic(6, 30, noise);
    Target both, left, right;
    EXPECT_EQ(mosaic.convert({0, 0, 6, 30}, bggr, both), pyxOk);
    EXPECT_EQ(mosaic.convert({0, 0, 1, 30}, bggr, left), pyxOk);
    EXPECT_EQ(mosaic.convert({1, 0, 5, 30}, bggr, right), pyxOk);
    const auto columns = [](Target& target, int from, int to) {
        Samples pixels;
        for (int y = 5; y < 25; ++y) pixels.insert(pixels.end(), target.pixel(from, y), target.pixel(to, y));
        return pixels;
    };
    EXPECT_EQ(columns(both, 0, 1), columns(left, 0, 1));
    EXPECT_EQ(columns(both, 1, 6), columns(right, 0, 5));
    EXPECT_NE(columns(both, 1, 5), columns(left, 1, 5));
}

TEST(DemosaicAhdBlocks, OddStepsOfWordsMoveBlocksByWholeSamplesOnly)
{
    // The inside of 14 by 14 is at (5, 5). Rows of the top strip are 121 bytes apart, but the inside begins 5 rows of
    // 120 bytes below the first.
    constexpr int width = 14, step = 121;
    std::vector<u16> mosaic(width * width, 0x6464), workspace(30 * 20);
    alignas(2) u8 target[step * 16];
    std::fill(std::begin(target), std::end(target), u8{7});
    u16* const first = reinterpret_cast<u16*>(target);
    EXPECT_EQ(pyxiDemosaicAHD_16u_C1C3R(mosaic.data(), {0, 0, width, width}, {width, width}, 2 * width, first, step,
                                        bggr, workspace.data(), 41),
              pyxOk);
    Samples expected(step * 16, 7);
    const auto fill = [&expected](int at, int rows, int bytes) {
        for (int y = 0; y < rows; ++y) std::fill_n(&expected[at + y * step], bytes, u8{0x64});
    };
    fill(0, 5, 6 * width);       // the top strip
    fill(5 * 120, 4, 6 * width); // the inside and the strips at its sides
    fill(9 * 120, 5, 6 * width); // the bottom strip
    EXPECT_EQ(Samples(std::begin(target), std::end(target)), expected);
}
