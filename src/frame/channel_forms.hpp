// Forms that begin and end on samples as they lie, whatever they widen in between: a block is a register a channel.
#pragma once

#include "lanes/lanes.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over samples of three channels, which gives as many.
struct OnChannels {
};

template <std::derived_from<OnChannels> Form, class Samples>
PYXCC_INLINE Three<Samples> apply(const Form& form, const Three<Samples>& pixels)
{
    return form(pixels.a, pixels.b, pixels.c);
}

} // namespace pyxcc::frame
