#include "reference/resampling.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// Rounds halves up in the columns below `upColumns` and down in the rest.
u8 averageAt(int column, int upColumns, u8 a, u8 b) { return column < upColumns ? avgUp(a, b) : avgDown(a, b); }

/// How many samples of a row of `count` are averaged with their right neighbours by avgUp.
int upColumnsOf(int count) { return (count - 1) & ~15; }

/// A row of `count` samples at twice its length: each sample is followed by its average with the next one, the last by
/// itself.
u8 widened(const Channel<const u8>& src, int row, int column, int count)
{
    const int left = column / 2;
    if (column % 2 == 0 || left == count - 1) return src.get(row, left);
    return averageAt(left, upColumnsOf(count), src.get(row, left), src.get(row, left + 1));
}

} // namespace

u8 avgUp(u8 a, u8 b) { return static_cast<u8>((a + b + 1) >> 1); }

u8 avgDown(u8 a, u8 b) { return static_cast<u8>((a + b) >> 1); }

// The odd rows of the source are left out.
void chroma411To420(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi)
{
    const int count = roi.width / 4;
    for (int row = 0; row < roi.height / 2; ++row) {
        for (int column = 0; column < 2 * count; ++column) {
            dst.set(row, column, widened(src, 2 * row, column, count));
        }
    }
}

// The last row is not averaged in any direction.
void chroma1620To420(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi)
{
    const int count = roi.width / 4;
    const int last = roi.height / 4 - 1;
    for (int row = 0; row <= last; ++row) {
        for (int column = 0; column < 2 * count; ++column) {
            const u8 here = widened(src, row, column, count);
            dst.set(2 * row, column, here);
            if (row < last) {
                const u8 below = widened(src, row + 1, column, count);
                dst.set(2 * row + 1, column, averageAt(column / 2, upColumnsOf(count), here, below));
            } else {
                dst.set(2 * row + 1, column, src.get(row, column / 2));
            }
        }
    }
}

// All rows of the source but the last are averaged with the next one, but at least one is: a source of one row is read
// beyond its end, and the target is then written beyond its own.
void chroma420To411(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi)
{
    const int count = roi.width / 4;
    const int upColumns = count & ~31;
    const int last = std::max(1, roi.height / 2 - 1);
    for (int row = 0; row < last; ++row) {
        for (int column = 0; column < count; ++column) {
            const u8 here = src.get(row, 2 * column), below = src.get(row + 1, 2 * column);
            dst.set(2 * row, column, here);
            dst.set(2 * row + 1, column, averageAt(column, upColumns, here, below));
        }
    }
    for (int column = 0; column < count; ++column) {
        dst.set(2 * last, column, src.get(last, 2 * column));
        dst.set(2 * last + 1, column, src.get(last, 2 * column));
    }
}

void chroma420To1620(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi)
{
    for (int row = 0; row < roi.height / 4; ++row) {
        for (int column = 0; column < roi.width / 4; ++column) dst.set(row, column, src.get(2 * row, 2 * column));
    }
}

} // namespace reference
