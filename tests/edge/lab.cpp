// RGB and L*a*b*: colours worked out by the definition, what has no linear segment, what is not clamped.
#include "pyxcc/pyxcc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <vector>

using namespace edge;

namespace
{

using Words = std::vector<u16>;
using Floats = std::vector<f32>;

template <typename D, typename S>
std::vector<D> rowOf(PyxStatus (*convert)(const S*, int, D*, int, RoiSize), const std::vector<S>& pixel, int width)
{
    std::vector<S> source;
    for (int i = 0; i < width; ++i) source.insert(source.end(), pixel.begin(), pixel.end());
    std::vector<D> target(source.size());
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// Expects every pixel of a row to be this one, in the blocks of the row and after them.
template <typename D, typename S>
void expectEach(PyxStatus (*convert)(const S*, int, D*, int, RoiSize), const std::vector<S>& pixel,
                const std::vector<D>& expected)
{
    for (const int width : {1, 7, 8, 13, 35}) {
        const std::vector<D> row = rowOf(convert, pixel, width);
        for (std::size_t i = 0; i < row.size(); ++i) EXPECT_EQ(row[i], expected[i % 3]) << width << ", " << i;
    }
}

void expectEachNear(PyxStatus (*convert)(const f32*, int, f32*, int, RoiSize), const Floats& pixel,
                    const Floats& expected, f32 tolerance)
{
    for (const int width : {1, 7, 8, 13, 35}) {
        const Floats row = rowOf(convert, pixel, width);
        for (std::size_t i = 0; i < row.size(); ++i)
            EXPECT_NEAR(row[i], expected[i % 3], tolerance) << width << ", " << i;
    }
}

} // namespace

// f is 0.13793103 three times, so that the differences are 0.
TEST(Lab, Black)
{
    expectEach<u8, u8>(pyxiRGBToLab_8u_C3R, {0, 0, 0}, {0, 128, 128});
    expectEach<u8, u8>(pyxiBGRToLab_8u_C3R, {0, 0, 0}, {0, 128, 128});
    expectEach<u16, u8>(pyxiBGRToLab_8u16u_C3R, {0, 0, 0}, {0, 32640, 32640});
    expectEach<f32, f32>(pyxiRGBToLab_32f_C3R, {0, 0, 0}, {0, 0, 0});
    expectEach<f32, f32>(pyxiBGRToLab_32f_C3R, {0, 0, 0}, {0, 0, 0});
}

TEST(Lab, White)
{
    expectEach<u8, u8>(pyxiRGBToLab_8u_C3R, {255, 255, 255}, {255, 128, 128});
    expectEach<u8, u8>(pyxiBGRToLab_8u_C3R, {255, 255, 255}, {255, 128, 128});
    expectEach<u16, u8>(pyxiBGRToLab_8u16u_C3R, {255, 255, 255}, {65535, 32640, 32640});
    expectEachNear(pyxiRGBToLab_32f_C3R, {1, 1, 1}, {100, 0, 0}, 1e-3f);
    expectEachNear(pyxiBGRToLab_32f_C3R, {1, 1, 1}, {100, 0, 0}, 1e-3f);
}

// Red is x = 0.433953, y = 0.212671, z = 0.017758, whose roots give 53.2406, 80.0942, 67.2015; in bytes 135.76, 208.09,
// 195.20 and in words 34891.2, 53064.01, 49776.4.
TEST(Lab, Red)
{
    expectEach<u8, u8>(pyxiRGBToLab_8u_C3R, {255, 0, 0}, {136, 208, 195});
    expectEach<u8, u8>(pyxiBGRToLab_8u_C3R, {0, 0, 255}, {136, 208, 195});
    expectEach<u16, u8>(pyxiBGRToLab_8u16u_C3R, {0, 0, 255}, {34891, 53064, 49776});
    expectEachNear(pyxiRGBToLab_32f_C3R, {1, 0, 0}, {53.2406f, 80.0942f, 67.2015f}, 1e-3f);
    expectEachNear(pyxiBGRToLab_32f_C3R, {0, 0, 1}, {53.2406f, 80.0942f, 67.2015f}, 1e-3f);
    expectEachNear(pyxiLabToRGB_32f_C3R, {53.2406f, 80.0942f, 67.2015f}, {1, 0, 0}, 1e-3f);
    expectEachNear(pyxiLabToBGR_32f_C3R, {53.2406f, 80.0942f, 67.2015f}, {0, 0, 1}, 1e-3f);
}

// Blue of 31: y = 0.008773 is below the limit, x = 0.023077 and z = 0.106101 are above it. L* = 903.3 y = 7.9251,
// a* = 500 (0.284703 - 0.206249) = 39.227, b* = 200 (0.206249 - 0.473411) = -53.4325.
TEST(Lab, EachRootHasALimitOfItsOwn)
{
    expectEach<u8, u8>(pyxiRGBToLab_8u_C3R, {0, 0, 31}, {20, 167, 75});
    expectEach<u8, u8>(pyxiBGRToLab_8u_C3R, {31, 0, 0}, {20, 167, 75});
    expectEach<u16, u8>(pyxiBGRToLab_8u16u_C3R, {31, 0, 0}, {5194, 42643, 19015});
    expectEachNear(pyxiRGBToLab_32f_C3R, {0, 0, 31 / 255.0f}, {7.9251f, 39.2270f, -53.4325f}, 1e-3f);
}

// Black comes back as (16 / 116)^3 = 0.0026241, which is 0.669 in bytes.
TEST(Lab, ThereIsNoLinearSegmentOnTheWayBack)
{
    expectEach<u8, u8>(pyxiLabToRGB_8u_C3R, {0, 128, 128}, {1, 1, 1});
    expectEach<u8, u8>(pyxiLabToBGR_8u_C3R, {0, 128, 128}, {1, 1, 1});
    expectEach<u8, u16>(pyxiLabToBGR_16u8u_C3R, {0, 32640, 32640}, {1, 1, 1});
    expectEachNear(pyxiLabToRGB_32f_C3R, {0, 0, 0}, {0.0026241f, 0.0026241f, 0.0026241f}, 1e-6f);
}

// (50, 100, 0) is x = 0.454703, y = z = 0.184184 of white: 1.01734, -0.06502, 0.19849. (120, 0, 0) is (136 / 116)^3.
TEST(Lab, FloatsAreNotClamped)
{
    expectEachNear(pyxiLabToRGB_32f_C3R, {50, 100, 0}, {1.01734f, -0.06502f, 0.19849f}, 1e-4f);
    expectEachNear(pyxiLabToBGR_32f_C3R, {50, 100, 0}, {0.19849f, -0.06502f, 1.01734f}, 1e-4f);
    expectEachNear(pyxiLabToRGB_32f_C3R, {120, 0, 0}, {1.61155f, 1.61155f, 1.61154f}, 1e-4f);
}

// In bytes (50, 100, 0) is L = 127.5; 128 and 228 are (50.196, 100, 0), still beyond red and below green.
TEST(Lab, BytesAreClamped)
{
    for (const int width : {5, 8}) {
        const Samples rgb = rowOf<u8, u8>(pyxiLabToRGB_8u_C3R, {128, 228, 128}, width);
        const Samples bgr = rowOf<u8, u8>(pyxiLabToBGR_8u_C3R, {128, 228, 128}, width);
        const Samples fromWords = rowOf<u8, u16>(pyxiLabToBGR_16u8u_C3R, {32896, 58140, 32640}, width);
        for (std::size_t i = 0; i < rgb.size(); i += 3) {
            EXPECT_EQ(rgb[i], 255);
            EXPECT_EQ(rgb[i + 1], 0);
            EXPECT_EQ(bgr[i + 2], 255);
            EXPECT_EQ(bgr[i + 1], 0);
            EXPECT_EQ(fromWords[i + 2], 255);
            EXPECT_EQ(fromWords[i + 1], 0);
        }
    }
}

TEST(Lab, StepsAreBytesAtEveryDepth)
{
    // A row of one pixel of three words takes 6 bytes, and the next row starts at the ninth.
    const Samples source(6, 0);
    std::vector<u8> target(16, 77);
    const int status = pyxiBGRToLab_8u16u_C3R(source.data(), 3, reinterpret_cast<u16*>(target.data()), 8, {1, 2});
    EXPECT_EQ(status, pyxOk);
    EXPECT_EQ(target, (std::vector<u8>{0, 0, 128, 127, 128, 127, 77, 77, 0, 0, 128, 127, 128, 127, 77, 77}));
}
