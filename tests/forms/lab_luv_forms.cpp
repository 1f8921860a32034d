// The forms of Lab and LUV over bytes: vector instances against scalar ones on every input; the table of cube roots
// against its rule; on every pixel, against the plain statements, what takes other ways to the same bytes.
#include "every_input.hpp"
#include "rounding_modes.hpp"

#include "perceptual/lab_forms.hpp"
#include "perceptual/luv_by_power.hpp"
#include "perceptual/luv_inverse_forms.hpp"
#include "pyxcc/lab.h"
#include "pyxcc/luv.h"
#include "reference/lab.hpp"
#include "reference/luv.hpp"

#include <cmath>
#include <string>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::perceptual;

template <class Form> class PerceptualFormOfBytes : public testing::Test
{
};

using Forms = testing::Types<RgbToLab<LabOfBytes, FusedSums>, RgbToLabCut<LabOfBytes>, LabToRgb<OfLabBytes, FusedSums>,
                             LabToRgb<OfLabBytes, PlainSums>, RgbToLuvOfBytesByRoots, RgbToLuvByPower,
                             LuvToRgbOfBytesC3, LuvToRgbOfBytesAC4, LuvToRgbTail<255>>;

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

// What comes of integer samples is looked up without bounds.
TEST(CubeRoot, OfWhiteIsWithinTheTable)
{
    for (const int mode : forms::roundingModes) {
        forms::roundingBy(mode, [mode] {
            volatile f32 white = 255, whiteOfWords = 65535; // so that the sums are made in the mode
            const scalar::F32 v(white), unit(0.003921569f), w(whiteOfWords);
            const auto [x, y, z] = RgbToLab<LabOfBytes, FusedSums>::overWhite(v, v, v);
            for (const scalar::F32& of : {x, y, z}) EXPECT_LE(labRow(of).v, 127) << mode;
            const auto xyz = multiplied<FusedSums>(xyzOfRgb, v * unit, v * unit, v * unit);
            EXPECT_LE(trunc(xyz.b * 127.998046875f).v, 127) << mode;
            EXPECT_LE(trunc((FusedSums::weighted(yOfRgb, v, v, v) / scalar::F32(255.0f)) * 127.998046875f).v, 127)
                << mode;
            EXPECT_LE((trunc(multiplied<FusedSums>(xyzOfRgb, w, w, w).b) >> 9).v, 127) << mode;
        });
    }
}

TEST(SmoothRoot, IsNearTheExactOne)
{
    for (int i = 0; i <= 100000; ++i) {
        const f32 v = smoothRootsFrom + (1 - smoothRootsFrom) * static_cast<f32>(i) / 100000;
        EXPECT_NEAR(smoothRoot(scalar::F32(v)).v, std::cbrt(static_cast<f64>(v)), 7e-7) << v;
    }
    EXPECT_NEAR(smoothRoot(scalar::F32(1.00001f)).v, 1, 7e-7);
}

// The roots that count come of four terms of the series, or are on a line near black. What is looked up is raised: rows
// of the table begin at 128ths, and black at two of them.
TEST(RootLines, AreNearTheRootsThatCount)
{
    const auto raised = [](f32 v) { return scalar::F32((v * 127.998046875f + 2) / 128); };
    for (int i = 0; i <= 100000; ++i) {
        const f32 v = static_cast<f32>(i) / 100000;
        if (std::abs(v - 0.008856f) < 1e-4f) continue; // lines on both sides of it only
        const scalar::F32 root =
            rootByFourTerms(rootStartWithin(labCubeRootTable, labRow(scalar::F32(v)), scalar::F32(v)));
        const f32 f = v < 0.008856f ? 7.787f * v + 0.13793103f : root.v;
        const f32 L = v < 0.008856f ? 903.3f * v : 116 * root.v - 16;
        EXPECT_NEAR(lookUp(labRootLines, raised(v)).v, f, 6e-7) << v;
        EXPECT_NEAR(lookUp(lightnessLines, raised(v)).v, L, 6e-5) << v;
    }
    EXPECT_TRUE(std::isnan(lookUp(labRootLines, raised(0.008856f)).v));
}

