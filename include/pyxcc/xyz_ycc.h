/**
 * @file
 * @brief RGB to and from CIE XYZ, with the primaries of BT.709 and the white of D65, and to and from YCC, luma and two
 * chroma samples with zeros of their own.
 *
 * Floats are nominally between 0 and 1. A sum of three terms is two fused operations on the first term, and all other
 * operations round by themselves:
 *
 *     X = 0.412453 R + 0.35758 G + 0.180423 B         R =  3.240479 X -  1.53715 Y - 0.498535 Z
 *     Y = 0.212671 R + 0.71516 G + 0.072169 B         G = -0.969256 X + 1.875991 Y + 0.041556 Z
 *     Z = 0.019334 R + 0.119193 G + 0.950227 B        B =  0.055648 X - 0.204043 Y + 1.057311 Z
 *
 *     s = 0.299 R + 0.587 G + 0.114 B                 y = 1.3584 Y
 *                                                     c1 = 2.2179 (C1 - 0.6117647)
 *                                                     c2 = 1.8215 (C2 - 0.5372549)
 *     Y = 0.7132668 s                                 R = y + c2
 *     C1 = 0.4368627 (B - s) + 0.6117647              G = y - 0.194 c1 - 0.509 c2
 *     C2 = 0.53192 (R - s) + 0.5372549                B = y + c1
 *
 * Z, and R, G and B as results, are held to 0 to 1; X, Y and YCC are not.
 *
 * 16-bit samples take the same way from 0 to 65535, where the zeros of C1 and C2 are 40092 and 35209. What comes out is
 * rounded in the caller's rounding mode and held to that range, of all three channels and in both directions. Signed
 * samples are taken with 32768 added, which is taken off the result again.
 *
 * 8-bit samples go by integers. A quotient is rounded down where it stands, and what is marked by > < is held to 0 to
 * 255; all others lie there, but those of C1 and C2, of which the low 8 bits are stored:
 *
 *     X =  (27030 R + 23434 G + 11824 B) / 65536      R = > (212368 X - 100738 Y - 32671 Z) / 65536 <
 *     Y =  (13937 R + 46868 G +  4729 B) / 65536      G = > (-63521 X + 122944 Y +  2723 Z) / 65536 <
 *     Z = > (1267 R +  7811 G + 62274 B) / 65536 <    B = >   (3646 X -  13372 Y + 69291 Z) / 65536 <
 *
 *     s = 4898 R + 9617 G + 1867 B                    y = 5564 Y
 *                                                     c1 = 9084 (C1 - 156)
 *                                                     c2 = 7460 (C2 - 137)
 *     Y = s / 1024 * 2921 / 65536                     R = > (y + c2) / 4096 <
 *     C1 = (16384 B - s) / 1024 * 1789 / 65536 + 156  G = > (16 y - 794 (c1 / 256) - 2084 (c2 / 256)) / 65536 <
 *     C2 = (16384 R - s) / 1024 * 2178 / 65536 + 137  B = > (y + c1) / 4096 <
 *
 * In AC4 layouts a pixel has four samples: the first three take part, and the target's fourth keeps its value. The
 * fourth of the source is not read.
 *
 * All conversions take sizes from 1 by 1 and steps of any value, and every column the same way. Tests come in this
 * order: pointers, size; nothing is written when one fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], xyz[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToXYZ_8u_C3R(rgb, 640 * 3, xyz, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-xyz-ycc
 */
#ifndef PYXCC_XYZ_YCC_H
#define PYXCC_XYZ_YCC_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * RGB to XYZ, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value, nominally 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to XYZ, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value, nominally 0 to 1; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToXYZ_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value, nominally 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * XYZ to RGB, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value, nominally 0 to 1; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiXYZToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value, nominally 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to YCC, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value, nominally 0 to 1; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCC_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value, nominally 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * YCC to RGB, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value, nominally 0 to 1; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCCToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
