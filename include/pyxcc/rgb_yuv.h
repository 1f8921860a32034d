/**
 * @file
 * @brief RGB to YUV and back at full resolution: 8 bits, full range.
 *
 * Y takes 0 to 255; U and V have 128 as zero, and V is clamped where strong reds and cyans would leave a byte. The
 * inverse accepts every sample from 0 to 255 and clamps its result. With all values in 0..255:
 *
 *     Y = 0.299 R + 0.587 G + 0.114 B        R = Y + 1.140 (V - 128)
 *     U = 0.492 (B - Y) + 128                G = Y - 0.394 (U - 128) - 0.581 (V - 128)
 *     V = 0.877 (R - Y) + 128                B = Y + 2.032 (U - 128)
 *
 * Each conversion fixes its results to the bit by named fixed-point forms. A row may take one form up to a column that
 * follows from its width, and another from there on; neighbouring forms differ by a few levels at the most.
 *
 * All conversions take sizes from 1 by 1 and any step, zero and negative ones included. They write nothing when they
 * return an error. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize. Arrays of planes are tested before the size, their
 * elements after it.
 *
 * @code
 * u8 rgb[480 * 640 * 3], yuv[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToYUV_8u_C3R(rgb, 640 * 3, yuv, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-rgb-yuv
 */
#ifndef PYXCC_RGB_YUV_H
#define PYXCC_RGB_YUV_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to interleaved YUV. The first `width & ~15` pixels of a row take `yuvFwdHigh`, the rest
 * `yuvFwdExactB`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst Y, U, V triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with alpha to interleaved YUV with alpha. All pixels take `yuvFwdExactA`.
 *
 * @param src R, G, B, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst Y, U, V, A, 4 bytes a pixel; the fourth byte keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to planar YUV. The first `width & ~7` pixels of a row take `yuvFwdHigh`, the rest `yuvFwdExactB`.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                     RoiSize roi);

/**
 * Interleaved RGB with alpha to planar YUV with alpha. The first `width & ~7` pixels of a row take `yuvFwdPlanar`, the
 * rest `yuvFwdExactA`.
 *
 * @param src R, G, B, A, 4 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V, A, one step for all; alpha is copied. The fourth plane must not be null and is not tested
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep,
                                                      RoiSize roi);

/**
 * Planar RGB to planar YUV. The first `width & ~15` pixels of a row take `yuvFwdHigh`, the rest `yuvFwdExactC`.
 *
 * @param src planes R, G, B, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes Y, U, V, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

/**
 * Interleaved YUV to interleaved RGB. The first `width & ~7` pixels of a row take `yuvInvHigh3`, the rest
 * `yuvInvExactA`.
 *
 * @param src Y, U, V triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved YUV with alpha to interleaved RGB with alpha. All pixels take `yuvInvExactA`.
 *
 * @param src Y, U, V, A, 4 bytes a pixel; alpha is not used
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel; the fourth byte keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved YUV to interleaved RGB with a fourth byte. The first `width & ~7` pixels of a row take `yuvInvHigh7`, the
 * rest `yuvInvExactC`.
 *
 * @param src Y, U, V triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_C3C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                     u8 aval);

/**
 * Planar YUV to interleaved RGB. The first `width & ~15` pixels of a row take `yuvInvHigh4`, the rest `yuvInvExactB`.
 *
 * @param src planes Y, U, V, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                     RoiSize roi);

/**
 * Planar YUV to planar RGB. All pixels take `yuvInvExactB`.
 *
 * @param src planes Y, U, V, one step for all
 * @param srcStep bytes from one source row to the next
 * @param dst planes R, G, B, one step for all
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
