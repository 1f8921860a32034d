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

/// Does the work under rounding to nearest. The control word of before is loaded back only if its mode was another one:
/// flags that the work raises under a caller who rounds to nearest stay raised.
template <class Work> void roundingToNearest(const Work& work)
{
    const u32 word = saveRoundMode(roundNearest);
    work();
    if (word & roundingField) restoreRoundMode(word);
}

} // namespace pyxcc::frame
