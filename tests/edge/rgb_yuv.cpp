// RGB to YUV and back: known colours, and the column at which a row passes from the wide form to that of the tail.
#include "pyxcc/rgb_yuv.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <array>

using namespace edge;

namespace
{

using Interleaved = PyxStatus (*)(const u8*, int, u8*, int, RoiSize);
using Planes = std::vector<Samples>;

/// A row of equal pixels, converted into a target of `count` samples a pixel that holds 77 before.
Samples converted(Interleaved convert, std::initializer_list<u8> pixel, int width, int count)
{
    const Samples source = repeated(pixel, width);
    Samples target(static_cast<std::size_t>(count) * width, 77);
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// The same, with 200 for the fourth sample.
Samples convertedC3C4(std::initializer_list<u8> pixel, int width)
{
    const Samples source = repeated(pixel, width);
    Samples target(4 * source.size(), 77);
    EXPECT_EQ(pyxiYUVToRGB_8u_C3C4R(source.data(), 0, target.data(), 0, {width, 1}, 200), pyxOk);
    target.resize(static_cast<std::size_t>(4) * width);
    return target;
}

/// Planes of a value each.
Planes planesOf(std::initializer_list<u8> pixel, int width)
{
    Planes planes;
    for (const u8 sample : pixel) planes.emplace_back(width, sample);
    return planes;
}

/// Planes of two spans, each of one colour.
Planes planesOf(std::initializer_list<u8> first, int count, std::initializer_list<u8> second, int width)
{
    const Planes left = planesOf(first, count), right = planesOf(second, width - count);
    Planes planes;
    for (std::size_t k = 0; k < left.size(); ++k) planes.push_back(left[k] + right[k]);
    return planes;
}

Planes planesFromC3(std::initializer_list<u8> pixel, int width)
{
    const Samples source = repeated(pixel, width);
    Planes target = planesOf({77, 77, 77}, width);
    u8* const dst[3] = {target[0].data(), target[1].data(), target[2].data()};
    EXPECT_EQ(pyxiRGBToYUV_8u_C3P3R(source.data(), 0, dst, 0, {width, 1}), pyxOk);
    return target;
}

Planes planesFromAC4(std::initializer_list<u8> pixel, int width)
{
    const Samples source = repeated(pixel, width);
    Planes target = planesOf({77, 77, 77, 77}, width);
    u8* const dst[4] = {target[0].data(), target[1].data(), target[2].data(), target[3].data()};
    EXPECT_EQ(pyxiRGBToYUV_8u_AC4P4R(source.data(), 0, dst, 0, {width, 1}), pyxOk);
    return target;
}

using BetweenPlanes = PyxStatus (*)(const u8* const*, int, u8* const*, int, RoiSize);

Planes planesFromP3(BetweenPlanes convert, std::initializer_list<u8> pixel, int width)
{
    const Planes source = planesOf(pixel, width);
    Planes target = planesOf({77, 77, 77}, width);
    const u8* const src[3] = {source[0].data(), source[1].data(), source[2].data()};
    u8* const dst[3] = {target[0].data(), target[1].data(), target[2].data()};
    EXPECT_EQ(convert(src, 0, dst, 0, {width, 1}), pyxOk);
    return target;
}

Samples interleavedFromP3(std::initializer_list<u8> pixel, int width)
{
    const Planes source = planesOf(pixel, width);
    const u8* const src[3] = {source[0].data(), source[1].data(), source[2].data()};
    Samples target(static_cast<std::size_t>(3) * width, 77);
    EXPECT_EQ(pyxiYUVToRGB_8u_P3C3R(src, 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

} // namespace

// White in the exact form: the weights 19595, 38470 and 7471 add up to 65536, so luma is 255 and no difference is left.
TEST(RgbToYuv, ShortRowsAreExact)
{
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {255, 255, 255}, 3, 3), repeated({255, 128, 128}, 3));
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {255, 255, 255}, 15, 3), repeated({255, 128, 128}, 15));
    EXPECT_EQ(planesFromC3({255, 255, 255}, 7), planesOf({255, 128, 128}, 7));
}

