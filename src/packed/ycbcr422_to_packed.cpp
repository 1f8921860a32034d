// YCbCr with chroma shared by two columns of a row to packed 16-bit pixels, their fields cut.
#include "pyxcc/ycbcr_to_packed.h"

#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
// Of the packed rows, those to two of the targets round.
PACKED_FROM_C2(YCbCr422, BGR444, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C2(YCbCr422, BGR555, wideThenTail<8>(invHighD, invExactD))
PACKED_FROM_C2(YCbCr422, BGR565, wideThenTail<8>(invHighD, invExactD))
PACKED_FROM_C2(YCbCr422, RGB444, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C2(YCbCr422, RGB555, wideThenTail<8>(invHighE, invExactA))
PACKED_FROM_C2(YCbCr422, RGB565, wideThenTail<8>(invHighE, invExactA))

PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR444, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR555, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, BGR565, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB444, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB555, everyPixel(invHighE))
PACKED_FROM_P3_OF_PAIRS(YCbCr422, RGB565, everyPixel(invHighE))
