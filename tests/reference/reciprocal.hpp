// The processor's approximate reciprocal, which results go by to the bit.
#pragma once

#include "pyxcc/types.h"

#include <cmath>
#include <xmmintrin.h>

namespace reference
{

inline f32 rcp(f32 x) { return _mm_cvtss_f32(_mm_rcp_ss(_mm_set_ss(x))); }

/// One step from x towards the reciprocal of v.
inline f32 refined(f32 x, f32 v) { return std::fma(-x, std::fma(x, v, -1.0f), x); }

} // namespace reference
