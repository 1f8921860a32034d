// The processor's reciprocal after a step of refinement.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::perceptual
{

/// As the tails have it: without fused operations.
template <class F32> PYXCC_INLINE F32 refined(const F32& v)
{
    const F32 x = rcp(v);
    return (x + x) - ((v * x) * x);
}

/// As the blocks of LUV have it.
template <class F32> PYXCC_INLINE F32 refinedByFused(const F32& v)
{
    const F32 x = rcp(v);
    return fused(-x, fused(x, v, F32(-1.0f)), x);
}

} // namespace pyxcc::perceptual
