/**
 * @file
 * @brief Images at fewer levels, which lie evenly between the ends of the range, by one of five methods.
 *
 * `ditherType` selects the method:
 *
 * - 0: the nearest level. `noise` has no effect.
 * - 1: error diffusion to 4 neighbours, by sixteenths.
 * - 2: error diffusion to 12 neighbours, by 48ths.
 * - 3: error diffusion to 12 neighbours, by 42nds.
 * - 4: an ordered matrix of 4 by 4.
 * - Any other does nothing, and the status is ::pyxOk.
 *
 * All arithmetic is in f32, rounded after each operation but for what is called fused; trunc is towards zero. It
 * follows the caller's rounding mode.
 *
 * With s = levels - 1, `step` lies between two levels and `inv` is its inverse: 65280 / s / 256 and s / 255 for bytes,
 * 65535 / s and s / 65535 for words, 1 / s and s for floats. A sample counts as p, which is the sample itself, or 32768
 * more for signed words.
 *
 * Nearest level: u is p times 0.003921569 for bytes, 1.5259022e-5 for words and 1 for floats; q = trunc(u s),
 * pr = q (1 / s), and r is u - pr, fused with the product that u is. If r > 0.5 / s the value is fused(q (1 / s) + 1 /
 * s) in the first columns and pr + 1 / s in the last, otherwise pr. It is stored times 255 or 65535, cut towards zero,
 * 32768 less for signed words, and held to the target's range. The first columns are whole runs of 8 samples of a row,
 * or of two pixels where the fourth sample takes no part.
 *
 * Error diffusion: channel by channel, row by row from the top, each from left to right. v is p and what the neighbours
 * before have left. From the upper end of the range on (255, 65535, 1) a sample becomes that end, and below the lower
 * one (0; 1.1920929e-7 for floats) that one, and leaves nothing. Otherwise q = trunc(v inv) step; the level is q + step
 * if v - q exceeds the threshold, else q; and v less the level is what the sample leaves. The threshold is step / 2, or
 * with noise a number between (50 - noise) step / 100 and (50 + noise) step / 100.
 *
 * The neighbours' weights, by rows from two above on, are 3/16 for the column to the right above, 5/16 for that above,
 * 1/16 to the left above, 7/16 to the left; or 1 3 5 3 1, 3 5 7 5 3, 5 7 of 48; or 1 2 4 2 1, 2 4 8 4 2, 4 8 of 42.
 * Outside of the region nothing is left, but a channel finds above its first row what the channel before has left in
 * its last ones.
 *
 * Ordered matrix: q = trunc(p inv). If p less q step exceeds the threshold, the value is q step + step, otherwise q
 * step; both sums are fused in the first columns, which are whole runs of 8 pixels, and rounded in the last. Floats are
 * held to the range first, as above. The threshold is step times an entry of the matrix in fifteenths, by row and
 * column modulo 4: 0 8 2 10, 12 4 14 6, 3 11 1 9, 15 7 13 5; or with noise, step times the sum of the entry and a
 * number between -noise / 100 and noise / 100.
 *
 * Values of the diffusion and of the matrix are stored cut towards zero: as they are; >> 8 for words that become bytes;
 * times 255 or 65535 for floats; 32768 less for signed words. In method 1, half is added first where floats are the
 * source, or signed words that become bytes.
 *
 * Noise is the same on every call, and for all channels of a pixel.
 *
 * Tests come in this order: pointers, size, `noise`, `levels`, then the method and memory. Steps are not tested, and
 * nothing is written when a test fails. Where the memory for the errors is missing, that for the noise is not given
 * back.
 *
 * @code
 * u8 gray[480 * 640], halftone[480 * 640];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiReduceBits_8u_C1R(gray, 640, halftone, 640, size, 0, 1, 2);
 * @endcode
 *
 * @see @ref family-reduce-bits
 */
#ifndef PYXCC_REDUCE_BITS_H
#define PYXCC_REDUCE_BITS_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Fewer levels of bytes, one sample a pixel.
 *
 * @param src bytes
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_8u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                     u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of bytes, three samples a pixel.
 *
 * @param src bytes
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                     u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of bytes, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src bytes
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of bytes, four samples a pixel.
 *
 * @param src bytes
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_8u_C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                     u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words, one sample a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u_C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words, three samples a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                       u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words, four samples a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u_C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words, one sample a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s_C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words, three samples a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                       u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words, four samples a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s_C4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                      u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words to bytes, one sample a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u8u_C1R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words to bytes, three samples a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words to bytes, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u8u_AC4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                         u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of unsigned words to bytes, four samples a pixel.
 *
 * @param src unsigned words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16u8u_C4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words to bytes, one sample a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C1R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words to bytes, three samples a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C3R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words to bytes, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_AC4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                         u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of signed words to bytes, four samples a pixel.
 *
 * @param src signed words
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_16s8u_C4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to bytes, one sample a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to bytes, three samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C3R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to bytes, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_AC4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                         u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to bytes, four samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 256
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f8u_C4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to unsigned words, one sample a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C1R(const f32* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to unsigned words, three samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C3R(const f32* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to unsigned words, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_AC4R(const f32* src, int srcStep, u16* dst, int dstStep,
                                                          RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to unsigned words, four samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst unsigned words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16u_C4R(const f32* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to signed words, one sample a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C1R(const f32* src, int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to signed words, three samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C3R(const f32* src, int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to signed words, four samples a pixel, the fourth of which is left as it was.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_AC4R(const f32* src, int srcStep, s16* dst, int dstStep,
                                                          RoiSize roi, u32 noise, u32 ditherType, s32 levels);

/**
 * Fewer levels of floats to signed words, four samples a pixel.
 *
 * @param src floats of 0 to 1
 * @param srcStep bytes from one source row to the next
 * @param dst signed words
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param noise by which thresholds vary, 0 to 100
 * @param ditherType the method, 0 to 4
 * @param levels 2 to 65536
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrNoise, ::pyxErrLevels or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiReduceBits_32f16s_C4R(const f32* src, int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, u32 noise, u32 ditherType, s32 levels);

#ifdef __cplusplus
}
#endif

#endif
