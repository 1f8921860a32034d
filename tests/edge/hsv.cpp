// HSV: grays, the circle's end, ties, body and tail. Hue and saturation of bytes go by the processor's approximate
// reciprocal, so that they are told to within its error.
#include "pyxcc/hsv.h"

#include <gtest/gtest.h>

#include <array>
#include <vector>

namespace
{

template <typename T> using Pixels = std::vector<std::array<T, 3>>;
template <typename T> using Converted = PyxStatus (*)(const T*, int, T*, int, RoiSize);

/// A row of equal pixels, converted.
template <typename T> Pixels<T> row(Converted<T> convert, std::array<T, 3> pixel, int width)
{
    const Pixels<T> source(width, pixel);
    Pixels<T> target(width);
    EXPECT_EQ(convert(source[0].data(), 0, target[0].data(), 0, {width, 1}), pyxOk);
    return target;
}

/// The same of pixels of four samples, the last of which is 9 in the source and 77 in the target.
template <typename T> Pixels<T> rowWithAlpha(Converted<T> convert, std::array<T, 3> pixel, int width)
{
    const std::vector<std::array<T, 4>> source(width, {pixel[0], pixel[1], pixel[2], 9});
    std::vector<std::array<T, 4>> target(width, {0, 0, 0, 77});
    EXPECT_EQ(convert(source[0].data(), 0, target[0].data(), 0, {width, 1}), pyxOk);
    Pixels<T> colours;
    for (const auto& p : target) {
        EXPECT_EQ(p[3], 77);
        colours.push_back({p[0], p[1], p[2]});
    }
    return colours;
}

} // namespace

TEST(Hsv, GrayHasNoHueAndNoSaturation)
{
    for (const int width : {1, 3, 4, 5, 11}) {
        for (int level = 0; level < 256; ++level) {
            const u8 v = static_cast<u8>(level);
            EXPECT_EQ(row<u8>(pyxiRGBToHSV_8u_C3R, {v, v, v}, width), Pixels<u8>(width, {0, 0, v}));
            EXPECT_EQ(rowWithAlpha<u8>(pyxiRGBToHSV_8u_AC4R, {v, v, v}, width), Pixels<u8>(width, {0, 0, v}));
            const u16 w = static_cast<u16>(257 * level);
            EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {w, w, w}, width), Pixels<u16>(width, {0, 0, w}));
        }
    }
}

TEST(Hsv, ValueIsTheLargestSample)
{
    for (const auto& pixel : row<u8>(pyxiRGBToHSV_8u_C3R, {7, 201, 100}, 7)) EXPECT_EQ(pixel[2], 201);
    for (const auto& pixel : row<u8>(pyxiRGBToHSV_8u_C3R, {7, 20, 101}, 7)) EXPECT_EQ(pixel[2], 101);
}

// Sixths of the circle at 65535 / 6 = 10922.5 each, rounded half up: whole where their number is even.
TEST(Hsv, PureColoursOfWords)
{
    constexpr u16 w = 65535;
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {w, 0, 0}, 5), Pixels<u16>(5, {0, w, w}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {w, w, 0}, 5), Pixels<u16>(5, {10923, w, w}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {0, w, 0}, 5), Pixels<u16>(5, {21845, w, w}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {0, w, w}, 5), Pixels<u16>(5, {32768, w, w}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {0, 0, w}, 5), Pixels<u16>(5, {43690, w, w}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {w, 0, w}, 5), Pixels<u16>(5, {54613, w, w}));
    EXPECT_EQ(rowWithAlpha<u16>(pyxiRGBToHSV_16u_AC4R, {w, 0, w}, 5), Pixels<u16>(5, {54613, w, w}));
}

// Half of the saturation is 32767.5 and is rounded up.
TEST(Hsv, SaturationOfWordsIsRoundedUp)
{
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {2, 1, 1}, 1), Pixels<u16>(1, {0, 32768, 2}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {4, 3, 3}, 1), Pixels<u16>(1, {0, 16384, 4}));
}

// A hue of -1 / 65535 sixths, from blue that is one above green, goes round to 65534.8 and is cut after a half is
// added.
TEST(Hsv, HueOfWordsBelowZeroGoesRound)
{
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {65535, 0, 1}, 1), Pixels<u16>(1, {65535, 65535, 65535}));
    EXPECT_EQ(row<u16>(pyxiRGBToHSV_16u_C3R, {65535, 1, 0}, 1), Pixels<u16>(1, {0, 65535, 65535}));
}

