// Sizes below the minimum.
#include "pyxcc/pyxcc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

using namespace edge;

namespace
{

/// Expects a status of every conversion between RGB and YCbCr, and of the target that no sample changes.
void expectNothingDone(RoiSize roi, PyxStatus expected)
{
    const Samples source(64, 1);
    Samples target(64, 77);
    const u8* const src = source.data();
    u8* const dst = target.data();
    const u8* const planes[3] = {src, src, src};
    u8* const targetPlanes[3] = {dst, dst + 16, dst + 32};

    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(src, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_AC4R(src, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3P3R(src, 4, targetPlanes, 4, roi), expected);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_AC4P3R(src, 4, targetPlanes, 4, roi), expected);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_P3R(planes, 4, targetPlanes, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_C3R(src, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_AC4R(src, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3R(planes, 4, targetPlanes, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3C3R(planes, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3C4R(planes, 4, dst, 4, roi, 5), expected);
    EXPECT_EQ(pyxiYCbCrToBGR_8u_P3C3R(planes, 4, dst, 4, roi), expected);
    EXPECT_EQ(pyxiYCbCrToBGR_8u_P3C4R(planes, 4, dst, 4, roi, 5), expected);
    EXPECT_EQ(target, Samples(64, 77));
}

} // namespace

TEST(Sizes, HeightZeroIsAnError) { expectNothingDone({1, 0}, pyxErrSize); }

TEST(Sizes, WidthZeroIsAnError) { expectNothingDone({0, 1}, pyxErrSize); }

TEST(Sizes, NegativeOnesAreErrors)
{
    expectNothingDone({-1, 1}, pyxErrSize);
    expectNothingDone({1, -1}, pyxErrSize);
}
