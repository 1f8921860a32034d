// The forms of Lab and LUV over bytes: vector instances against scalar ones on every input; the table of cube roots
// against its rule; L by a power against the plain statement.
#include "every_input.hpp"
#include "perceptual/lab_forms.hpp"
#include "perceptual/luv_by_power.hpp"
#include "perceptual/luv_inverse_forms.hpp"
#include "pyxcc/luv.h"
#include "reference/luv.hpp"

#include <cmath>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::perceptual;

template <class Form> class PerceptualFormOfBytes : public testing::Test
{
};

using Forms = testing::Types<RgbToLab<LabOfBytes, FusedSums>, RgbToLabCut<LabOfBytes>, LabToRgb<OfLabBytes, FusedSums>,
                             LabToRgb<OfLabBytes, PlainSums>, RgbToLuvOfBytes, RgbToLuvByPower, LuvToRgbOfBytesC3,
                             LuvToRgbOfBytesAC4, LuvToRgbTail<255>>;

struct Names {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"rgbToLab",        "rgbToLabTail", "labToRgb",    "labToRgbTail", "rgbToLuv",
                          "rgbToLuvByPower", "luvToRgb",     "luvToRgbAC4", "luvToRgbTail"}[i];
    }
};

TYPED_TEST_SUITE(PerceptualFormOfBytes, Forms, Names);

TYPED_TEST(PerceptualFormOfBytes, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

/// To six decimals, and from there to the nearest float.
f32 toSixDecimals(long double x) { return static_cast<f32>(std::round(x * 1e6L) / 1e6L); }

TEST(CubeRootTable, FollowsItsRule)
{
    const auto expectRow = [](const Two<f32>& row, int i, long double rowsToOne) {
        const long double v = (i + 1) / rowsToOne + 0.0001L;
        EXPECT_EQ(row.a, toSixDecimals(std::cbrt(v))) << i;
        EXPECT_EQ(row.b, toSixDecimals(1 / v)) << i;
    };
    for (int i = 0; i < 128; ++i) {
        expectRow(labCubeRootTable[i], i, 127.998046875L);
        expectRow(luvCubeRootTable[i], i, i < 124 ? 127.998046875L : 128.0L);
    }
}

// The series of eight is furthest off near its line, where rows of the table are far apart.
TEST(CubeRoot, IsNearTheExactOne)
{
    for (int i = 1; i <= 100000; ++i) {
        const f32 v = 0.008856f + (1 - 0.008856f) * static_cast<f32>(i) / 100000;
        const auto start = rootStart(labCubeRootTable, trunc(scalar::F32(v * labRowsToOne)), scalar::F32(v));
        EXPECT_NEAR(rootByEightTerms(start, labLastTermsOfFloats).v, std::cbrt(v), 4e-6) << v;
        EXPECT_NEAR(rootByFourTerms(start).v, std::cbrt(v), 1e-2 * std::cbrt(v)) << v;
    }
}

TEST(LuvByPower, AllPixelsAreThoseOfThePlainStatement)
{
    std::vector<u8> source(4 * 65536), found(4 * 65536), expected(4 * 65536);
    for (int r = 0; r < 256; ++r) {
        for (int i = 0; i < 65536; ++i) {
            source[4 * i] = static_cast<u8>(r);
            source[4 * i + 1] = static_cast<u8>(i >> 8);
            source[4 * i + 2] = static_cast<u8>(i);
        }
        ASSERT_EQ(pyxiRGBToLUV_8u_AC4R(source.data(), 0, found.data(), 0, {65536, 1}), pyxOk);
        ASSERT_EQ(reference::pyxiRGBToLUV_8u_AC4R(source.data(), 0, expected.data(), 0, {65536, 1}), pyxOk);
        ASSERT_EQ(found, expected) << "with a red of " << r;
    }
}

} // namespace
