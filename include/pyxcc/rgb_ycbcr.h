/**
 * @file
 * @brief RGB to YCbCr and back at full resolution: 8 bits, BT.601, studio range.
 *
 * Y takes 16 to 235 and Cb, Cr 16 to 240 with 128 as zero, for R, G, B from 0 to 255. The inverse accepts every
 * sample from 0 to 255 and clamps its result. With all values in 0..255:
 *
 *     Y  = 16  + 0.257 R + 0.504 G + 0.098 B        R = 1.164 (Y - 16) + 1.596 (Cr - 128)
 *     Cb = 128 - 0.148 R - 0.291 G + 0.439 B        G = 1.164 (Y - 16) - 0.392 (Cb - 128) - 0.813 (Cr - 128)
 *     Cr = 128 + 0.439 R - 0.368 G - 0.071 B        B = 1.164 (Y - 16) + 2.017 (Cb - 128)
 *
 * Each conversion fixes its results to the bit by named fixed-point forms. A row may take one form up to a column that
 * follows from its width, and another from there on; neighbouring forms differ by one level at the most for the forward
 * direction, so equal pixels at both ends of a row can differ by one.
 *
 * All conversions take sizes from 1 by 1 and any step, zero and negative ones included. They write nothing when they
 * return an error. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], ycbcr[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToYCbCr_8u_C3R(rgb, 640 * 3, ycbcr, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-rgb-ycbcr
 */
#ifndef PYXCC_RGB_YCBCR_H
#define PYXCC_RGB_YCBCR_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to interleaved YCbCr. The first `width & ~15` pixels of a row take `fwdRound`, the rest `fwdExact`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Y, Cb, Cr triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with alpha to interleaved YCbCr with alpha. All pixels take `fwdExact`.
 *
 * @param src R, G, B, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst Y, Cb, Cr, A, 4 bytes a pixel; the fourth byte keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to planar YCbCr. The first `width & ~7` pixels of a row take `fwdHigh`, the rest `fwdExact`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                       RoiSize roi);

/**
 * Interleaved RGB with alpha to planar YCbCr. The first `width & ~7` pixels of a row take `fwdHigh`, the rest
 * `fwdExact`.
 *
 * @param src R, G, B, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr, one step for all; the array itself must not be null and is not tested
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                        RoiSize roi);

/**
 * Planar RGB to planar YCbCr. The first `width & ~7` pixels of a row take `fwdHigh`, the rest `fwdExact`.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, Cb, Cr, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                     RoiSize roi);

/**
 * Interleaved YCbCr to interleaved RGB. The first `width & ~3` pixels of a row take `invHighA`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved YCbCr with alpha to interleaved RGB with alpha. All pixels take `invExactA`.
 *
 * @param src Y, Cb, Cr, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel; the fourth byte keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr to planar RGB. The first `width & ~3` pixels of a row take `invHighB`, the rest `invExactB`.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                     RoiSize roi);

/**
 * Planar YCbCr to interleaved RGB. The first `width & ~7` pixels of a row take `invHighC`, the rest `invExactC`.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                       RoiSize roi);

/**
 * Planar YCbCr to interleaved RGB with a fourth byte. The first `width & ~7` pixels of a row take `invHighD`, the rest
 * `invExactD`.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                       RoiSize roi, u8 aval);

/**
 * Planar YCbCr to interleaved BGR. All pixels take `invHighC`.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                       RoiSize roi);

/**
 * Planar YCbCr to interleaved BGR with a fourth byte. All pixels take `invHighD`.
 *
 * @param src planes Y, Cb, Cr, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                       RoiSize roi, u8 aval);

#ifdef __cplusplus
}
#endif

#endif
