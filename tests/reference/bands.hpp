// 4:2:0 images that are smoothed in the column, whole or in horizontal bands. A band is told by `layout` and gives the
// rows of the whole image that it covers, which for all bands but the top one begin two rows above its own first row.
#pragma once

#include "reference/subsampled.hpp"

namespace reference
{

/// To 4:2:2.
void bandTo422(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, s32 layout);

/// To 4:2:0, with chroma half a row further down.
void bandTo420(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, s32 layout);

} // namespace reference
