// RGB and L*u*v*: colours worked out by the definition, black and what is next to it, how each depth rounds, alpha.
#include "pyxcc/pyxcc.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

template <typename T> using Conversion = PyxStatus (*)(const T*, int, T*, int, RoiSize);

/// What the samples of a target hold before the call.
constexpr int untouched = 77;

/// A row of equal pixels, of three samples or of four.
template <typename T> std::vector<T> rowOf(Conversion<T> convert, const std::vector<T>& pixel, int width)
{
    std::vector<T> source;
    for (int i = 0; i < width; ++i) source.insert(source.end(), pixel.begin(), pixel.end());
    std::vector<T> target(source.size(), static_cast<T>(untouched));
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// The pixels of a row: those of whole blocks, then those after them.
template <typename T>
void expectSpans(Conversion<T> convert, const std::vector<T>& pixel, int block, const std::vector<T>& inBlocks,
                 const std::vector<T>& after)
{
    for (const int width : {1, 3, 4, 6, 8, 13, 35}) {
        const std::vector<T> row = rowOf(convert, pixel, width);
        const std::size_t count = pixel.size(), end = count * static_cast<std::size_t>(width / block * block);
        for (std::size_t i = 0; i < row.size(); ++i)
            EXPECT_EQ(row[i], (i < end ? inBlocks : after)[i % count]) << width << ", " << i;
    }
}

template <typename T>
void expectEach(Conversion<T> convert, const std::vector<T>& pixel, const std::vector<T>& expected)
{
    expectSpans(convert, pixel, 1, expected, expected);
}

void expectEachNear(Conversion<f32> convert, const std::vector<f32>& pixel, const std::vector<f32>& expected,
                    f32 tolerance)
{
    for (const int width : {1, 3, 4, 6, 8, 13, 35}) {
        const std::vector<f32> row = rowOf(convert, pixel, width);
        for (std::size_t i = 0; i < row.size(); ++i)
            EXPECT_NEAR(row[i], expected[i % pixel.size()], tolerance) << width << ", " << i;
    }
}

/// The words of 16 bits, moved down.
std::vector<s16> moved(const std::vector<u16>& words)
{
    std::vector<s16> result;
    for (const u16 word : words) result.push_back(static_cast<s16>(word - 32768));
    return result;
}

/// The same with a fourth sample, which stays.
template <typename T> std::vector<T> withFourth(std::vector<T> pixel)
{
    pixel.push_back(static_cast<T>(untouched));
    return pixel;
}

} // namespace

// u* and v* are 0: 134 * 0.720339 = 96.5 and 140 * 0.9732825 = 136.3 in bytes, 24807.03 and 35018.7 in words.
TEST(Luv, Black)
{
    expectEach<u8>(pyxiRGBToLUV_8u_C3R, {0, 0, 0}, {0, 97, 136});
    expectEach<u8>(pyxiBGRToLUV_8u_C3R, {0, 0, 0}, {0, 97, 136});
    expectEach<u8>(pyxiRGBToLUV_8u_AC4R, {0, 0, 0, 9}, {0, 97, 136, untouched});
    const std::vector<u16> words = {0, 24807, 35019};
    expectEach<u16>(pyxiRGBToLUV_16u_C3R, {0, 0, 0}, words);
    expectEach<u16>(pyxiRGBToLUV_16u_AC4R, {0, 0, 0, 9}, withFourth(words));
    expectEach<s16>(pyxiRGBToLUV_16s_C3R, {-32768, -32768, -32768}, moved(words));
    expectEach<s16>(pyxiRGBToLUV_16s_AC4R, {-32768, -32768, -32768, 9}, withFourth(moved(words)));
    expectEach<f32>(pyxiRGBToLUV_32f_C3R, {0, 0, 0}, {0, 0, 0});
    expectEach<f32>(pyxiBGRToLUV_32f_C3R, {0, 0, 0}, {0, 0, 0});
    expectEach<f32>(pyxiRGBToLUV_32f_AC4R, {0, 0, 0, 9}, {0, 0, 0, untouched});
}

