// YCbCr and YUV with chroma shared by two columns of two rows to packed 16-bit pixels, their fields dithered.
#include "pyxcc/dithered_packed.h"

#include "packed/dithered_pixels.hpp"
#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR444Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR555Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR565Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB444Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB555Dither, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB565Dither, everyPixel(invHighE))

PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR444Dither, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR555Dither, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR565Dither, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB444Dither, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB555Dither, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB565Dither, everyPixel(yuvInvHighPacked))
