// Mosaics in one pass: corners, the frame, gradients within it, regions, and what is tested.
#include "pyxcc/pyxcc.h"

#include "edge/mosaics.hpp"

using namespace edge;

namespace
{

using Bytes = std::vector<u8>;
using Words = std::vector<u16>;

/// A whole mosaic.
Bytes converted(const Bytes& mosaic, RoiSize size, s32 grid, s32 interpolation = 0)
{
    Bytes target(3 * mosaic.size(), unwritten);
    EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), {0, 0, size.width, size.height}, size, size.width, target.data(),
                                    3 * size.width, grid, interpolation),
              pyxOk);
    return target;
}

Words converted(const Words& mosaic, RoiSize size, s32 grid)
{
    Words target(3 * mosaic.size(), unwritten);
    EXPECT_EQ(pyxiCFAToRGB_16u_C1C3R(mosaic.data(), {0, 0, size.width, size.height}, size, 2 * size.width,
                                     target.data(), 6 * size.width, grid, 0),
              pyxOk);
    return target;
}

template <typename T> Pixel<T> pixelAt(const std::vector<T>& image, int width, int x, int y)
{
    const std::size_t first = 3 * (static_cast<std::size_t>(width) * y + x);
    return {image[first], image[first + 1], image[first + 2]};
}

} // namespace

// Each corner has one sample of red and of blue; green is its own, or the rounded average of the two: (20 + 31 + 1)
// >> 1.
TEST(CfaToRgb, FourSamplesAreAllCorners)
{
    EXPECT_EQ(converted(Bytes{10, 20, 31, 40}, {2, 2}, 1), (Bytes{10, 26, 40, 10, 20, 40, 10, 31, 40, 10, 26, 40}));
    EXPECT_EQ(converted(Bytes{10, 20, 31, 40}, {2, 2}, 0), (Bytes{40, 26, 10, 40, 20, 10, 40, 31, 10, 40, 26, 10}));
    EXPECT_EQ(converted(Bytes{10, 20, 31, 40}, {2, 2}, 2), (Bytes{31, 10, 20, 31, 25, 20, 31, 25, 20, 31, 40, 20}));
    EXPECT_EQ(converted(Bytes{10, 20, 31, 40}, {2, 2}, 3), (Bytes{20, 10, 31, 20, 25, 31, 20, 25, 31, 20, 40, 31}));
    EXPECT_EQ(converted(Words{1000, 2000, 3001, 4000}, {2, 2}, 1),
              (Words{1000, 2501, 4000, 1000, 2000, 4000, 1000, 3001, 4000, 1000, 2501, 4000}));
}

// One column and one row are both the second and the last but one. Red is at the corners and blue, 99, in the middle;
// of the middle green is (21 + 85 + 40 + 64 + 2) >> 2 and red (10 + 33 + 70 + 201 + 2) >> 2.
TEST(CfaToRgb, ThreeColumnsAndRowsHaveOneAmidTheFrame)
{
    EXPECT_EQ(converted(Bytes{10, 21, 33, 40, 99, 64, 70, 85, 201}, {3, 3}, 1),
              (Bytes{10, 31, 99, 22,  21, 99, 33,  43, 99, //
                     40, 40, 99, 79,  53, 99, 117, 64, 99, //
                     70, 63, 99, 136, 85, 99, 201, 75, 99}));
}

TEST(CfaToRgb, OneColourIsThatColourEverywhere)
{
    for (s32 grid = 0; grid < 4; ++grid) {
        for (int height = 2; height < 9; ++height) {
            for (const int width : {2, 3, 4, 5, 6, 7, 20, 37}) {
                const RoiSize size = {width, height};
                const std::size_t count = static_cast<std::size_t>(width) * height;
                EXPECT_EQ(converted(mosaicOf<u8>({100, 150, 255}, grid, size), size, grid),
                          pixels<u8>({100, 150, 255}, count))
                    << grid << ", " << width << ", " << height;
                EXPECT_EQ(converted(mosaicOf<u16>({100, 65535, 40000}, grid, size), size, grid),
                          pixels<u16>({100, 65535, 40000}, count))
                    << grid << ", " << width << ", " << height;
            }
        }
    }
}

