// Planes of chroma resampled with averages of neighbours. The sizes are those of luma.
#pragma once

#include "reference/image.hpp"

namespace reference
{

u8 avgUp(u8 a, u8 b);
u8 avgDown(u8 a, u8 b);

void chroma411To420(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi);
void chroma1620To420(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi);
void chroma420To411(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi);
void chroma420To1620(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi);

} // namespace reference
