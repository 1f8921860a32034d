// A picture to try conversions on when there is none at hand.
#pragma once

#include "image.hpp"

namespace tool
{

/// Colour bars, ramps of gray, hue and the primaries, a zone plate, skin tones, and patterns that chroma subsampling
/// destroys; RGB C3 u8.
Image testCard(RoiSize size);

/// The zone plate alone.
Image zonePlate(RoiSize size);

} // namespace tool
