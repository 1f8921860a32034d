/**
 * @file
 * @brief Everything that the library exports.
 */
#ifndef PYXCC_PYXCC_H
#define PYXCC_PYXCC_H

#include "pyxcc/bt709.h"
#include "pyxcc/cbycr422.h"
#include "pyxcc/cfa_to_rgb.h"
#include "pyxcc/color_twist.h"
#include "pyxcc/demosaic_ahd.h"
#include "pyxcc/dithered_packed.h"
#include "pyxcc/filter_interlace.h"
#include "pyxcc/gamma.h"
#include "pyxcc/gray.h"
#include "pyxcc/hls.h"
#include "pyxcc/hsv.h"
#include "pyxcc/lab.h"
#include "pyxcc/luv.h"
#include "pyxcc/packed_rgb.h"
#include "pyxcc/reduce_bits.h"
#include "pyxcc/reduce_bits_1u.h"
#include "pyxcc/repack.h"
#include "pyxcc/rgb_to_subsampled.h"
#include "pyxcc/rgb_ycbcr.h"
#include "pyxcc/rgb_yuv.h"
#include "pyxcc/rgb_yuv_subsampled.h"
#include "pyxcc/subsampled_to_rgb.h"
#include "pyxcc/tone_map.h"
#include "pyxcc/types.h"
#include "pyxcc/version.h"
#include "pyxcc/xyz_ycc.h"
#include "pyxcc/ycbcr_to_packed.h"
#include "pyxcc/ycocg.h"

#endif