// About the red sample in the middle green is 60 above, 71 below, 200 and 100 beside: (60 + 71 + 1) >> 1, (200 + 100 +
// 1)
// >> 1 or (431 + 2) >> 2. The reds around it tell which.
TEST(CfaToRgb, GreenGoesAlongTheSmallerDifference)
{
    const struct {
        u8 left, right, above, below, green;
    } cases[] = {{10, 50, 30, 30, 66},
                 {30, 30, 10, 50, 150},
                 {10, 50, 50, 10, 108},
                 {0, 255, 254, 0, 66},
                 {0, 254, 255, 0, 150}};
    for (const auto& [left, right, above, below, green] : cases) {
        Bytes mosaic(25, 0);
        mosaic[2] = above, mosaic[22] = below, mosaic[10] = left, mosaic[14] = right;
        mosaic[7] = 60, mosaic[17] = 71, mosaic[11] = 200, mosaic[13] = 100, mosaic[12] = 33;
        mosaic[6] = 1, mosaic[8] = 2, mosaic[16] = 3, mosaic[18] = 4;
        EXPECT_EQ(pixelAt(converted(mosaic, {5, 5}, 1), 5, 2, 2), (Pixel<u8>{33, green, 3})) << int{green};
        const Pixel<u8> asBlue = {3, green, 33};
        EXPECT_EQ(pixelAt(converted(mosaic, {5, 5}, 0), 5, 2, 2), asBlue) << int{green};
    }
}

// The second row and column have neighbours, but no gradient: the blue sample at (1, 1) has greens of 60, 200, 71 and
// 100 around it, whatever the blues two away.
TEST(CfaToRgb, TheFrameIsTwoSamplesWide)
{
    Bytes mosaic(49, 0);
    mosaic[1] = 60, mosaic[7] = 200, mosaic[15] = 71, mosaic[9] = 100;
    mosaic[10] = 255;
    EXPECT_EQ(pixelAt(converted(mosaic, {7, 7}, 1), 7, 1, 1)[1], 108);
}

TEST(CfaToRgb, PairsBesideGreenRoundUp)
{
    // Green at (3, 2) in a red row, with red 10 and 21 beside it and blue 30 and 41 above and below.
    Bytes mosaic(49, 0);
    mosaic[16] = 10, mosaic[18] = 21, mosaic[10] = 30, mosaic[24] = 41, mosaic[17] = 99;
    EXPECT_EQ(pixelAt(converted(mosaic, {7, 7}, 1), 7, 3, 2), (Pixel<u8>{16, 99, 36}));
    EXPECT_EQ(pixelAt(converted(mosaic, {7, 7}, 0), 7, 3, 2), (Pixel<u8>{36, 99, 16}));
}

TEST(CfaToRgb, ARegionIsAPartOfTheWhole)
{
    constexpr int width = 23, height = 11;
    const Bytes mosaic = noise<u8>(width * height);
    for (s32 grid = 0; grid < 4; ++grid) {
        const Bytes whole = converted(mosaic, {width, height}, grid);
        for (const RoiRect roi :
             {RoiRect{0, 0, 1, 1}, RoiRect{1, 1, 3, 2}, RoiRect{3, 4, 6, 5}, RoiRect{2, 2, 19, 7}, RoiRect{21, 9, 2, 2},
              RoiRect{22, 0, 1, 11}, RoiRect{0, 10, 23, 1}, RoiRect{5, 0, 17, 11}}) {
            Bytes target(3 * static_cast<std::size_t>(roi.width) * roi.height, unwritten);
            EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), roi, {width, height}, width, target.data(), 3 * roi.width,
                                            grid, 0),
                      pyxOk);
            for (int y = 0; y < roi.height; ++y) {
                for (int x = 0; x < roi.width; ++x)
                    EXPECT_EQ(pixelAt(target, roi.width, x, y), pixelAt(whole, width, roi.x + x, roi.y + y))
                        << grid << ": " << roi.x << ", " << roi.y << ", " << x << ", " << y;
            }
        }
    }
}

