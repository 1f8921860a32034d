// Forms to which all samples are alike, whatever their channel.
#pragma once

#include "lanes/lanes.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over several registers at once: of bytes or of floats, as they are. Words reach it as floats, and come back
/// as integers that saturate.
struct OnSamples {
};

template <std::derived_from<OnSamples> Form, class Samples, int N>
PYXCC_INLINE Several<Samples, N> apply(const Form& form, const Several<Samples, N>& samples)
{
    return form(samples);
}

template <std::derived_from<OnSamples> Form, int N>
PYXCC_INLINE Several<wide::U16, N> apply(const Form& form, const Several<wide::U16, N>& samples)
{
    return each(
        [&](wide::U16 words) PYXCC_INLINE_LAMBDA {
            const Two<wide::F32> floats = toF32(words);
            const Several<wide::S32, 2> integers = form(several(floats.a, floats.b));
            return wide::saturate<wide::U16>(Two{integers.part[0], integers.part[1]});
        },
        samples);
}

template <std::derived_from<OnSamples> Form, class Samples>
PYXCC_INLINE Three<Samples> apply(const Form& form, const Three<Samples>& pixels)
{
    const Several<Samples, 3> result = apply(form, several(pixels.a, pixels.b, pixels.c));
    return {result.part[0], result.part[1], result.part[2]};
}

} // namespace pyxcc::frame