// White in the high form: luma from the high words 19518, 38318 and 7441, of which 65277 >> 8 = 254; U from -2399,
// -4717 and 7115, V from 10036, -8405 and -1632, each sum -1 and -1 after its shift.
TEST(RgbToYuv, WholeBlocksTakeTheHighForm)
{
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {255, 255, 255}, 16, 3), repeated({254, 127, 127}, 16));
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {255, 255, 255}, 17, 3),
              repeated({254, 127, 127}, 16) + repeated({255, 128, 128}, 1));
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {255, 255, 255}, 47, 3),
              repeated({254, 127, 127}, 32) + repeated({255, 128, 128}, 15));
    EXPECT_EQ(planesFromC3({255, 255, 255}, 8), planesOf({254, 127, 127}, 8));
    EXPECT_EQ(planesFromC3({255, 255, 255}, 31), planesOf({254, 127, 127}, 24, {255, 128, 128}, 31));
}

// The exact form of planes has a green weight of 38469: luma is 65535 * 255 >> 16 = 254. The weights of U and of V add
// up to 1, and 255 >> 15 is 0.
TEST(RgbToYuv, PlanesHaveAnExactFormOfTheirOwn)
{
    EXPECT_EQ(planesFromP3(pyxiRGBToYUV_8u_P3R, {255, 255, 255}, 15), planesOf({254, 128, 128}, 15));
    EXPECT_EQ(planesFromP3(pyxiRGBToYUV_8u_P3R, {255, 255, 255}, 16), planesOf({254, 127, 127}, 16));
    EXPECT_EQ(planesFromP3(pyxiRGBToYUV_8u_P3R, {255, 255, 255}, 31),
              planesOf({254, 127, 127}, 16, {254, 128, 128}, 31));
}

// Blue of 255. The planar form: t = 58 + 1, luma 59 >> 1 = 29, U from (510 - 59) * 16121 >> 16 = 110 and V from
// -59 * 28737 >> 16 = -26. The exact form: s = 1905105, U from 226 * 32244 >> 16 = 111.
TEST(RgbToYuv, AlphaGoesToThePlaneOfItsOwn)
{
    for (const int width : {1, 3, 7}) {
        EXPECT_EQ(planesFromAC4({0, 0, 255, 9}, width), planesOf({29, 239, 102, 9}, width));
    }
    EXPECT_EQ(planesFromAC4({0, 0, 255, 9}, 8), planesOf({29, 238, 102, 9}, 8));
    EXPECT_EQ(planesFromAC4({0, 0, 255, 9}, 45), planesOf({29, 238, 102, 9}, 40, {29, 239, 102, 9}, 45));
}

// Luma of a blue of 255 is 29.07, of 254 it is 28.95: the only exact form that rounds gives 29 for both.
TEST(RgbToYuv, FourChannelsRoundInEveryPixel)
{
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_AC4R, {255, 255, 255, 9}, 33, 4), repeated({255, 128, 128, 77}, 33));
    const Samples row = converted(pyxiRGBToYUV_8u_AC4R, {0, 0, 254, 9}, 33, 4);
    for (std::size_t i = 0; i < row.size(); i += 4) EXPECT_EQ(row[i], 29);
    EXPECT_EQ(converted(pyxiRGBToYUV_8u_C3R, {0, 0, 254}, 1, 3)[0], 28);
}

