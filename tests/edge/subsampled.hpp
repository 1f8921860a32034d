// Images of Y, Cb and Cr whose pixels share chroma, as conversions take them and leave them.
#pragma once

#include "edge/samples.hpp"

#include <gtest/gtest.h>

namespace edge
{

/// What the samples of a target hold before the call.
inline constexpr u8 untouched = 77;

/// The fourth sample of target pixels, where a conversion sets it.
inline constexpr u8 aval = 200;

/// The pixels that share a chroma sample.
struct Block {
    int columns, rows;
};

inline constexpr Block block420 = {2, 2};
inline constexpr Block block422 = {2, 1};
inline constexpr Block block411 = {4, 1};

struct Colour {
    u8 y, cb, cr;
};

inline constexpr Colour black = {16, 128, 128};
inline constexpr Colour white = {235, 128, 128};

/// Luma has a sample a pixel; chroma one a block, those that are not whole included.
struct YCbCrPlanes {
    Samples y, cb, cr;
    bool operator==(const YCbCrPlanes&) const = default;
};

inline RoiSize chromaSize(RoiSize roi, Block block)
{
    return {(roi.width + block.columns - 1) / block.columns, (roi.height + block.rows - 1) / block.rows};
}

inline std::size_t pixelCount(RoiSize roi) { return static_cast<std::size_t>(roi.width) * roi.height; }

/// An image of one colour.
inline YCbCrPlanes filledPlanes(Colour colour, RoiSize roi, Block block)
{
    const std::size_t luma = pixelCount(roi), chroma = pixelCount(chromaSize(roi, block));
    return {Samples(luma, colour.y), Samples(chroma, colour.cb), Samples(chroma, colour.cr)};
}

inline YCbCrPlanes untouchedPlanes(RoiSize roi, Block block)
{
    return filledPlanes({untouched, untouched, untouched}, roi, block);
}

/// How much of a row takes the wide forms.
struct Span {
    int width, wideColumns;
};

/// The rows of one block, wide and then tail.
inline YCbCrPlanes twoSpans(Colour wide, Colour tail, Span span, Block block)
{
    const auto row = [](u8 first, int count, u8 second, int end) {
        return Samples(count, first) + Samples(end - count, second);
    };
    const int chromaColumns = span.width / block.columns, wideChromaColumns = span.wideColumns / block.columns;
    Samples luma;
    for (int i = 0; i < block.rows; ++i) luma = luma + row(wide.y, span.wideColumns, tail.y, span.width);
    return {luma, row(wide.cb, wideChromaColumns, tail.cb, chromaColumns),
            row(wide.cr, wideChromaColumns, tail.cr, chromaColumns)};
}

using ToPlanes = PyxStatus (*)(const u8*, int, u8* const*, const int*, RoiSize);

/// What becomes of untouched planes. The second plane is told as Cb, the third as Cr, whatever the name of the
/// conversion.
inline YCbCrPlanes toPlanes(ToPlanes convert, const Samples& pixels, RoiSize roi, Block block, PyxStatus expected)
{
    YCbCrPlanes target = untouchedPlanes(roi, block);
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    const int chromaStep = chromaSize(roi, block).width;
    const int dstStep[3] = {roi.width, chromaStep, chromaStep};
    const int srcStep = static_cast<int>(pixels.size()) / roi.height;
    EXPECT_EQ(convert(pixels.data(), srcStep, dst, dstStep, roi), expected);
    return target;
}

using FromPlanes = PyxStatus (*)(const u8* const*, const int*, u8*, int, RoiSize);
using FromPlanesWithAlpha = PyxStatus (*)(const u8* const*, const int*, u8*, int, RoiSize, u8);

/// What becomes of untouched pixels of three samples.
inline Samples fromPlanes(FromPlanes convert, const YCbCrPlanes& source, RoiSize roi, Block block, PyxStatus expected)
{
    Samples target(3 * pixelCount(roi), untouched);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    const int chromaStep = chromaSize(roi, block).width;
    const int srcStep[3] = {roi.width, chromaStep, chromaStep};
    EXPECT_EQ(convert(src, srcStep, target.data(), 3 * roi.width, roi), expected);
    return target;
}

/// The same of pixels of four samples.
inline Samples fromPlanes(FromPlanesWithAlpha convert, const YCbCrPlanes& source, RoiSize roi, Block block,
                          PyxStatus expected)
{
    Samples target(4 * pixelCount(roi), untouched);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    const int chromaStep = chromaSize(roi, block).width;
    const int srcStep[3] = {roi.width, chromaStep, chromaStep};
    EXPECT_EQ(convert(src, srcStep, target.data(), 4 * roi.width, roi, aval), expected);
    return target;
}

using Packed = PyxStatus (*)(const u8*, int, u8*, int, RoiSize);
using PackedWithAlpha = PyxStatus (*)(const u8*, int, u8*, int, RoiSize, u8);

/// One row through a conversion with two samples a pixel at one end: what becomes of `targetSize` untouched samples.
inline Samples packedRow(Packed convert, const Samples& source, int width, std::size_t targetSize)
{
    Samples target(targetSize, untouched);
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

inline Samples packedRow(PackedWithAlpha convert, const Samples& source, int width, std::size_t targetSize)
{
    Samples target(targetSize, untouched);
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}, aval), pyxOk);
    return target;
}

} // namespace edge
