/**
 * @file
 * @brief A sensor's mosaic to RGB by means of the samples around each, in one pass.
 *
 * A mosaic has one sample a place, of one of three colours. `grid` tells which: 0 is B G over G R, 1 is R G over G B, 2
 * is G B over R G and 3 is G R over B G, from the first sample of the mosaic on. `src` is that sample, and not the
 * first one of the region, which `srcRoi` places within the mosaic; `srcSize` is the size of the whole.
 *
 * With C the sample itself, L, R, U and D those left, right, above and below it, and X the four diagonal ones, a pixel
 * is
 *
 *     red sample                   R = C,                   G = see below, B = (sum of X + 2) >> 2
 *     blue sample                  R = (sum of X + 2) >> 2, G = see below, B = C
 *     green sample in a red row    R = (L + R + 1) >> 1,    G = C,         B = (U + D + 1) >> 1
 *     green sample in a blue row   R = (U + D + 1) >> 1,    G = C,         B = (L + R + 1) >> 1
 *
 * Green at a red or blue sample follows the direction in which its own colour changes less. With h the distance between
 * the samples two columns to the left and to the right and v that between those two rows above and below, it is
 *
 *     v < h   (U + D + 1) >> 1
 *     v > h   (L + R + 1) >> 1
 *     v = h   (L + R + U + D + 2) >> 2
 *
 * In the two outer rows and columns of the mosaic it is always the last of these, and beyond the first and last row and
 * column the mosaic is mirrored about them.
 *
 * A region that goes beyond the mosaic's right or lower end stops there; if nothing is left, nothing is written. A
 * region must not begin in front of the mosaic. Only the part of the mosaic that it needs is read.
 *
 * Tests come in this order: pointers, the size of the mosaic, grid. Steps are not tested, and nothing is written when a
 * test fails. A step of 16-bit samples counts without its lowest bit.
 *
 * @code
 * u8 mosaic[480 * 640], rgb[480 * 640 * 3];
 * RoiRect whole = {0, 0, 640, 480};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiCFAToRGB_8u_C1C3R(mosaic, whole, size, 640, rgb, 640 * 3, 0, 0);
 * @endcode
 *
 * @see @ref family-cfa
 */
#ifndef PYXCC_CFA_TO_RGB_H
#define PYXCC_CFA_TO_RGB_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * 16-bit samples.
 *
 * @param src the first sample of the mosaic
 * @param srcRoi the region to convert, within the mosaic
 * @param srcSize width and height of the mosaic, each at least 2
 * @param srcStep bytes from one source row to the next
 * @param dst the first pixel of the converted region: R, G and B
 * @param dstStep bytes from one target row to the next
 * @param grid 0 to 3, the colours of the mosaic
 * @param interpolation not used; any value will do
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrBadArg
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCFAToRGB_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep,
                                                      u16* dst, int dstStep, s32 grid, s32 interpolation);

/**
 * 8-bit samples; otherwise as pyxiCFAToRGB_16u_C1C3R().
 *
 * @param src the first sample of the mosaic
 * @param srcRoi the region to convert, within the mosaic
 * @param srcSize width and height of the mosaic, each at least 2
 * @param srcStep bytes from one source row to the next
 * @param dst the first pixel of the converted region: R, G and B
 * @param dstStep bytes from one target row to the next
 * @param grid 0 to 3, the colours of the mosaic
 * @param interpolation not used; any value will do
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrBadArg
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCFAToRGB_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep,
                                                     u8* dst, int dstStep, s32 grid, s32 interpolation);

#ifdef __cplusplus
}
#endif

#endif
