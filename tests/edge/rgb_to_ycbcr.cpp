// RGB to YCbCr: known colours, and the column at which a row passes from the wide form to that of the tail.
#include "pyxcc/rgb_ycbcr.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <utility>

using namespace edge;

namespace
{

using Interleaved = PyxStatus (*)(const u8*, int, u8*, int, RoiSize);
using ToPlanes = PyxStatus (*)(const u8*, int, u8* const*, int, RoiSize);

/// A row of `width` equal pixels, converted.
Samples interleavedRow(Interleaved convert, std::initializer_list<u8> pixel, int width)
{
    const Samples source = repeated(pixel, width);
    Samples target(source.size());
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

struct Planes {
    Samples y, cb, cr;
    bool operator==(const Planes&) const = default;
};

Planes planesRow(ToPlanes convert, std::initializer_list<u8> pixel, int width)
{
    const Samples source = repeated(pixel, width);
    Planes target = {Samples(width), Samples(width), Samples(width)};
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    EXPECT_EQ(convert(source.data(), 0, dst, 0, {width, 1}), pyxOk);
    return target;
}

/// The planar conversion, fed from three planes of one value each.
PyxStatus fromPlanes(const u8* src, int, u8* const* dst, int dstStep, RoiSize roi)
{
    const Samples r(roi.width, src[0]), g(roi.width, src[1]), b(roi.width, src[2]);
    const u8* const planes[3] = {r.data(), g.data(), b.data()};
    return pyxiRGBToYCbCr_8u_P3R(planes, 0, dst, dstStep, roi);
}

/// The rows of luma, all chroma being that of gray.
Planes gray(Samples y)
{
    const Samples chroma(y.size(), 128);
    return {std::move(y), chroma, chroma};
}

} // namespace

TEST(RgbToYCbCr, BlackAndWhiteAreTheSameInEveryForm)
{
    for (const int width : {15, 16, 17}) {
        EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_C3R, {0, 0, 0}, width), repeated({16, 128, 128}, width));
        EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_C3R, {255, 255, 255}, width), repeated({235, 128, 128}, width));
        for (const ToPlanes convert : {ToPlanes{pyxiRGBToYCbCr_8u_C3P3R}, ToPlanes{fromPlanes}}) {
            EXPECT_EQ(planesRow(convert, {0, 0, 0}, width), gray(Samples(width, 16)));
            EXPECT_EQ(planesRow(convert, {255, 255, 255}, width), gray(Samples(width, 235)));
        }
    }
}

TEST(RgbToYCbCr, InterleavedRowOf15IsExact)
{
    EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_C3R, {255, 0, 0}, 15), repeated({82, 90, 240}, 15));
}

TEST(RgbToYCbCr, InterleavedRowOf16IsRounded)
{
    EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_C3R, {255, 0, 0}, 16), repeated({81, 90, 239}, 16));
}

TEST(RgbToYCbCr, InterleavedRowOf17EndsExact)
{
    EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_C3R, {255, 0, 0}, 17),
              repeated({81, 90, 239}, 16) + repeated({82, 90, 240}, 1));
}

TEST(RgbToYCbCr, AlignmentOfTheTargetDoesNotShow)
{
    const Samples source = repeated({255, 0, 0}, 2 * 17);
    const Samples row = repeated({81, 90, 239}, 16) + repeated({82, 90, 240}, 1);
    alignas(16) u8 target[256];
    for (const int offset : {0, 1}) {
        // A step of 64 keeps all rows aligned as the first.
        EXPECT_EQ(pyxiRGBToYCbCr_8u_C3R(source.data(), 51, target + offset, 64, {17, 2}), pyxOk);
        EXPECT_EQ(Samples(target + offset, target + offset + 51), row);
        EXPECT_EQ(Samples(target + offset + 64, target + offset + 64 + 51), row);
    }
}

TEST(RgbToYCbCr, AlphaOfTheTargetStays)
{
    const Samples source = repeated({255, 0, 0, 99}, 33);
    Samples target(4 * 33, 77);
    EXPECT_EQ(pyxiRGBToYCbCr_8u_AC4R(source.data(), 0, target.data(), 0, {33, 1}), pyxOk);
    EXPECT_EQ(target, repeated({82, 90, 240, 77}, 33));
}

TEST(RgbToYCbCr, AlphaOfTheSourceDoesNotMatter)
{
    for (const u8 alpha : {0, 1, 128, 255}) {
        EXPECT_EQ(interleavedRow(pyxiRGBToYCbCr_8u_AC4R, {255, 0, 0, alpha}, 33), repeated({82, 90, 240, 0}, 33));
        EXPECT_EQ(planesRow(pyxiRGBToYCbCr_8u_AC4P3R, {39, 39, 39, alpha}, 9), gray(Samples(8, 49) + Samples(1, 50)));
    }
}

// Luma of a gray of 39. The exact form: 39 * (16843 + 33030 + 6423) + 0x108000 = 3276888, of which the high word is 50.
// The high form cuts the products of 9984 and the weights to their high words 2565, 5031 and 978; with 128 the sum is
// 8702, and (8702 >> 8) + 16 = 49.
TEST(RgbToYCbCr, PlanarTargetsTakeTheHighFormInBlocksOf8)
{
    for (const ToPlanes convert : {ToPlanes{pyxiRGBToYCbCr_8u_C3P3R}, ToPlanes{fromPlanes}}) {
        EXPECT_EQ(planesRow(convert, {39, 39, 39}, 7), gray(Samples(7, 50)));
        EXPECT_EQ(planesRow(convert, {39, 39, 39}, 8), gray(Samples(8, 49)));
        EXPECT_EQ(planesRow(convert, {39, 39, 39}, 9), gray(Samples(8, 49) + Samples(1, 50)));
        EXPECT_EQ(planesRow(convert, {39, 39, 39}, 31), gray(Samples(24, 49) + Samples(7, 50)));
        EXPECT_EQ(planesRow(convert, {39, 39, 39}, 32), gray(Samples(32, 49)));
    }
}

TEST(RgbToYCbCr, AlignedPlanesGiveTheSame)
{
    // Pointers, steps and width are multiples of 16 here, in the other tests only by chance.
    alignas(16) u8 source[3][64];
    alignas(16) u8 target[3][64] = {};
    std::fill_n(source[0], 3 * 64, u8{39});
    const u8* const src[3] = {source[0], source[1], source[2]};
    u8* const dst[3] = {target[0], target[1], target[2]};
    EXPECT_EQ(pyxiRGBToYCbCr_8u_P3R(src, 32, dst, 32, {16, 2}), pyxOk);
    const Samples gap(16, 0);
    EXPECT_EQ(Samples(target[0], target[0] + 64), Samples(16, 49) + gap + Samples(16, 49) + gap);
    EXPECT_EQ(Samples(target[1], target[1] + 64), Samples(16, 128) + gap + Samples(16, 128) + gap);
    EXPECT_EQ(Samples(target[2], target[2] + 64), Samples(16, 128) + gap + Samples(16, 128) + gap);
}
