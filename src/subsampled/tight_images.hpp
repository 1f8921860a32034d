// Images without steps: their rows follow one another without gaps.
#pragma once

#include "pyxcc/types.h"

#include <array>
#include <cstdint>
#include <limits>

namespace pyxcc::subsampled
{

/// The steps of planes with chroma for two columns, a sample for an odd last one included or left out.
constexpr std::array<int, 3> tightSteps(int width, int chromaWidth) { return {width, chromaWidth, chromaWidth}; }
constexpr std::array<int, 3> stepsOf420(int width) { return tightSteps(width, width / 2); }
constexpr std::array<int, 3> stepsOf422(int width) { return tightSteps(width, width / 2 + width % 2); }

/// 4:2:2 rows of an even width are one long row, if there are 256 pixels in all: which form a pixel takes then follows
/// from where it is in the image.
constexpr RoiSize asOneRow(RoiSize roi)
{
    const std::int64_t pixels = std::int64_t{roi.width} * roi.height;
    const bool merges = roi.width % 2 == 0 && pixels >= 256 && pixels <= std::numeric_limits<int>::max();
    return merges ? RoiSize{static_cast<int>(pixels), 1} : roi;
}

} // namespace pyxcc::subsampled
