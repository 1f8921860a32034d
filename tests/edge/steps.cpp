// Steps of zero and below: rows are simply taken at those distances, from top to bottom.
#include "pyxcc/rgb_ycbcr.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

using namespace edge;

namespace
{

// Red, black and white, in rows too short for the wide form: (82, 90, 240), (16, 128, 128) and (235, 128, 128).
const Samples redBlackWhite = repeated({255, 0, 0}, 2) + repeated({0, 0, 0}, 2) + repeated({255, 255, 255}, 2);
const Samples red = repeated({82, 90, 240}, 2);
const Samples black = repeated({16, 128, 128}, 2);
const Samples white = repeated({235, 128, 128}, 2);

} // namespace

TEST(Steps, ZeroRepeatsASourceRow)
{
    Samples target(18);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(redBlackWhite.data(), 0, target.data(), 6, {2, 3}), pyxOk);
    EXPECT_EQ(target, red + red + red);
}

TEST(Steps, ZeroLeavesTheLastRowInTheTarget)
{
    Samples target(12, 77);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(redBlackWhite.data(), 6, target.data(), 0, {2, 3}), pyxOk);
    EXPECT_EQ(target, white + Samples(6, 77));
}

TEST(Steps, NegativeSourceStepReadsUpwards)
{
    Samples target(18);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(redBlackWhite.data() + 12, -6, target.data(), 6, {2, 3}), pyxOk);
    EXPECT_EQ(target, white + black + red);
}

TEST(Steps, NegativeTargetStepWritesUpwards)
{
    Samples target(18);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(redBlackWhite.data(), 6, target.data() + 12, -6, {2, 3}), pyxOk);
    EXPECT_EQ(target, white + black + red);
}

TEST(Steps, AlignedTargetTakesANegativeStepToo)
{
    // 16 pixels are 48 bytes, so that with an aligned start all rows are aligned and take the wide form.
    alignas(16) u8 target[96];
    const Samples source = repeated({255, 0, 0}, 16) + repeated({255, 255, 255}, 16);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(source.data(), 48, target + 48, -48, {16, 2}), pyxOk);
    EXPECT_EQ(Samples(target, target + 96), repeated({235, 128, 128}, 16) + repeated({81, 90, 239}, 16));
}
