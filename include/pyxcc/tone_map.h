/**
 * @file
 * @brief Tone mapping: floats of any range to 8 bits by one scale for the whole image.
 *
 * A level is found first, in all of the region. The scale is 255 over the level, and a sample becomes scale * sample in
 * floats, cut towards zero. The two conversions differ in the level and in what they do beyond a byte.
 *
 * - Level below zero: nothing is written, and the status is ::pyxWarnNegativeLevel.
 * - Level of zero, of less than the smallest normal float, or NaN: the target is filled with zeros.
 *
 * Source and target may share memory: the result is that of converting one sample after the other, row by row from left
 * to right. For the mapping, but not for the level, rows of the source begin a whole number of samples apart: the two
 * lowest bits of y * srcStep count as zero.
 *
 * Tests come in this order: pointers, size. Steps are not tested, and nothing is written when a test fails.
 *
 * @code
 * f32 radiance[480 * 640];
 * u8 gray[480 * 640];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiToneMapMean_32f8u_C1R(radiance, 640 * sizeof(f32), gray, 640, size);
 * @endcode
 *
 * @see @ref family-tone-map
 */
#ifndef PYXCC_TONE_MAP_H
#define PYXCC_TONE_MAP_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Maps the largest sample to 255. The low byte of a result is stored, so that negative samples wrap: -3 becomes 253.
 *
 * A NaN is neither larger nor smaller: the search for the largest sample starts anew behind it.
 *
 * @param src one float a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst one byte a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxWarnNegativeLevel
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiToneMapLinear_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Maps twice the mean to 255. Results are held to 0 to 255; one that is beyond 32 bits becomes 0.
 *
 * The mean is taken in doubles. In which order the samples are added is not fixed.
 *
 * @param src one float a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst one byte a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxWarnNegativeLevel
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiToneMapMean_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep,
                                                         RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
