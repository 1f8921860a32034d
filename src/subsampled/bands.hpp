// Horizontal bands of an image, each of which is a call of its own.
//
// A filter looks at the rows around a row, so that the last two rows of a band wait for the next one: it starts two
// rows above its own first row.
#pragma once

#include "pyxcc/types.h"

#include <algorithm>
#include <optional>

namespace pyxcc::subsampled
{

/// The rows that a call gives, counted from the first row that it was handed.
struct Band {
    int first, end;
    bool atTop, atBottom; ///< whether it reaches the edges of the image
    int chromaRows;       ///< that lie in the band

    /// Whether a row is at an edge of the image.
    bool begins(int y) const { return atTop && y == 0; }
    bool ends(int y) const { return atBottom && y == end - 1; }

    /// The row of chroma to read for row `j`, which at the bottom of the image may be beyond the last one.
    int chroma(int j) const { return atBottom ? std::min(j, chromaRows - 1) : j; }
};

/// Nothing for a layout that is none.
inline std::optional<Band> bandOf(s32 layout, int height)
{
    constexpr s32 top = 1, middle = 4, bottom = 16, whole = top | middle | bottom;
    const int chromaRows = height >> 1;
    if ((layout & whole) == whole) return Band{0, height, true, true, chromaRows};
    if (layout == top) return Band{0, height - 2, true, false, chromaRows};
    if (layout == middle) return Band{-2, height - 2, false, false, chromaRows};
    if (layout == bottom) return Band{-2, height, false, true, chromaRows};
    return std::nullopt;
}

} // namespace pyxcc::subsampled
