// A mosaic to RGB, each pixel interpolated along its row or along its column, whichever leaves the image smoother.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiDemosaicAHD_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst, int dstStep,
                                    s32 grid, u16* tmp, int tmpStep);
PyxStatus pyxiDemosaicAHD_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst, int dstStep,
                                   s32 grid, u8* tmp, int tmpStep);

} // namespace reference
