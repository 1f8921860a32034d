// The noise that is added to thresholds. It is the same at every call.
#pragma once

#include "pyxcc/types.h"

#include <array>

namespace reference
{

template <typename T> struct NoiseBounds {
    T low, high;
};

/// Numbers between two bounds, by a lagged difference with borrow and a congruence.
class NoiseGenerator
{
public:
    explicit NoiseGenerator(NoiseBounds<s16> bounds);
    explicit NoiseGenerator(NoiseBounds<f32> bounds);

    f64 next();

private:
    f64 middle_, scale_;
    u32 congruence_ = 1131199209;
    u32 lags_[3];
    u32 borrow_ = 0xffffffff;

    NoiseGenerator(f64 middle, f64 scale);
};

/// Noise by the place of a pixel.
class Noise
{
public:
    explicit Noise(NoiseBounds<f32> bounds);

    f32 at(int x, int y) const;

private:
    std::array<f32, 1024> values_;
    std::array<u16, 1024> places_;
};

} // namespace reference
