// Compares the vector instance of a form with its scalar one.
#pragma once

#include "frame/forms.hpp"
#include "layouts/avx2/interleave.hpp"

#include <gtest/gtest.h>

#include <array>

namespace forms
{

/// All 2^24 triples of bytes, 32 at a time.
template <class Form> void expectInstancesAgree(const Form& form)
{
    using pyxcc::Three;
    using pyxcc::scalar::S16;
    constexpr int block = pyxcc::wide::U8::count;
    std::array<u8, block> a, b, c, x, y, z;
    for (int first = 0; first < 256; ++first) {
        for (int second = 0; second < 256; ++second) {
            for (int third = 0; third < 256; third += block) {
                a.fill(static_cast<u8>(first));
                b.fill(static_cast<u8>(second));
                for (int i = 0; i < block; ++i) c[i] = static_cast<u8>(third + i);
                const auto wide = pyxcc::frame::apply(form, Three{pyxcc::layouts::loadSamples(a.data()),
                                                                  pyxcc::layouts::loadSamples(b.data()),
                                                                  pyxcc::layouts::loadSamples(c.data())});
                pyxcc::layouts::storeSamples(x.data(), wide.a);
                pyxcc::layouts::storeSamples(y.data(), wide.b);
                pyxcc::layouts::storeSamples(z.data(), wide.c);
                for (int i = 0; i < block; ++i) {
                    const auto one = form(S16(first), S16(second), S16(third + i));
                    const bool same = x[i] == one.a.v && y[i] == one.b.v && z[i] == one.c.v;
                    ASSERT_TRUE(same) << "of (" << first << ", " << second << ", " << third + i
                                      << ") a register makes (" << int{x[i]} << ", " << int{y[i]} << ", " << int{z[i]}
                                      << "), one value (" << int{one.a.v} << ", " << int{one.b.v} << ", "
                                      << int{one.c.v} << ")";
                }
            }
        }
    }
}

} // namespace forms
