/**
 * @file
 * @brief A sensor's mosaic to RGB along rows or along columns, whichever makes the smoother picture.
 *
 * The mosaic, its region and `grid` are as in cfa_to_rgb.h. Beyond its first and last row and column the mosaic is
 * mirrored about them, once: at a size of 5 this reads up to two samples beyond a row's other end, and two rows beyond
 * the last and in front of the first.
 *
 * Two candidates are made of each pixel, one with its green along the row and one along the column. Green at a red or
 * blue sample c between its green neighbours a and b, with f and g the samples behind those, is
 *
 *     ((a + b) >> 1) + ((2 c - f - g) >> 2), held between a and b.
 *
 * Red and blue are that green plus a quarter of what the four diagonal samples of the colour differ from the
 * candidate's green there, or half of what the two samples beside or above and below differ, rounded down and held to
 * the range of the samples.
 *
 * Both candidates are turned into Y, Cb and Cr:
 *
 *     Y = (66 R + 129 G + 25 B + 128) >> 8, Cb = (-38 R - 74 G + 112 B + 128) >> 8, Cr = (112 R - 94 G - 18 B + 128) >>
 * 8
 *
 * and compared with their four neighbours: how far apart their luma is, and the sum of the squares of what their chroma
 * differs, which wraps to a signed number of 32 bits. Each has a limit: the lesser of the larger distance to left and
 * right along the row and the larger one to above and below along the column. A candidate counts the neighbours that
 * are within both limits, and a pixel's score is the count along the row less the one along the column. The sum of the
 * scores of a pixel and the eight around it decides: below zero the candidate along the column is taken, above it the
 * other one. Where it is zero the pixel does as the one in front of it did, and the first of a row takes the one along
 * the row.
 *
 * For that the region falls apart into an inside and strips along the edges, each with rows of its own. The inside lies
 * 5 samples or more within the mosaic, begins at a red sample and has an even width and height. The strips above and
 * below it are as wide as the region, those on its left and right are as high as the inside. They are converted in this
 * order: inside, top, bottom, left, right. The top strip ends and the left strip begins where the inside would, even if
 * the region ends in front of that: of a small region near the mosaic's upper or left end, up to 6 rows or columns are
 * written, and `dst` must have room for them. At a mosaic's size of 5 a strip may begin one row or column in front of
 * the target.
 *
 * A region that begins in front of the mosaic is moved into it, not narrowed. One that goes beyond its right or lower
 * end stops there; if nothing is left, nothing is written.
 *
 * `tmp` is memory to work in: 30 rows of as many samples as the widest block has columns, and 6 more. It is not looked
 * at, and what it holds afterwards is not fixed. No two calls may use it at once. Of a 16-bit workspace's step the
 * lowest bit does not count, and neither does that of a 16-bit target's step on the way to the first row of a block.
 *
 * Tests come in this order: `src` and `dst`, the size of the mosaic, grid. Neither `tmp` nor steps are tested, and
 * nothing is written when a test fails.
 *
 * @code
 * u8 mosaic[480 * 640], rgb[480 * 640 * 3], workspace[30 * 646];
 * RoiRect whole = {0, 0, 640, 480};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiDemosaicAHD_8u_C1C3R(mosaic, whole, size, 640, rgb, 640 * 3, 0, workspace, 646);
 * @endcode
 *
 * @see @ref family-demosaic-ahd
 */
#ifndef PYXCC_DEMOSAIC_AHD_H
#define PYXCC_DEMOSAIC_AHD_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * 16-bit samples.
 *
 * @param src the first sample of the mosaic
 * @param srcRoi the region to convert
 * @param srcSize width and height of the mosaic, each at least 5
 * @param srcStep bytes from one source row to the next
 * @param dst the first pixel of the converted region: R, G and B
 * @param dstStep bytes from one target row to the next
 * @param grid 0 to 3, the colours of the mosaic
 * @param tmp memory to work in
 * @param tmpStep bytes from one of its 30 rows to the next
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrBadArg
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiDemosaicAHD_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep,
                                                         u16* dst, int dstStep, s32 grid, u16* tmp, int tmpStep);

/**
 * 8-bit samples; otherwise as pyxiDemosaicAHD_16u_C1C3R().
 *
 * @param src the first sample of the mosaic
 * @param srcRoi the region to convert
 * @param srcSize width and height of the mosaic, each at least 5
 * @param srcStep bytes from one source row to the next
 * @param dst the first pixel of the converted region: R, G and B
 * @param dstStep bytes from one target row to the next
 * @param grid 0 to 3, the colours of the mosaic
 * @param tmp memory to work in
 * @param tmpStep bytes from one of its 30 rows to the next
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrBadArg
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiDemosaicAHD_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep,
                                                        u8* dst, int dstStep, s32 grid, u8* tmp, int tmpStep);

#ifdef __cplusplus
}
#endif

#endif