// A piece of the frame would be written around the region, and reads other samples than the two around it.
TEST(CfaToRgb, ARegionInsideTouchesNoPieceOfTheFrame)
{
    constexpr int width = 16, height = 14, room = 4;
    const RoiRect roi = {4, 5, 7, 4};
    const Bytes mosaic = noise<u8>(width * height);
    Bytes other = mosaic;
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            const bool isNear =
                x >= roi.x - 2 && x < roi.x + roi.width + 2 && y >= roi.y - 2 && y < roi.y + roi.height + 2;
            if (!isNear) other[static_cast<std::size_t>(y * width + x)] ^= 0xff;
        }
    }
    const auto convertedRegion = [&](const Bytes& of, s32 grid) {
        constexpr int step = 3 * (7 + 2 * room);
        Bytes target(std::size_t{step} * (4 + 2 * room), unwritten);
        EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(of.data(), roi, {width, height}, width, &target[room * step + 3 * room], step,
                                        grid, 0),
                  pyxOk);
        return target;
    };
    for (s32 grid = 0; grid < 4; ++grid) {
        const Bytes whole = converted(mosaic, {width, height}, grid), region = convertedRegion(mosaic, grid);
        EXPECT_EQ(region, convertedRegion(other, grid)) << grid;
        for (int y = -room; y < roi.height + room; ++y) {
            for (int x = -room; x < roi.width + room; ++x) {
                const bool isIn = x >= 0 && x < roi.width && y >= 0 && y < roi.height;
                EXPECT_EQ(pixelAt(region, roi.width + 2 * room, x + room, y + room),
                          isIn ? pixelAt(whole, width, roi.x + x, roi.y + y) : (Pixel<u8>{77, 77, 77}))
                    << grid << ": " << x << ", " << y;
            }
        }
    }
}

// Columns of the frame belong to a region that begins with them, and rows likewise: one that begins in front of the
// mosaic has no part in the first two, but for what rows of the frame take along.
TEST(CfaToRgb, ARegionThatBeginsInFrontOfTheMosaicLeavesOutTheFirstEdge)
{
    constexpr int size = 9, room = 4, pitch = size + 2 * room;
    const Bytes around = noise<u8>(pitch * size);
    Bytes mosaic;
    for (int y = 0; y < size; ++y)
        mosaic.insert(mosaic.end(), &around[y * pitch + room], &around[y * pitch + room + size]);
    for (s32 grid = 0; grid < 4; ++grid) {
        const Bytes whole = converted(mosaic, {size, size}, grid);
        Bytes target(3 * 6 * 6, unwritten);
        EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(&around[room], {-1, 0, 6, 6}, {size, size}, pitch, target.data(), 18, grid, 0),
                  pyxOk);
        for (int y = 0; y < 6; ++y) {
            for (int x = y < 2 ? 0 : -1; x < 5; ++x) {
                const bool isWritten = y < 2 || x >= 2;
                EXPECT_EQ(pixelAt(target, 6, x + 1, y),
                          isWritten ? pixelAt(whole, size, x, y) : (Pixel<u8>{77, 77, 77}))
                    << grid << ": " << x << ", " << y;
            }
        }
        target = Bytes(3 * 6 * 6, unwritten);
        EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(&around[room], {0, -1, 6, 6}, {size, size}, pitch, target.data(), 18, grid, 0),
                  pyxOk);
        for (int y = -1; y < 5; ++y) {
            for (int x = 0; x < 6; ++x) {
                EXPECT_EQ(pixelAt(target, 6, x, y + 1), y >= 2 ? pixelAt(whole, size, x, y) : (Pixel<u8>{77, 77, 77}))
                    << grid << ": " << x << ", " << y;
            }
        }
    }
}

