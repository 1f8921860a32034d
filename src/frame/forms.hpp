// How a form meets a block of pixels: what lanes it computes in, and the widening and narrowing around it.
#pragma once

#include "lanes/lanes.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over 16-bit lanes, three samples in and three bytes out.
struct OnWords {
};

template <std::derived_from<OnWords> Form>
PYXCC_INLINE Three<wide::U8> apply(const Form& form, const Three<wide::U8>& pixels)
{
    const Two<wide::Sample> a = widen(pixels.a), b = widen(pixels.b), c = widen(pixels.c);
    const auto low = form(a.a, b.a, c.a);
    const auto high = form(a.b, b.b, c.b);
    return {narrow(low.a, high.a), narrow(low.b, high.b), narrow(low.c, high.c)};
}

} // namespace pyxcc::frame
