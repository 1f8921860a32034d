// Images of packed 16-bit pixels by the names of their models, which tell the channels from the low bits up. The
// channels of all of them are R, G, B.
#pragma once

#include "layouts/packed_pixels.hpp"

namespace pyxcc::packed::models
{

template <class Pixel> auto RGB444(Pixel* first, int step)
{
    return layouts::packedPixelsApart<layouts::fields444>(first, step);
}

template <class Pixel> auto RGB555(Pixel* first, int step)
{
    return layouts::packedPixelsApart<layouts::fields555>(first, step);
}

template <class Pixel> auto RGB565(Pixel* first, int step)
{
    return layouts::packedPixelsApart<layouts::fields565>(first, step);
}

template <class Pixel> auto BGR444(Pixel* first, int step) { return reversed(RGB444(first, step)); }
template <class Pixel> auto BGR555(Pixel* first, int step) { return reversed(RGB555(first, step)); }
template <class Pixel> auto BGR565(Pixel* first, int step) { return reversed(RGB565(first, step)); }

} // namespace pyxcc::packed::models
