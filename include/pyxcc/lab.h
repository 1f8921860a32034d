/**
 * @file
 * @brief RGB to and from CIE L*a*b* with the white of D65.
 *
 * With X, Y and Z of the RGB primaries of BT.709, without a transfer curve, over those of white:
 *
 *     X = 0.412453 R + 0.35758 G + 0.180423 B         L = 116 f(Y) - 16, but 903.3 Y up to 0.008856
 *     Y = 0.212671 R + 0.71516 G + 0.072169 B         a = 500 (f(X) - f(Y))
 *     Z = 0.019334 R + 0.119193 G + 0.950227 B        b = 200 (f(Y) - f(Z))
 *
 * where f is the cube root above 0.008856, taken from a table and a series, and 7.787 t + 0.13793103 up to there. The
 * way back cubes throughout, so that very dark colours do not come back exactly.
 *
 *     samples     L              a and b               colours
 *     floats      0 to 100       as they are           0 to 1
 *     8 bits      2.55 L         a + 128, b + 128      0 to 255
 *     16 bits     655.35 L       255 (a + 128)         0 to 255, 8 bits
 *
 * Columns in whole blocks, of 8 pixels, or of 4 where one side has 16 bits, are computed by fused sums, and those
 * behind them by plain ones: a result can differ by one in the last place with the column of its pixel. To Lab, samples
 * in whole blocks are clamped, and the low bits are kept of those behind them; of colours in range, both are the same.
 * From Lab, bytes are clamped, and floats are not. Floats outside of 0 to 1 take the cube root from the nearest end of
 * the table. Rounding to integers follows the caller's rounding mode.
 *
 * All conversions take sizes from 1 by 1 and steps of any value. Tests come in this order: pointers, size; nothing is
 * written when one fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], lab[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToLab_8u_C3R(rgb, 640 * 3, lab, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-lab
 */
#ifndef PYXCC_LAB_H
#define PYXCC_LAB_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * BGR to Lab, floats.
 *
 * @param src B, G and R of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, a and b of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * BGR to Lab, 8 bits to 16.
 *
 * @param src B, G and R of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, a and b of every pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToLab_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * BGR to Lab, 8 bits.
 *
 * @param src B, G and R of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, a and b of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to Lab, floats.
 *
 * @param src R, G and B of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, a and b of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to Lab, 8 bits.
 *
 * @param src R, G and B of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, a and b of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Lab to BGR, 16 bits to 8.
 *
 * @param src L, a and b of every pixel, 6 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst B, G and R of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLabToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Lab to BGR, floats.
 *
 * @param src L, a and b of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst B, G and R of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLabToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Lab to BGR, 8 bits.
 *
 * @param src L, a and b of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst B, G and R of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLabToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Lab to RGB, floats.
 *
 * @param src L, a and b of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst R, G and B of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLabToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Lab to RGB, 8 bits.
 *
 * @param src L, a and b of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst R, G and B of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLabToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
