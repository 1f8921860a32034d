// The checks checked: they accept the reference itself, and reject functions that are wrong in one way each.
#include "conformance/suites.hpp"
#include "reference/reference.hpp"
#include "support/called.hpp"

#include <gtest/gtest.h>

#include <cfenv>
#include <cmath>

using support::Subject;

namespace
{

constexpr auto right = reference::pyxiRGBToYCbCr_8u_C3R;
constexpr int pixel = 3;

u8* rowOf(u8* base, int step, int y) { return base + std::ptrdiff_t{y} * step; }

PyxStatus oneLevelOffAtOneWidth(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    if (roi.width == 33) rowOf(dst, dstStep, roi.height - 1)[32 * pixel + 2] ^= 1;
    return status;
}

PyxStatus wrongWhenAligned(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    const bool aligned = reinterpret_cast<std::uintptr_t>(dst) % 16 == 0 && dstStep % 16 == 0;
    if (status == pyxOk && aligned) dst[0] ^= 1;
    return status;
}

PyxStatus writesBehindRows(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    if (status == pyxOk) dst[roi.width * pixel] = 0x55;
    return status;
}

PyxStatus writesInFrontOfRows(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    if (status == pyxOk) dst[-1] = 0x55;
    return status;
}

PyxStatus goesFromBottomToTop(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus status = right(src, srcStep, dst, dstStep, roi)) return status;
    for (int y = roi.height - 1; y >= 0; --y) {
        right(src + std::ptrdiff_t{y} * srcStep, srcStep, rowOf(dst, dstStep, y), dstStep, {roi.width, 1});
    }
    return pyxOk;
}

PyxStatus writesToTheSource(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    if (status == pyxOk && roi.width == 16) const_cast<u8*>(src)[0] ^= 1;
    return status;
}

PyxStatus warnsOfOddSizes(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    return status == pyxOk && roi.width % 2 ? pyxWarnOddSize : status;
}

PyxStatus setsTheFourthSample(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = reference::pyxiRGBToYCbCr_8u_AC4R(src, srcStep, dst, dstStep, roi);
    if (status == pyxOk) dst[3] = src[3];
    return status;
}

void touch(const u8* at) { [[maybe_unused]] const u8 value = *static_cast<const volatile u8*>(at); }

PyxStatus readsBehindTheSource(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    for (int y = 0; y < roi.height; ++y) touch(src + std::ptrdiff_t{y} * srcStep + roi.width * pixel);
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus readsInFrontOfTheSource(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    for (int y = 0; y < roi.height; ++y) touch(src + std::ptrdiff_t{y} * srcStep - 1);
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus rewritesWhatFollowsTheTarget(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    for (int y = 0; y < roi.height; ++y) {
        volatile u8* const behind = rowOf(dst, dstStep, y) + roi.width * pixel;
        *behind = *behind;
    }
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus writesBeforeItTestsTheSize(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (src && dst) dst[0] = 0;
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus testsTheSizeFirst(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (roi.width < 1 || roi.height < 1) return pyxErrSize;
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus acceptsNoRows(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (src && dst && roi.width > 0 && roi.height == 0) return pyxOk;
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus testsTheElementsFirst(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (src && dst && !src[1]) return pyxErrNullPtr;
    return reference::pyxiRGBToYCbCr_8u_P3R(src, srcStep, dst, dstStep, roi);
}

PyxStatus ignoresAnElement(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (src && dst && !dst[2] && roi.width > 0 && roi.height > 0) return pyxOk;
    return reference::pyxiRGBToYCbCr_8u_P3R(src, srcStep, dst, dstStep, roi);
}

PyxStatus leavesItsOwnMode(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    std::fesetround(FE_TONEAREST);
    return right(src, srcStep, dst, dstStep, roi);
}

PyxStatus roundsAsTheCaller(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = right(src, srcStep, dst, dstStep, roi);
    volatile double half = 0.5;
    dst[0] = static_cast<u8>(dst[0] + std::lrint(half));
    return status;
}

template <auto function> Subject ac4()
{
    return support::substitute("pyxiRGBToYCbCr_8u_AC4R", support::called<function>());
}

template <auto function> Subject c3()
{
    return support::substitute("pyxiRGBToYCbCr_8u_C3R", support::called<function>());
}

template <auto function> Subject p3()
{
    return support::substitute("pyxiRGBToYCbCr_8u_P3R", support::called<function>());
}

TEST(Checker, AcceptsWhatIsRight)
{
    for (const Subject& subject : {c3<right>(), p3<reference::pyxiRGBToYCbCr_8u_P3R>()}) {
        for (const auto check : {conformance::checkValues, conformance::checkGuards, conformance::checkFaults,
                                 conformance::checkRounding}) {
            EXPECT_EQ(check(subject).value_or(""), "");
        }
    }
}

TEST(Checker, SeesWrongValues)
{
    EXPECT_TRUE(conformance::checkValues(c3<oneLevelOffAtOneWidth>()));
    EXPECT_TRUE(conformance::checkValues(c3<wrongWhenAligned>()));
    EXPECT_TRUE(conformance::checkValues(c3<writesBehindRows>()));
    EXPECT_TRUE(conformance::checkValues(c3<writesInFrontOfRows>()));
    EXPECT_TRUE(conformance::checkValues(c3<goesFromBottomToTop>()));
    EXPECT_TRUE(conformance::checkValues(c3<writesToTheSource>()));
    EXPECT_TRUE(conformance::checkValues(c3<warnsOfOddSizes>()));
    EXPECT_TRUE(conformance::checkValues(ac4<setsTheFourthSample>()));
}

TEST(CheckerDeathTest, SeesStrayAccesses)
{
    EXPECT_DEATH(conformance::checkGuards(c3<readsBehindTheSource>()), "memory was touched");
    EXPECT_DEATH(conformance::checkGuards(c3<readsInFrontOfTheSource>()), "memory was touched");
    EXPECT_DEATH(conformance::checkGuards(c3<rewritesWhatFollowsTheTarget>()), "memory was touched");
}

TEST(Checker, SeesWrongStatuses)
{
    EXPECT_TRUE(conformance::checkFaults(c3<writesBeforeItTestsTheSize>()));
    EXPECT_TRUE(conformance::checkFaults(c3<testsTheSizeFirst>()));
    EXPECT_TRUE(conformance::checkFaults(c3<acceptsNoRows>()));
    EXPECT_TRUE(conformance::checkFaults(p3<testsTheElementsFirst>()));
    EXPECT_TRUE(conformance::checkFaults(p3<ignoresAnElement>()));
}

TEST(Checker, SeesTheRoundingMode)
{
    EXPECT_TRUE(conformance::checkRounding(c3<leavesItsOwnMode>()));
    EXPECT_TRUE(conformance::checkRounding(c3<roundsAsTheCaller>()));
}

} // namespace
