#include "reference/perceptual.hpp"

namespace reference
{

Triple<f32> xyzOf(Triple<f32> rgb, Span span)
{
    const auto [r, g, b] = rgb;
    return {
        mulAdd(span, b, 0.180423f, mulAdd(span, r, 0.412453f, g * 0.35758f)),
        mulAdd(span, b, 0.072169f, mulAdd(span, r, 0.212671f, g * 0.71516f)),
        mulAdd(span, b, 0.950227f, mulAdd(span, r, 0.019334f, g * 0.119193f)),
    };
}

} // namespace reference
