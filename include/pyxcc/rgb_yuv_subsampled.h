/**
 * @file
 * @brief RGB to YUV with shared chroma and back: 8 bits, full range, 4:2:0 and 4:2:2.
 *
 * The model is that of rgb_yuv.h. U and V are those of the sums of R, G and B over the pixels that share them, two
 * columns of a row (4:2:2) or of two rows (4:2:0), counted from the first pixel of the region; back, a sample serves
 * all the pixels of its block. Planes are Y of full size and U, V of half the width, and for 4:2:0 of half the height
 * as well; packed rows (`C2`) are Y0 U Y1 V.
 *
 * | layout | an odd last column | an odd last row |
 * |---|---|---|
 * | 4:2:0 | stays untouched, ::pyxWarnOddSize | stays untouched, ::pyxWarnOddSize |
 * | 4:2:2 planes | has U and V of its own: (width + 1) / 2 samples a row | rows are independent |
 * | 4:2:2 packed | has a U of its own and no V | rows are independent |
 *
 * Each conversion fixes its results to the bit by named fixed-point forms: a wide one for the first `W` columns of a
 * row and an exact one for the rest, or one form for all. `W` follows from the width alone.
 *
 * Names without an `R` at the end take images without gaps between their rows: `3 * width` bytes a row of triples,
 * `width` a row of Y, R, G or B; and a row of U or V has `width / 2` bytes for 4:2:0 and `width / 2 + width % 2` for
 * 4:2:2. Those of 4:2:2 take an image of an even width and of 256 pixels or more, up to 2^31 - 1, as a single row of
 * width x height pixels, and the form of a pixel follows from its place in that.
 *
 * The others take any step, zero and negative ones included. None writes anything when it returns an error. Pointers
 * and arrays of planes are tested before the size, the elements of arrays after it; arrays of steps must not be null
 * and are not tested.
 *
 * @code
 * u8 rgb[480 * 640 * 3], y[480 * 640], u[240 * 320], v[240 * 320];
 * u8* const planes[3] = {y, u, v};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToYUV420_8u_C3P3(rgb, planes, size);
 * @endcode
 *
 * @see @ref family-rgb-yuv-subsampled
 */
#ifndef PYXCC_RGB_YUV_SUBSAMPLED_H
#define PYXCC_RGB_YUV_SUBSAMPLED_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to planar YUV 4:2:0. The first `width & ~7` pixels of a row take `yuv420Round`, the rest
 * `yuv420Exact14`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V; those of U and V have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to planar YUV 4:2:0. The first `width & ~7` pixels of a row take `yuv420Round`, the rest
 * `yuv420Exact14`. No gaps between rows.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param dst planes Y, U, V; those of U and V have half the width and height
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi);

/**
 * Planar RGB to planar YUV 4:2:0. All whole blocks take `yuv420Exact16`.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V; those of U and V have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi);

/**
 * Planar RGB to planar YUV 4:2:0. All whole blocks take `yuv420Exact16`. No gaps between rows.
 *
 * @param src planes R, G, B
 * @param dst planes Y, U, V; those of U and V have half the width and height
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar YUV 4:2:0. All whole blocks take `yuv420Exact16`.
 *
 * @param src B, G, R, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V; those of U and V have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYUV420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                         const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to packed YUV 4:2:2. All pairs take `yuv422Exact32768`; so does an odd last pixel alone, of which Y
 * and U are written and V is not.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Y0, U, Y1, V, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to planar YUV 4:2:2. The first `width & ~15` pixels of a row take `yuv422Round`, the other pairs
 * `yuv422Exact65535`, an odd last pixel `yuv422Odd15`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V; those of U and V have half the width, rounded up
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi);

/**
 * Interleaved RGB to planar YUV 4:2:2. The first `width & ~15` pixels of a row take `yuv422Round`, the other pairs
 * `yuv422Exact65535`, an odd last pixel `yuv422Odd15`. No gaps between rows; a long row where it can be.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param dst planes Y, U, V; those of U and V have half the width, rounded up
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi);

/**
 * Planar RGB to planar YUV 4:2:2. All pairs take `yuv422Exact65535`, an odd last pixel `yuv422OddFloor15`.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V; those of U and V have half the width, rounded up
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi);

/**
 * Planar RGB to planar YUV 4:2:2. All pairs take `yuv422Exact65535`, an odd last pixel `yuv422OddFloor15`. No gaps
 * between rows; a long row where it can be.
 *
 * @param src planes R, G, B
 * @param dst planes Y, U, V; those of U and V have half the width, rounded up
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);

/**
 * Planar YUV 4:2:0 to planar RGB. All whole blocks take `yuvInvExactD`.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                      int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to planar RGB. All whole blocks take `yuvInvExactD`. No gaps between rows.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param dst planes R, G, B
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);

/**
 * Planar YUV 4:2:0 to interleaved RGB. All whole blocks take `yuvInvHigh4`.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                        int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to interleaved RGB. All whole blocks take `yuvInvHigh4`. No gaps between rows.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi);

/**
 * Planar YUV 4:2:0 to interleaved BGR. All whole blocks take `yuvInvHigh4x`.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                        int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to interleaved RGB with a fourth byte, which is set to 0. The first `width & ~15` pixels of a row
 * take `yuvInvHigh8`, the rest of the whole blocks `yuvInvExactC`.
 *
 * @param src planes Y, U, V; those of U and V have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B, 0, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                         int dstStep, RoiSize roi);

/**
 * Packed YUV 4:2:2 to interleaved RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the rest
 * `yuvInvExactC`. An odd last pixel has a U of its own and takes the V of the pair before it; in a row of one pixel V
 * is 128.
 *
 * @param src Y0, U, Y1, V, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:2 to planar RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the other pairs
 * `yuvInvExactD`, an odd last pixel `yuv422OddInv13`.
 *
 * @param src planes Y, U, V; those of U and V have half the width, rounded up
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                      int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:2 to planar RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the other pairs
 * `yuvInvExactD`, an odd last pixel `yuv422OddInv13`. No gaps between rows; a long row where it can be.
 *
 * @param src planes Y, U, V; those of U and V have half the width, rounded up
 * @param dst planes R, G, B
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi);

/**
 * Planar YUV 4:2:2 to interleaved RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the rest
 * `yuvInvExactD`.
 *
 * @param src planes Y, U, V; those of U and V have half the width, rounded up
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                        int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:2 to interleaved RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the rest
 * `yuvInvExactD`. No gaps between rows; a long row where it can be.
 *
 * @param src planes Y, U, V; those of U and V have half the width, rounded up
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi);

/**
 * Planar YUV 4:2:2 to interleaved RGB with a fourth byte, which is set to 0. The first `width & ~3` pixels of a row
 * take `yuvInvHigh8`, the rest `yuvInvExactD`.
 *
 * @param src planes Y, U, V; those of U and V have half the width, rounded up
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B, 0, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                         int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
