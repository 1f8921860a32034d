// The processor's approximate reciprocal, which results go by to the bit.
#pragma once

#include "pyxcc/types.h"

#include <xmmintrin.h>

namespace reference
{

inline f32 rcp(f32 x) { return _mm_cvtss_f32(_mm_rcp_ss(_mm_set_ss(x))); }

} // namespace reference
