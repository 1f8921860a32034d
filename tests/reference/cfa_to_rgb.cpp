#include "reference/cfa_to_rgb.hpp"

#include "reference/arguments.hpp"
#include "reference/image.hpp"
#include "reference/mosaic.hpp"
#include "reference/pixels.hpp"

#include <algorithm>
#include <cstdint>
#include <cstdlib>

namespace reference
{

namespace
{

/// Green of a red or blue sample. Where it is `inner`, it goes along the smaller difference of its own colour.
template <typename T> s32 greenAt(const Mosaic<T>& mosaic, int x, int y, bool inner)
{
    const s32 left = mosaic.at(x - 1, y), right = mosaic.at(x + 1, y);
    const s32 up = mosaic.at(x, y - 1), down = mosaic.at(x, y + 1);
    if (inner) {
        const s32 h = std::abs(mosaic.at(x - 2, y) - mosaic.at(x + 2, y));
        const s32 v = std::abs(mosaic.at(x, y - 2) - mosaic.at(x, y + 2));
        if (v < h) return (up + down + 1) >> 1;
        if (v > h) return (left + right + 1) >> 1;
    }
    return (left + right + up + down + 2) >> 2;
}

template <typename T> Triple<s32> rgbAt(const Mosaic<T>& mosaic, int x, int y, bool inner)
{
    const s32 centre = mosaic.at(x, y);
    const s32 beside = (mosaic.at(x - 1, y) + mosaic.at(x + 1, y) + 1) >> 1;
    const s32 above = (mosaic.at(x, y - 1) + mosaic.at(x, y + 1) + 1) >> 1;
    const s32 diagonal =
        (mosaic.at(x - 1, y - 1) + mosaic.at(x + 1, y - 1) + mosaic.at(x - 1, y + 1) + mosaic.at(x + 1, y + 1) + 2) >>
        2;
    switch (mosaic.site(x, y)) {
    case Site::red:
        return {centre, greenAt(mosaic, x, y, inner), diagonal};
    case Site::blue:
        return {diagonal, greenAt(mosaic, x, y, inner), centre};
    case Site::greenInRedRow:
        return {beside, centre, above};
    default:
        return {above, centre, beside};
    }
}

/// Rows and columns from the first to the last.
struct Piece {
    bool runs;
    int firstColumn, lastColumn, firstRow, lastRow;
};

/// The two outer samples at each edge are a frame, in pieces; what is within goes by gradients.
template <typename T>
PyxStatus interpolate(const T* src, RoiRect srcRoi, RoiSize size, int srcStep, T* dst, int dstStep, s32 grid)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(size, 2, 2)) return pyxErrSize;
    if (!isGridKnown(grid)) return pyxErrBadArg;

    const int x = srcRoi.x, y = srcRoi.y;
    const int w = std::int64_t{x} + srcRoi.width > size.width ? size.width - x : srcRoi.width;
    const int h = std::int64_t{y} + srcRoi.height > size.height ? size.height - y : srcRoi.height;
    if (w < 1 || h < 1) return pyxOk;
    const int xEnd = x + w, yEnd = y + h;

    const int lastColumn = std::min(xEnd - 1, size.width - 1);
    const int firstRow = std::max(y, 2), lastRow = std::min(yEnd - 1, size.height - 3);
    const auto row = [&](bool runs, int at) { return Piece{runs, x, lastColumn, at, at}; };
    const auto column = [&](bool runs, int at) { return Piece{runs, at, at, firstRow, lastRow}; };
    const bool isHigh = size.height >= 3, isWide = size.width >= 3;
    const Piece frame[8] = {
        row(y == 0, 0),
        row(isHigh && ((y == 0 && h >= 2) || y == 1), 1),
        column(x == 0, 0),
        column(isWide && ((x == 0 && w >= 2) || x == 1), 1),
        column(isWide && xEnd >= size.width - 1 && x < size.width - 1, size.width - 2),
        column(xEnd == size.width, size.width - 1),
        row(isHigh && yEnd >= size.height - 1 && y < size.height - 1, size.height - 2),
        row(yEnd == size.height, size.height - 1),
    };
    const Piece within = {true, std::max(x, 2), std::min(xEnd - 1, size.width - 3), firstRow, lastRow};

    const Mosaic<T> mosaic(src, srcStep, size, grid);
    const auto target = interleaved(dst, dstStep, 3);
    const auto convertPiece = [&](const Piece& piece, bool inner) {
        if (!piece.runs) return;
        for (int j = piece.firstRow; j <= piece.lastRow; ++j) {
            for (int i = piece.firstColumn; i <= piece.lastColumn; ++i) {
                const Triple<s32> rgb = rgbAt(mosaic, i, j, inner);
                for (int k = 0; k < 3; ++k) target[k].set(j - y, i - x, static_cast<T>(rgb[k]));
            }
        }
    };
    for (const Piece& piece : frame) convertPiece(piece, false);
    convertPiece(within, true);
    return pyxOk;
}

} // namespace

PyxStatus pyxiCFAToRGB_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst, int dstStep,
                                s32 grid, s32)
{
    return interpolate(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}

// Rows are counted in whole samples, so that an odd step loses its low bit.
PyxStatus pyxiCFAToRGB_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst, int dstStep,
                                 s32 grid, s32)
{
    return interpolate(src, srcRoi, srcSize, srcStep & ~1, dst, dstStep & ~1, grid);
}

} // namespace reference
