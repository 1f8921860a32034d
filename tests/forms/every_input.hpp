// Compares the vector instance of a form with its scalar one.
#pragma once

#include "frame/forms.hpp"
#include "layouts/avx2/interleave.hpp"

#include <gtest/gtest.h>

#include <array>

namespace forms
{

/// The bytes that a form makes, one after the other.
inline std::array<u8, 1> bytesOf(pyxcc::scalar::Byte x) { return {x.v}; }
inline std::array<u8, 2> bytesOf(const pyxcc::Two<pyxcc::scalar::Byte>& x) { return {x.a.v, x.b.v}; }
inline std::array<u8, 3> bytesOf(const pyxcc::Three<pyxcc::scalar::Byte>& x) { return {x.a.v, x.b.v, x.c.v}; }

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
    using pyxcc::scalar::S16;
    using pyxcc::wide::U8;
    std::array<u8, U8::count> lanes;
    for (int first = 0; first < 256; ++first) {
        for (int second = 0; second < 256; ++second) {
            for (int third = 0; third < 256; third += U8::count) {
                for (int i = 0; i < U8::count; ++i) lanes[i] = static_cast<u8>(third + i);
                const auto wide = outputsOf(pyxcc::frame::apply(
                    form, pyxcc::Three{U8(first), U8(second), pyxcc::layouts::loadSamples(lanes.data())}));
                for (int i = 0; i < U8::count; ++i) {
                    const auto one = bytesOf(form(S16(first), S16(second), S16(third + i)));
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
