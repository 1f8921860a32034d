// What the methods of reducing an image to fewer levels are called with.
#pragma once

#include "tone/reduce_bits_depths.hpp"

namespace pyxcc::tone
{

/// Which samples of a pixel take part.
template <int Channels, int PixelSamples> struct Pixel {
    static constexpr int channels = Channels, samples = PixelSamples;
    static constexpr bool keepsFourth = Channels < PixelSamples;
};

using C1Pixel = Pixel<1, 1>;
using C3Pixel = Pixel<3, 3>;
using AC4Pixel = Pixel<3, 4>;
using C4Pixel = Pixel<4, 4>;

template <class Depth> struct ReduceBits {
    using Source = typename Depth::Source;
    using Target = typename Depth::Target;

    const Source* src;
    int srcStep;
    Target* dst;
    int dstStep;
    RoiSize roi;
    u32 noise;
    s32 levels;
};

} // namespace pyxcc::tone
