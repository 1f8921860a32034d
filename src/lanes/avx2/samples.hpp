// Which register holds samples of a type, as they lie in memory.
#pragma once

#include "lanes/avx2/floats.hpp"
#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

namespace detail
{

template <class Sample> struct RegisterFor;
template <> struct RegisterFor<u8> {
    using Type = U8;
};
template <> struct RegisterFor<s8> {
    using Type = S8;
};
template <> struct RegisterFor<u16> {
    using Type = U16;
};
template <> struct RegisterFor<s16> {
    using Type = S16;
};
template <> struct RegisterFor<s32> {
    using Type = S32;
};
template <> struct RegisterFor<f32> {
    using Type = F32;
};
template <> struct RegisterFor<f64> {
    using Type = F64;
};

} // namespace detail

template <class Sample> using RegisterOf = typename detail::RegisterFor<Sample>::Type;

} // namespace pyxcc::wide