TEST(CfaToRgb, ARegionEndsWithTheMosaic)
{
    const RoiSize size = {6, 6};
    const Bytes mosaic = mosaicOf<u8>({100, 150, 200}, 1, size);
    Bytes target(48, unwritten);
    EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), {4, 5, 4, 4}, size, 6, target.data(), 12, 1, 0), pyxOk);
    Bytes expected(48, unwritten);
    for (std::size_t i = 0; i < 6; ++i) expected[i] = Bytes{100, 150, 200}[i % 3];
    EXPECT_EQ(target, expected);
    for (const RoiRect empty : {RoiRect{6, 0, 2, 2}, RoiRect{0, 7, 2, 2}, RoiRect{0, 0, 0, 2}, RoiRect{0, 0, 2, -1}}) {
        target = Bytes(48, unwritten);
        EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), empty, size, 6, target.data(), 12, 1, 0), pyxOk);
        EXPECT_EQ(target, Bytes(48, unwritten));
    }
}

// Steps may be anything: where rows overlap, each is written over those above it, over its whole width.
TEST(CfaToRgb, RowsThatOverlapAreWrittenOneAfterTheOther)
{
    const RoiSize size = {4300, 12};
    const Bytes mosaic = noise<u8>(static_cast<std::size_t>(size.width) * size.height);
    for (const int step : {0, 3, 30, -6, 12000}) {
        const std::size_t first = step < 0 ? 100 : 0, count = 3 * 4296 + 7 * 12000 + 100;
        Bytes whole(count, unwritten), oneByOne(count, unwritten);
        EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), {2, 2, 4296, 8}, size, size.width, &whole[first], step, 1, 0),
                  pyxOk);
        for (int y = 0; y < 8; ++y) {
            u8* const row = &oneByOne[first] + y * step;
            EXPECT_EQ(pyxiCFAToRGB_8u_C1C3R(mosaic.data(), {2, 2 + y, 4296, 1}, size, size.width, row, 0, 1, 0), pyxOk);
        }
        EXPECT_EQ(whole, oneByOne) << step;
    }
}

TEST(CfaToRgb, AnyInterpolationIsTheSame)
{
    const Bytes mosaic = noise<u8>(64);
    const Bytes expected = converted(mosaic, {8, 8}, 2, 0);
    for (const s32 interpolation : {-1, 1, 4, 12345}) EXPECT_EQ(converted(mosaic, {8, 8}, 2, interpolation), expected);
}

TEST(CfaToRgb, OddStepsOfWordsLoseTheirLowBit)
{
    const Words mosaic = mosaicOf<u16>({100, 150, 200}, 1, {2, 2});
    Words target(12, unwritten);
    EXPECT_EQ(pyxiCFAToRGB_16u_C1C3R(mosaic.data(), {0, 0, 2, 2}, {2, 2}, 5, target.data(), 13, 1, 0), pyxOk);
    EXPECT_EQ(target, pixels<u16>({100, 150, 200}, 4));
}

TEST(CfaToRgb, ArgumentsAreTestedInTheirOrder)
{
    const Bytes source(16, 1);
    Bytes target(12, unwritten);
    const auto status = [&](const u8* src, u8* dst, RoiSize size, s32 grid) {
        return pyxiCFAToRGB_8u_C1C3R(src, {0, 0, 2, 2}, size, 4, dst, 6, grid, 0);
    };
    EXPECT_EQ(status(nullptr, target.data(), {1, 1}, 4), pyxErrNullPtr);
    EXPECT_EQ(status(source.data(), nullptr, {1, 1}, 4), pyxErrNullPtr);
    EXPECT_EQ(status(source.data(), target.data(), {1, 4}, 4), pyxErrSize);
    EXPECT_EQ(status(source.data(), target.data(), {4, 1}, 0), pyxErrSize);
    EXPECT_EQ(status(source.data(), target.data(), {4, 4}, 4), pyxErrBadArg);
    EXPECT_EQ(status(source.data(), target.data(), {4, 4}, -1), pyxErrBadArg);
    EXPECT_EQ(target, Bytes(12, unwritten));
}
