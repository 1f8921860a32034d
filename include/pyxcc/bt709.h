/**
 * @file
 * @brief RGB to YCbCr and back by BT.709: 8 bits, 4:2:0, packed 4:2:2 and full resolution.
 *
 * `709CSC` is studio range: Y takes 16 to 235 and Cb, Cr 16 to 240 with 128 as zero. `709HDTV` is full range, and its
 * forward results are clamped to 1..254: black has Y 1, white 254. With all values in 0..255:
 *
 *     709CSC    Y  = 16  + 0.183 R + 0.614 G + 0.062 B      709HDTV    Y  = 0.213 R + 0.715 G + 0.072 B
 *               Cb = 128 - 0.101 R - 0.338 G + 0.439 B                 Cb = 128 - 0.117 R - 0.394 G + 0.511 B
 *               Cr = 128 + 0.439 R - 0.399 G - 0.040 B                 Cr = 128 + 0.511 R - 0.464 G - 0.047 B
 *
 * Layouts and chroma blocks are those of rgb_to_subsampled.h; `CbYCr422` rows are packed Cb Y0 Cr Y1. The 4:2:0
 * conversions work on whole blocks of two columns and two rows: an odd last column or row of any plane stays untouched,
 * and the result is ::pyxWarnOddSize. The other ones convert every pixel and do not warn.
 *
 * Each conversion fixes its results to the bit: it takes a wide form for the first `W` columns of a row, which follows
 * from the width alone, and an exact one for the rest. All take any step, zero and negative ones included, and write
 * nothing when they return an error. Arrays of steps must not be null and are not tested.
 *
 * @code
 * u8 bgra[1080 * 1920 * 4], y[1080 * 1920], cb[540 * 960], cr[540 * 960];
 * u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {1920, 960, 960};
 * RoiSize size = {1920, 1080};
 * PyxStatus status = pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(bgra, 1920 * 4, planes, steps, size);
 * @endcode
 *
 * @see @ref family-bt709
 */
#ifndef PYXCC_BT709_H
#define PYXCC_BT709_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved BGR to planar studio-range YCbCr 4:2:0. `luma709High` and `chroma709HighU` up to `W`, which is `width &
 * ~15`, exact forms from there on.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                 const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR to semi-planar studio-range YCbCr 4:2:0. As ::pyxiBGRToYCbCr420_709CSC_8u_C3P3R.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                                 u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Interleaved BGR to planar studio-range YCrCb 4:2:0. As ::pyxiBGRToYCbCr420_709CSC_8u_C3P3R.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                 const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar studio-range YCbCr 4:2:0. `luma709High` and `chroma709HighS` up to `W`,
 * which is `width & ~7`, exact forms from there on.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                  const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar studio-range YCrCb 4:2:0. As ::pyxiBGRToYCbCr420_709CSC_8u_AC4P3R.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cr, Cb; those of Cr and Cb have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                  const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to planar full-range YCbCr 4:2:0. `lumaHdtvHigh` and `chromaHdtvHigh` (32) up to
 * `W`, which is `width & ~7`, exact forms from there on.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param dstStep for each plane, bytes from one row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                   const int dstStep[3], RoiSize roi);

/**
 * Interleaved BGR to packed full-range CbYCr 4:2:2. All pairs take `lumaHdtvHigh` and `chromaHdtvHigh` (64). An odd
 * last pixel gets its own Cb and Y, by exact forms.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst packed Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_709HDTV_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                                  RoiSize roi);

/**
 * Interleaved BGR with a fourth byte to packed full-range CbYCr 4:2:2. As ::pyxiBGRToCbYCr422_709HDTV_8u_C3C2R, but an
 * odd last pixel is read as R, G, B.
 *
 * @param src B, G, R and a fourth byte, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst packed Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                                   RoiSize roi);

/**
 * Planar studio-range YCbCr to interleaved BGR. `inv709High` (4) up to `W`, which is `width & ~15`, `inv709Exact` from
 * there on.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR_709CSC_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                              RoiSize roi);

/**
 * Planar studio-range YCbCr to interleaved BGR with a fourth byte. As ::pyxiYCbCrToBGR_709CSC_8u_P3C3R.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR_709CSC_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                              RoiSize roi, u8 aval);

/**
 * Planar studio-range YCbCr 4:2:0 to interleaved BGR. `inv709High` (0) up to `W`, which is `width & ~15`,
 * `inv709Exact` from there on. The elements of `src` are tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_709CSC_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                                 int dstStep, RoiSize roi);

/**
 * Planar full-range YCbCr 4:2:0 to interleaved BGR with a fourth byte. `invHdtvHigh` up to `W`, which is `width &
 * ~15`, `invHdtvExact` from there on. The elements of `src` are tested after the size.
 *
 * @param src planes Y, Cb, Cr; those of Cb and Cr have half the width and height
 * @param srcStep for each plane, bytes from one row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                                  int dstStep, RoiSize roi, u8 aval);

/**
 * Packed full-range CbYCr 4:2:2 to interleaved BGR. `invHdtvHigh` up to `W`, which is `width & ~7`, `invHdtvExact`
 * from there on. An odd last pixel takes the Cr of the pair before; in a row of one pixel its Cb serves as Cr.
 *
 * @param src packed Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                                  RoiSize roi);

/**
 * Packed full-range CbYCr 4:2:2 to interleaved BGR with a fourth byte. As ::pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R.
 *
 * @param src packed Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                                  RoiSize roi, u8 aval);

#ifdef __cplusplus
}
#endif

#endif
