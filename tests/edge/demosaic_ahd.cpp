// Mosaics by the smoother of two directions: colours, stripes, how a region is cut up, and what is tested.
#include "pyxcc/pyxcc.h"

#include "edge/mosaics.hpp"

#include <algorithm>

using namespace edge;

namespace
{

using Bytes = std::vector<u8>;
using Words = std::vector<u16>;

PyxStatus demosaic(const u8* src, RoiRect roi, RoiSize size, int srcStep, u8* dst, int dstStep, s32 grid)
{
    const int step = std::max({roi.width, 8, size.width}) + 6;
    Bytes scratch(30 * static_cast<std::size_t>(step));
    return pyxiDemosaicAHD_8u_C1C3R(src, roi, size, srcStep, dst, dstStep, grid, scratch.data(), step);
}

PyxStatus demosaic(const u16* src, RoiRect roi, RoiSize size, int srcStep, u16* dst, int dstStep, s32 grid)
{
    const int step = 2 * (std::max({roi.width, 8, size.width}) + 6);
    Words scratch(15 * static_cast<std::size_t>(step));
    return pyxiDemosaicAHD_16u_C1C3R(src, roi, size, srcStep, dst, dstStep, grid, scratch.data(), step);
}

/// A mosaic with as many samples around it as are read outside of the smallest ones.
constexpr int margin = 2;

template <typename T> std::vector<T> converted(const std::vector<T>& withMargin, RoiSize size, s32 grid)
{
    const int bytes = static_cast<int>(sizeof(T)), step = (size.width + 2 * margin) * bytes;
    const T* const src = withMargin.data() + margin * (size.width + 2 * margin) + margin;
    // Strips of small regions may end up to five pixels past them, or begin in front.
    const std::size_t spare = 3 * 8 * static_cast<std::size_t>(size.width + 8);
    std::vector<T> target(3 * static_cast<std::size_t>(size.width) * size.height + 2 * spare, unwritten);
    EXPECT_EQ(
        demosaic(src, {0, 0, size.width, size.height}, size, step, target.data() + spare, 3 * size.width * bytes, grid),
        pyxOk);
    return {target.begin() + static_cast<std::ptrdiff_t>(spare), target.end() - static_cast<std::ptrdiff_t>(spare)};
}

RoiSize withMargin(RoiSize size) { return {size.width + 2 * margin, size.height + 2 * margin}; }

/// A grey image as a mosaic with its margin: the grid makes no difference.
template <typename Rule> Bytes greyOf(RoiSize size, Rule rule)
{
    Bytes samples;
    for (int y = -margin; y < size.height + margin; ++y) {
        for (int x = -margin; x < size.width + margin; ++x) samples.push_back(rule(x, y));
    }
    return samples;
}

} // namespace

// All excesses over green are the same, so that both candidates are the colour itself.
TEST(DemosaicAhd, OneColourIsThatColourEverywhere)
{
    for (s32 grid = 0; grid < 4; ++grid) {
        for (const RoiSize size : {RoiSize{5, 5}, RoiSize{5, 9}, RoiSize{6, 6}, RoiSize{7, 5}, RoiSize{10, 10},
                                   RoiSize{13, 12}, RoiSize{16, 17}, RoiSize{43, 21}}) {
            const std::size_t count = static_cast<std::size_t>(size.width) * size.height;
            EXPECT_EQ(converted(mosaicOf<u8>({100, 150, 200}, grid, withMargin(size)), size, grid),
                      pixels<u8>({100, 150, 200}, count))
                << grid << ", " << size.width << ", " << size.height;
            EXPECT_EQ(converted(mosaicOf<u16>({60000, 150, 65535}, grid, withMargin(size)), size, grid),
                      pixels<u16>({60000, 150, 65535}, count))
                << grid << ", " << size.width << ", " << size.height;
        }
    }
}

// Along a stripe all samples are alike, so that the candidate along it is the image itself, and its neighbours along it
// are at no distance: wherever the other candidate is not, it has the fewer alike.
TEST(DemosaicAhd, StripesComeBackAsTheyAre)
{
    const RoiSize size = {32, 24};
    const auto stripe = [](int i) { return static_cast<u8>((i & 31) < 9 ? 40 : (i & 31) < 17 ? 200 : 90); };
    const Bytes columns = greyOf(size, [&](int x, int) { return stripe(x); });
    const Bytes rows = greyOf(size, [&](int, int y) { return stripe(y); });
    Bytes expectedColumns, expectedRows;
    for (int y = 0; y < size.height; ++y) {
        for (int x = 0; x < size.width; ++x) {
            expectedColumns.insert(expectedColumns.end(), 3, stripe(x));
            expectedRows.insert(expectedRows.end(), 3, stripe(y));
        }
    }
    for (s32 grid = 0; grid < 4; ++grid) {
        EXPECT_EQ(converted(columns, size, grid), expectedColumns) << grid;
        EXPECT_EQ(converted(rows, size, grid), expectedRows) << grid;
    }
}

