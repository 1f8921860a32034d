// RGB to XYZ and back on the way to the perceptual models, with fused sums and with plain ones.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::perceptual
{

/// A row of a matrix.
struct Weights {
    f32 a, b, c;
};

inline constexpr Weights xOfRgb = {0.412453f, 0.35758f, 0.180423f}, yOfRgb = {0.212671f, 0.71516f, 0.072169f},
                         zOfRgb = {0.019334f, 0.119193f, 0.950227f};
inline constexpr Weights rOfXyz = {3.240479f, -1.53715f, -0.498535f}, gOfXyz = {-0.969256f, 1.875991f, 0.041556f},
                         bOfXyz = {0.055648f, -0.204043f, 1.057311f};

/// The middle term by itself, then the first onto it, then the last.
struct FusedSums {
    template <class F32> static PYXCC_INLINE F32 weighted(const Weights& k, const F32& a, const F32& b, const F32& c)
    {
        return fused(c, F32(k.c), fused(a, F32(k.a), b * k.b));
    }
    template <class F32> static PYXCC_INLINE F32 productAndSum(const F32& x, const F32& y, const F32& z)
    {
        return fused(x, y, z);
    }
};

/// Each operation by itself.
struct PlainSums {
    template <class F32> static PYXCC_INLINE F32 weighted(const Weights& k, const F32& a, const F32& b, const F32& c)
    {
        return (a * k.a + b * k.b) + c * k.c;
    }
    template <class F32> static PYXCC_INLINE F32 productAndSum(const F32& x, const F32& y, const F32& z)
    {
        return x * y + z;
    }
};

template <class Sums, class F32>
PYXCC_INLINE Three<F32> multiplied(const Three<Weights>& matrix, const F32& a, const F32& b, const F32& c)
{
    return {Sums::weighted(matrix.a, a, b, c), Sums::weighted(matrix.b, a, b, c), Sums::weighted(matrix.c, a, b, c)};
}

inline constexpr Three<Weights> xyzOfRgb = {xOfRgb, yOfRgb, zOfRgb}, rgbOfXyz = {rOfXyz, gOfXyz, bOfXyz};

} // namespace pyxcc::perceptual