TEST(YuvToRgb, BlackAndWhiteAreTheSameInEveryForm)
{
    for (const u8 level : {0, 255}) {
        for (int width = 1; width <= 50; ++width) {
            const Samples rgb = repeated({level, level, level}, width);
            EXPECT_EQ(converted(pyxiYUVToRGB_8u_C3R, {level, 128, 128}, width, 3), rgb);
            EXPECT_EQ(interleavedFromP3({level, 128, 128}, width), rgb);
            EXPECT_EQ(converted(pyxiYUVToRGB_8u_AC4R, {level, 128, 128, 9}, width, 4),
                      repeated({level, level, level, 77}, width));
            EXPECT_EQ(convertedC3C4({level, 128, 128}, width), repeated({level, level, level, 200}, width));
            EXPECT_EQ(planesFromP3(pyxiYUVToRGB_8u_P3R, {level, 128, 128}, width),
                      planesOf({level, level, level}, width));
        }
    }
}

// Y = 100, U' = -38 and V' = 72. Rounded, R is 182.58 and B 23.28; green, which is not, 73.14. The high form of three
// products cuts them to 82, 14 and -42, and -78.
TEST(YuvToRgb, InterleavedRowsTakeTheHighFormInBlocksOf8)
{
    EXPECT_EQ(converted(pyxiYUVToRGB_8u_C3R, {100, 90, 200}, 7, 3), repeated({182, 73, 23}, 7));
    EXPECT_EQ(converted(pyxiYUVToRGB_8u_C3R, {100, 90, 200}, 8, 3), repeated({182, 72, 22}, 8));
    EXPECT_EQ(converted(pyxiYUVToRGB_8u_C3R, {100, 90, 200}, 31, 3),
              repeated({182, 72, 22}, 24) + repeated({182, 73, 23}, 7));
}

// All three channels cut: R 182.07, G 73.14 and B 22.78. The wide form from planes halves 364, 145 and 45.
TEST(YuvToRgb, PlanesTakeTheHighFormInBlocksOf16)
{
    EXPECT_EQ(interleavedFromP3({100, 90, 200}, 15), repeated({182, 73, 22}, 15));
    EXPECT_EQ(interleavedFromP3({100, 90, 200}, 16), repeated({182, 72, 22}, 16));
    EXPECT_EQ(interleavedFromP3({100, 90, 200}, 47), repeated({182, 72, 22}, 32) + repeated({182, 73, 22}, 15));
}

TEST(YuvToRgb, PlanesToPlanesAreTheSameAtEveryWidth)
{
    for (int width = 1; width <= 70; ++width) {
        EXPECT_EQ(planesFromP3(pyxiYUVToRGB_8u_P3R, {100, 90, 200}, width), planesOf({182, 73, 22}, width));
    }
}

TEST(YuvToRgb, AlphaOfTheTargetStays)
{
    for (const int width : {1, 8, 33}) {
        EXPECT_EQ(converted(pyxiYUVToRGB_8u_AC4R, {100, 90, 200, 9}, width, 4), repeated({182, 73, 23, 77}, width));
    }
}

TEST(YuvToRgb, ElementsOfArraysAreTestedAfterTheSize)
{
    u8 sample = 77;
    const u8* const src[3] = {&sample, nullptr, &sample};
    u8* const dst[4] = {&sample, &sample, nullptr, nullptr};
    EXPECT_EQ(pyxiYUVToRGB_8u_P3C3R(src, 0, &sample, 0, {0, 1}), pyxErrSize);
    EXPECT_EQ(pyxiYUVToRGB_8u_P3C3R(src, 0, &sample, 0, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiYUVToRGB_8u_P3C3R(src, 0, nullptr, 0, {0, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYUV_8u_C3P3R(&sample, 0, dst, 0, {1, 0}), pyxErrSize);
    EXPECT_EQ(pyxiRGBToYUV_8u_C3P3R(&sample, 0, dst, 0, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYUV_8u_AC4P4R(&sample, 0, dst, 0, {1, 0}), pyxErrSize);
    EXPECT_EQ(pyxiRGBToYUV_8u_AC4P4R(&sample, 0, dst, 0, {1, 1}), pyxErrNullPtr);
    EXPECT_EQ(sample, 77);
}
