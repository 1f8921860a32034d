// The conversions with shared chroma: null pointers against sizes, and sizes below the minimum.
#include "pyxcc/pyxcc.h"

#include "edge/subsampled.hpp"

#include <algorithm>
#include <iterator>

using namespace edge;

namespace
{

constexpr RoiSize enough = {4, 2};
constexpr RoiSize nothing = {4, 0};

u8 source[64] = {};
u8 target[64] = {};
constexpr int steps[3] = {4, 4, 4};

const u8* const sourcePlanes[3] = {source, source, source};
u8* const targetPlanes[3] = {target, target + 16, target + 32};

/// Arrays with one null element each.
const u8* const sourcesWithNull[3][3] = {
    {nullptr, source, source}, {source, nullptr, source}, {source, source, nullptr}};
u8* const targetsWithNull[3][3] = {{nullptr, target, target}, {target, nullptr, target}, {target, target, nullptr}};

using FromLumaAndPairsWithAlpha = PyxStatus (*)(const u8*, int, const u8*, int, u8*, int, RoiSize, u8);

} // namespace

TEST(SubsampledArguments, TheSizeOutranksAnyPointerInTwoConversionsOnly)
{
    struct Case {
        FromLumaAndPairsWithAlpha convert;
        PyxStatus expected;
    };
    for (const auto& [convert, expected] : {Case{pyxiYCrCb420ToBGR_8u_P2C4R, pyxErrSize},
                                            {pyxiYCrCb420ToRGB_8u_P2C4R, pyxErrSize},
                                            {pyxiYCbCr420ToBGR_8u_P2C4R, pyxErrNullPtr},
                                            {pyxiYCbCr420ToRGB_8u_P2C4R, pyxErrNullPtr}}) {
        EXPECT_EQ(convert(nullptr, 4, source, 4, target, 16, nothing, 0), expected);
        EXPECT_EQ(convert(source, 4, nullptr, 4, target, 16, nothing, 0), expected);
        EXPECT_EQ(convert(source, 4, source, 4, nullptr, 16, nothing, 0), expected);
        EXPECT_EQ(convert(nullptr, 4, source, 4, target, 16, enough, 0), pyxErrNullPtr);
        EXPECT_EQ(convert(source, 4, nullptr, 4, target, 16, enough, 0), pyxErrNullPtr);
        EXPECT_EQ(convert(source, 4, source, 4, nullptr, 16, enough, 0), pyxErrNullPtr);
    }
    EXPECT_EQ(pyxiYCrCb420ToBGR_8u_P2C3R(nullptr, 4, source, 4, target, 12, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCrCb420ToRGB_8u_P2C3R(nullptr, 4, source, 4, target, 12, nothing), pyxErrNullPtr);
}

TEST(SubsampledArguments, AnElementOutranksTheSizeWhereItIsTestedWithTheArray)
{
    for (const auto& planes : targetsWithNull) {
        for (const ToPlanes convert :
             {pyxiBGRToYCbCr411_8u_AC4P3R, pyxiBGRToYCbCr411_8u_C3P3R, pyxiBGRToYCbCr420_8u_AC4P3R,
              pyxiBGRToYCbCr420_8u_C3P3R, pyxiBGRToYCrCb420_8u_AC4P3R, pyxiBGRToYCrCb420_8u_C3P3R,
              pyxiRGBToYCrCb420_8u_AC4P3R, pyxiBGRToYCbCr422_8u_AC4P3R, pyxiBGRToYCbCr422_8u_C3P3R,
              pyxiRGBToYCbCr422_8u_C3P3R, pyxiBGRToYCbCr420_709CSC_8u_AC4P3R, pyxiBGRToYCbCr420_709CSC_8u_C3P3R,
              pyxiBGRToYCrCb420_709CSC_8u_AC4P3R, pyxiBGRToYCrCb420_709CSC_8u_C3P3R,
              pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R}) {
            EXPECT_EQ(convert(source, 16, planes, steps, nothing), pyxErrNullPtr);
            EXPECT_EQ(convert(source, 16, planes, steps, enough), pyxErrNullPtr);
        }
    }
    for (const auto& planes : sourcesWithNull) {
        for (const FromPlanes convert : {pyxiYCbCr422ToBGR_8u_P3C3R, pyxiYCbCr411ToBGR_8u_P3C3R}) {
            EXPECT_EQ(convert(planes, steps, target, 12, nothing), pyxErrNullPtr);
            EXPECT_EQ(convert(planes, steps, target, 12, enough), pyxErrNullPtr);
        }
        EXPECT_EQ(pyxiYCbCr411ToBGR_8u_P3C4R(planes, steps, target, 16, nothing, 0), pyxErrNullPtr);
        EXPECT_EQ(pyxiYCbCrToBGR_709CSC_8u_P3C3R(planes, 4, target, 12, nothing), pyxErrNullPtr);
        EXPECT_EQ(pyxiYCbCrToBGR_709CSC_8u_P3C4R(planes, 4, target, 16, nothing, 0), pyxErrNullPtr);
    }
}

TEST(SubsampledArguments, TheSizeOutranksAnElementWhereItIsTestedLast)
{
    for (const auto& planes : targetsWithNull) {
        EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(source, 12, planes, steps, nothing), pyxErrSize);
        EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(source, 12, planes, steps, enough), pyxErrNullPtr);
        for (const auto convert : {pyxiYCbCr422ToRGB_8u_C2P3R, pyxiYCrCb422ToRGB_8u_C2P3R}) {
            EXPECT_EQ(convert(source, 8, planes, 4, nothing), pyxErrSize);
            EXPECT_EQ(convert(source, 8, planes, 4, enough), pyxErrNullPtr);
        }
    }
    for (const auto& planes : sourcesWithNull) {
        for (const auto convert : {pyxiRGBToYCbCr422_8u_P3C2R, pyxiRGBToYCrCb422_8u_P3C2R}) {
            EXPECT_EQ(convert(planes, 4, target, 8, nothing), pyxErrSize);
            EXPECT_EQ(convert(planes, 4, target, 8, enough), pyxErrNullPtr);
        }
        for (const FromPlanes convert : {pyxiYCbCr420ToBGR_8u_P3C3R, pyxiYCbCr420ToRGB_8u_P3C3R,
                                         pyxiYCbCr422ToRGB_8u_P3C3R, pyxiYCbCr420ToBGR_709CSC_8u_P3C3R}) {
            EXPECT_EQ(convert(planes, steps, target, 12, nothing), pyxErrSize);
            EXPECT_EQ(convert(planes, steps, target, 12, enough), pyxErrNullPtr);
        }
        for (const FromPlanesWithAlpha convert :
             {pyxiYCbCr420ToBGR_8u_P3C4R, pyxiYCrCb420ToRGB_8u_P3C4R, pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R}) {
            EXPECT_EQ(convert(planes, steps, target, 16, nothing, 0), pyxErrSize);
            EXPECT_EQ(convert(planes, steps, target, 16, enough, 0), pyxErrNullPtr);
        }
    }
}

