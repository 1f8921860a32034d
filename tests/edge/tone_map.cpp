// Tone mapping: levels, what wraps and what saturates, common memory, steps off the samples.
#include "pyxcc/tone_map.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <limits>

using namespace edge;

namespace
{

using Floats = std::vector<f32>;
constexpr f32 none = std::numeric_limits<f32>::quiet_NaN();

Samples mapped(PyxStatus (*map)(const f32*, int, u8*, int, RoiSize), const Floats& row, PyxStatus expected = pyxOk)
{
    Samples target(row.size(), 99);
    EXPECT_EQ(map(row.data(), 0, target.data(), 0, {static_cast<int>(row.size()), 1}), expected);
    return target;
}

/// A row with something else in one place.
Floats with(Floats row, int place, f32 sample)
{
    row[place] = sample;
    return row;
}

} // namespace

// 255 / 3 is 85, and 85 * 3 is 255. 255 / 41 rounds down in floats, and 41 times that to what is below 255.
TEST(ToneMap, EqualSamples)
{
    for (const int width : {1, 6, 7, 31, 32, 100}) {
        EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, Floats(width, 3)), Samples(width, 255));
        EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, Floats(width, 3)), Samples(width, 127));
        const f32 scale = 255.0f / 41.0f;
        const u8 level = scale * 41.0f < 255 ? 254 : 255;
        EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, Floats(width, 41)), Samples(width, level));
    }
}

TEST(ToneMap, DarkImagesBecomeZeros)
{
    for (const f32 dark : {0.0f, -0.0f, std::numeric_limits<f32>::min(), std::numeric_limits<f32>::denorm_min()}) {
        EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, Floats(40, dark)), Samples(40, 0));
    }
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, Floats(40, 0)), Samples(40, 0));
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, with(Floats(40, 1), 3, none)), Samples(40, 0));
    EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, with(Floats(40, 1), 39, none)), Samples(40, 0));
}

TEST(ToneMap, NegativeLevelsWarnAndWriteNothing)
{
    EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, Floats(40, -1), pyxWarnNegativeLevel), Samples(40, 99));
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, with(Floats(40, -1), 7, 20), pyxWarnNegativeLevel), Samples(40, 99));
}

// The scale is 255 / 255 by the largest sample, and by the mean 255 / (2 * 85).
TEST(ToneMap, NegativeSamplesWrapOrBecomeZero)
{
    EXPECT_EQ(mapped(pyxiToneMapLinear_32f8u_C1R, {255, -3, 3}), (Samples{255, 253, 3}));
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, {255, -3, 3}), (Samples{255, 0, 4}));
}

// The mean is 11, of which 1e6 is far above. A single 1 among 2^25 zeros makes a scale of 255 / 2 * 2^25, and the
// result does not fit 32 bits.
TEST(ToneMap, SamplesFarAboveTheMean)
{
    Floats row(100000, 1);
    row[5] = 1e6f;
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, row)[5], 255);
    row.assign(1 << 25, 0);
    row[9] = 1;
    EXPECT_EQ(mapped(pyxiToneMapMean_32f8u_C1R, row)[9], 0);
}

// Behind a NaN the search starts anew: 2 is the largest sample that counts, and 8 becomes 1020.
TEST(ToneMap, TheLargestSampleIsSoughtBehindNaN)
{
    for (const int at : {1, 20, 39, 61}) {
        Floats row(64, 2);
        row[0] = 8;
        row[at] = none;
        const Samples target = mapped(pyxiToneMapLinear_32f8u_C1R, row);
        EXPECT_EQ(target[0], 1020 % 256) << at;
        EXPECT_EQ(target[at], 0) << at;
        EXPECT_EQ(target[63], 255) << at;
    }
}

TEST(ToneMap, InPlace)
{
    for (const int width : {3, 40, 200}) {
        Floats row(width);
        for (int x = 0; x < width; ++x) row[x] = static_cast<f32>(x + 1);
        const Samples apart = mapped(pyxiToneMapMean_32f8u_C1R, row);
        auto* const same = reinterpret_cast<u8*>(row.data());
        ASSERT_EQ(pyxiToneMapMean_32f8u_C1R(row.data(), 0, same, 0, {width, 1}), pyxOk);
        EXPECT_EQ(Samples(same, same + width), apart);
    }
}

// The target begins at sample 24. The first 24 samples give 255, four of which in the place of a sample are no number,
// which gives 0. So samples 24 to 29 do; four of those zeros are sample 30, and three in front of the last byte of 1,
// 0x3f, make 0.5 of sample 31. Those behind it are read before they are overwritten.
TEST(ToneMap, ATargetAmongTheSamplesOverwritesThemInTurn)
{
    Floats row(60, 1);
    auto* const target = reinterpret_cast<u8*>(row.data() + 24);
    ASSERT_EQ(pyxiToneMapLinear_32f8u_C1R(row.data(), 0, target, 0, {40, 1}), pyxOk);
    Samples expected(40, 255);
    std::fill_n(expected.begin() + 24, 7, u8{0});
    expected[31] = 127;
    EXPECT_EQ(Samples(target, target + 40), expected);
}

// Rows are 4 bytes apart for the mapping where the step says 5 to 7, while the level is sought at the step.
TEST(ToneMap, StepsOffTheSamplesCountWithoutTheirLowBits)
{
    Floats column = {1, 2, 3, 4, 5, 6};
    Samples target(3);
    ASSERT_EQ(pyxiToneMapLinear_32f8u_C1R(column.data(), 4, target.data(), 1, {1, 3}), pyxOk);
    EXPECT_EQ(target, (Samples{85, 170, 255}));
    column.assign({1, 1, 0.5f, 0.25f});
    u8 memory[32] = {};
    std::memcpy(memory, column.data(), 16);
    const f32 level = 1; // of the sample at 0, which is larger than what lies at 5
    f32 between;
    std::memcpy(&between, memory + 5, 4);
    ASSERT_LT(between, level);
    ASSERT_EQ(pyxiToneMapLinear_32f8u_C1R(reinterpret_cast<const f32*>(memory), 5, target.data(), 1, {1, 2}), pyxOk);
    EXPECT_EQ(target[0], 255);
    EXPECT_EQ(target[1], 255); // the sample at 4
}
