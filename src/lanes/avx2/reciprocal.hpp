// The approximate reciprocal, which is the processor's own: the instruction for one float and the one for a register
// give the same bits.
#pragma once

#include "lanes/avx2/floats.hpp"
#include "lanes/scalar.hpp"

namespace pyxcc
{

namespace wide
{

/// Within 1.5 / 4096 of the reciprocal; that of 0 is infinite.
PYXCC_INLINE F32 rcp(F32 x) { return F32(_mm256_rcp_ps(x.v)); }

} // namespace wide

namespace scalar
{

inline F32 rcp(F32 x) { return _mm_cvtss_f32(_mm_rcp_ss(_mm_set_ss(x.v))); }

} // namespace scalar

} // namespace pyxcc
