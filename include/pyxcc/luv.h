/**
 * @file
 * @brief RGB to and from CIE L*u*v* with the white of D65.
 *
 * With X, Y and Z of the RGB primaries of BT.709, without a transfer curve and 1 for white's Y:
 *
 *     X = 0.412453 R + 0.35758 G + 0.180423 B         L = 116 Y^(1/3) - 16, but 903.3 Y up to 0.008856
 *     Y = 0.212671 R + 0.71516 G + 0.072169 B         u = 13 L (4 X / D - 0.197839)
 *     Z = 0.019334 R + 0.119193 G + 0.950227 B        v = 13 L (9 Y / D - 0.468342)
 *
 * where D is X + 15 Y + 3 Z. Back, L below 0.00009 is black, whatever u and v are, and all colours are held to their
 * range.
 *
 *     samples          L             u                      v
 *     floats           as it is      as it is               as it is, colours from 0 to 1
 *     8 bits           2.55 L        (u + 134) 255 / 354    (v + 140) 255 / 262
 *     16 bits          655.35 L      (u + 134) 185.12712    (v + 140) 250.13359
 *     signed 16 bits   the same less 32768
 *
 * The conversions differ in their arithmetic, and within one the columns in whole blocks differ from those behind them:
 * blocks use fused sums and approximate reciprocals of the processor's, so that their last places may differ between
 * makes of processors; what is behind them divides or refines, and rounds after each operation. From 16-bit and from
 * four-channel 8-bit LUV, blocks are cut towards zero, and what is behind them is rounded: a result can differ by one
 * with the column of its pixel. Elsewhere rounding to integers follows the caller's rounding mode.
 *
 * Samples of floats outside of 0 to 1 take the cube root from the nearest end of its table.
 *
 * All conversions take sizes from 1 by 1 and steps of any value. Tests come in this order: pointers, size; nothing is
 * written when one fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], luv[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToLUV_8u_C3R(rgb, 640 * 3, luv, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-luv
 */
#ifndef PYXCC_LUV_H
#define PYXCC_LUV_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * RGB to LUV, floats. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src R, G and B of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * BGR to LUV, floats. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src B, G and R of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, floats, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the others
 * behind blocks.
 *
 * @param src R, G and B of every pixel and a sample that is not used, 16 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel and a sample that keeps its value, 16 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, 8 bits. All columns the same way.
 *
 * @param src R, G and B of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * BGR to LUV, 8 bits. All columns the same way.
 *
 * @param src B, G and R of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, 8 bits, pixels with a fourth sample. L by a power, with true divisions, the same way in all columns.
 * Results are cut: L as it is, u and v with a half added.
 *
 * @param src R, G and B of every pixel and a sample that is not used, 4 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst L, u and v of every pixel and a sample that keeps its value, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, 16 bits. Columns before `width & ~3` are computed in blocks, the others behind blocks.
 *
 * @param src R, G and B of every pixel, 6 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst L, u and v of every pixel, 6 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, 16 bits, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the others
 * behind blocks.
 *
 * @param src R, G and B of every pixel and a sample that is not used, 8 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst L, u and v of every pixel and a sample that keeps its value, 8 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, signed 16 bits. Columns before `width & ~3` are computed in blocks, the others behind blocks.
 *
 * @param src R, G and B of every pixel, 6 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst L, u and v of every pixel, 6 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to LUV, signed 16 bits, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the
 * others behind blocks.
 *
 * @param src R, G and B of every pixel and a sample that is not used, 8 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst L, u and v of every pixel and a sample that keeps its value, 8 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToLUV_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, floats. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst R, G and B of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * LUV to BGR, floats. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 12 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst B, G and R of every pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, floats, pixels with a fourth sample. All columns by true divisions.
 *
 * @param src L, u and v of every pixel and a sample that is not used, 16 bytes
 * @param srcStep bytes from one source row to the next; its two low bits do not count
 * @param dst R, G and B of every pixel and a sample that keeps its value, 16 bytes
 * @param dstStep bytes from one target row to the next; its two low bits do not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, 8 bits. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst R, G and B of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * LUV to BGR, 8 bits. Columns before `width & ~7` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 3 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst B, G and R of every pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, 8 bits, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the others
 * behind blocks.
 *
 * @param src L, u and v of every pixel and a sample that is not used, 4 bytes
 * @param srcStep bytes from one source row to the next
 * @param dst R, G and B of every pixel and a sample that keeps its value, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, 16 bits. Columns before `width & ~3` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 6 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst R, G and B of every pixel, 6 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, 16 bits, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the others
 * behind blocks.
 *
 * @param src L, u and v of every pixel and a sample that is not used, 8 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst R, G and B of every pixel and a sample that keeps its value, 8 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, signed 16 bits. Columns before `width & ~3` are computed in blocks, the others behind blocks.
 *
 * @param src L, u and v of every pixel, 6 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst R, G and B of every pixel, 6 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * LUV to RGB, signed 16 bits, pixels with a fourth sample. Columns before `width & ~3` are computed in blocks, the
 * others behind blocks.
 *
 * @param src L, u and v of every pixel and a sample that is not used, 8 bytes
 * @param srcStep bytes from one source row to the next; its low bit does not count
 * @param dst R, G and B of every pixel and a sample that keeps its value, 8 bytes
 * @param dstStep bytes from one target row to the next; its low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiLUVToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
