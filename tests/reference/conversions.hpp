// From floats to samples.
#pragma once

#include "pyxcc/types.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace reference
{

/// Numbers beyond 32 bits, and what is no number, become the least integer, as the processor has it.
template <typename F> s32 integerOf(F whole)
{
    return std::fabs(whole) < F{2147483648} ? static_cast<s32>(whole) : std::numeric_limits<s32>::min();
}

/// In the rounding mode in force.
inline s32 nearest(f32 x) { return integerOf(std::nearbyint(x)); }

/// Towards zero.
template <typename F> s32 truncated(F x) { return integerOf(x); }

/// The nearest sample of the type.
template <typename T> T saturated(s32 x)
{
    return static_cast<T>(std::clamp<s32>(x, std::numeric_limits<T>::min(), std::numeric_limits<T>::max()));
}

/// The low bits of x.
template <typename T> T lowBits(s32 x) { return static_cast<T>(x); }

} // namespace reference
