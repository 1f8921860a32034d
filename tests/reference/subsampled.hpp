// Images with chroma at a lower resolution than luma. Their channels are Y, Cb, Cr, and the rows and columns of chroma
// count its own samples.
#pragma once

#include "reference/image.hpp"
#include "reference/pixels.hpp"

namespace reference
{

/// The pixels that share a chroma sample.
struct Block {
    int columns, rows;
};

inline constexpr Block block420 = {2, 2};
inline constexpr Block block422 = {2, 1};
inline constexpr Block block411 = {4, 1};

/// The part of a region that is made of whole blocks.
constexpr RoiSize wholeBlocks(RoiSize roi, Block block)
{
    return {roi.width / block.columns * block.columns, roi.height / block.rows * block.rows};
}

/// What comes of a conversion that warns of a size off the block.
constexpr PyxStatus statusOf(RoiSize roi, Block block)
{
    const bool whole = roi.width % block.columns == 0 && roi.height % block.rows == 0;
    return whole ? pyxOk : pyxWarnOddSize;
}

/// Planes of Y, Cb and Cr with a step each.
template <typename T> Image<T> planar(T* const* planes, const int* steps)
{
    return {Channel<T>(planes[0], steps[0], 1), Channel<T>(planes[1], steps[1], 1), Channel<T>(planes[2], steps[2], 1)};
}

/// A plane of Y and one of Cb, Cr pairs.
template <typename T> Image<T> semiPlanar(T* y, int yStep, T* cbcr, int cbcrStep)
{
    return {Channel<T>(y, yStep, 1), Channel<T>(cbcr, cbcrStep, 2), Channel<T>(cbcr + 1, cbcrStep, 2)};
}

/// Pairs of pixels: Y0 Cb Y1 Cr.
template <typename T> Image<T> packedYCbCr(T* first, int step)
{
    return {Channel<T>(first, step, 2), Channel<T>(first + 1, step, 4), Channel<T>(first + 3, step, 4)};
}

/// Pairs of pixels: Cb Y0 Cr Y1.
template <typename T> Image<T> packedCbYCr(T* first, int step)
{
    return {Channel<T>(first + 1, step, 2), Channel<T>(first, step, 4), Channel<T>(first + 2, step, 4)};
}

/// The same image where Cr is stored in the place of Cb, and Cb in that of Cr.
template <typename T> Image<T> chromaExchanged(const Image<T>& image) { return {image[0], image[2], image[1]}; }

/// The chroma sample that comes first in a pair of packed pixels. It stays where the last pair has one pixel only.
enum class First { cb, cr };

/// The first three samples of a pixel, in the order of its channels.
Triple<u8> pixelOf(const Image<const u8>& image, int row, int column);

/// A chroma sample of each kind.
struct Chroma {
    u8 cb, cr;
};

using LumaForm = u8 (*)(Triple<u8> rgb);
using ChromaForm = Chroma (*)(Triple<s32> sums);

/// The arithmetic towards luma and chroma in a span of columns.
struct ForwardForms {
    LumaForm luma;
    ChromaForm chroma;
    LumaForm oddLuma = luma; ///< of the pixels in odd columns
};

/// Luma of every pixel of the region, chroma of its whole blocks. Chroma is taken from the sums of R, G, B over the
/// block. The pixels of the first `wideColumns` columns take the wide forms, those that are left take the tail forms; a
/// block goes by its first pixel.
void toSubsampled(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, Block block, int wideColumns,
                  const ForwardForms& wide, const ForwardForms& tail);

using InverseForm = Triple<u8> (*)(Triple<u8> ycbcr);

/// Which chroma samples serve a pixel.
struct ChromaPlace {
    int row, cbColumn, crColumn;
};

void convertPixel(const Image<const u8>& ycbcr, const Image<u8>& rgb, int row, int column, ChromaPlace chroma,
                  InverseForm form);

/// Every pixel of the region with the chroma of its block.
void fromSubsampled(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, Block block, int wideColumns,
                    InverseForm wide, InverseForm tail);

/// Every pixel of a packed image. The last pixel of an odd width has the first chroma sample of its pair, and for want
/// of the second one that of the pair before. In a row of one pixel that lies before the row.
void fromPacked(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, First first, int wideColumns,
                InverseForm wide, InverseForm tail);

} // namespace reference
