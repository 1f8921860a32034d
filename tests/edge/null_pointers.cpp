// Null pointers, and their rank against a bad size.
#include "pyxcc/pyxcc.h"

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <string>
#include <vector>

namespace
{

constexpr RoiSize pixel = {1, 1};
constexpr RoiSize nothing = {0, 1};

u8 source[4] = {};
u8 target[4] = {};
u8* const targetPlanes[3] = {target, target + 1, target + 2};
const u8* const sourcePlanes[3] = {source, source + 1, source + 2};

/// A conversion with planes at one end; the other end is always in order.
struct PlanarEnd {
    std::string name;
    std::function<PyxStatus(bool arrayNull, int nullElement, RoiSize)> call;
};

template <typename Call> std::function<PyxStatus(bool, int, RoiSize)> withSourcePlanes(Call call)
{
    return [call](bool arrayNull, int nullElement, RoiSize roi) {
        std::array<const u8*, 3> planes = {source, source, source};
        if (nullElement >= 0) planes[nullElement] = nullptr;
        return call(arrayNull ? nullptr : planes.data(), roi);
    };
}

template <typename Call> std::function<PyxStatus(bool, int, RoiSize)> withTargetPlanes(Call call)
{
    return [call](bool arrayNull, int nullElement, RoiSize roi) {
        std::array<u8*, 3> planes = {target, target + 1, target + 2};
        if (nullElement >= 0) planes[nullElement] = nullptr;
        return call(arrayNull ? nullptr : planes.data(), roi);
    };
}

using Sources = const u8* const*;
using Targets = u8* const*;

/// These test the elements together with the array, ahead of the size.
const std::vector<PlanarEnd> elementsFirst = {
    {"pyxiRGBToYCbCr_8u_C3P3R",
     withTargetPlanes([](Targets dst, RoiSize roi) { return pyxiRGBToYCbCr_8u_C3P3R(source, 3, dst, 1, roi); })},
    {"pyxiYCbCrToBGR_8u_P3C3R",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiYCbCrToBGR_8u_P3C3R(src, 1, target, 3, roi); })},
    {"pyxiYCbCrToBGR_8u_P3C4R",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiYCbCrToBGR_8u_P3C4R(src, 1, target, 4, roi, 0); })},
};

/// As above, but the array itself must not be null.
const std::vector<PlanarEnd> arrayUntested = {
    {"pyxiRGBToYCbCr_8u_AC4P3R",
     withTargetPlanes([](Targets dst, RoiSize roi) { return pyxiRGBToYCbCr_8u_AC4P3R(source, 4, dst, 1, roi); })},
};

/// These read the elements out of the array only after the size has passed.
const std::vector<PlanarEnd> sizeFirst = {
    {"pyxiRGBToYCbCr_8u_P3R, source",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiRGBToYCbCr_8u_P3R(src, 1, targetPlanes, 1, roi); })},
    {"pyxiRGBToYCbCr_8u_P3R, target",
     withTargetPlanes([](Targets dst, RoiSize roi) { return pyxiRGBToYCbCr_8u_P3R(sourcePlanes, 1, dst, 1, roi); })},
    {"pyxiYCbCrToRGB_8u_P3R, source",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiYCbCrToRGB_8u_P3R(src, 1, targetPlanes, 1, roi); })},
    {"pyxiYCbCrToRGB_8u_P3R, target",
     withTargetPlanes([](Targets dst, RoiSize roi) { return pyxiYCbCrToRGB_8u_P3R(sourcePlanes, 1, dst, 1, roi); })},
    {"pyxiYCbCrToRGB_8u_P3C3R",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiYCbCrToRGB_8u_P3C3R(src, 1, target, 3, roi); })},
    {"pyxiYCbCrToRGB_8u_P3C4R",
     withSourcePlanes([](Sources src, RoiSize roi) { return pyxiYCbCrToRGB_8u_P3C4R(src, 1, target, 4, roi, 0); })},
};

constexpr bool arrayNull = true, arrayGiven = false;
constexpr int noElement = -1;

} // namespace

TEST(NullPointers, AnyElementOfAnArrayIsFound)
{
    for (const auto* group : {&elementsFirst, &arrayUntested, &sizeFirst}) {
        for (const PlanarEnd& end : *group) {
            EXPECT_EQ(end.call(arrayGiven, noElement, pixel), pyxOk) << end.name;
            for (int k = 0; k < 3; ++k)
                EXPECT_EQ(end.call(arrayGiven, k, pixel), pyxErrNullPtr) << end.name << ' ' << k;
        }
    }
}

TEST(NullPointers, TheArrayIsFound)
{
    for (const auto* group : {&elementsFirst, &sizeFirst}) {
        for (const PlanarEnd& end : *group) EXPECT_EQ(end.call(arrayNull, noElement, pixel), pyxErrNullPtr) << end.name;
    }
}

TEST(NullPointers, TheArrayOutranksTheSize)
{
    for (const auto* group : {&elementsFirst, &sizeFirst}) {
        for (const PlanarEnd& end : *group)
            EXPECT_EQ(end.call(arrayNull, noElement, nothing), pyxErrNullPtr) << end.name;
    }
}

TEST(NullPointers, AnElementOutranksTheSizeWhereItIsTestedWithTheArray)
{
    for (const auto* group : {&elementsFirst, &arrayUntested}) {
        for (const PlanarEnd& end : *group) {
            for (int k = 0; k < 3; ++k)
                EXPECT_EQ(end.call(arrayGiven, k, nothing), pyxErrNullPtr) << end.name << ' ' << k;
        }
    }
}

TEST(NullPointers, TheSizeOutranksAnElementWhereItIsTestedLast)
{
    for (const PlanarEnd& end : sizeFirst) {
        for (int k = 0; k < 3; ++k) EXPECT_EQ(end.call(arrayGiven, k, nothing), pyxErrSize) << end.name << ' ' << k;
    }
}

TEST(NullPointers, AnInterleavedEndOutranksTheSize)
{
    for (const auto convert :
         {pyxiRGBToYCbCr_8u_C3R, pyxiRGBToYCbCr_8u_AC4R, pyxiYCbCrToRGB_8u_C3R, pyxiYCbCrToRGB_8u_AC4R}) {
        EXPECT_EQ(convert(nullptr, 4, target, 4, nothing), pyxErrNullPtr);
        EXPECT_EQ(convert(source, 4, nullptr, 4, nothing), pyxErrNullPtr);
    }
    EXPECT_EQ(pyxiRGBToYCbCr_8u_C3P3R(nullptr, 3, targetPlanes, 1, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_AC4P3R(nullptr, 4, targetPlanes, 1, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3C3R(sourcePlanes, 1, nullptr, 3, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCrToRGB_8u_P3C4R(sourcePlanes, 1, nullptr, 4, nothing, 0), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCrToBGR_8u_P3C3R(sourcePlanes, 1, nullptr, 3, nothing), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCbCrToBGR_8u_P3C4R(sourcePlanes, 1, nullptr, 4, nothing, 0), pyxErrNullPtr);
}
