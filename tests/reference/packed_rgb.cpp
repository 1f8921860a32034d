#include "reference/packed_rgb.hpp"

#include "reference/arguments.hpp"
#include "reference/bt601_subsampled.hpp"
#include "reference/packed_pixels.hpp"
#include "reference/primitives.hpp"
#include "reference/subsampled.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// Packed pixels of a model.
struct PackedSource {
    Channel<const u16> pixels;
    PackedModel model;

    /// The fields moved up to 8 bits, with zeros below them.
    Triple<s32> rgb(int row, int column) const;
};

Triple<s32> PackedSource::rgb(int row, int column) const
{
    const s32 pixel = pixels.get(row, column);
    const s32 outerMask = (1 << model.outerBits) - 1, middleMask = (1 << model.middleBits) - 1;
    const s32 low = (pixel & outerMask) << (8 - model.outerBits);
    const s32 middle = (pixel >> model.outerBits & middleMask) << (8 - model.middleBits);
    const s32 high = (pixel >> (model.outerBits + model.middleBits) & outerMask) << (8 - model.outerBits);
    return model.redIsHigh ? Triple<s32>{high, middle, low} : Triple<s32>{low, middle, high};
}

PackedSource packedSource(const u16* src, int srcStep, PackedModel model) { return {packedRows(src, srcStep), model}; }

/// The pixels of a block that lie in the region, summed up.
struct BlockSums {
    Triple<s32> rgb;
    int pixels;
};

BlockSums sumsOf(const PackedSource& src, RoiSize roi, Block block, int blockRow, int blockColumn)
{
    BlockSums sums = {{0, 0, 0}, 0};
    const int endRow = std::min((blockRow + 1) * block.rows, roi.height);
    const int endColumn = std::min((blockColumn + 1) * block.columns, roi.width);
    for (int row = blockRow * block.rows; row < endRow; ++row) {
        for (int column = blockColumn * block.columns; column < endColumn; ++column) {
            const Triple<s32> pixel = src.rgb(row, column);
            for (int k = 0; k < 3; ++k) sums.rgb[k] += pixel[k];
            ++sums.pixels;
        }
    }
    return sums;
}

// Bias and rounding are those of one pixel at any number of them, so that an eighth of a step rounds up.
Chroma chromaOf(const BlockSums& sums)
{
    if (sums.pixels == 4) return chromaExact(sums.rgb, 18, 0x1ff8000);
    if (sums.pixels == 2) return chromaExact(sums.rgb, 17, 0xffc000);
    return chromaExact(sums.rgb, 16, 0x7fe000);
}

u8 lumaOf(Triple<s32> rgb)
{
    const auto [r, g, b] = rgb;
    return low8((16843 * r + 33030 * g + 6423 * b + 0x108000) >> 16);
}

/// Every pixel of the region, and of its blocks those that are not whole too.
void toYCbCr(const PackedSource& src, const Image<u8>& dst, RoiSize roi, Block block)
{
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) dst[0].set(row, column, lumaOf(src.rgb(row, column)));
    }
    for (int row = 0; row * block.rows < roi.height; ++row) {
        for (int column = 0; column * block.columns < roi.width; ++column) {
            const Chroma chroma = chromaOf(sumsOf(src, roi, block, row, column));
            dst[1].set(row, column, chroma.cb);
            dst[2].set(row, column, chroma.cr);
        }
    }
}

