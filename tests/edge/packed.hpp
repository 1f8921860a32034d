// Packed pixels of 16 bits, by their fields.
#pragma once

#include "edge/subsampled.hpp"

#include <vector>

namespace edge
{

using PackedRow = std::vector<u16>;

/// What the pixels of a target hold before the call.
inline constexpr u16 untouchedPixel = 0x7777;

/// The fields of a pixel, red first, whatever the order in memory.
inline u16 bgr444(int r, int g, int b) { return static_cast<u16>(r << 8 | g << 4 | b); }
inline u16 rgb444(int r, int g, int b) { return static_cast<u16>(b << 8 | g << 4 | r); }
inline u16 bgr555(int r, int g, int b) { return static_cast<u16>(r << 10 | g << 5 | b); }
inline u16 rgb555(int r, int g, int b) { return static_cast<u16>(b << 10 | g << 5 | r); }
inline u16 bgr565(int r, int g, int b) { return static_cast<u16>(r << 11 | g << 5 | b); }
inline u16 rgb565(int r, int g, int b) { return static_cast<u16>(b << 11 | g << 5 | r); }

inline PackedRow operator+(PackedRow first, const PackedRow& second)
{
    first.insert(first.end(), second.begin(), second.end());
    return first;
}

using PackFromPixels = PyxStatus (*)(const u8*, int, u16*, int, RoiSize);
using PackFromPlanes = PyxStatus (*)(const u8* const*, int, u16*, int, RoiSize);
using PackFromSubsampled = PyxStatus (*)(const u8* const*, const int*, u16*, int, RoiSize);

/// One row of interleaved samples through a conversion.
inline PackedRow packedRowOf(PackFromPixels convert, const Samples& source, int width)
{
    PackedRow target(static_cast<std::size_t>(width), untouchedPixel);
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}), pyxOk);
    return target;
}

/// An image of planes at full resolution.
inline PackedRow packedOf(PackFromPlanes convert, const YCbCrPlanes& source, RoiSize roi)
{
    PackedRow target(pixelCount(roi), untouchedPixel);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    EXPECT_EQ(convert(src, roi.width, target.data(), 2 * roi.width, roi), pyxOk);
    return target;
}

/// An image of planes whose pixels share chroma.
inline PackedRow packedOf(PackFromSubsampled convert, const YCbCrPlanes& source, RoiSize roi, Block block,
                          PyxStatus expected = pyxOk)
{
    PackedRow target(pixelCount(roi), untouchedPixel);
    const u8* const src[3] = {source.y.data(), source.cb.data(), source.cr.data()};
    const int chromaStep = chromaSize(roi, block).width;
    const int srcStep[3] = {roi.width, chromaStep, chromaStep};
    EXPECT_EQ(convert(src, srcStep, target.data(), 2 * roi.width, roi), expected);
    return target;
}

} // namespace edge
