<<<<<<< HEAD
// The processor's approximate reciprocal, which results go by to the bit.
=======
// The processor's approximate reciprocal, whose bits are its own.
>>>>>>> dbc0ceb (Plain statements of LUV: 20 conversions)
#pragma once

#include "pyxcc/types.h"

<<<<<<< HEAD
#include <xmmintrin.h>
=======
#include <cmath>
#include <immintrin.h>
>>>>>>> dbc0ceb (Plain statements of LUV: 20 conversions)

namespace reference
{

inline f32 rcp(f32 x) { return _mm_cvtss_f32(_mm_rcp_ss(_mm_set_ss(x))); }

<<<<<<< HEAD
=======
/// One step from x towards the reciprocal of v.
inline f32 refined(f32 x, f32 v) { return std::fma(-x, std::fma(x, v, -1.0f), x); }

>>>>>>> dbc0ceb (Plain statements of LUV: 20 conversions)
} // namespace reference
