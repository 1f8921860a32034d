// How a form over floats meets a block of pixels.
#pragma once

#include "lanes/lanes.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over floats, three or four in and as many out, or one: floats, or integers that saturate on their way to
/// samples.
struct OnFloats {
};

template <std::derived_from<OnFloats> Form> PYXCC_INLINE auto apply(const Form& form, const Three<wide::F32>& pixels)
{
    return form(pixels.a, pixels.b, pixels.c);
}

template <std::derived_from<OnFloats> Form> PYXCC_INLINE auto apply(const Form& form, const Three<wide::F64>& pixels)
{
    return form(pixels.a, pixels.b, pixels.c);
}

template <std::derived_from<OnFloats> Form> PYXCC_INLINE auto apply(const Form& form, const Four<wide::F32>& pixels)
{
    return form(pixels.a, pixels.b, pixels.c, pixels.d);
}

namespace detail
{

template <class Samples> PYXCC_INLINE Samples saturateAll(wide::S32 x, wide::S32 y)
{
    return saturate<Samples>(Two{x, y});
}
template <class Samples> PYXCC_INLINE Three<Samples> saturateAll(const Three<wide::S32>& x, const Three<wide::S32>& y)
{
    return {saturate<Samples>(Two{x.a, y.a}), saturate<Samples>(Two{x.b, y.b}), saturate<Samples>(Two{x.c, y.c})};
}

template <class Samples, class Form>
PYXCC_INLINE auto applyToParts(const Form& form, const Two<wide::F32>& a, const Two<wide::F32>& b,
                               const Two<wide::F32>& c)
{
    return saturateAll<Samples>(form(a.a, b.a, c.a), form(a.b, b.b, c.b));
}

template <class Samples, class Form>
PYXCC_INLINE Three<Samples> applyToParts(const Form& form, const Four<wide::F32>& a, const Four<wide::F32>& b,
                                         const Four<wide::F32>& c)
{
    const auto x = form(a.a, b.a, c.a), y = form(a.b, b.b, c.b), z = form(a.c, b.c, c.c), w = form(a.d, b.d, c.d);
    return {saturate<Samples>(Four{x.a, y.a, z.a, w.a}), saturate<Samples>(Four{x.b, y.b, z.b, w.b}),
            saturate<Samples>(Four{x.c, y.c, z.c, w.c})};
}

} // namespace detail

/// Integer samples through a form that gives integers, back to samples of the same type.
template <std::derived_from<OnFloats> Form, class Samples>
PYXCC_INLINE auto apply(const Form& form, const Three<Samples>& pixels)
{
    return detail::applyToParts<Samples>(form, toF32(pixels.a), toF32(pixels.b), toF32(pixels.c));
}

/// A form for signed words over which 32768 is added on their way in, and taken off again on their way out.
template <class Form> struct OnRaisedWords {
    Form form;
};

PYXCC_INLINE wide::S16 loweredAll(wide::U16 x) { return lowered(x); }
PYXCC_INLINE Three<wide::S16> loweredAll(const Three<wide::U16>& x)
{
    return {lowered(x.a), lowered(x.b), lowered(x.c)};
}

template <class Form> PYXCC_INLINE auto apply(const OnRaisedWords<Form>& raising, const Three<wide::S16>& pixels)
{
    return loweredAll(apply(raising.form, Three{raised(pixels.a), raised(pixels.b), raised(pixels.c)}));
}

} // namespace pyxcc::frame
