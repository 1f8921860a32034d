// YCbCr and YUV with chroma shared by two columns of two rows to packed 16-bit pixels, their fields cut. A last odd
// column or row has chroma of its own.
#include "pyxcc/ycbcr_to_packed.h"

#include "packed/exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::packed;

// clang-format off
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR444, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR555, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, BGR565, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB444, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB555, everyPixel(invHighE))
PACKED_FROM_P3_OF_ROW_PAIRS(YCbCr420, RGB565, everyPixel(invHighE))

PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR444, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR555, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, BGR565, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB444, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB555, everyPixel(yuvInvHighPacked))
PACKED_FROM_P3_OF_ROW_PAIRS(YUV420, RGB565, everyPixel(yuvInvHighPacked))
