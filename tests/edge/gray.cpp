// Gray: weights that add up to more than 1, the order of fused sums, steps of signed words, rounding modes.
#include "pyxcc/gray.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <cfenv>
#include <cstring>
#include <vector>

using namespace edge;

namespace
{

/// One pixel of three floats.
f32 grayOf(f32 r, f32 g, f32 b, const f32* coeffs)
{
    const f32 source[3] = {r, g, b};
    f32 target = -1;
    EXPECT_EQ(pyxiColorToGray_32f_C3C1R(source, 12, &target, 4, {1, 1}, coeffs), pyxOk);
    return target;
}

/// One pixel of three words in a rounding mode.
u16 grayIn(int mode, u16 r, const f32* coeffs)
{
    const u16 source[3] = {r, 0, 0};
    u16 target = 77;
    std::fesetround(mode);
    const PyxStatus status = pyxiColorToGray_16u_C3C1R(source, 6, &target, 2, {1, 1}, coeffs);
    std::fesetround(FE_TONEAREST);
    EXPECT_EQ(status, pyxOk);
    return target;
}

} // namespace

// The high words of 65280 and the weights 9798, 19235 and 3736 are 9759, 19159 and 3721, of which with 64 the sum is
// 32703, and 32703 >> 7 = 255. In the tail (255 * 32769 + 16384) >> 15 = 255.
TEST(Gray, WhiteIs255InBothForms)
{
    for (const int width : {1, 15, 16, 17, 31, 32, 33, 63}) {
        const Samples three(3 * width, 255), four(4 * width, 255), white(width, 255);
        Samples target(width);
        EXPECT_EQ(pyxiRGBToGray_8u_C3C1R(three.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, white);
        target.assign(width, 0);
        EXPECT_EQ(pyxiRGBToGray_8u_AC4C1R(four.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, white);
    }
}

// Three times 255 is 765, of which the low byte is 253.
TEST(Gray, BrightPixelsSaturateInBlocksAndWrapInTheTail)
{
    const f32 ones[3] = {1, 1, 1};
    const Samples source(3 * 47, 255);
    for (const int width : {15, 16, 33, 47}) {
        Samples target(width);
        EXPECT_EQ(pyxiColorToGray_8u_C3C1R(source.data(), 0, target.data(), 0, {width, 1}, ones), pyxOk);
        EXPECT_EQ(target, Samples(width & ~15, 255) + Samples(width & 15, 253));
    }
}

TEST(Gray, AlphaDoesNotMatter)
{
    const f32 coeffs[3] = {0.25f, 0.5f, 0.25f};
    for (const u8 alpha : {0, 1, 128, 255}) {
        const Samples source = repeated({40, 80, 120, alpha}, 35);
        Samples target(35);
        EXPECT_EQ(pyxiColorToGray_8u_AC4C1R(source.data(), 0, target.data(), 0, {35, 1}, coeffs), pyxOk);
        EXPECT_EQ(target, Samples(35, 80));
    }
}

TEST(Gray, DefaultWeightsAreThoseOfTheNullPointer)
{
    const f32 weights[3] = {0.299f, 0.587f, 0.114f};
    Samples source;
    for (int i = 0; i < 3 * 50; ++i) source.push_back(static_cast<u8>(i * 37));
    Samples fixed(50), given(50), null(50);
    EXPECT_EQ(pyxiRGBToGray_8u_C3C1R(source.data(), 0, fixed.data(), 0, {50, 1}), pyxOk);
    EXPECT_EQ(pyxiColorToGray_8u_C3C1R(source.data(), 0, given.data(), 0, {50, 1}, weights), pyxOk);
    EXPECT_EQ(pyxiColorToGray_8u_C3C1R(source.data(), 0, null.data(), 0, {50, 1}, nullptr), pyxOk);
    EXPECT_EQ(given, fixed);
    EXPECT_EQ(null, fixed);
    EXPECT_EQ(grayOf(1, 0, 0, nullptr), 0.299f);
    EXPECT_EQ(grayOf(0, 1, 0, nullptr), 0.587f);
    EXPECT_EQ(grayOf(0, 0, 1, nullptr), 0.114f);
}

TEST(Gray, DefaultWeightsOfDoublesAreTheFloats)
{
    const f64 red[3] = {1, 0, 0};
    f64 target = 0;
    EXPECT_EQ(pyxiColorToGray_64f_C3C1R(red, 24, &target, 8, {1, 1}, nullptr), pyxOk);
    EXPECT_EQ(target, 0x1.322d0ep-2);
}

// (1 + e)^2 is 1 + 2 e + e^2, and with e = 2^-12 a float drops e^2. Green is rounded before it is added, red and blue
// are not.
TEST(Gray, TheMiddleTermIsRoundedTheOthersAreFused)
{
    constexpr f32 a = 1 + 0x1p-12f, b = 1 + 0x1p-11f;
    const f32 green[3] = {-1, a, 0}, red[3] = {a, -1, 0}, blue[3] = {0, -1, a};
    EXPECT_EQ(grayOf(b, a, 0, green), 0);
    EXPECT_EQ(grayOf(a, b, 0, red), 0x1p-24f);
    EXPECT_EQ(grayOf(0, b, a, blue), 0x1p-24f);
}

TEST(Gray, FloatsAreNotClamped)
{
    const f32 ones[3] = {1, 1, 1};
    EXPECT_EQ(grayOf(2, 3, 4, ones), 9);
    EXPECT_EQ(grayOf(-2, -3, -4, ones), -9);
}

TEST(Gray, WordsSaturate)
{
    const f32 ones[3] = {1, 1, 1};
    const u16 bright[3] = {65535, 65535, 65535};
    u16 target = 0;
    EXPECT_EQ(pyxiColorToGray_16u_C3C1R(bright, 6, &target, 2, {1, 1}, ones), pyxOk);
    EXPECT_EQ(target, 65535);
    // Distances from the lower bound: twice 32767 + 32768 is beyond the range, and three times 0 is not.
    const s16 signedBright[3] = {32767, 32767, -32768}, dark[3] = {-32768, -32768, -32768};
    s16 signedTarget = 0;
    EXPECT_EQ(pyxiColorToGray_16s_C3C1R(signedBright, 6, &signedTarget, 2, {1, 1}, ones), pyxOk);
    EXPECT_EQ(signedTarget, 32767);
    EXPECT_EQ(pyxiColorToGray_16s_C3C1R(dark, 6, &signedTarget, 2, {1, 1}, ones), pyxOk);
    EXPECT_EQ(signedTarget, -32768);
}

TEST(Gray, WordsFollowTheRoundingMode)
{
    const f32 half[3] = {0.5f, 0, 0};
    EXPECT_EQ(grayIn(FE_TONEAREST, 1, half), 0);
    EXPECT_EQ(grayIn(FE_TONEAREST, 3, half), 2);
    EXPECT_EQ(grayIn(FE_UPWARD, 1, half), 1);
    EXPECT_EQ(grayIn(FE_DOWNWARD, 3, half), 1);
    EXPECT_EQ(grayIn(FE_TOWARDZERO, 3, half), 1);
}

TEST(Gray, OddStepsOfSignedWordsLoseAByte)
{
    const f32 ones[3] = {1, 0, 0};
    const s16 first[3] = {100, 0, 0}, second[3] = {200, 0, 0};
    std::vector<u8> source(32, 0), target(8, 77);
    std::memcpy(source.data() + 16, first, 6);
    const auto rowAt = [&](int offset) {
        std::vector<u8> bytes = source;
        std::memcpy(bytes.data() + offset, second, 6);
        return bytes;
    };
    const auto sampleAt = [&](int offset) {
        s16 sample;
        std::memcpy(&sample, target.data() + offset, 2);
        return sample;
    };
    // 7 bytes are 3 samples of 2, and -7 bytes are -4; a target step of 3 is one sample.
    const auto convert = [&](const std::vector<u8>& bytes, int step) {
        const s16* const start = reinterpret_cast<const s16*>(bytes.data() + 16);
        return pyxiColorToGray_16s_C3C1R(start, step, reinterpret_cast<s16*>(target.data()), 3, {1, 2}, ones);
    };
    EXPECT_EQ(convert(rowAt(22), 7), pyxOk);
    EXPECT_EQ(sampleAt(0), 100);
    EXPECT_EQ(sampleAt(2), 200);
    target.assign(8, 77);
    EXPECT_EQ(convert(rowAt(8), -7), pyxOk);
    EXPECT_EQ(sampleAt(0), 100);
    EXPECT_EQ(sampleAt(2), 200);
}

TEST(Gray, OddStepsOfUnsignedWordsStay)
{
    const f32 ones[3] = {1, 0, 0};
    const u16 first[3] = {100, 0, 0}, second[3] = {200, 0, 0};
    u8 source[16] = {}, target[5] = {};
    std::memcpy(source, first, 6);
    std::memcpy(source + 7, second, 6);
    const u16* const src = reinterpret_cast<const u16*>(source);
    EXPECT_EQ(pyxiColorToGray_16u_C3C1R(src, 7, reinterpret_cast<u16*>(target), 3, {1, 2}, ones), pyxOk);
    EXPECT_EQ(Samples(target, target + 5), (Samples{100, 0, 0, 200, 0}));
}

TEST(Gray, EveryChannelOfAPixelIsTheSample)
{
    for (const int width : {1, 3, 4, 35}) {
        Samples source, three, four;
        for (int i = 0; i < width; ++i) {
            const u8 g = static_cast<u8>(10 + i);
            source.push_back(g);
            three = three + Samples{g, g, g};
            four = four + Samples{g, g, g, 7};
        }
        Samples target(3 * width), targetWithAlpha(4 * width);
        EXPECT_EQ(pyxiGrayToRGB_8u_C1C3R(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, three);
        EXPECT_EQ(pyxiGrayToRGB_8u_C1C4R(source.data(), 0, targetWithAlpha.data(), 0, {width, 1}, 7), pyxOk);
        EXPECT_EQ(targetWithAlpha, four);
    }
}

TEST(Gray, LumaOfOnePackedPixel)
{
    const u8 source[2] = {55, 66};
    u8 target[2] = {77, 77};
    EXPECT_EQ(pyxiYCbCr422ToGray_8u_C2C1R(source, 2, target, 1, {1, 1}), pyxOk);
    EXPECT_EQ(target[0], 55);
    EXPECT_EQ(target[1], 77);
}

TEST(Gray, LumaOfAnOddWidth)
{
    Samples source, luma;
    for (int i = 0; i < 37; ++i) {
        source = source + Samples{static_cast<u8>(i), 200};
        luma.push_back(static_cast<u8>(i));
    }
    Samples target(37);
    EXPECT_EQ(pyxiYCbCr422ToGray_8u_C2C1R(source.data(), 74, target.data(), 37, {37, 1}), pyxOk);
    EXPECT_EQ(target, luma);
}
