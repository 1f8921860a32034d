/**
 * @file
 * @brief YCbCr from one chroma form or plane layout to another: 8 bits, 4:2:0, 4:2:2, 4:1:1 and 1620.
 *
 * Luma is copied. Chroma is moved, doubled or dropped by one of seven rules, and never averaged but in the four
 * conversions at the end. With (i, j) a chroma sample of the target, by column and row, and a plane of the source that
 * holds the same component:
 *
 * | rule | from, to | target sample (i, j) is source sample |
 * |---|---|---|
 * | `sameGrid` | the same form | (i, j) |
 * | `rowDouble` | 4:2:0, 4:2:2 | (i, j >> 1) |
 * | `rowSkip` | 4:2:2, 4:2:0 | (i, 2 j): odd rows are ignored |
 * | `colDouble` | 4:1:1, 4:2:2 | (i >> 1, j) |
 * | `colSkip` | 4:2:2, 4:1:1 | (2 i, j): odd columns are ignored |
 * | `rowFold` | 4:1:1, 4:2:0 | (i >> 1, 2 j + (i & 1)): nothing is lost |
 * | `rowUnfold` | 4:2:0, 4:1:1 | (2 i + (j & 1), j >> 1): undoes `rowFold` |
 *
 * A chroma sample belongs to 2 columns of 2 rows in 4:2:0, to 2 columns of a row in 4:2:2, to 4 columns of a row in
 * 4:1:1 and to 4 columns of 4 rows in 1620. Layouts are those of the targets in rgb_to_subsampled.h: three planes with
 * a step each, a plane of luma and one of chroma pairs, or packed rows of 4:2:2. A name with `YCrCb` has Cr before Cb;
 * where only one end has, the components change places, each keeping its name, unless said otherwise.
 *
 * Off sizes are rounded down in silence, and what lies behind is neither read nor written: the width to a multiple of 4
 * where 4:1:1 takes part and of 2 elsewhere, the height to a multiple of 2 where 4:2:0 takes part. In the four
 * conversions at the end, avgUp(a, b) is (a + b + 1) >> 1 and avgDown(a, b) is (a + b) >> 1, and sizes must be
 * multiples.
 *
 * All conversions take any step, zero and negative ones included, and write nothing when they return an error. Arrays
 * of steps must not be null and are not tested.
 *
 * @code
 * u8 y[480 * 640], cbCr[240 * 640], packed[480 * 640 * 2];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiYCbCr420ToYCbCr422_8u_P2C2R(y, 640, cbCr, 640, packed, 640 * 2, size);
 * @endcode
 *
 * @see @ref family-repack
 */
#ifndef PYXCC_REPACK_H
#define PYXCC_REPACK_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * YCbCr 4:2:0 from semi-planar to planes: `sameGrid`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                     u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * YCbCr 4:2:0 from planes to semi-planar: `sameGrid`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                     int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * YCbCr 4:2:2 from packed rows to planes: `sameGrid`.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 2, and height, at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                     RoiSize roi);