PyxStatus to420(const PackedSource& src, const u16* first, u8* const* dst, const int* dstStep, RoiSize roi,
                bool exchanged)
{
    if (anyNull(first, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    const auto target = planar(dst, dstStep);
    toYCbCr(src, exchanged ? chromaExchanged(target) : target, roi, block420);
    return pyxOk;
}

PyxStatus to422(const PackedSource& src, const u16* first, u8* const* dst, const int* dstStep, RoiSize roi)
{
    if (anyNull(first, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    toYCbCr(src, planar(dst, dstStep), roi, block422);
    return pyxOk;
}

/// A last odd pixel has no place for its Cr.
PyxStatus to422Packed(const PackedSource& src, const u16* first, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(first, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    const auto target = packedYCbCr(dst, dstStep);
    toYCbCr(src, target, wholeBlocks(roi, block422), block422);
    if (roi.width % 2 == 0) return pyxOk;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<s32> lone = src.rgb(row, column);
        target[0].set(row, column, lumaOf(lone));
        target[1].set(row, column / 2, chromaOf({lone, 1}).cb);
    }
    return pyxOk;
}

PyxStatus to411(const PackedSource& src, const u16* first, u8* const* dst, const int* dstStep, RoiSize roi)
{
    if (anyNull(first, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    toYCbCr(src, planar(dst, dstStep), wholeBlocks(roi, block411), block411);
    return statusOf(roi, block411);
}

/// How Y, U and V are rounded.
struct YuvRounding {
    s32 luma, chroma;
    int chromaShift;
};

/// What makes no whole block is left out.
PyxStatus toYuv(const PackedSource& src, u8* const* dst, const int* dstStep, RoiSize roi, Block block,
                YuvRounding rounding)
{
    const RoiSize whole = wholeBlocks(roi, block);
    const auto target = planar(dst, dstStep);
    const auto weighted = [](Triple<s32> rgb) { return 19595 * rgb[0] + 38470 * rgb[1] + 7471 * rgb[2]; };
    for (int row = 0; row < whole.height; ++row) {
        for (int column = 0; column < whole.width; ++column)
            target[0].set(row, column, low8((weighted(src.rgb(row, column)) + rounding.luma) >> 16));
    }
    for (int row = 0; row < whole.height / block.rows; ++row) {
        for (int column = 0; column < whole.width / block.columns; ++column) {
            const Triple<s32> sums = sumsOf(src, whole, block, row, column).rgb;
            const s32 s = weighted(sums);
            const s32 blue = (sums[2] * 65536 - s + rounding.chroma) >> 16;
            const s32 red = (sums[0] * 65536 - s + rounding.chroma) >> 16;
            target[1].set(row, column, low8((blue * 32244 >> rounding.chromaShift) - 128));
            target[2].set(row, column, sat8((red * 57475 >> rounding.chromaShift) + 128));
        }
    }
    return statusOf(roi, block);
}

PyxStatus toYuv420(const PackedSource& src, const u16* first, u8* const* dst, const int* dstStep, RoiSize roi)
{
    if (anyNull(first, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    return toYuv(src, dst, dstStep, roi, block420, {32768, 0x1ffff, 18});
}

PyxStatus unpack565(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = packedSource(src, srcStep, rgb565);
    const auto target = interleaved(dst, dstStep, 3);
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const Triple<s32> pixel = source.rgb(row, column);
            for (int k = 0; k < 3; ++k) target[k].set(row, column, static_cast<u8>(pixel[k]));
        }
    }
    return pyxOk;
}

// The target's step is taken as it is, unlike that of a packed source.
PyxStatus pack565(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = interleaved(src, srcStep, 3);
    const PackedTarget target = {Channel<u16>(dst, dstStep, 1), rgb565, cut};
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) target.set(row, column, pixelOf(source, row, column));
    }
    return pyxOk;
}

} // namespace

// The channels go by their places, so that the same statement serves both orders.
PyxStatus pyxiBGR565ToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return unpack565(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGB565ToRGB_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return unpack565(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiBGRToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack565(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack565(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiBGR555ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to420(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi, false);
}

PyxStatus pyxiBGR555ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to420(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi, true);
}

PyxStatus pyxiBGR555ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to422(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR555ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return to422Packed(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR555ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to411(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR555ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi)
{
    return toYuv420(packedSource(src, srcStep, bgr555), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR565ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to420(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi, false);
}

PyxStatus pyxiBGR565ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to420(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi, true);
}

PyxStatus pyxiBGR565ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to422(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR565ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return to422Packed(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR565ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                           RoiSize roi)
{
    return to411(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi);
}

PyxStatus pyxiBGR565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi)
{
    return toYuv420(packedSource(src, srcStep, bgr565), src, dst, dstStep, roi);
}

// Luma is not rounded.
PyxStatus pyxiRGB565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    return toYuv(packedSource(src, srcStep, rgb565), dst, dstStep, roi, block420, {0, 0x1ffff, 18});
}

PyxStatus pyxiRGB565ToYUV422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                         RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    return toYuv(packedSource(src, srcStep, rgb565), dst, dstStep, roi, block422, {0, 65535, 17});
}

} // namespace reference