TEST(RootLines, ReachBeyondWhite)
{
    const scalar::F32 white(255);
    const auto raised = [white](const Weights& k, f64 scale) {
        return weighted(raisedWeights(k, scale), white, white, white).v;
    };
    const f32 end = labRootLines.from(static_cast<int>(labRootLines.line.size()));
    EXPECT_LT(raised(zOfRgb, LabOfBytes::white.c), end);
    EXPECT_LT(raised(yOfRgb, 0.003921569f), end);
}

// A level has 65536 parts.
TEST(FineLevels, AreToldFromThoseNearTheNextOne)
{
    const auto any = [](int a, int b, int c) {
        const Three levels = {fineLevel(scalar::S32(a)), fineLevel(scalar::S32(b)), fineLevel(scalar::S32(c))};
        const Three registers = {fineLevel(wide::S32(a)), fineLevel(wide::S32(b)), fineLevel(wide::S32(c))};
        EXPECT_EQ(anyFractionBelow(levels, 80), anyFractionBelow(registers, 80)) << a << ' ' << b << ' ' << c;
        return anyFractionBelow(levels, 80);
    };
    EXPECT_FALSE(any(80, 65535, 3 * 65536 + 80));
    EXPECT_TRUE(any(79, 65535, 3 * 65536 + 80));
    EXPECT_TRUE(any(80, 5 * 65536, 3 * 65536 + 80));
    EXPECT_TRUE(any(80, 65535, 255 * 65536 + 79));
}

using Interleaved = PyxStatus (*)(const u8*, int, u8*, int, RoiSize);

struct Conversion {
    const char* name;
    Interleaved library, plain;
    int pixelBytes;
    bool inEveryMode;
};

class EveryPixelOfPerceptualBytes : public testing::TestWithParam<Conversion>
{
};

TEST_P(EveryPixelOfPerceptualBytes, IsThatOfThePlainStatement)
{
    const Conversion& conversion = GetParam();
    constexpr int pixels = 65536;
    const int bytes = conversion.pixelBytes;
    std::vector<u8> source(bytes * pixels), found(bytes * pixels), expected(bytes * pixels);
    for (int first = 0; first < 256; ++first) {
        for (int i = 0; i < pixels; ++i) {
            source[bytes * i] = static_cast<u8>(first);
            source[bytes * i + 1] = static_cast<u8>(i >> 8);
            source[bytes * i + 2] = static_cast<u8>(i);
        }
        for (const int mode : forms::roundingModes) {
            if (mode != FE_TONEAREST && (!conversion.inEveryMode || first % 51 != 0)) continue;
            forms::roundingBy(mode, [&] {
                conversion.library(source.data(), 0, found.data(), 0, {pixels, 1});
                conversion.plain(source.data(), 0, expected.data(), 0, {pixels, 1});
            });
            ASSERT_EQ(found, expected) << "with a first sample of " << first << " in mode " << mode;
        }
    }
}

constexpr Conversion conversions[] = {
    {"RGBToLab", pyxiRGBToLab_8u_C3R, reference::pyxiRGBToLab_8u_C3R, 3, true},
    {"BGRToLab", pyxiBGRToLab_8u_C3R, reference::pyxiBGRToLab_8u_C3R, 3, true},
    {"RGBToLUV", pyxiRGBToLUV_8u_C3R, reference::pyxiRGBToLUV_8u_C3R, 3, true},
    {"RGBToLUVByPower", pyxiRGBToLUV_8u_AC4R, reference::pyxiRGBToLUV_8u_AC4R, 4, false},
    {"LUVToRGB", pyxiLUVToRGB_8u_C3R, reference::pyxiLUVToRGB_8u_C3R, 3, true},
    {"LUVToRGBOfFour", pyxiLUVToRGB_8u_AC4R, reference::pyxiLUVToRGB_8u_AC4R, 4, true},
};

INSTANTIATE_TEST_SUITE_P(Conversions, EveryPixelOfPerceptualBytes, testing::ValuesIn(conversions),
                         [](const auto& info) { return std::string(info.param.name); });

} // namespace
