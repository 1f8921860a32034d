// Forms in two steps: what they begin with waits long for tables, and what they end with is a long chain of operations.
// Each block is begun before the one in front of it is ended, so that the processor has the one to do while it waits
// for the other.
#pragma once

#include "frame/float_forms.hpp"
#include "frame/row_driver.hpp"

namespace pyxcc::frame
{

/// Whether `begin` and `end` of a form are to be taken by themselves. The form as such is both of them.
template <class Form> inline constexpr bool inTwoSteps = requires { requires Form::inTwoSteps; };
template <class Form> inline constexpr bool inTwoSteps<OnRaisedWords<Form>> = inTwoSteps<Form>;

template <class Form>
concept InTwoSteps = inTwoSteps<Form>;

template <std::derived_from<OnFloats> Form> PYXCC_INLINE auto begin(const Form& form, const Three<wide::F32>& pixels)
{
    return form.begin(pixels.a, pixels.b, pixels.c);
}

template <std::derived_from<OnFloats> Form> PYXCC_INLINE auto begin(const Form& form, const Three<wide::U16>& pixels)
{
    const Two<wide::F32> a = toF32(pixels.a), b = toF32(pixels.b), c = toF32(pixels.c);
    return Two{form.begin(a.a, b.a, c.a), form.begin(a.b, b.b, c.b)};
}

template <class Form> PYXCC_INLINE auto begin(const OnRaisedWords<Form>& raising, const Three<wide::S16>& pixels)
{
    return begin(raising.form, Three{raised(pixels.a), raised(pixels.b), raised(pixels.c)});
}

template <std::derived_from<OnFloats> Form, class Begun> PYXCC_INLINE auto end(const Form& form, const Begun& begun)
{
    return form.end(begun);
}

template <std::derived_from<OnFloats> Form, class Begun>
PYXCC_INLINE auto end(const Form& form, const Two<Begun>& begun)
{
    return detail::saturateAll<wide::U16>(form.end(begun.a), form.end(begun.b));
}

template <class Form, class Begun> PYXCC_INLINE auto end(const OnRaisedWords<Form>& raising, const Begun& begun)
{
    return loweredAll(end(raising.form, begun));
}

/// As with other forms.
template <class Source, class Target, InTwoSteps Form>
PYXCC_INLINE void convertColumns(const Source& source, const Target& target, int from, int to, const Form& form)
{
    constexpr int block = Source::block;
    static_assert(block == Target::block);
    int x = from;
    if (x <= to - block) {
        auto begun = begin(form, source.load(x));
        for (; x <= to - 2 * block; x += block) {
            const auto next = begin(form, source.load(x + block));
            target.store(x, end(form, begun));
            begun = next;
        }
        target.store(x, end(form, begun));
        x += block;
    }
    if (x < to) target.store(x, to - x, apply(form, source.load(x, to - x)));
}

} // namespace pyxcc::frame
