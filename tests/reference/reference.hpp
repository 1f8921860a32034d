// The plain statement of every conversion: scalar, one pixel at a time, under the name and the signature of the export.
#pragma once

#include "reference/bt709.hpp"
#include "reference/cbycr422.hpp"
#include "reference/color_twist.hpp"
#include "reference/filter_interlace.hpp"
#include "reference/gamma.hpp"
#include "reference/gray.hpp"
#include "reference/lab.hpp"
#include "reference/packed_rgb.hpp"
#include "reference/repack.hpp"
#include "reference/rgb_to_subsampled.hpp"
#include "reference/rgb_ycbcr.hpp"
#include "reference/rgb_yuv.hpp"
#include "reference/subsampled_to_rgb.hpp"
#include "reference/xyz_ycc.hpp"
#include "reference/ycbcr_to_packed.hpp"
#include "reference/ycbcr_to_packed_dither.hpp"