TEST(DemosaicAhd, TheOriginIsMovedIntoTheMosaicAndTheRegionKeepsItsSize)
{
    const RoiSize size = {100, 100};
    const Bytes mosaic = noise<u8>(10000);
    constexpr std::size_t count = 3 * 24 * 32;
    for (s32 grid = 0; grid < 4; ++grid) {
        Bytes moved(count, unwritten), expected(count, unwritten);
        EXPECT_EQ(demosaic(mosaic.data(), {-3, 0, 10, 14}, size, 100, moved.data(), 72, grid), pyxOk);
        EXPECT_EQ(demosaic(mosaic.data(), {0, 0, 10, 14}, size, 100, expected.data(), 72, grid), pyxOk);
        EXPECT_EQ(moved, expected) << grid;
        moved = Bytes(count, unwritten);
        EXPECT_EQ(demosaic(mosaic.data(), {-1, -50, 10, 14}, size, 100, moved.data(), 72, grid), pyxOk);
        EXPECT_EQ(moved, expected) << grid;
    }
}

TEST(DemosaicAhd, NothingIsDoneOutsideTheMosaic)
{
    const Bytes mosaic(100, 1);
    for (const RoiRect roi : {RoiRect{10, 0, 4, 4}, RoiRect{0, 11, 4, 4}, RoiRect{0, 0, 0, 4}, RoiRect{2, 2, 4, -1}}) {
        Bytes target(600, unwritten);
        EXPECT_EQ(demosaic(mosaic.data(), roi, {10, 10}, 10, target.data(), 60, 0), pyxOk);
        EXPECT_EQ(target, Bytes(600, unwritten));
    }
}

// The strip at the top ends where the inner block would begin: at the sixth row, or at the seventh, if the sixth has no
// red sample. At (5, 5) the grids have red, blue, green in a red row and green in a blue row, and only in a row of blue
// the block begins one further down.
TEST(DemosaicAhd, TheStripAtTheTopIsNotCutToASmallRegion)
{
    const RoiSize size = {40, 40};
    const int rows[4] = {5, 6, 5, 6};
    for (s32 grid = 0; grid < 4; ++grid) {
        const Bytes mosaic = mosaicOf<u8>({100, 150, 200}, grid, size);
        Bytes target(3 * 4 * 9, unwritten), expected(3 * 4 * 9, unwritten);
        EXPECT_EQ(demosaic(mosaic.data(), {0, 0, 2, 2}, size, 40, target.data(), 12, grid), pyxOk);
        for (int row = 0; row < rows[grid]; ++row) {
            for (std::size_t i = 0; i < 6; ++i)
                expected[12 * static_cast<std::size_t>(row) + i] = Bytes{100, 150, 200}[i % 3];
        }
        EXPECT_EQ(target, expected) << grid;
    }
}

// A mosaic of five reaches two samples past itself, and no further.
TEST(DemosaicAhd, TheSmallestMosaicReadsTwoSamplesAround)
{
    const RoiSize size = {5, 5};
    constexpr int outer = 4, span = 5 + 2 * outer;
    Bytes near = noise<u8>(span * span), far = near;
    for (int y = -outer; y < 5 + outer; ++y) {
        for (int x = -outer; x < 5 + outer; ++x) {
            const bool isFar = x < -margin || y < -margin || x >= 5 + margin || y >= 5 + margin;
            if (isFar) far[static_cast<std::size_t>((y + outer) * span + x + outer)] ^= 0xff;
        }
    }
    for (s32 grid = 0; grid < 4; ++grid) {
        Bytes a(3 * 12 * 12, unwritten), b = a;
        const std::ptrdiff_t first = outer * span + outer, middle = 3 * (3 * 12 + 3);
        EXPECT_EQ(demosaic(near.data() + first, {0, 0, 5, 5}, size, span, a.data() + middle, 36, grid), pyxOk);
        EXPECT_EQ(demosaic(far.data() + first, {0, 0, 5, 5}, size, span, b.data() + middle, 36, grid), pyxOk);
        EXPECT_EQ(a, b) << grid;
    }
}

TEST(DemosaicAhd, ArgumentsAreTestedInTheirOrder)
{
    const Bytes source(64, 1);
    Bytes target(48, unwritten);
    const auto status = [&](const u8* src, u8* dst, RoiSize size, s32 grid) {
        return demosaic(src, {0, 0, 4, 4}, size, 8, dst, 12, grid);
    };
    EXPECT_EQ(status(nullptr, target.data(), {4, 4}, 4), pyxErrNullPtr);
    EXPECT_EQ(status(source.data(), nullptr, {4, 4}, 4), pyxErrNullPtr);
    EXPECT_EQ(status(source.data(), target.data(), {4, 8}, 4), pyxErrSize);
    EXPECT_EQ(status(source.data(), target.data(), {8, 4}, 0), pyxErrSize);
    EXPECT_EQ(status(source.data(), target.data(), {8, 8}, 4), pyxErrBadArg);
    EXPECT_EQ(status(source.data(), target.data(), {8, 8}, -1), pyxErrBadArg);
    EXPECT_EQ(target, Bytes(48, unwritten));
}
