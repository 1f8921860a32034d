// XYZ and YCC: white and black, clamps, alpha, rounding modes.
#include "pyxcc/xyz_ycc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cfenv>

using namespace edge;

namespace
{

template <typename T> using Pixel = std::array<T, 3>;

template <typename T> Pixel<T> converted(PyxStatus (*convert)(const T*, int, T*, int, RoiSize), Pixel<T> source)
{
    Pixel<T> target = {};
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {1, 1}), pyxOk);
    return target;
}

} // namespace

// 62288 * 255 >> 16 = 242 and 65534 * 255 >> 16 = 254. The last sum, 71352 * 255 >> 16 = 277, is clamped.
TEST(Xyz, WhiteInBytes)
{
    for (const int width : {1, 7, 8, 9, 33}) {
        const Samples source(3 * width, 255);
        Samples target(3 * width);
        EXPECT_EQ(pyxiRGBToXYZ_8u_C3R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({242, 254, 255}, width));
    }
}

TEST(Xyz, AlphaOfTheTargetStays)
{
    for (const int width : {1, 4, 9, 33}) {
        const Samples source = repeated({255, 255, 255, 9}, width);
        Samples target(4 * width, 77);
        EXPECT_EQ(pyxiRGBToXYZ_8u_AC4R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({242, 254, 255, 77}, width));
    }
}

// Y alone: red is -1.54, green 1.88 and blue -0.20.
TEST(Xyz, ColoursOutsideTheRangeAreClamped)
{
    EXPECT_EQ(converted<f32>(pyxiXYZToRGB_32f_C3R, {0, 1, 0}), (Pixel<f32>{0, 1, 0}));
    EXPECT_EQ(converted<u8>(pyxiXYZToRGB_8u_C3R, {0, 255, 0}), (Pixel<u8>{0, 255, 0}));
    EXPECT_EQ(converted<u16>(pyxiXYZToRGB_16u_C3R, {0, 65535, 0}), (Pixel<u16>{0, 65535, 0}));
    EXPECT_EQ(converted<s16>(pyxiXYZToRGB_16s_C3R, {-32768, 32767, -32768}), (Pixel<s16>{-32768, 32767, -32768}));
}

TEST(Xyz, OfFloatsZAloneIsClamped)
{
    const Pixel<f32> bright = converted<f32>(pyxiRGBToXYZ_32f_C3R, {2, 2, 2});
    EXPECT_NEAR(bright[0], 1.900912, 1e-6);
    EXPECT_NEAR(bright[1], 2, 1e-6);
    EXPECT_EQ(bright[2], 1);
    const Pixel<f32> dark = converted<f32>(pyxiRGBToXYZ_32f_C3R, {-1, -1, -1});
    EXPECT_NEAR(dark[0], -0.950456, 1e-6);
    EXPECT_NEAR(dark[1], -1, 1e-6);
    EXPECT_EQ(dark[2], 0);
}

TEST(Xyz, WhiteInWords)
{
    // 0.950456 * 65535 = 62288.1; the third sum exceeds the range.
    EXPECT_EQ(converted<u16>(pyxiRGBToXYZ_16u_C3R, {65535, 65535, 65535}), (Pixel<u16>{62288, 65535, 65535}));
    EXPECT_EQ(converted<s16>(pyxiRGBToXYZ_16s_C3R, {32767, 32767, 32767}), (Pixel<s16>{29520, 32767, 32767}));
    EXPECT_EQ(converted<s16>(pyxiRGBToXYZ_16s_C3R, {-32768, -32768, -32768}), (Pixel<s16>{-32768, -32768, -32768}));
}

