// The copy and the fill of whole planes at every alignment and on both sides of their limits, against plain loops.
#include "frame/plane_service.hpp"

#include "cache_size.hpp"
#include "pyxcc/core.h"
#include "support/compare.hpp"
#include "support/fault_report.hpp"
#include "support/samples.hpp"

#include <gtest/gtest.h>

#include <algorithm>

using namespace support;
using pyxcc::frame::copyPlane8u;
using pyxcc::frame::fillPlane8u;

s32 cacheSize = 0;

namespace
{

int questions = 0; ///< how often the cache's size was asked for

} // namespace

PyxStatus PYXCC_CALL pyxGetMaxCacheSizeB(s32* size)
{
    ++questions;
    if (cacheSize == 0) return pyxErrBadArg;
    *size = cacheSize;
    return pyxOk;
}

namespace
{

constexpr int copyLimit = 0x100000;
constexpr int fillLimit = 0x600000;

struct Rows {
    int width, height, gap;
};

/// Negative gaps stand for rows upward, a byte nearer.
int stepOf(const Rows& rows) { return rows.gap < 0 ? -rows.width - ~rows.gap : rows.width + rows.gap; }

Plane planeOf(const Rows& rows, Placement placement, int alignment, Random& random)
{
    Plane plane(geometryOf({rows.width, rows.height}, catalog::Element::u8, stepOf(rows)), placement, alignment);
    random.fill(plane.all());
    return plane;
}

std::string nameOf(const Rows& rows, Placement placement, int alignment)
{
    return std::to_string(rows.width) + " x " + std::to_string(rows.height) + ", step " + std::to_string(stepOf(rows)) +
           ", " + std::to_string(alignment) + " mod 64, " + std::string(support::nameOf(placement));
}

void expectCopy(const Rows& from, const Rows& to, Placement placement, int alignment)
{
    const std::string text = "copyPlane8u, " + nameOf(to, placement, alignment);
    const FaultReport report(text);
    Random random(seedOf(text, from.gap));
    const Plane source = planeOf(from, placement, random.between(0, 63), random);
    const Plane target = planeOf(to, placement, alignment, random);
    const Image expected = {target};
    for (int y = 0; y < to.height; ++y) std::ranges::copy(source.row(y), expected[0].row(y).begin());

    const PyxStatus status = copyPlane8u(source.base(), stepOf(from), target.base(), stepOf(to), to.width, to.height);
    EXPECT_EQ(status, pyxOk) << text;
    EXPECT_EQ(firstDifference(expected, {target}).value_or(""), "") << text;
}

void expectFill(const Rows& rows, Placement placement, int alignment)
{
    const std::string text = "fillPlane8u, " + nameOf(rows, placement, alignment);
    const FaultReport report(text);
    Random random(seedOf(text, 0));
    const auto value = static_cast<u8>(random.next());
    const Plane target = planeOf(rows, placement, alignment, random);
    const Image expected = {target};
    for (int y = 0; y < rows.height; ++y) std::ranges::fill(expected[0].row(y), value);

    fillPlane8u(value, target.base(), stepOf(rows), rows.width, rows.height);
    EXPECT_EQ(firstDifference(expected, {target}).value_or(""), "") << text;
}

class PlaneService : public testing::Test
{
protected:
    PlaneService()
    {
        cacheSize = tinyCache;
        questions = 0;
    }
};

TEST_F(PlaneService, CopiesSmallPlanesAtEveryAlignment)
{
    for (int alignment = 0; alignment < 64; ++alignment) {
        for (const int width : {1, 2, 31, 32, 33, 63, 64, 65, 127, 128, 129, 200}) {
            for (const int gap : {0, 1, 64, -1, -4}) {
                expectCopy({width, 3, 0}, {width, 3, gap}, Placement::margins, alignment);
                expectCopy({width, 3, gap}, {width, 3, 0}, Placement::margins, alignment);
                expectCopy({width, 3, gap}, {width, 3, gap}, Placement::margins, alignment);
            }
        }
    }
}

TEST_F(PlaneService, CopiesLargePlanesAtEveryAlignment)
{
    for (int alignment = 0; alignment < 64; ++alignment) {
        expectCopy({1031, 1024, 0}, {1031, 1024, 0}, Placement::margins, alignment);
        expectCopy({1031, 1024, 0}, {1031, 1024, 3}, Placement::margins, alignment);
    }
    expectCopy({1031, 1024, 3}, {1031, 1024, 0}, Placement::margins, 5);
    expectCopy({1031, 1024, -1}, {1031, 1024, -6}, Placement::margins, 5);
}

TEST_F(PlaneService, CopiesOnBothSidesOfTheLimits)
{
    for (const Rows& rows : {Rows{64, copyLimit / 64, 0}, Rows{63, copyLimit / 63 + 1, 1}, Rows{64, copyLimit / 64, 1},
                             Rows{65, copyLimit / 65 + 1, 1}, Rows{copyLimit, 1, 0}, Rows{copyLimit - 1, 1, 0}}) {
        for (const s32 cache : {0, tinyCache, 2 * copyLimit, 2 * copyLimit + 2, 0x7fffffff}) {
            cacheSize = cache;
            expectCopy(rows, rows, Placement::margins, 7);
        }
    }
}

TEST_F(PlaneService, CopiesUpToTheGuardPages)
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int width = 1; width < 200; ++width) {
            expectCopy({width, 3, 0}, {width, 3, 0}, placement, 0);
            expectCopy({width, 3, 5}, {width, 3, 1}, placement, 0);
        }
        for (int width = 1031; width < 1031 + 64; width += 9) {
            expectCopy({width, 1024, 0}, {width, 1024, 0}, placement, 0);
            expectCopy({width, 1024, 0}, {width, 1024, 1}, placement, 0);
        }
    }
}

