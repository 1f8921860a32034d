#include "tone/reduce_bits_noise.hpp"

namespace pyxcc::tone
{

PyxStatus Noise::make(f32 low, f32 high)
{
    amounts = frame::allocate<f32>(length);
    if (!amounts) return pyxErrNoMemory;
    offsets = frame::allocate<u16>(length);
    if (!offsets) return pyxErrNoMemory;
    NoiseGeneratorU16* ofOffsets = nullptr;
    if (const PyxStatus failure = noiseGenInitU16(&ofOffsets, 0, 1024, 0)) return failure;
    offsetGenerator.reset(ofOffsets);
    NoiseGeneratorF32* ofAmounts = nullptr;
    if (const PyxStatus failure = noiseGenInitF32(&ofAmounts, low, high, 0)) return failure;
    amountGenerator.reset(ofAmounts);
    if (const PyxStatus failure = noiseGenFillU16(offsets.get(), length, ofOffsets)) return failure;
    return noiseGenFillF32(amounts.get(), length, ofAmounts);
}

void Noise::abandon()
{
    static_cast<void>(amounts.release());
    static_cast<void>(offsets.release());
    static_cast<void>(offsetGenerator.release());
    static_cast<void>(amountGenerator.release());
}

NoiseByColumns::NoiseByColumns(const Noise& noise)
{
    for (int odd = 0; odd < 2; ++odd) {
        for (int i = 0; i < whole; ++i) amounts_[whole * odd + i] = noise.amounts[(2 * i + odd) % Noise::length];
    }
    for (int x = 0; x < Noise::length; ++x) {
        const int place = noise.offsets[x] + x;
        placeOf_[x] = static_cast<u16>((place / 2) % half + whole * (place % 2));
    }
}

} // namespace pyxcc::tone
