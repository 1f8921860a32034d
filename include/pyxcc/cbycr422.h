/**
 * @file
 * @brief Packed CbYCr 4:2:2: 8-bit RGB to it and back by BT.601, studio range, and other forms of YCbCr to it and back.
 *
 * A pair of pixels is four bytes, Cb Y0 Cr Y1. In a row of odd width the last pixel has two bytes, its Cb and its Y; it
 * has no Cr.
 *
 * **From RGB.** `pyxiRGBToCbYCr422_8u_C3C2R` filters chroma along the row: that of a pair takes its even pixel twice,
 * its odd pixel once, and the odd pixel of the pair in front once. With (Re, Ge, Be) the even pixel of a pair and (Ro,
 * Go, Bo) the odd one,
 *
 *     oddCb = 3596 Bo - 1213 Ro - 2385 Go
 *     oddCr = 3596 Ro - 3015 Go -  582 Bo
 *     Cb = (7193 Be - 2426 Re - 4769 Ge + oddCb + oddCb of the pair in front + 0x403FFF) >> 15
 *     Cr = (7193 Re - 6030 Ge - 1164 Be + oddCr + oddCr of the pair in front + 0x403FFF) >> 15
 *     Y  = (8422 R + 16515 G + 3212 B + 0x84000) >> 15
 *
 * In front of the first pair nothing is taken, as if that were black: its chroma leans towards 128. A last odd pixel
 * has Y and Cb of `fwdExact` (rgb_ycbcr.h), from itself alone.
 *
 * `pyxiRGBToCbYCr422Gamma_8u_C3C2R` does the same with every sample v replaced by 255 g(v / 255) to the nearest
 * integer, ties to even (those are v = 1, which gives 4, and v = 3, which gives 14); g(x) is 4.5 x below 0.018 and
 * 1.099 x^0.45 - 0.099 from there.
 *
 * **To RGB.** Chroma is not interpolated. The wide form takes the first `width & ~7` pixels, `invExactD` the rest. A
 * last odd pixel has a Cb of its own; its Cr is that of the pair in front, two bytes in front of its Cb. In a row of
 * one pixel these two bytes lie in front of the row: the byte there must be readable, and belongs to the result.
 *
 * **Repacking.** Luma is copied, chroma is copied, doubled or dropped, and never averaged. Sizes are rounded down to
 * whole blocks without a warning, and nothing beyond them is read or written.
 *
 * No conversion here returns a warning. All take any step, zero and negative ones included, and write nothing when they
 * return an error. Arrays of steps must not be null and are not tested; arrays of planes and their elements are tested
 * before the size.
 *
 * @code
 * u8 rgb[480 * 640 * 3], packed[480 * 640 * 2];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToCbYCr422_8u_C3C2R(rgb, 640 * 3, packed, 640 * 2, size);
 * @endcode
 *
 * @see @ref family-cbycr422
 */
#ifndef PYXCC_CBYCR422_H
#define PYXCC_CBYCR422_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to packed CbYCr, chroma filtered along the row.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToCbYCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Interleaved RGB to packed CbYCr, gamma-corrected, chroma filtered along the row.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToCbYCr422Gamma_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                               RoiSize roi);

/**
 * Interleaved BGR with a fourth byte, which is not read, to packed CbYCr. Chroma stands for the two pixels of a pair.
 * All pairs take `lumaHigh7` and `chromaHighS`(64), as rgb_to_subsampled.h has them. A last odd pixel takes Y and Cb of
 * `fwdExact` from its bytes as if they were R, G and B in this order, which they are not.
 *
 * @param src B, G, R and a spare byte, 4 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Packed CbYCr to interleaved RGB. The wide form is `invHighC`.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * Packed CbYCr to interleaved BGR with a fourth byte. The wide form is `invHighD`.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                          u8 aval);

/**
 * Packed CbYCr to packed YCbCr: the two bytes of every pixel change places. A last odd column is left alone.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 and 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Packed YCbCr to packed CbYCr: the two bytes of every pixel change places. A last odd column is left alone.
 *
 * @param src Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 and 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToCbYCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Packed CbYCr to planar YCbCr 4:2:2. A last odd column is left alone.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to packed CbYCr. A last odd column is left alone, in silence.
 *
 * @param src planes of Y, of Cb and of Cr, chroma of half the width
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 and 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

/**
 * Packed CbYCr to planar YCbCr 4:1:1: every other chroma sample of a row is dropped. The last `width & 3` columns are
 * left alone. The height is not tested; below 1 nothing is written.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of a quarter of the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, the width at least 4
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Packed CbYCr to semi-planar YCbCr 4:2:0. The chroma of odd rows is dropped. A last odd column and a last
 * odd row are left alone.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dstY plane of Y
 * @param dstYStep bytes from one row of Y to the next
 * @param dstCbCr plane of Cb, Cr pairs, of half the width and height
 * @param dstCbCrStep bytes from one row of pairs to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep,
                                                               u8* dstCbCr, int dstCbCrStep, RoiSize roi);

/**
 * Packed CbYCr to planar YCbCr 4:2:0. The chroma of odd rows is dropped. A last odd column and a last
 * odd row are left alone.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Packed CbYCr to planar YCrCb 4:2:0. The chroma of odd rows is dropped. A last odd column and a last
 * odd row are left alone.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, of Cr and of Cb, chroma of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to packed CbYCr. Each row of chroma serves two rows. A last odd column and a
 * last odd row are left alone.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToCbYCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                               int srcCbCrStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to packed CbYCr. Each row of chroma serves two rows. A last odd column and a last odd row are left
 * alone.
 *
 * The steps of the chroma planes are crossed: the rows of `src[1]` are `srcStep[2]` apart, those of `src[2]` are
 * `srcStep[1]` apart.
 *
 * @param src planes of Y, of Cr and of Cb, chroma of half the width and height
 * @param srcStep bytes from one row to the next: of Y, of Cb and of Cr
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
