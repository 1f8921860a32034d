/**
 * @file
 * @brief Bytes to one bit a pixel, by a threshold or by error diffusion.
 *
 * @see @ref family-reduce-bits-1u
 */
#ifndef PYXCC_REDUCE_BITS_1U_H
#define PYXCC_REDUCE_BITS_1U_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Bytes to one bit a pixel, eight pixels a byte, the first in the highest bit. Bits outside the row's pixels are kept.
 *
 * - Type 0, by the threshold alone: the bit is set if the sample is above `threshold`.
 * - Type 3, error diffusion over two rows above and two columns to each side, in integers. With P1 and P2 what was left
 *   in the row above and in the one above that, and C in the row itself:
 *   sum = P2[x-2] + P2[x+2] + 2 (P2[x-1] + P2[x+1] + P1[x-2] + P1[x+2]) +
 *   4 (P2[x] + P1[x-1] + P1[x+1] + C[x-2]) + 8 (P1[x] + C[x-1]), w = 8192 sample + 23 sum.
 *   The bit is set if w > 8192 `threshold`. C[x] is w >> 10, less 2047 if the bit is set. Outside the region nothing is
 *   left. All of it wraps in 32 bits.
 *
 * Tests come in this order: pointers, size and `dstBitOffset`, `ditherType`, memory. Nothing is written when one fails.
 *
 * @param src one byte a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst the byte of a row in which the first pixel's bit is
 * @param dstStep bytes from one target row to the next
 * @param dstBitOffset how far the first pixel is from the highest bit; only its three low bits count. Not below 0
 * @param roi width and height in pixels, each at least 1
 * @param unused0 not read
 * @param unused1 not read
 * @param ditherType 0 or 3
 * @param threshold what a sample has to be above
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrDitherType, or ::pyxErrNoMemory for type 3
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_8u1u_C1R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                       s32 dstBitOffset, RoiSize roi, s32 unused0, s32 unused1,
                                                       s32 ditherType, u8 threshold);

#ifdef __cplusplus
}
#endif

#endif
