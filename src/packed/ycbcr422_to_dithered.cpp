// YCbCr with chroma shared by two columns of a row to packed 16-bit pixels, their fields dithered.
#include "pyxcc/dithered_packed.h"

#include "packed/dithered_pixels.hpp"
#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
PACKED_FROM_C2(YCbCr422, BGR444Dither, everyPixel(invHighE))
PACKED_FROM_C2(YCbCr422, BGR555Dither, everyPixel(invHighE))
PACKED_FROM_C2(YCbCr422, BGR565Dither, everyPixel(invHighE))
PACKED_FROM_C2(YCbCr422, RGB444Dither, everyPixel(invHighE))
PACKED_FROM_C2(YCbCr422, RGB555Dither, everyPixel(invHighE))
PACKED_FROM_C2(YCbCr422, RGB565Dither, everyPixel(invHighE))

PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR444Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR555Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR565Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB444Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB555Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB565Dither, everyPixel(invHighE))
