// Which colour a sensor has at a place.
#pragma once

#include "frame/checks.hpp"
#include "pyxcc/types.h"

namespace pyxcc::mosaic
{

/// A place by its colour and by that of the other samples of its row; an odd step along x or y leads to another one.
enum class Site { red, greenOfBlueRow, blue, greenOfRedRow };

constexpr bool isGreen(Site site) { return site == Site::greenOfBlueRow || site == Site::greenOfRedRow; }
constexpr bool isOfRedRow(Site site) { return site == Site::red || site == Site::greenOfRedRow; }

/// The site at (x, y) of a mosaic whose first sample `grid` tells.
constexpr Site siteAt(s32 grid, s32 x, s32 y)
{
    constexpr Site first[] = {Site::blue, Site::red, Site::greenOfBlueRow, Site::greenOfRedRow};
    const int alongX = (x & 1) != 0 ? 3 : 0, alongY = y & 1;
    return static_cast<Site>(static_cast<int>(first[grid]) ^ alongX ^ alongY);
}

inline auto knownGrid(s32 grid)
{
    return [=]() -> PyxStatus { return grid >= 0 && grid <= 3 ? pyxOk : pyxErrBadArg; };
}

} // namespace pyxcc::mosaic