// The array of targets alone; the array of sources of one conversion is read ahead of its test.
TEST(SubsampledArguments, TheArrayOutranksTheSize)
{
    EXPECT_EQ(pyxiBGRToYCbCr420_8u_C3P3R(source, 12, nullptr, steps, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(source, 12, nullptr, steps, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYCbCr422_8u_P3C2R(nullptr, 4, target, 8, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr422ToRGB_8u_C2P3R(source, 8, nullptr, 4, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr422ToRGB_8u_P3C3R(nullptr, steps, target, 12, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr420ToBGR_709CSC_8u_P3C3R(nullptr, steps, target, 12, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCr422ToBGR_8u_P3C3R(sourcePlanes, steps, nullptr, 12, nothing), pyxErrNullPtr);
}

TEST(SubsampledArguments, SizesBelowTheMinimumAreErrorsAndWriteNothing)
{
    std::ranges::fill(target, untouched);
    // Two columns and two rows.
    for (const ToPlanes convert :
         {pyxiBGRToYCbCr420_8u_C3P3R, pyxiBGRToYCbCr420_8u_AC4P3R, pyxiBGRToYCrCb420_8u_C3P3R,
          pyxiBGRToYCrCb420_8u_AC4P3R, pyxiRGBToYCrCb420_8u_AC4P3R, pyxiBGRToYCbCr420_709CSC_8u_C3P3R,
          pyxiBGRToYCbCr420_709CSC_8u_AC4P3R, pyxiBGRToYCrCb420_709CSC_8u_C3P3R, pyxiBGRToYCrCb420_709CSC_8u_AC4P3R,
          pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R}) {
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {1, 2}), pyxErrSize);
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {2, 1}), pyxErrSize);
    }
    EXPECT_EQ(pyxiBGRToYCbCr420_709CSC_8u_C3P2R(source, 16, target, 4, target, 4, {2, 1}), pyxErrSize);
    EXPECT_EQ(pyxiBGRToYCbCr420_709CSC_8u_C3P2R(source, 16, target, 4, target, 4, {1, 2}), pyxErrSize);
    // Two columns and a row.
    for (const ToPlanes convert :
         {pyxiBGRToYCbCr422_8u_C3P3R, pyxiBGRToYCbCr422_8u_AC4P3R, pyxiRGBToYCbCr422_8u_C3P3R}) {
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {1, 1}), pyxErrSize);
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {2, 0}), pyxErrSize);
    }
    for (const Packed convert : {pyxiBGRToYCbCr422_8u_C3C2R, pyxiBGRToYCbCr422_8u_AC4C2R}) {
        EXPECT_EQ(convert(source, 16, target, 8, {1, 1}), pyxErrSize);
        EXPECT_EQ(convert(source, 16, target, 8, {2, 0}), pyxErrSize);
    }
    EXPECT_EQ(pyxiYCbCr422ToBGR_8u_P3C3R(sourcePlanes, steps, target, 12, {1, 1}), pyxErrSize);
    // Four columns and a row.
    for (const ToPlanes convert : {pyxiBGRToYCbCr411_8u_C3P3R, pyxiBGRToYCbCr411_8u_AC4P3R}) {
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {3, 1}), pyxErrSize);
        EXPECT_EQ(convert(source, 16, targetPlanes, steps, {4, 0}), pyxErrSize);
    }
    EXPECT_EQ(pyxiYCbCr411ToBGR_8u_P3C3R(sourcePlanes, steps, target, 12, {3, 1}), pyxErrSize);
    EXPECT_EQ(pyxiYCbCr411ToBGR_8u_P3C4R(sourcePlanes, steps, target, 16, {3, 1}, 0), pyxErrSize);
    EXPECT_EQ(Samples(std::begin(target), std::end(target)), Samples(64, untouched));
}
