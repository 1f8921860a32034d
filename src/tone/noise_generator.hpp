// Noise for dithering, the same on every call: the lower word of a lagged subtraction with borrow and of a congruential
// generator added up, brought between two bounds. There is one variety for words and one for floats.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::tone
{

/// The state of a generator, in scratch memory.
template <class Number> struct NoiseGenerator {
    u32 tag;
    u32 seed;
    Number low, high;
    f64 mid;
    f64 scale;
    u32 x;
    u32 s0, s1, s2;
    u32 d;
};

using NoiseGeneratorU16 = NoiseGenerator<s16>;
using NoiseGeneratorF32 = NoiseGenerator<f32>;

PyxStatus noiseGenInitU16(NoiseGeneratorU16** record, s16 low, s16 high, u32 seed);
PyxStatus noiseGenFillU16(u16* array, s32 length, NoiseGeneratorU16* record);
PyxStatus noiseGenFreeU16(NoiseGeneratorU16* record);

PyxStatus noiseGenInitF32(NoiseGeneratorF32** record, f32 low, f32 high, u32 seed);
PyxStatus noiseGenFillF32(f32* array, s32 length, NoiseGeneratorF32* record);
PyxStatus noiseGenFreeF32(NoiseGeneratorF32* record);

} // namespace pyxcc::tone
