// The rounding mode of the vector float unit, which belongs to the calling thread.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::frame
{

inline constexpr u32 roundingField = 0x6000; ///< of the control word
inline constexpr u32 roundNearest = 0x0000;

/// Sets the rounding field to `mode`, if it is not that already, and returns the control word as it was.
u32 saveRoundMode(u32 mode);

/// Loads a control word that saveRoundMode() returned.
void restoreRoundMode(u32 word);

} // namespace pyxcc::frame