// Red: L* = 116 * 0.212671^(1/3) - 16 = 53.2406, u' = 0.450704 and v' = 0.522888, u* = 175.015, v* = 37.752. In bytes
// 135.76, 222.60, 173.003; the conversion that cuts L* off has 135 for it.
TEST(Luv, Red)
{
    expectEach<u8>(pyxiRGBToLUV_8u_C3R, {255, 0, 0}, {136, 223, 173});
    expectEach<u8>(pyxiBGRToLUV_8u_C3R, {0, 0, 255}, {136, 223, 173});
    expectEach<u8>(pyxiRGBToLUV_8u_AC4R, {255, 0, 0, 9}, {135, 223, 173, untouched});
    expectEachNear(pyxiRGBToLUV_32f_C3R, {1, 0, 0}, {53.2406f, 175.0150f, 37.7522f}, 2e-2f);
    expectEachNear(pyxiBGRToLUV_32f_C3R, {0, 0, 1}, {53.2406f, 175.0150f, 37.7522f}, 2e-2f);
    expectEachNear(pyxiRGBToLUV_32f_AC4R, {1, 0, 0, 9}, {53.2406f, 175.0150f, 37.7522f, untouched}, 2e-2f);
    expectEachNear(pyxiLUVToRGB_32f_C3R, {53.2406f, 175.0150f, 37.7522f}, {1, 0, 0}, 1e-3f);
    expectEachNear(pyxiLUVToBGR_32f_C3R, {53.2406f, 175.0150f, 37.7522f}, {0, 0, 1}, 1e-3f);
    expectEachNear(pyxiLUVToRGB_32f_AC4R, {53.2406f, 175.0150f, 37.7522f, 9}, {1, 0, 0, untouched}, 1e-3f);
}

// (25700, 38550, 12850) has L* = 77.17509, which is 50576.70.
TEST(Luv, LightnessOfWordsIsCutOffAfterTheBlocksOfOneConversion)
{
    const auto lightness = [](auto row, std::size_t pixelSize) {
        decltype(row) result;
        for (std::size_t i = 0; i < row.size(); i += pixelSize) result.push_back(row[i]);
        return result;
    };
    const std::vector<u16> colour = {25700, 38550, 12850}, colour4 = {25700, 38550, 12850, 9};
    EXPECT_EQ(lightness(rowOf<u16>(pyxiRGBToLUV_16u_C3R, colour, 6), 3), std::vector<u16>(6, 50577));
    EXPECT_EQ(lightness(rowOf<u16>(pyxiRGBToLUV_16u_AC4R, colour4, 6), 4),
              (std::vector<u16>{50577, 50577, 50577, 50577, 50576, 50576}));
    EXPECT_EQ(lightness(rowOf<s16>(pyxiRGBToLUV_16s_C3R, moved(colour), 6), 3), std::vector<s16>(6, 17809));
    EXPECT_EQ(lightness(rowOf<s16>(pyxiRGBToLUV_16s_AC4R, moved(colour4), 6), 4), std::vector<s16>(6, 17809));
}

// With R = 0.950227 and B = -0.019334 Z is the difference of two equal products. Y = 0.2006904, L* = 51.9152, and with
// fractions of 0 u* = -0.197839 * 13 L* = -133.521 and v* = -0.468342 * 13 L* = -316.083. In a block the sum of X and
// 15 Y divides: 175.005 and 42.577.
TEST(Luv, FractionsAreTakenForZeroWhereZIs)
{
    const std::vector<f32> pixel = {0.950227f, 0.0f, -0.019334f, 9};
    const std::vector<f32> row = rowOf<f32>(pyxiRGBToLUV_32f_AC4R, pixel, 5);
    for (std::size_t i = 0; i < 4; ++i) {
        EXPECT_NEAR(row[4 * i], 51.9152f, 1e-2f);
        EXPECT_NEAR(row[4 * i + 1], 175.005f, 2e-2f);
        EXPECT_NEAR(row[4 * i + 2], 42.577f, 2e-2f);
    }
    EXPECT_NEAR(row[16], 51.9152f, 1e-2f);
    EXPECT_NEAR(row[17], -133.521f, 2e-2f);
    EXPECT_NEAR(row[18], -316.083f, 2e-2f);
}

// Without the bound the row of the table would be read past its end: Y of white is 1 or just above it.
TEST(Luv, WhiteOfFloats)
{
    expectEachNear(pyxiRGBToLUV_32f_AC4R, {1, 1, 1, 9}, {100, 0, 0, untouched}, 1e-2f);
    expectEachNear(pyxiRGBToLUV_32f_C3R, {1, 1, 1}, {100, 0, 0}, 1e-2f);
}

