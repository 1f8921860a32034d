/**
 * @file
 * @brief RGB to YCbCr with shared chroma: 8 bits, BT.601, studio range, 4:2:0, 4:2:2 and 4:1:1.
 *
 * | form | one chroma sample covers | chroma planes |
 * |---|---|---|
 * | 4:2:0 | two columns of two rows | width / 2 by height / 2 |
 * | 4:2:2 | two columns of a row | width / 2 by height |
 * | 4:1:1 | four columns of a row | width / 4 by height |
 *
 * Divisions round down. Blocks are counted from the first pixel of the region. R, G and B are summed over the pixels
 * of a block, and chroma is that of the sums; luma is of full size. Y takes 16 to 235 and Cb, Cr 16 to 240 with 128 as
 * zero.
 *
 * Layouts: `P3` is three planes with a step each, `P2` a plane of Y and one of chroma pairs, `C2` packed rows of two
 * bytes a pixel, Y0 Cb Y1 Cr or Y0 Cr Y1 Cb. A name with `YCrCb` has Cr before Cb.
 *
 * Each conversion fixes its results to the bit by named fixed-point forms, and most have one for the first `W` columns
 * of a row and another for the rest; `W` follows from the width alone. They differ by a level at the most, so equal
 * pixels at both ends of a row can differ by one.
 *
 * Columns and rows that do not fill a block are told for each conversion: they stay untouched, or get luma and no
 * chroma, or in a `C2` row luma and the first chroma sample of the pair, from the lone pixel. All take any step, zero
 * and negative ones included, and write nothing when they return an error. The array of steps must not be null and is
 * not tested.
 *
 * @code
 * u8 rgb[480 * 640 * 3], y[480 * 640], cb[240 * 320], cr[240 * 320];
 * u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToYCbCr420_8u_C3P3R(rgb, 640 * 3, planes, steps, size);
 * @endcode
 *
 * @see @ref family-rgb-to-subsampled
 */
#ifndef PYXCC_RGB_TO_SUBSAMPLED_H
#define PYXCC_RGB_TO_SUBSAMPLED_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved BGR to planar YCbCr 4:2:0. `lumaHigh7` and `chromaHighS` (32) up to `W`, `fwdExact` and `chromaExact`
 * from there on. `W` is `width & ~15`. An odd last column and an odd last row stay untouched in all planes.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar YCbCr 4:2:0. `lumaHigh7` and `chromaHighU` (16400, 7) up to `W`,
 * `fwdExact` and `chromaExact` from there on. `W` is `(width & ~15) + ((width & 7) >= 4 ? 4 : 0)`. An odd last column
 * and an odd last row stay untouched in all planes.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                           const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR to planar YCrCb 4:2:0. As ::pyxiBGRToYCbCr420_8u_C3P3R. An odd last column and an odd last row stay
 * untouched in all planes.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar YCrCb 4:2:0. As ::pyxiBGRToYCbCr420_8u_AC4P3R. An odd last column and
 * an odd last row stay untouched in all planes.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                           const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB with a fourth byte to planar YCrCb 4:2:0. As ::pyxiBGRToYCbCr420_8u_AC4P3R. An odd last column and
 * an odd last row stay untouched in all planes.
 *
 * @param src R, G, B and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                           const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to planar YCbCr 4:2:0. `fwdRound` and `chromaRound` up to `W`, `fwdExact` and `chromaExact` from
 * there on. `W` is `width & ~7`. An odd last column and an odd last row stay untouched in all planes.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to semi-planar YCbCr 4:2:0. As ::pyxiRGBToYCbCr420_8u_C3P3R. An odd last column and an odd last row
 * stay untouched in all planes.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth byte to semi-planar YCbCr 4:2:0. As ::pyxiRGBToYCbCr420_8u_C3P3R. An odd last column
 * and an odd last row stay untouched in all planes.
 *
 * @param src R, G, B and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C4P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Interleaved BGR to planar YCbCr 4:1:1. `lumaRoundPlain` and `chromaRoundPlain` up to `W`, `fwdExact` and
 * `chromaExact` from there on. `W` is `width & ~15`. The last `width & 3` columns stay untouched in all planes.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have a quarter of the width
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, at least 4 by 1
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr411_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar YCbCr 4:1:1. `lumaHigh7` and `chromaHighU` (16400, 7) up to `W`,
 * `fwdExact` and `chromaExact` from there on. `W` is `width & ~31`. The last `width & 3` columns get Y and no chroma.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have a quarter of the width
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, at least 4 by 1
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr411_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                           const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR to planar YCbCr 4:2:2. `lumaHigh7` and `chromaHighU` (8200, 6) up to `W`, `fwdExact` and
 * `chromaExact` from there on. `W` is `(width & ~31) + ((width & 15) >= 8 ? 8 : 0)`. An odd last column gets Y and no
 * chroma, and there is no warning.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, at least 2 by 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar YCbCr 4:2:2. As ::pyxiBGRToYCbCr422_8u_C3P3R.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, at least 2 by 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                           const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to planar YCbCr 4:2:2. As ::pyxiBGRToYCbCr422_8u_C3P3R, but an odd last column stays untouched in
 * all planes, and there is a warning.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, at least 2 by 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                          const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR to packed YCbCr 4:2:2. All pairs take `lumaHigh7` and `chromaHighS` (64). An odd last pixel gets Y
 * by `fwdExact` and Cb by an exact sum to which an eighth of a step is added.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 by 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to packed YCbCr 4:2:2. As ::pyxiBGRToYCbCr422_8u_C3C2R, but half a step is added
 * to the Cb of an odd last pixel.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 by 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved RGB to packed YCbCr 4:2:2. Luma is `lumaHigh8` up to `W`; from there on it is `fwdExact` in even
 * columns, which rounds, and `lumaExactOdd` in odd ones, which does not. `W` is `width & ~7`. Chroma is exact and
 * rounded. An odd last pixel gets Y and Cb, from itself alone.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Interleaved RGB to packed YCrCb 4:2:2. As ::pyxiRGBToYCbCr422_8u_C3C2R; an odd last pixel gets Y and Cr.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCrCb422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Planar RGB to packed YCbCr 4:2:2. As ::pyxiRGBToYCbCr422_8u_C3C2R.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next, in each plane
 * @param dst packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Planar RGB to packed YCrCb 4:2:2. As ::pyxiRGBToYCbCr422_8u_C3C2R; an odd last pixel gets Y and Cr.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next, in each plane
 * @param dst packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCrCb422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
