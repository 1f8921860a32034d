// Bytes to one bit a pixel: places of bits, those that are kept, the threshold, the first steps of the diffusion.
#include "pyxcc/pyxcc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

using namespace edge;

namespace
{

/// The bytes of a row that held `before`.
Samples bits(const Samples& source, s32 bitOffset, s32 type, u8 threshold, Samples before)
{
    const int width = static_cast<int>(source.size());
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(source.data(), 0, before.data(), 0, bitOffset, {width, 1}, 0, 0, type, threshold),
              pyxOk);
    return before;
}

} // namespace

TEST(ReduceBitsToOne, BitsOutsideThePixelsAreKept)
{
    for (const s32 offset : {3, 11, 0x7ffffffb}) {
        for (const s32 type : {0, 3}) {
            EXPECT_EQ(bits(Samples(7, 255), offset, type, 0, {0, 0, 0}), (Samples{0x1f, 0xc0, 0})) << offset;
            EXPECT_EQ(bits(Samples(7, 0), offset, type, 0, {255, 255, 255}), (Samples{0xe0, 0x3f, 255})) << offset;
        }
    }
    EXPECT_EQ(bits({255}, 3, 0, 0, {0x80}), (Samples{0x90}));
}

TEST(ReduceBitsToOne, TheFirstPixelIsTheHighBit)
{
    EXPECT_EQ(bits({255, 0, 0, 255, 0, 255, 255, 255, 0, 255}, 0, 0, 128, {0, 0}), (Samples{0x97, 0x40}));
    // The same over whole blocks.
    Samples row;
    for (int i = 0; i < 9; ++i) row = row + Samples{255, 0, 0, 255, 0, 255, 255, 255};
    EXPECT_EQ(bits(row, 0, 0, 128, Samples(9, 0)), Samples(9, 0x97));
    EXPECT_EQ(bits(row, 4, 0, 128, Samples(10, 0xff)), Samples{0xf9} + Samples(8, 0x79) + Samples{0x7f});
}

TEST(ReduceBitsToOne, OnlyWhatIsAboveTheThresholdIsSet)
{
    EXPECT_EQ(bits({0, 1, 255, 0, 2, 0, 0, 3}, 0, 0, 0, {0}), (Samples{0x69}));
    EXPECT_EQ(bits({99, 100, 101, 100, 101, 0, 255, 100}, 0, 0, 100, {0}), (Samples{0x2a}));
    EXPECT_EQ(bits(Samples(70, 255), 0, 0, 255, Samples(9, 0)), Samples(9, 0));
}

// 128 is just not above 128 and leaves 1024. The next has 8 * 1024 * 23 on top, is set, and leaves 1208 - 2047 = -839.
// The third has 4 * 1024 - 8 * 839 = -2616 and leaves (1048576 - 60168) >> 10 = 965. The fourth has 8 * 965 - 4 * 839 =
// 4364.
TEST(ReduceBitsToOne, DiffusionAlongARow) { EXPECT_EQ(bits(Samples(4, 128), 0, 3, 128, {0}), (Samples{0x50})); }

// One column: 128 leaves 1024, of which the next row has 8 * 1024, and so on as along a row but for the weights of
// the row before that, which are half of them: the third row has 4 * 1024 - 8 * 839 as well.
TEST(ReduceBitsToOne, DiffusionDownAColumn)
{
    const Samples source(4, 128);
    Samples target(4, 0);
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(source.data(), 1, target.data(), 1, 0, {1, 4}, 0, 0, 3, 128), pyxOk);
    EXPECT_EQ(target, (Samples{0, 0x80, 0, 0x80}));
}

TEST(ReduceBitsToOne, DiffusionOfBlackAndWhite)
{
    // White gains 2040 and pays 2047, and what is owed stays far below it.
    for (const int width : {1, 8, 37, 70}) {
        const RoiSize roi = {width, 9};
        const int step = (width + 7) / 8;
        const std::size_t count = static_cast<std::size_t>(width) * 9, targetCount = static_cast<std::size_t>(step) * 9;
        Samples target(targetCount, 0xff);
        EXPECT_EQ(pyxiReduceBits_8u1u_C1R(Samples(count, 0).data(), width, target.data(), step, 0, roi, 0, 0, 3, 0),
                  pyxOk);
        Samples black, white;
        for (int row = 0; row < 9; ++row) {
            const u8 kept = static_cast<u8>(0xff >> ((width - 1) % 8 + 1));
            black = black + Samples(static_cast<std::size_t>(step - 1), 0) + Samples{kept};
            white = white + Samples(static_cast<std::size_t>(step - 1), 0xff) + Samples{static_cast<u8>(~kept)};
        }
        EXPECT_EQ(target, black) << width;
        target = Samples(targetCount, 0);
        EXPECT_EQ(pyxiReduceBits_8u1u_C1R(Samples(count, 255).data(), width, target.data(), step, 0, roi, 0, 0, 3, 0),
                  pyxOk);
        EXPECT_EQ(target, white) << width;
    }
}

TEST(ReduceBitsToOne, ArgumentsAreTestedInTheirOrder)
{
    const u8 source = 255;
    u8 target = 0;
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(nullptr, 1, &target, 1, -1, {0, 1}, 0, 0, 1, 0), pyxErrNullPtr);
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, nullptr, 1, 0, {1, 1}, 0, 0, 0, 0), pyxErrNullPtr);
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, &target, 1, 0, {0, 1}, 0, 0, 1, 0), pyxErrSize);
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, &target, 1, 0, {1, 0}, 0, 0, 0, 0), pyxErrSize);
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, &target, 1, -1, {1, 1}, 0, 0, 1, 0), pyxErrSize);
    for (const s32 type : {-1, 1, 2, 4})
        EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, &target, 1, 0, {1, 1}, 0, 0, type, 0), pyxErrDitherType);
    EXPECT_EQ(target, 0);
    // The two arguments in front of the type are not looked at.
    EXPECT_EQ(pyxiReduceBits_8u1u_C1R(&source, 1, &target, 1, 0, {1, 1}, -5, 12345, 0, 0), pyxOk);
    EXPECT_EQ(target, 0x80);
}