/**
 * YCbCr 4:2:2 from planes to packed rows: `sameGrid`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 2, and height, at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                     RoiSize roi);

/**
 * YCbCr 4:1:1 from semi-planar to planes: `sameGrid`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                     u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * YCbCr 4:1:1 from planes to semi-planar: `sameGrid`.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                     int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to planar YCrCb 4:2:0: `sameGrid`. The first sample of each pair goes to `dst[1]`, which the
 * name calls Cr, and the second to `dst[2]`: the bytes are those of pyxiYCbCr420_8u_P2P3R(). A width or height below 1
 * yields ::pyxErrSize before the elements of `dst` are tested, one below 2 after that.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cr and Cb; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to semi-planar YCbCr 4:2:0: `sameGrid`, with the components exchanged. `src[1]` is walked by
 * `srcStep[2]`, and `src[2]` by `srcStep[1]`.
 *
 * @param src planes of Y, Cr and Cb; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to packed YCrCb 4:2:2: `sameGrid`, with the components exchanged.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 2, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCrCb422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to packed YCrCb 4:2:2: `sameGrid`, with the components exchanged.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 2, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to planar YCbCr 4:2:2: `sameGrid`, with the components exchanged.
 *
 * @param src Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 2, and height, at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to packed YCbCr 4:2:2: `rowDouble`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to packed YCbCr 4:2:2: `rowDouble`, with the components exchanged. `src[1]` is walked by
 * `srcStep[2]`, and `src[2]` by `srcStep[1]`.
 *
 * @param src planes of Y, Cr and Cb; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to planar YCbCr 4:2:2: `rowDouble`. The second copies in `dst[2]` of samples c & ~31 up to c
 * & ~7, c being half the width, are `dstStep[1]` bytes behind the first ones, where those of all other samples are
 * `dstStep[2]` bytes behind. In each pair of rows the second copies come after the first ones, and count where the two
 * overlap.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to planar YCbCr 4:2:2: `rowDouble`. The second copies in `dst[2]` of samples c & ~63 up to c & ~7,
 * c being half the width, are `dstStep[1]` bytes behind the first ones, where those of all other samples are
 * `dstStep[2]` bytes behind. In each pair of rows the second copies come after the first ones, and count where the two
 * overlap.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to planar YCbCr 4:2:2: `rowDouble`, with the components exchanged. The second copies in `dst[2]`
 * of samples c & ~63 up to c & ~7, c being half the width, are `dstStep[1]` bytes behind the first ones, where those of
 * all other samples are `dstStep[2]` bytes behind. In each pair of rows the second copies come after the first ones,
 * and count where the two overlap.
 *
 * @param src planes of Y, Cr and Cb; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to semi-planar YCbCr 4:2:0: `rowSkip`.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                               u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to planar YCbCr 4:2:0: `rowSkip`.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to semi-planar YCbCr 4:2:0: `rowSkip`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to planar YCbCr 4:2:0: `rowSkip`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to planar YCrCb 4:2:0: `rowSkip`, with the components exchanged.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cr and Cb; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to planar YCbCr 4:2:0: `rowSkip`, with the components exchanged.
 *
 * @param src Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:1:1 to packed YCbCr 4:2:2: `colDouble`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Semi-planar YCbCr 4:1:1 to planar YCbCr 4:2:2: `colDouble`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to packed YCbCr 4:2:2: `colDouble`.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to planar YCbCr 4:2:2: `colDouble`.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to packed YCrCb 4:2:2: `colDouble`, with the components exchanged.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to planar YCrCb 4:2:2: `colDouble`, with the components exchanged.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cr and Cb; chroma has half the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCrCb422_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to semi-planar YCbCr 4:1:1: `colSkip`.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr411_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                               u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to planar YCbCr 4:1:1: `colSkip`.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to semi-planar YCbCr 4:1:1: `colSkip`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to planar YCbCr 4:1:1: `colSkip`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToYCbCr411_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Packed YCrCb 4:2:2 to planar YCbCr 4:1:1: `colSkip`, with the components exchanged.
 *
 * @param src Y0 Cr Y1 Cb, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, which is not tested: below 1 there is nothing to do
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:1:1 to planar YCbCr 4:2:0: `rowFold`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to semi-planar YCbCr 4:2:0: `rowFold`.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to planar YCbCr 4:2:0: `rowFold`.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                             u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:1:1 to planar YCrCb 4:2:0: `rowFold`, with the components exchanged.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cr and Cb; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to planar YCbCr 4:1:1: `rowUnfold`.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                               RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to semi-planar YCbCr 4:1:1: `rowUnfold`.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to semi-planar YCbCr 4:1:1: `rowUnfold`, with the components exchanged.
 *
 * @param src planes of Y, Cr and Cb; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of a quarter of the width
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width in pixels, at least 4, and height, at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY,
                                                               int dstYStep, u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * 4:1:1 to 4:2:0 by interpolation along rows. Odd rows of chroma of the source are ignored. In a row of n samples,
 * target sample 2 k is source sample k, and 2 k + 1 lies half way between k and k + 1: `avgUp` for k below (n - 1) &
 * ~15, `avgDown` behind. The last one is source sample n - 1.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each a multiple of 4 and at least 4
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize, also for a size that is not a multiple
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi);

/**
 * 1620 to 4:2:0 by interpolation in both directions: along rows as in pyxiYCbCr411To420_8u_P3R(), and target row 2 r +
 * 1 lies half way between rows 2 r and 2 r + 2, by the same average as its column pair. The last row has each sample of
 * the last source row twice, without interpolation.
 *
 * @param src planes of Y, Cb and Cr; chroma has a quarter of the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has half the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each a multiple of 4 and at least 4
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize, also for a size that is not a multiple
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr1620To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                         const int dstStep[3], RoiSize roi);

/**
 * 4:2:0 to 4:1:1: odd columns of chroma are dropped, and rows interpolated. Target row 2 r is source row r, and 2 r + 1
 * lies half way between rows r and r + 1: `avgUp` for the first n & ~31 of n columns, `avgDown` behind. The last row is
 * the one above it. At a height of 2 the row of chroma behind the source's only one is read as well, and four rows of
 * chroma are written: source row 0, the average, and source row 1 twice. The planes must have room for that.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width in pixels, a multiple of 4 and at least 4, and height, a multiple of 2 and at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize, also for a size that is not a multiple
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420To411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi);

/**
 * 4:2:0 to 1620: every other column and row of chroma is dropped. Nothing is averaged.
 *
 * @param src planes of Y, Cb and Cr; chroma has half the width and height
 * @param srcStep bytes from one row of each plane to the next
 * @param dst planes of Y, Cb and Cr; chroma has a quarter of the width and height
 * @param dstStep bytes from one row of each plane to the next
 * @param roi width and height in pixels, each a multiple of 4 and at least 4
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize, also for a size that is not a multiple
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420To1620_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                         const int dstStep[3], RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
