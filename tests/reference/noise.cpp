#include "reference/noise.hpp"

#include <cmath>

namespace reference
{

namespace
{

constexpr u32 multiplier = 69069, increment = 1013904243;

/// About 2^-32.
constexpr f64 unit = 2.3283064365387e-10;

} // namespace

NoiseGenerator::NoiseGenerator(NoiseBounds<s16> bounds)
    : NoiseGenerator(static_cast<f64>(bounds.low + bounds.high) * 0.5,
                     static_cast<f64>(bounds.high - bounds.low) * unit)
{
}

NoiseGenerator::NoiseGenerator(NoiseBounds<f32> bounds)
    : NoiseGenerator(static_cast<f64>(bounds.low + bounds.high) * 0.5,
                     static_cast<f64>(bounds.high - bounds.low) * unit)
{
}

NoiseGenerator::NoiseGenerator(f64 middle, f64 scale) : middle_(middle), scale_(scale)
{
    lags_[0] = 0;
    lags_[1] = lags_[0] * multiplier + increment;
    lags_[2] = lags_[1] * multiplier + increment;
}

f64 NoiseGenerator::next()
{
    const u32 t = lags_[1] - lags_[2] + borrow_;
    const bool isNegative = static_cast<s32>(t) < 0;
    borrow_ = isNegative ? 0xffffffff : 0;
    const u32 u = isNegative ? t - 18 : t;
    lags_[2] = lags_[1];
    lags_[1] = lags_[0];
    lags_[0] = u;
    congruence_ = congruence_ * multiplier + increment;
    return std::fma(scale_, static_cast<f64>(static_cast<s32>(u + congruence_)), middle_);
}

Noise::Noise(NoiseBounds<f32> bounds)
{
    NoiseGenerator places(NoiseBounds<s16>{0, 1024});
    for (u16& place : places_) place = static_cast<u16>(static_cast<s32>(places.next()));
    NoiseGenerator values(bounds);
    for (f32& value : values_) value = static_cast<f32>(values.next());
}

f32 Noise::at(int x, int y) const { return values_[(places_[x & 1023] + 2 * y + x) & 1023]; }

} // namespace reference
