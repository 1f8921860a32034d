#include "reference/repacking.hpp"

namespace reference
{

namespace
{

constexpr Block block411by420 = {4, 2};

ChromaIndex same(int row, int column) { return {row, column}; }

/// Each row of the source serves two rows.
ChromaIndex halfRow(int row, int column) { return {row >> 1, column}; }

/// Odd rows of the source are left out.
ChromaIndex evenRow(int row, int column) { return {2 * row, column}; }

/// Each sample of the source serves two columns.
ChromaIndex halfColumn(int row, int column) { return {row, column >> 1}; }

/// Odd columns of the source are left out.
ChromaIndex evenColumn(int row, int column) { return {row, 2 * column}; }

/// The samples of two rows in turn: even ones of the upper row, odd ones of the lower.
ChromaIndex folded(int row, int column) { return {2 * row + (column & 1), column >> 1}; }

/// The way back: even samples for the upper row, odd ones for the lower.
ChromaIndex unfolded(int row, int column) { return {row >> 1, 2 * column + (row & 1)}; }

} // namespace

const Regrid sameGrid420 = {same, block420, block420};
const Regrid sameGrid422 = {same, block422, block422};
const Regrid sameGrid411 = {same, block411, block411};
const Regrid rowDouble = {halfRow, block420, block422};
const Regrid rowSkip = {evenRow, block420, block420};
const Regrid colDouble = {halfColumn, block411, block422};
const Regrid colSkip = {evenColumn, block411, block411};
const Regrid rowFold = {folded, block411by420, block420};
const Regrid rowUnfold = {unfolded, block411by420, block411};

void copyChannel(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size)
{
    for (int row = 0; row < size.height; ++row) {
        for (int column = 0; column < size.width; ++column) dst.set(row, column, src.get(row, column));
    }
}

void repack(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, const Regrid& regrid)
{
    const RoiSize worked = wholeBlocks(roi, regrid.worked);
    copyChannel(src[0], dst[0], worked);
    for (int row = 0; row < worked.height / regrid.target.rows; ++row) {
        for (int column = 0; column < worked.width / regrid.target.columns; ++column) {
            const ChromaIndex from = regrid.rule(row, column);
            dst[1].set(row, column, src[1].get(from.row, from.column));
            dst[2].set(row, column, src[2].get(from.row, from.column));
        }
    }
}

Image<const u8> planarYCrCbOfCrossedSteps(const u8* const* planes, const int* steps)
{
    const Channel<const u8> y(planes[0], steps[0], 1);
    const Channel<const u8> cb(planes[2], steps[1], 1);
    const Channel<const u8> cr(planes[1], steps[2], 1);
    return {y, cb, cr};
}

} // namespace reference
