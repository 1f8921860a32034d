// What the perceptual models share.
#pragma once

#include "reference/pixels.hpp"

#include <cmath>

namespace reference
{

/// Where in its row a pixel lies: in the whole blocks, or after them. The steps of the two round differently.
enum class Span { body, tail };

/// a * b + c, in one rounding or in two.
inline f32 mulAdd(bool inOne, f32 a, f32 b, f32 c) { return inOne ? std::fma(a, b, c) : a * b + c; }

inline f32 mulAdd(Span span, f32 a, f32 b, f32 c) { return mulAdd(span == Span::body, a, b, c); }

/// X, Y, Z of a colour.
Triple<f32> xyzOf(Triple<f32> rgb, Span span);

/// The largest value, in the measure of Y, to which lightness is linear.
inline constexpr f32 linearLimit = 0.008856f;

} // namespace reference