TEST(Luv, NextToNoLightnessIsBlackWhateverTheRest)
{
    for (const f32 l : {0.0f, 8e-5f, -3.0f}) {
        expectEach<f32>(pyxiLUVToRGB_32f_C3R, {l, 50, -50}, {0, 0, 0});
        expectEach<f32>(pyxiLUVToBGR_32f_C3R, {l, -50, 90}, {0, 0, 0});
        expectEach<f32>(pyxiLUVToRGB_32f_AC4R, {l, 50, -50, 9}, {0, 0, 0, untouched});
    }
    expectEach<u8>(pyxiLUVToRGB_8u_C3R, {0, 200, 10}, {0, 0, 0});
    expectEach<u8>(pyxiLUVToBGR_8u_C3R, {0, 10, 250}, {0, 0, 0});
    expectEach<u8>(pyxiLUVToRGB_8u_AC4R, {0, 200, 10, 9}, {0, 0, 0, untouched});
    expectEach<u16>(pyxiLUVToRGB_16u_C3R, {0, 60000, 10}, {0, 0, 0});
    expectEach<u16>(pyxiLUVToRGB_16u_AC4R, {0, 60000, 10, 9}, {0, 0, 0, untouched});
    expectEach<s16>(pyxiLUVToRGB_16s_C3R, {-32768, 30000, -30000}, {-32768, -32768, -32768});
    expectEach<s16>(pyxiLUVToRGB_16s_AC4R, {-32768, 30000, -30000, 9}, {-32768, -32768, -32768, untouched});
}

// (100, 200, 0): u' = 0.351685 and v' = 0.468342, X = 1.689526, Z = 0.842446: 3.51787, 0.27338, 0.78064. (50, -150,
// 20): -0.46907, 0.38015, 0.16736.
TEST(Luv, FloatsAreClamped)
{
    expectEachNear(pyxiLUVToRGB_32f_C3R, {100, 200, 0}, {1, 0.27338f, 0.78064f}, 1e-4f);
    expectEachNear(pyxiLUVToBGR_32f_C3R, {50, -150, 20}, {0.16736f, 0.38015f, 0}, 1e-4f);
    expectEachNear(pyxiLUVToRGB_32f_AC4R, {100, 200, 0, 9}, {1, 0.27338f, 0.78064f, untouched}, 1e-4f);
    for (const int width : {1, 8}) {
        EXPECT_EQ(rowOf<f32>(pyxiLUVToRGB_32f_C3R, {100, 200, 0}, width)[0], 1.0f);
        EXPECT_EQ(rowOf<f32>(pyxiLUVToRGB_32f_C3R, {50, -150, 20}, width)[0], 0.0f);
    }
}

// (100, 120, 140) is L* = 39.2157, u* = 32.5882, v* = 3.8431: 55.80, 19.62, 22.21 of 255. It is rounded, but for the
// blocks of pixels with alpha.
TEST(Luv, BytesAreCutOffInBlocksWithAlpha)
{
    expectEach<u8>(pyxiLUVToRGB_8u_C3R, {100, 120, 140}, {56, 20, 22});
    expectEach<u8>(pyxiLUVToBGR_8u_C3R, {100, 120, 140}, {22, 20, 56});
    expectSpans<u8>(pyxiLUVToRGB_8u_AC4R, {100, 120, 140, 9}, 4, {55, 19, 22, untouched}, {56, 20, 22, untouched});
}

// (12000, 24807, 35019) is L* = 18.31083 with next to no u* and v*: 1695.84, 1695.89, 1695.76 of 65535.
TEST(Luv, WordsAreCutOffInBlocks)
{
    const std::vector<u16> colour = {12000, 24807, 35019}, inBlocks = {1695, 1695, 1695}, after = {1696, 1696, 1696};
    expectSpans<u16>(pyxiLUVToRGB_16u_C3R, colour, 4, inBlocks, after);
    expectSpans<u16>(pyxiLUVToRGB_16u_AC4R, withFourth(colour), 4, withFourth(inBlocks), withFourth(after));
    expectSpans<s16>(pyxiLUVToRGB_16s_C3R, moved(colour), 4, moved(inBlocks), moved(after));
    expectSpans<s16>(pyxiLUVToRGB_16s_AC4R, withFourth(moved(colour)), 4, withFourth(moved(inBlocks)),
                     withFourth(moved(after)));
}

TEST(Luv, StepsOfWholeSamplesLoseTheirLowBits)
{
    // Rows of one pixel of three words, which are 6 bytes; of four floats, which are 16.
    const std::vector<u16> words = {0, 1, 2, 0, 3, 4};
    std::vector<u16> target(6, untouched);
    EXPECT_EQ(pyxiLUVToRGB_16u_C3R(words.data(), 7, target.data(), 7, {1, 2}), pyxOk);
    EXPECT_EQ(target, std::vector<u16>(6, 0));
    const std::vector<f32> floats(8, 0.0f);
    std::vector<f32> floatTarget(8, untouched);
    EXPECT_EQ(pyxiLUVToRGB_32f_AC4R(floats.data(), 19, floatTarget.data(), 18, {1, 2}), pyxOk);
    EXPECT_EQ(floatTarget, (std::vector<f32>{0, 0, 0, untouched, 0, 0, 0, untouched}));
}
