// Gamma: single values, the border between the curve and its table, bounds, and what is kept.
#include "pyxcc/gamma.h"

#include <gtest/gtest.h>

#include <array>
#include <limits>
#include <vector>

namespace
{

/// What a row of three like samples becomes.
template <class T, class Function> T mapped(Function function, T sample)
{
    const std::array<T, 3> source = {sample, sample, sample};
    std::array<T, 3> target = {};
    EXPECT_EQ(function(source.data(), sizeof source, target.data(), sizeof target, {1, 1}), pyxOk);
    EXPECT_EQ(target[0], target[1]);
    EXPECT_EQ(target[0], target[2]);
    return target[0];
}

} // namespace

TEST(Gamma, BytesNearBlackAndWhite)
{
    // 4.5 v rounded to even up to 4: 4.5 to 4, 13.5 to 14, 22.5 past the linear part by the power.
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 0), 0);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 1), 4);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 2), 9);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 3), 14);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 4), 18);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 5), 23);
    EXPECT_EQ(mapped<u8>(pyxiGammaFwd_8u_C3R, 255), 255);
    EXPECT_EQ(mapped<u8>(pyxiGammaInv_8u_C3R, 0), 0);
    EXPECT_EQ(mapped<u8>(pyxiGammaInv_8u_C3R, 3), 1);
    EXPECT_EQ(mapped<u8>(pyxiGammaInv_8u_C3R, 7), 2);
    EXPECT_EQ(mapped<u8>(pyxiGammaInv_8u_C3R, 255), 255);
}

TEST(Gamma, WordsNearBlackAndWhite)
{
    // 4.5 + 0.5 is 5 exactly, odd, and brought down; 13.5 + 0.5 is 14, even, and stays.
    EXPECT_EQ(mapped<u16>(pyxiGammaFwd_16u_C3R, 0), 0);
    EXPECT_EQ(mapped<u16>(pyxiGammaFwd_16u_C3R, 1), 4);
    EXPECT_EQ(mapped<u16>(pyxiGammaFwd_16u_C3R, 3), 14);
    EXPECT_EQ(mapped<u16>(pyxiGammaFwd_16u_C3R, 65535), 65535);
}

TEST(Gamma, LargestImageByCurveAndSmallestByTableAgree)
{
    // 21845 pixels are 65535 samples, 21846 are 65538.
    constexpr int width = 21846;
    std::vector<u16> source(3 * width), byTable(3 * width), byCurve(3 * width);
    for (int i = 0; i < 3 * width; ++i) source[i] = static_cast<u16>(i * 40503);
    for (const auto function : {pyxiGammaFwd_16u_C3R, pyxiGammaInv_16u_C3R}) {
        ASSERT_EQ(function(source.data(), 6 * width, byTable.data(), 6 * width, {width, 1}), pyxOk);
        ASSERT_EQ(function(source.data(), 6 * width, byCurve.data(), 6 * width, {width - 1, 1}), pyxOk);
        ASSERT_EQ(function(source.data() + 3 * (width - 1), 6, byCurve.data() + 3 * (width - 1), 6, {1, 1}), pyxOk);
        EXPECT_EQ(byTable, byCurve);
    }
}

TEST(Gamma, BoundsAreTestedBeforeAll)
{
    f32 pixel[3] = {};
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(pixel, 12, pixel, 12, {1, 1}, 2, 2), pyxErrRange);
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(nullptr, 12, pixel, 12, {1, 1}, 2, 2), pyxErrRange);
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(nullptr, 0, nullptr, 0, {0, 0}, 2, 1), pyxErrRange);
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(nullptr, 0, nullptr, 0, {0, 0}, 1, 2), pyxErrNullPtr);
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(pixel, 0, pixel, 0, {0, 0}, 1, 2), pyxErrSize);
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(pixel, 0, pixel, 0, {1, 1}, 1, 2), pyxErrStep);
}

TEST(Gamma, NaNAmongTheBoundsPassesAndShows)
{
    constexpr f32 nan = std::numeric_limits<f32>::quiet_NaN();
    const f32 source[3] = {0, 0.5f, 1};
    f32 target[3] = {};
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(source, 12, target, 12, {1, 1}, nan, 1), pyxOk);
    for (const f32 sample : target) EXPECT_NE(sample, sample);
}

TEST(Gamma, BoundsMapToThemselves)
{
    const f32 source[3] = {-2, 6, -2};
    f32 target[3] = {};
    for (const auto function : {pyxiGammaFwd_32f_C3R, pyxiGammaInv_32f_C3R}) {
        EXPECT_EQ(function(source, 12, target, 12, {1, 1}, -2, 6), pyxOk);
        EXPECT_EQ(target[0], -2);
        EXPECT_FLOAT_EQ(target[1], 6);
    }
}

TEST(Gamma, BelowTheLowerBoundTheLineGoesOn)
{
    // 4.5 (s - vMin) + vMin at s = -1 and vMin = 0.
    const f32 source[3] = {-1, -2, -0.5f};
    f32 target[3] = {};
    EXPECT_EQ(pyxiGammaFwd_32f_C3R(source, 12, target, 12, {1, 1}, 0, 1), pyxOk);
    EXPECT_EQ(target[0], -4.5f);
    EXPECT_EQ(target[1], -9.0f);
    EXPECT_EQ(target[2], -2.25f);
}

TEST(Gamma, FourthSampleStays)
{
    const std::vector<u8> source(4 * 37, 5);
    std::vector<u8> target(4 * 37, 77), place(4 * 37, 5);
    EXPECT_EQ(pyxiGammaFwd_8u_AC4R(source.data(), 148, target.data(), 148, {37, 1}), pyxOk);
    EXPECT_EQ(pyxiGammaFwd_8u_AC4IR(place.data(), 148, {37, 1}), pyxOk);
    for (int x = 0; x < 37; ++x) {
        EXPECT_EQ(target[4 * x], 23);
        EXPECT_EQ(target[4 * x + 3], 77);
        EXPECT_EQ(place[4 * x + 2], 23);
        EXPECT_EQ(place[4 * x + 3], 5);
    }
    const std::vector<u16> words(4 * 37, 3);
    std::vector<u16> wordTarget(4 * 37, 777);
    EXPECT_EQ(pyxiGammaFwd_16u_AC4R(words.data(), 296, wordTarget.data(), 296, {37, 1}), pyxOk);
    for (int x = 0; x < 37; ++x) {
        EXPECT_EQ(wordTarget[4 * x + 1], 14);
        EXPECT_EQ(wordTarget[4 * x + 3], 777);
    }
}
