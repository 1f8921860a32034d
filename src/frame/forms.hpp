// How a form meets a block of pixels: what lanes it computes in, and the widening and narrowing around it.
#pragma once

#include "lanes/lanes.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over 16-bit lanes, three samples in and bytes out.
struct OnWords {
};

/// One whose results are luma and what two chroma samples add to it, clamped to a byte.
struct AddedToLuma : OnWords {
};

template <std::derived_from<wide::Byte> Byte> PYXCC_INLINE wide::U8 narrowAll(Byte low, Byte high)
{
    return narrow(low, high);
}
PYXCC_INLINE Three<wide::U8> narrowAll(const Three<wide::Byte>& low, const Three<wide::Byte>& high)
{
    return {narrow(low.a, high.a), narrow(low.b, high.b), narrow(low.c, high.c)};
}

template <std::derived_from<OnWords> Form>
PYXCC_INLINE auto apply(const Form& form, const Two<Three<wide::Sample>>& pixels)
{
    return narrowAll(form(pixels.a.a, pixels.a.b, pixels.a.c), form(pixels.b.a, pixels.b.b, pixels.b.c));
}

template <std::derived_from<OnWords> Form> PYXCC_INLINE auto apply(const Form& form, const Three<wide::U8>& pixels)
{
    const Two<wide::Sample> a = widen(pixels.a), b = widen(pixels.b), c = widen(pixels.c);
    return narrowAll(form(a.a, b.a, c.a), form(a.b, b.b, c.b));
}

/// A form that has another way for bytes, which is less work than to widen them.
template <class Form>
concept AlsoOfBytes = std::derived_from<Form, OnWords> && requires(wide::U8 x)
{
    Form::ofBytes(x, x, x);
};

template <AlsoOfBytes Form> PYXCC_INLINE auto apply(const Form&, const Three<wide::U8>& pixels)
{
    return Form::ofBytes(pixels.a, pixels.b, pixels.c);
}

/// A form over three samples of pixels of four, the fourth of which goes along as it is.
template <class Form> struct WithFourth {
    Form form;
};

template <class Form> constexpr auto withFourth(Form form) { return WithFourth<Form>{form}; }

template <class Form, class Samples> PYXCC_INLINE auto apply(const WithFourth<Form>& form, const Four<Samples>& pixels)
{
    const Three<Samples> result = apply(form.form, Three<Samples>{pixels.a, pixels.b, pixels.c});
    return Four<Samples>{result.a, result.b, result.c, pixels.d};
}

/// A form over whole pixels of bytes: three sums, of which the upper halves are the samples, or what is made of them.
struct OnPixels {
};

template <std::derived_from<OnPixels> Form, int PixelBytes>
PYXCC_INLINE wide::PixelWords apply(const Form& form, const wide::Pixels<PixelBytes>& pixels)
{
    return asPixelWords(form(pixels));
}

/// The form of conversions that only move samples.
struct Unchanged {
};

template <class Pixels> PYXCC_INLINE const Pixels& apply(Unchanged, const Pixels& pixels) { return pixels; }

} // namespace pyxcc::frame