TEST(Hsv, TiesOfBytes)
{
    const std::array<u8, 3> ties[3] = {{255, 255, 0}, {0, 255, 255}, {255, 0, 255}};
    const double hues[3] = {42.5, 127.5, 212.5};
    for (int k = 0; k < 3; ++k) {
        for (const auto& pixel : row<u8>(pyxiRGBToHSV_8u_C3R, ties[k], 7)) {
            EXPECT_NEAR(pixel[0], hues[k], 1);
            EXPECT_NEAR(pixel[1], 255, 1);
            EXPECT_EQ(pixel[2], 255);
        }
    }
}

TEST(Hsv, WithoutSaturationTheChannelsAreTheValue)
{
    for (int hue = 0; hue < 256; ++hue) {
        for (const u8 v : {0, 1, 100, 255}) {
            const u8 h = static_cast<u8>(hue);
            EXPECT_EQ(row<u8>(pyxiHSVToRGB_8u_C3R, {h, 0, v}, 7), Pixels<u8>(7, {v, v, v}));
        }
        const u16 h = static_cast<u16>(257 * hue);
        EXPECT_EQ(row<u16>(pyxiHSVToRGB_16u_C3R, {h, 0, 54321}, 7), Pixels<u16>(7, {54321, 54321, 54321}));
    }
}

TEST(Hsv, TheLastHueIsTheFirst)
{
    // 200 * (1 - 100 / 255) = 121.57, and 50000 * (1 - 10000 / 65535) = 42370.49.
    for (const u8 h : {0, 255}) {
        EXPECT_EQ(row<u8>(pyxiHSVToRGB_8u_C3R, {h, 100, 200}, 7), Pixels<u8>(7, {200, 122, 122}));
        EXPECT_EQ(rowWithAlpha<u8>(pyxiHSVToRGB_8u_AC4R, {h, 100, 200}, 7), Pixels<u8>(7, {200, 122, 122}));
    }
    for (const u16 h : {0, 65535}) {
        EXPECT_EQ(row<u16>(pyxiHSVToRGB_16u_C3R, {h, 10000, 50000}, 7), Pixels<u16>(7, {50000, 42370, 42370}));
    }
}

// With a value of 255 and all of the saturation what rises is 255 times the share of its sixth, which is 6 a step, and
// what falls is that below 255. The hues are 21, 20.5, 20, 19.5, 19 and 18.5 steps of 42.5 into their sixths.
TEST(Hsv, EachSixthHasItsPlaces)
{
    const std::array<u8, 3> expected[6] = {{255, 126, 0}, {132, 255, 0}, {0, 255, 120},
                                           {0, 138, 255}, {114, 0, 255}, {255, 0, 144}};
    for (int k = 0; k < 6; ++k) {
        const u8 hue = static_cast<u8>(21 + 42 * k);
        EXPECT_EQ(row<u8>(pyxiHSVToRGB_8u_C3R, {hue, 255, 255}, 7), Pixels<u8>(7, expected[k]));
    }
}

// H = 81 is 38.5 of 42.5 into its sixth, and what falls is 193 (1 - 167 / 255 * 38.5 / 42.5) = 78.50002. In floats the
// body has 0.9058825 for the share and comes out at 78.49999; the tail has 0.90588248, of which the product is
// 114.49999 and the difference 78.50001.
TEST(Hsv, BodyAndTailRoundApart)
{
    for (const int width : {1, 3, 4, 5, 11}) {
        Pixels<u8> expected(width & ~3, {78, 193, 67});
        expected.resize(width, {79, 193, 67});
        EXPECT_EQ(row<u8>(pyxiHSVToRGB_8u_C3R, {81, 167, 193}, width), expected);
        EXPECT_EQ(rowWithAlpha<u8>(pyxiHSVToRGB_8u_AC4R, {81, 167, 193}, width), expected);
    }
}

TEST(Hsv, OddStepsOfWordsLoseAByte)
{
    const u16 source[6] = {100, 100, 100, 200, 200, 200};
    u16 target[6] = {};
    EXPECT_EQ(pyxiRGBToHSV_16u_C3R(source, 7, target, 7, {1, 2}), pyxOk);
    EXPECT_EQ(target[2], 100);
    EXPECT_EQ(target[5], 200);
}
