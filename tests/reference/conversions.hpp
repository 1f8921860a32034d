// From floats to samples.
#pragma once

#include "pyxcc/types.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace reference
{

/// In the rounding mode in force.
inline s32 nearest(f32 x) { return static_cast<s32>(std::nearbyint(x)); }

inline s32 truncated(f32 x) { return static_cast<s32>(x); }

/// The nearest sample of the type.
template <typename T> T saturated(s32 x)
{
    return static_cast<T>(std::clamp<s32>(x, std::numeric_limits<T>::min(), std::numeric_limits<T>::max()));
}

/// The low bits of x.
template <typename T> T lowBits(s32 x) { return static_cast<T>(x); }

} // namespace reference
