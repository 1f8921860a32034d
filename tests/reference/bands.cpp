#include "reference/bands.hpp"

#include "reference/primitives.hpp"
#include "reference/resampling.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// Rows of luma, counted from the first row of the region, and the ends of the image that are among them.
struct Band {
    int begin, end;
    bool atTop, atBottom;
};

/// The last two rows of a band that another one follows are left to that one.
Band bandOf(s32 layout, int height)
{
    const bool whole = (layout & 1) != 0 && (layout & 4) != 0 && (layout & 16) != 0;
    if (whole) return {0, height, true, true};
    if (layout == 1) return {0, height - 2, true, false};
    if (layout == 4) return {-2, height - 2, false, false};
    if (layout == 16) return {-2, height, false, true};
    return {0, 0, false, false};
}

bool isFirst(const Band& band, int row) { return band.atTop && row == 0; }

bool isLast(const Band& band, int row) { return band.atBottom && row == band.end - 1; }

/// The cascade of 1, 2, 1.
u8 smoothed(u8 above, u8 here, u8 below) { return avgUp(avgUp(above, here), avgUp(here, below)); }

/// Chroma row k and the one below it. The last row of the image has none below, nor has a luma row beyond the last pair
/// a chroma row of its own.
u8 halfRowDown(const Channel<const u8>& chroma, const Band& band, int k, int column)
{
    int here = k, below = k + 1;
    if (band.atBottom) {
        const int last = band.end / 2 - 1;
        here = std::min(here, last);
        below = std::min(below, last);
    }
    return avgUp(chroma.get(here, column), chroma.get(below, column));
}

} // namespace

void bandTo422(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, s32 layout)
{
    const Band band = bandOf(layout, roi.height);
    const int columns = roi.width & ~1;
    for (int row = band.begin; row < band.end; ++row) {
        for (int column = 0; column < columns; ++column) {
            const auto y = [&](int r) { return src[0].get(r, column); };
            if (isFirst(band, row)) {
                dst[0].set(row, column, sat8((3 * y(row) + y(row + 1) + 4) >> 2));
            } else if (isLast(band, row)) {
                dst[0].set(row, column, sat8((3 * y(row) + y(row - 1) + 4) >> 2));
            } else {
                dst[0].set(row, column, smoothed(y(row - 1), y(row), y(row + 1)));
            }
        }
        for (int column = 0; column < columns / 2; ++column) {
            dst[1].set(row, column, halfRowDown(src[1], band, row >> 1, column));
            dst[2].set(row, column, halfRowDown(src[2], band, row >> 1, column));
        }
    }
}

// At the ends of the image a row of luma takes the place of the neighbour that it lacks.
void bandTo420(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, s32 layout)
{
    const Band band = bandOf(layout, roi.height);
    const int columns = roi.width & ~1;
    for (int row = band.begin; row < band.end; ++row) {
        const int above = isFirst(band, row) ? row : row - 1;
        const int below = isLast(band, row) ? row : row + 1;
        for (int column = 0; column < columns; ++column) {
            const Channel<const u8>& y = src[0];
            dst[0].set(row, column, smoothed(y.get(above, column), y.get(row, column), y.get(below, column)));
        }
    }
    for (int row = band.begin / 2; row < band.end / 2; ++row) {
        for (int column = 0; column < columns / 2; ++column) {
            dst[1].set(row, column, halfRowDown(src[1], band, row, column));
            dst[2].set(row, column, halfRowDown(src[2], band, row, column));
        }
    }
}

} // namespace reference
