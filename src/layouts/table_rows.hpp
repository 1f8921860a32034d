// Rows of 16-bit samples through a table of all 65536.
#pragma once

#include "pyxcc/types.h"

#include <cstddef>

namespace pyxcc::layouts
{

/// `count` samples, one behind the other.
void lookUpSamples(const u16* table, const u8* from, u8* to, std::ptrdiff_t count);

/// The first three of each four samples.
void lookUpThreeOfFour(const u16* table, const u8* from, u8* to, std::ptrdiff_t pixels);

} // namespace pyxcc::layouts
