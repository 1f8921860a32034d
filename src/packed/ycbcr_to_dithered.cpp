// YCbCr with chroma of each pixel's own to packed 16-bit pixels, their fields dithered.
#include "pyxcc/dithered_packed.h"

#include "packed/dithered_pixels.hpp"
#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
PACKED_FROM_C3(YCbCr, BGR444Dither, everyPixel(invHighE))
PACKED_FROM_C3(YCbCr, BGR555Dither, everyPixel(invHighE))
PACKED_FROM_C3(YCbCr, BGR565Dither, everyPixel(invHighE))
PACKED_FROM_C3(YCbCr, RGB444Dither, everyPixel(invHighE))
PACKED_FROM_C3(YCbCr, RGB555Dither, everyPixel(invHighE))
PACKED_FROM_C3(YCbCr, RGB565Dither, everyPixel(invHighE))

PACKED_FROM_P3(YCbCr, BGR444Dither, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, BGR555Dither, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, BGR565Dither, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB444Dither, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB555Dither, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB565Dither, everyPixel(invHighE))
