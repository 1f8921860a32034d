/**
 * @file
 * @brief YCbCr with shared chroma to RGB: 8 bits, BT.601, studio range, 4:2:0, 4:2:2 and 4:1:1.
 *
 * Every sample from 0 to 255 is accepted, and results are clamped:
 *
 *     R = 1.164 (Y - 16) + 1.596 (Cr - 128)
 *     G = 1.164 (Y - 16) - 0.392 (Cb - 128) - 0.813 (Cr - 128)
 *     B = 1.164 (Y - 16) + 2.017 (Cb - 128)
 *
 * Chroma blocks and source layouts are those of the targets in rgb_to_subsampled.h. Chroma is not interpolated: a
 * sample serves all the pixels of its block. A name with `YCrCb` has Cr before Cb.
 *
 * Each conversion fixes its results to the bit by named fixed-point forms: a wide one for the first `W` columns of a
 * row and an exact one for the rest, or one form for all. `W` follows from the width alone. The forms differ in the
 * last bit, so equal pixels at both ends of a row can differ by one; Y 235 with Cb and Cr 128 is white in some of them
 * and one below in some channels of others.
 *
 * | layout | an odd last column | an odd last row |
 * |---|---|---|
 * | 4:2:0 | stays untouched, ::pyxWarnOddSize | stays untouched, ::pyxWarnOddSize |
 * | 4:2:2 planes | is told for each conversion | rows are independent |
 * | 4:2:2 packed | has one chroma sample of its own, the other is the byte before its Y | rows are independent |
 * | 4:1:1 | up to three columns take the last whole chroma sample | rows are independent |
 *
 * A packed row of one pixel has its second chroma sample in the byte before the row, which must be readable: it belongs
 * to the result. Nothing else outside of the rows is read. All conversions take any step, zero and negative ones
 * included, and write nothing when they return an error. Arrays of steps must not be null and are not tested.
 *
 * @code
 * u8 y[480 * 640], cb[240 * 320], cr[240 * 320], rgb[480 * 640 * 3];
 * const u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiYCbCr420ToRGB_8u_P3C3R(planes, steps, rgb, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-subsampled-to-rgb
 */
#ifndef PYXCC_SUBSAMPLED_TO_RGB_H
#define PYXCC_SUBSAMPLED_TO_RGB_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Semi-planar YCbCr 4:2:0 to interleaved BGR. All whole blocks take `inv3A`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to interleaved BGR with a fourth byte. All whole blocks take `inv3A`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi, u8 aval);

/**
 * Semi-planar YCbCr 4:2:0 to interleaved RGB. All whole blocks take `inv3A`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to interleaved RGB with a fourth byte. All whole blocks take `inv3A`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi, u8 aval);

/**
 * Semi-planar YCrCb 4:2:0 to interleaved BGR. All whole blocks take `inv3B`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cr, Cb pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Semi-planar YCrCb 4:2:0 to interleaved BGR with a fourth byte. All whole blocks take `inv3B`. The size is tested
 * before the pointers.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cr, Cb pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi, u8 aval);

/**
 * Semi-planar YCrCb 4:2:0 to interleaved RGB. All whole blocks take `inv3B`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cr, Cb pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Semi-planar YCrCb 4:2:0 to interleaved RGB with a fourth byte. All whole blocks take `inv3B`. The size is tested
 * before the pointers.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cr, Cb pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                          int srcCbCrStep, u8* dst, int dstStep, RoiSize roi, u8 aval);

/**
 * Planar YCbCr 4:2:0 to interleaved BGR. `inv3D` up to `W`, which is `width & ~15`, `invExactB` from there on. The
 * elements of `src` are tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to interleaved BGR with a fourth byte. All whole blocks take `inv3A`. The elements of `src` are
 * tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi, u8 aval);

/**
 * Planar YCbCr 4:2:0 to interleaved RGB. `invHighC` up to `W`, which is `width & ~7`, `invExactB` from there on. The
 * elements of `src` are tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to interleaved RGB with a fourth byte. `invHighD` up to `W`, which is `width & ~7`, `invExactB`
 * from there on. The elements of `src` are tested after the size.
 *
 * @param src planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi, u8 aval);

/**
 * Packed YCbCr 4:2:2 to interleaved BGR. `invHighD` up to `W`, which is `width & ~7`, `invExactD` from there on.
 *
 * @param src packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to interleaved BGR with a fourth byte. `invHighD` up to `W`, which is `width & ~7`, `invExactD`
 * from there on.
 *
 * @param src packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                          u8 aval);

/**
 * Packed YCbCr 4:2:2 to interleaved RGB. `invHighB` up to `W`, which is `width & ~3`, `invExactF` from there on.
 *
 * @param src packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to interleaved RGB with a fourth byte. `inv3C` up to `W`, which is `width & ~7`, `invExactB` from
 * there on.
 *
 * @param src packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                          u8 aval);

/**
 * Packed YCbCr 4:2:2 to planar RGB. `invHighB` up to `W`, which is `width & ~3`, `invExactF` from there on. The
 * elements of `dst` are tested after the size.
 *
 * @param src packed Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                          RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to interleaved BGR. `inv3C` up to `W`, which is `width & ~7`, `invExactB` from there on.
 *
 * @param src packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to interleaved BGR with a fourth byte. `inv3C` up to `W`, which is `width & ~7`, `invExactB` from
 * there on.
 *
 * @param src packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                          u8 aval);

/**
 * Packed YCrCb 4:2:2 to interleaved RGB. `inv3C` up to `W`, which is `width & ~7`, `invExactB` from there on.
 *
 * @param src packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to interleaved RGB with a fourth byte. `inv3C` up to `W`, which is `width & ~7`, `invExactB` from
 * there on.
 *
 * @param src packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                          u8 aval);

/**
 * Packed YCrCb 4:2:2 to planar RGB. `invHighB` up to `W`, which is `width & ~3`, `invExactF` from there on. The
 * elements of `dst` are tested after the size.
 *
 * @param src packed Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                          RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to interleaved BGR. `invHighC` up to `W`, which is `width & ~7`, `invExactF` from there on. An
 * odd last column stays untouched.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi a width of at least 2 and a height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to interleaved RGB. Up to `W`, which is `width & ~7`, `inv3D` if the three planes, `dst` and all
 * four steps are multiples of 16, else `invHighC`; `invExactC` from there on. This is the one conversion of its kind
 * whose results depend on where the images lie. An odd last column has chroma samples of its own, so that the rows of
 * Cb and Cr hold (width + 1) / 2. The elements of `src` are tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width, rounded up
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to interleaved BGR. `invHighA` up to `W`, which is `width & ~3`, or `width` if three columns are
 * left over; `invExactE` from there on.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have a quarter of the width
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi a width of at least 4 and a height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to interleaved BGR with a fourth byte. `invHighA` up to `W`, which is `width & ~3`, or `width` if
 * three columns are left over; `invExactE` from there on.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have a quarter of the width
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi a width of at least 4 and a height of at least 1, in pixels
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                          int dstStep, RoiSize roi, u8 aval);

#ifdef __cplusplus
}
#endif

#endif