TEST_F(PlaneService, CopyTestsItsArguments)
{
    u8 source = 1, target = 2;
    EXPECT_EQ(copyPlane8u(nullptr, 1, &target, 1, 1, 1), pyxErrNullPtr);
    EXPECT_EQ(copyPlane8u(&source, 1, nullptr, 1, 1, 1), pyxErrNullPtr);
    EXPECT_EQ(copyPlane8u(nullptr, 1, &target, 1, 0, -1), pyxErrNullPtr);
    for (const int bad : {0, -1, -1024}) {
        EXPECT_EQ(copyPlane8u(&source, 1, &target, 1, bad, 1), pyxErrSize);
        EXPECT_EQ(copyPlane8u(&source, 1, &target, 1, 1, bad), pyxErrSize);
    }
    EXPECT_EQ(target, 2);
}

TEST_F(PlaneService, FillsSmallPlanesAtEveryAlignment)
{
    for (int alignment = 0; alignment < 64; ++alignment) {
        for (const int width : {1, 2, 31, 32, 33, 63, 64, 65, 127, 128, 129, 200}) {
            for (const int gap : {0, 1, 64, -1, -4}) expectFill({width, 3, gap}, Placement::margins, alignment);
        }
    }
}

TEST_F(PlaneService, FillsLargePlanesAtEveryAlignment)
{
    expectFill({2502, 2600, 1}, Placement::margins, 0); // an odd step brings rows to every alignment
    for (int alignment = 0; alignment < 64; alignment += 9) expectFill({2501, 2600, 0}, Placement::margins, alignment);
    expectFill({2501, 2600, -3}, Placement::margins, 5);
}

TEST_F(PlaneService, FillsOnBothSidesOfTheLimits)
{
    for (const s32 cache : {0, tinyCache, fillLimit, fillLimit + 1, fillLimit + 2, 0x7fffffff}) {
        cacheSize = cache;
        expectFill({fillLimit, 1, 0}, Placement::margins, 3);
        expectFill({fillLimit + 1, 1, 0}, Placement::margins, 3);
    }
}

TEST_F(PlaneService, FillAsksForTheCacheOnlyWhenThePlaneIsLarge)
{
    expectFill({fillLimit / 2, 2, 0}, Placement::margins, 0);
    EXPECT_EQ(questions, 0);
    expectFill({fillLimit + 1, 1, 0}, Placement::margins, 0);
    EXPECT_EQ(questions, 1);
}

TEST_F(PlaneService, FillsUpToTheGuardPages)
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int width = 1; width < 300; ++width) expectFill({width, 3, width % 3}, placement, 0);
        for (int width = 2501; width < 2501 + 64; width += 21) expectFill({width, 2600, 0}, placement, 0);
    }
}

TEST_F(PlaneService, FillsNothingWithoutRowsOrColumns)
{
    u8 byte = 7;
    for (const int none : {0, -1, -1024}) {
        fillPlane8u(9, &byte, 1, none, 1);
        fillPlane8u(9, &byte, 1, 1, none);
    }
    EXPECT_EQ(byte, 7);
}

} // namespace
