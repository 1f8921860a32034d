#include "catalog.hpp"

#include <algorithm>

namespace catalog
{

namespace
{

constexpr FamilyInfo table[] = {
    {Family::rgbYCbCr, "rgb-ycbcr", "RGB and YCbCr at full resolution",
     "8-bit RGB to BT.601 studio-range YCbCr and back, one chroma sample a pixel."},
};

} // namespace

std::span<const FamilyInfo> families() { return table; }

const FamilyInfo& infoOf(Family family) { return *std::ranges::find(table, family, &FamilyInfo::family); }

} // namespace catalog
