#include "reference/subsampled.hpp"

namespace reference
{

namespace
{

/// The sums of each channel over the pixels of a block, which is counted in blocks.
Triple<s32> sumsOf(const Image<const u8>& rgb, Block block, int blockRow, int blockColumn)
{
    Triple<s32> sums = {0, 0, 0};
    for (int i = 0; i < block.rows; ++i) {
        for (int j = 0; j < block.columns; ++j) {
            const Triple<u8> pixel = pixelOf(rgb, blockRow * block.rows + i, blockColumn * block.columns + j);
            for (int k = 0; k < 3; ++k) sums[k] += pixel[k];
        }
    }
    return sums;
}

} // namespace

Triple<u8> pixelOf(const Image<const u8>& image, int row, int column)
{
    return {image[0].get(row, column), image[1].get(row, column), image[2].get(row, column)};
}

void toSubsampled(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, Block block, int wideColumns,
                  const ForwardForms& wide, const ForwardForms& tail)
{
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const ForwardForms& forms = column < wideColumns ? wide : tail;
            const LumaForm luma = column % 2 == 0 ? forms.luma : forms.oddLuma;
            ycbcr[0].set(row, column, luma(pixelOf(rgb, row, column)));
        }
    }
    for (int row = 0; row < roi.height / block.rows; ++row) {
        for (int column = 0; column < roi.width / block.columns; ++column) {
            const ForwardForms& forms = column * block.columns < wideColumns ? wide : tail;
            const Chroma chroma = forms.chroma(sumsOf(rgb, block, row, column));
            ycbcr[1].set(row, column, chroma.cb);
            ycbcr[2].set(row, column, chroma.cr);
        }
    }
}

void convertPixel(const Image<const u8>& ycbcr, const Image<u8>& rgb, int row, int column, ChromaPlace chroma,
                  InverseForm form)
{
    const u8 y = ycbcr[0].get(row, column);
    const u8 cb = ycbcr[1].get(chroma.row, chroma.cbColumn);
    const u8 cr = ycbcr[2].get(chroma.row, chroma.crColumn);
    const Triple<u8> out = form({y, cb, cr});
    for (int k = 0; k < 3; ++k) rgb[k].set(row, column, out[k]);
}

void fromSubsampled(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, Block block, int wideColumns,
                    InverseForm wide, InverseForm tail)
{
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const int chromaColumn = column / block.columns;
            const ChromaPlace chroma = {row / block.rows, chromaColumn, chromaColumn};
            convertPixel(ycbcr, rgb, row, column, chroma, column < wideColumns ? wide : tail);
        }
    }
}

void fromPacked(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, First first, int wideColumns,
                InverseForm wide, InverseForm tail)
{
    fromSubsampled(ycbcr, rgb, wholeBlocks(roi, block422), block422, wideColumns, wide, tail);
    if (roi.width % 2 == 0) return;
    const int column = roi.width - 1;
    const int own = column / 2, before = own - 1;
    for (int row = 0; row < roi.height; ++row) {
        const ChromaPlace chroma = first == First::cb ? ChromaPlace{row, own, before} : ChromaPlace{row, before, own};
        convertPixel(ycbcr, rgb, row, column, chroma, tail);
    }
}

} // namespace reference
