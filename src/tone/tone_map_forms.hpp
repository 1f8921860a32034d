// What becomes of a sample in tone mapping: a float in, a byte out, 32 at a time.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::tone
{

/// The scaled sample towards zero, of which the low byte is stored: where the largest sample gives the scale none is
/// above 255, and what is negative wraps.
struct ScaledLowByte {
    f32 scale;

    template <class F32> PYXCC_INLINE auto operator()(const F32& x) const { return trunc(x * scale) & 255; }
};

/// The same, held to 0 to 255.
struct ScaledSaturated {
    f32 scale;

    template <class F32> PYXCC_INLINE auto operator()(const F32& x) const { return trunc(x * scale); }
};

namespace detail
{

template <class Form> PYXCC_INLINE wide::U8 bytesOf(const Form& form, const Four<wide::F32>& x)
{
    return wide::saturate<wide::U8>(Four{form(x.a), form(x.b), form(x.c), form(x.d)});
}

} // namespace detail

PYXCC_INLINE wide::U8 apply(const ScaledLowByte& form, const Four<wide::F32>& x) { return detail::bytesOf(form, x); }
PYXCC_INLINE wide::U8 apply(const ScaledSaturated& form, const Four<wide::F32>& x) { return detail::bytesOf(form, x); }

} // namespace pyxcc::tone
