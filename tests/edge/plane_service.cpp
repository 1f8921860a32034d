// The copy and the fill of whole planes, which the library hides. The size of the cache that they ask for is set here.
#include "frame/plane_service.hpp"

#include "edge/samples.hpp"
#include "pyxcc/core.h"

#include <gtest/gtest.h>

using namespace edge;
using pyxcc::frame::copyPlane8u;
using pyxcc::frame::fillPlane8u;

namespace
{

/// What pyxGetMaxCacheSizeB() tells; 0 for not known.
s32 cacheSize = 0;

/// Not known, too small for the large planes below, and large enough for them.
constexpr s32 cacheSizes[] = {0, 0x100000, 0x10000000};

Samples counted(std::size_t count)
{
    Samples samples(count);
    for (std::size_t i = 0; i < count; ++i) samples[i] = static_cast<u8>(i % 251);
    return samples;
}

} // namespace

PyxStatus PYXCC_CALL pyxGetMaxCacheSizeB(s32* size)
{
    if (cacheSize == 0) return pyxErrBadArg;
    *size = cacheSize;
    return pyxOk;
}

TEST(CopyPlane, WidthEqualToBothStepsIsOneRow)
{
    const Samples source = counted(5 * 7);
    Samples target(5 * 7 + 2, 77);
    EXPECT_EQ(copyPlane8u(source.data(), 5, target.data() + 1, 5, 5, 7), pyxOk);
    EXPECT_EQ(target, Samples(1, 77) + source + Samples(1, 77));
}

TEST(CopyPlane, GapBetweenTargetRowsStays)
{
    const Samples source = {1, 2, 3, 100, 4, 5, 6, 100};
    Samples target(10, 77);
    EXPECT_EQ(copyPlane8u(source.data(), 4, target.data(), 5, 3, 2), pyxOk);
    EXPECT_EQ(target, (Samples{1, 2, 3, 77, 77, 4, 5, 6, 77, 77}));
}

TEST(CopyPlane, LargePlaneIsOneRowToo)
{
    const int width = 1100, height = 1000;
    static_assert(width * height >= 0x100000);
    const Samples source = counted(width * height);
    for (const s32 size : cacheSizes) {
        cacheSize = size;
        Samples target(width * height + 2, 77);
        EXPECT_EQ(copyPlane8u(source.data(), width, target.data() + 1, width, width, height), pyxOk);
        EXPECT_TRUE(target == Samples(1, 77) + source + Samples(1, 77)) << size;
    }
}

TEST(CopyPlane, GapBetweenRowsOfALargePlaneStays)
{
    const int width = 1101, height = 1000, step = 1103;
    static_assert(width * height >= 0x100000);
    const Samples source = counted(width * height);
    Samples expected;
    for (int j = 0; j < height; ++j) {
        expected.insert(expected.end(), source.begin() + j * width, source.begin() + (j + 1) * width);
        expected.insert(expected.end(), step - width, 77);
    }
    for (const s32 size : cacheSizes) {
        cacheSize = size;
        Samples target(step * height, 77);
        EXPECT_EQ(copyPlane8u(source.data(), width, target.data(), step, width, height), pyxOk);
        EXPECT_TRUE(target == expected) << size;
    }
}

TEST(CopyPlane, NullOutranksSize)
{
    u8 byte = 0;
    EXPECT_EQ(copyPlane8u(nullptr, 1, &byte, 1, 0, 0), pyxErrNullPtr);
    EXPECT_EQ(copyPlane8u(&byte, 1, nullptr, 1, 0, 0), pyxErrNullPtr);
    EXPECT_EQ(copyPlane8u(&byte, 1, &byte, 1, 0, 1), pyxErrSize);
    EXPECT_EQ(copyPlane8u(&byte, 1, &byte, 1, 1, 0), pyxErrSize);
}

TEST(FillPlane, GapBetweenRowsStays)
{
    Samples plane(10, 77);
    fillPlane8u(9, plane.data(), 5, 3, 2);
    EXPECT_EQ(plane, (Samples{9, 9, 9, 77, 77, 9, 9, 9, 77, 77}));
}

TEST(FillPlane, GapBetweenRowsOfALargePlaneStays)
{
    // The rows start off every alignment.
    const int width = 2501, height = 2600, step = 2503;
    static_assert(width * height > 0x600000);
    Samples expected(1, 77);
    for (int j = 0; j < height; ++j) {
        expected.insert(expected.end(), width, 9);
        expected.insert(expected.end(), step - width, 77);
    }
    for (const s32 size : cacheSizes) {
        cacheSize = size;
        Samples plane(1 + step * height, 77);
        fillPlane8u(9, plane.data() + 1, step, width, height);
        EXPECT_TRUE(plane == expected) << size;
    }
}

TEST(FillPlane, WidthEqualToTheStepIsOneRow)
{
    Samples plane(37 * 5 + 2, 77);
    fillPlane8u(9, plane.data() + 1, 37, 37, 5);
    EXPECT_EQ(plane, Samples(1, 77) + Samples(37 * 5, 9) + Samples(1, 77));
}
