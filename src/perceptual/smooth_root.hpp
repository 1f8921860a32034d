// Cube roots by polynomials, for what needs them to six digits only: a register looks up coefficients by 8, where a
// table takes a gather.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::perceptual
{

inline constexpr f32 smoothRootsFrom = 1.0f / 16; ///< up to 1

/// The coefficients in ascending order. Half octaves have a polynomial each, found by the exponent and the first bit of
/// the mantissa: the six from 1/8 on, and then the two in front of them.
inline constexpr std::array<f32, 8> smoothRootCoefficients[] = {
    {0.242087737f, 0.271775365f, 0.305011421f, 0.342415482f, 0.384290338f, 0.431416482f, 0.192145169f, 0.215708241f},
    {3.16007352f, 2.50953913f, 1.99072158f, 1.58091068f, 1.254076f, 0.9959113f, 5.01630402f, 3.9836452f},
    {-12.3113766f, -6.93385363f, -3.87784076f, -2.18402696f, -1.2214433f, -0.687925398f, -39.0861855f, -22.0136127f},
    {33.1383362f, 13.2700253f, 5.21896076f, 2.08989787f, 0.821934819f, 0.329138309f, 210.415314f, 84.259407f},
    {-38.7261734f, -11.0535669f, -3.04949498f, -0.87041384f, -0.240132689f, -0.0685407966f, -491.791748f,
     -140.371552f}};

/// The cube root, off by 7e-7 at most.
template <class F32> PYXCC_INLINE F32 smoothRoot(const F32& x)
{
    constexpr f32 belowOne = 1 - 0x1p-24f;
    const F32 v = lesser(x, F32(belowOne)); // white may come out a little above 1, which has no polynomial
    const auto piece = halfOctave(v);
    const auto& k = smoothRootCoefficients;
    F32 sum = lookUp(k[4], piece);
    for (int i = 3; i >= 0; --i) sum = fused(sum, v, lookUp(k[i], piece));
    return sum;
}

} // namespace pyxcc::perceptual