// X of 1 alone makes red 3.24, green less than 0 and blue 0.056.
TEST(Xyz, WordsFollowTheRoundingMode)
{
    const auto in = [](int mode) {
        std::fesetround(mode);
        const Pixel<u16> rgb = converted<u16>(pyxiXYZToRGB_16u_C3R, {1, 0, 0});
        std::fesetround(FE_TONEAREST);
        return rgb;
    };
    EXPECT_EQ(in(FE_TONEAREST), (Pixel<u16>{3, 0, 0}));
    EXPECT_EQ(in(FE_UPWARD), (Pixel<u16>{4, 0, 1}));
    EXPECT_EQ(in(FE_DOWNWARD), (Pixel<u16>{3, 0, 0}));
    EXPECT_EQ(in(FE_TOWARDZERO), (Pixel<u16>{3, 0, 0}));
}

TEST(Ycc, BlackHasChromaOf156And137)
{
    EXPECT_EQ(converted<u8>(pyxiRGBToYCC_8u_C3R, {0, 0, 0}), (Pixel<u8>{0, 156, 137}));
    EXPECT_EQ(converted<u16>(pyxiRGBToYCC_16u_C3R, {0, 0, 0}), (Pixel<u16>{0, 40092, 35209}));
    EXPECT_EQ(converted<s16>(pyxiRGBToYCC_16s_C3R, {-32768, -32768, -32768}), (Pixel<s16>{-32768, 7324, 2441}));
    EXPECT_EQ(converted<f32>(pyxiRGBToYCC_32f_C3R, {0, 0, 0}), (Pixel<f32>{0, 0.6117647f, 0.5372549f}));
}

// 9084 * 156 and 7460 * 137 are the constants 1417104 and 1022020.
TEST(Ycc, BlackComesBack)
{
    EXPECT_EQ(converted<u8>(pyxiYCCToRGB_8u_C3R, {0, 156, 137}), (Pixel<u8>{0, 0, 0}));
    EXPECT_EQ(converted<u16>(pyxiYCCToRGB_16u_C3R, {0, 40092, 35209}), (Pixel<u16>{0, 0, 0}));
    EXPECT_EQ(converted<s16>(pyxiYCCToRGB_16s_C3R, {-32768, 7324, 2441}), (Pixel<s16>{-32768, -32768, -32768}));
    EXPECT_EQ(converted<f32>(pyxiYCCToRGB_32f_C3R, {0, 0.6117647f, 0.5372549f}), (Pixel<f32>{0, 0, 0}));
}

// Luma of white: 16382 * 255 >> 10 = 4079, and 4079 * 2921 >> 16 = 181. The differences, 510 >> 10, are 0. Back from
// it: 5564 * 181 >> 12 = 245.
TEST(Ycc, WhiteInBytes)
{
    EXPECT_EQ(converted<u8>(pyxiRGBToYCC_8u_C3R, {255, 255, 255}), (Pixel<u8>{181, 156, 137}));
    EXPECT_EQ(converted<u8>(pyxiYCCToRGB_8u_C3R, {181, 156, 137}), (Pixel<u8>{245, 245, 245}));
}

TEST(Ycc, AlphaOfTheTargetStays)
{
    for (const int width : {1, 4, 9, 33}) {
        const Samples source = repeated({255, 255, 255, 9}, width);
        Samples target(4 * width, 77);
        EXPECT_EQ(pyxiRGBToYCC_8u_AC4R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({181, 156, 137, 77}, width));
    }
}

// Chroma of 0 is below zero by 1.357 in blue and by 0.979 in red, which green gains from.
TEST(Ycc, ColoursOutsideTheRangeAreClamped)
{
    EXPECT_EQ(converted<f32>(pyxiYCCToRGB_32f_C3R, {0.5f, 0, 0}), (Pixel<f32>{0, 1, 0}));
    EXPECT_EQ(converted<u16>(pyxiYCCToRGB_16u_C3R, {32768, 0, 0}), (Pixel<u16>{0, 65535, 0}));
    EXPECT_EQ(converted<u8>(pyxiYCCToRGB_8u_C3R, {128, 0, 0}), (Pixel<u8>{0, 255, 0}));
}
