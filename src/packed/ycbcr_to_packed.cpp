// YCbCr with chroma of each pixel's own to packed 16-bit pixels, their fields cut.
#include "pyxcc/ycbcr_to_packed.h"

#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
PACKED_FROM_C3(YCbCr, BGR444, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C3(YCbCr, BGR555, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C3(YCbCr, BGR565, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C3(YCbCr, RGB444, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C3(YCbCr, RGB555, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C3(YCbCr, RGB565, wideThenTail<8>(invHighE, invExactA))

PACKED_FROM_P3(YCbCr, BGR444, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, BGR555, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, BGR565, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB444, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB555, everyPixel(invHighE))
PACKED_FROM_P3(YCbCr, RGB565, everyPixel(invHighE))
