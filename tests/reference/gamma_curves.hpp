// The gamma curves: what becomes of a sample. Fwd is linear near black and a power of 0.45 above, Inv takes it back.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

u8 gammaFwd8u(u8 v);
u8 gammaInv8u(u8 v);
u16 gammaFwd16u(u16 v);
u16 gammaInv16u(u16 v);

/// The bounds that take the places of black and white in a float image.
struct GammaBounds {
    f32 vMin, vMax;
};

f32 gammaFwd32f(f32 s, GammaBounds bounds);
f32 gammaInv32f(f32 s, GammaBounds bounds);

} // namespace reference
