// From floats to integers.
#pragma once

#include "pyxcc/types.h"

#include <cmath>
#include <limits>

namespace reference
{

/// Numbers beyond 32 bits, and what is no number, become the least integer, as the processor has it.
inline s32 integerOf(f32 whole)
{
    return std::fabs(whole) < 2147483648.0f ? static_cast<s32>(whole) : std::numeric_limits<s32>::min();
}

/// In the rounding mode in force.
inline s32 nearest(f32 x) { return integerOf(std::nearbyint(x)); }

/// Towards zero.
inline s32 truncated(f32 x) { return integerOf(x); }

} // namespace reference
