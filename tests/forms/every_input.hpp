// Compares the vector instance of a form with its scalar one.
#pragma once

#include "frame/channel_forms.hpp"
#include "frame/float_forms.hpp"
#include "frame/forms.hpp"
#include "layouts/avx2/interleave.hpp"

#include <gtest/gtest.h>

#include <array>
#include <concepts>

namespace forms
{

/// The bytes that a form makes, one after the other.
inline std::array<u8, 1> bytesOf(pyxcc::scalar::Byte x) { return {x.v}; }
inline std::array<u8, 2> bytesOf(const pyxcc::Two<pyxcc::scalar::Byte>& x) { return {x.a.v, x.b.v}; }
inline std::array<u8, 3> bytesOf(const pyxcc::Three<pyxcc::scalar::Byte>& x) { return {x.a.v, x.b.v, x.c.v}; }

/// What a form makes of a pixel of bytes, by its scalar instance.
template <std::derived_from<pyxcc::frame::OnWords> Form> auto ofOne(const Form& form, int a, int b, int c)
{
    using pyxcc::scalar::S16;
    return bytesOf(form(S16(a), S16(b), S16(c)));
}
template <std::derived_from<pyxcc::frame::OnChannels> Form>
std::array<u8, 3> ofOne(const Form& form, int a, int b, int c)
{
    using pyxcc::scalar::U8;
    const pyxcc::Three<U8> x = form(U8(a), U8(b), U8(c));
    return {x.a.v, x.b.v, x.c.v};
}
template <std::derived_from<pyxcc::frame::OnFloats> Form> std::array<u8, 3> ofOne(const Form& form, int a, int b, int c)
{
    const auto f = [](int x) { return pyxcc::scalar::F32(static_cast<f32>(x)); };
    const auto x = form(f(a), f(b), f(c));
    const auto byte = [](auto y) { return pyxcc::scalar::saturate<u8>(y); };
    return {byte(x.a), byte(x.b), byte(x.c)};
}

/// What a register holds, a lane after the other.
inline std::array<u8, 32> lanesOf(pyxcc::wide::U8 x)
{
    std::array<u8, 32> lanes;
    pyxcc::layouts::storeSamples(lanes.data(), x);
    return lanes;
}
inline std::array<std::array<u8, 32>, 1> outputsOf(pyxcc::wide::U8 x) { return {lanesOf(x)}; }
inline std::array<std::array<u8, 32>, 3> outputsOf(const pyxcc::Three<pyxcc::wide::U8>& x)
{
    return {lanesOf(x.a), lanesOf(x.b), lanesOf(x.c)};
}

/// All 2^24 triples of bytes, 32 at a time.
template <class Form> void expectInstancesAgree(const Form& form)
{
    using pyxcc::wide::U8;
    std::array<u8, U8::count> lanes;
    for (int first = 0; first < 256; ++first) {
        for (int second = 0; second < 256; ++second) {
            for (int third = 0; third < 256; third += U8::count) {
                for (int i = 0; i < U8::count; ++i) lanes[i] = static_cast<u8>(third + i);
                const auto wide = outputsOf(pyxcc::frame::apply(
                    form, pyxcc::Three{U8(first), U8(second), pyxcc::layouts::loadSamples(lanes.data())}));
                for (int i = 0; i < U8::count; ++i) {
                    const auto one = ofOne(form, first, second, third + i);
                    for (std::size_t k = 0; k < one.size(); ++k) {
                        ASSERT_EQ(int{wide[k][i]}, int{one[k]}) << "output " << k << " of (" << first << ", " << second
                                                                << ", " << third + i << "), register and one value";
                    }
                }
            }
        }
    }
}

} // namespace forms
