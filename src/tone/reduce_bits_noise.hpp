// What a call makes of noise: tables that depend on the amount, and a place in them for each pixel.
#pragma once

#include "frame/scratch.hpp"
#include "tone/noise_generator.hpp"

#include <memory>

namespace pyxcc::tone
{

struct FreeNoiseGenerator {
    void operator()(NoiseGeneratorU16* record) const { noiseGenFreeU16(record); }
    void operator()(NoiseGeneratorF32* record) const { noiseGenFreeF32(record); }
};

struct Noise {
    static constexpr int length = 1024;

    frame::Scratch<f32> amounts;
    frame::Scratch<u16> offsets;
    std::unique_ptr<NoiseGeneratorU16, FreeNoiseGenerator> offsetGenerator;
    std::unique_ptr<NoiseGeneratorF32, FreeNoiseGenerator> amountGenerator;

    /// Amounts between two bounds.
    PyxStatus make(f32 low, f32 high);

    /// Leaves what make() took to nobody.
    void abandon();

    /// The amount for column x of row y, the same for all channels.
    f32 at(int x, int y) const
    {
        const u32 column = static_cast<u32>(x), row = static_cast<u32>(y);
        return amounts[(offsets[column % length] + 2 * row + column) % length];
    }
};

} // namespace pyxcc::tone
