/**
 * @file
 * @brief Colour twists: an affine colour matrix of the caller's over every pixel.
 *
 * With s0, s1, s2 a pixel's samples, the sample of target channel c is
 *
 *     twist[c][0] s0 + twist[c][1] s1 + twist[c][2] s2 + twist[c][3]
 *
 * Channels count by their place in memory or in the array of planes, from 0 to 2, whatever they mean. The constant term
 * is in the units of the samples: nothing is scaled. All is computed in f32, and each product and each sum is rounded
 * by itself, in a fixed order:
 *
 *     (twist[c][3] + s0 twist[c][0]) + (s2 twist[c][2] + s1 twist[c][1])       for 8u, 16u, 16s and 32f
 *     ((s0 twist[c][0] + s1 twist[c][1]) + s2 twist[c][2]) + twist[c][3]       for 8s
 *
 * Integer samples are then rounded to nearest, ties to even, and held within their type's range: 127.5 becomes 128, and
 * 126.5 becomes 126. A NaN, which takes a NaN or an infinity in the matrix, becomes the greatest sample. The
 * conversions of integers round to nearest under every rounding mode of the calling thread and leave its mode as it
 * was; those of floats follow the mode, and store what they get, NaN and infinities included.
 *
 * #pyxiColorTwist_32f_C4R is another one: four channels, a 4 by 4 matrix without constant terms, and fused operations.
 *
 * In AC4 layouts a pixel has four samples: the first three take part, and the target's fourth keeps its value. The
 * fourth of the source is not copied. Images are converted in place (`I`) to what the conversion from one image to
 * another gives; other overlaps are not supported.
 *
 * All conversions take sizes from 1 by 1 and steps from 1, which need not be multiples of the sample's size. The matrix
 * may hold any values and is not kept. Tests come in this order: pointers, size, steps; nothing is written when one
 * fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep.
 *
 * @code
 * static const f32 sepia[3][4] = {
 *     {0.393f, 0.769f, 0.189f, 0}, {0.349f, 0.686f, 0.168f, 0}, {0.272f, 0.534f, 0.131f, 0}};
 * u8 rgb[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiColorTwist32f_8u_C3IR(rgb, 640 * 3, size, sepia);
 * @endcode
 *
 * @see @ref family-color-twist
 */
#ifndef PYXCC_COLOR_TWIST_H
#define PYXCC_COLOR_TWIST_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        const f32 twist[3][4]);

/**
 * Interleaved, 8 bits, in place.
 *
 * @param srcDst three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, 8 bits, in place.
 *
 * @param srcDst four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Planar, 8 bits.
 *
 * @param src three planes, one step for all; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3],
                                                        int dstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Planar, 8 bits, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved, signed 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of -128 to 127
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                                        const f32 twist[3][4]);

/**
 * Interleaved, signed 8 bits, in place.
 *
 * @param srcDst three samples a pixel, 3 bytes; samples of -128 to 127
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3IR(s8* srcDst, int srcDstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, signed 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of -128 to 127; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, signed 8 bits, in place.
 *
 * @param srcDst four samples a pixel, 4 bytes; samples of -128 to 127; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4IR(s8* srcDst, int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Planar, signed 8 bits.
 *
 * @param src three planes, one step for all; samples of -128 to 127
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_P3R(const s8* const src[3], int srcStep, s8* const dst[3],
                                                        int dstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Planar, signed 8 bits, in place.
 *
 * @param srcDst three planes, one step for all; samples of -128 to 127
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_IP3R(s8* const srcDst[3], int srcDstStep, RoiSize roi,
                                                         const f32 twist[3][4]);

/**
 * Interleaved, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi, const f32 twist[3][4]);

/**
 * Interleaved, 16 bits, in place.
 *
 * @param srcDst three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep,
                                                          RoiSize roi, const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, 16 bits, in place.
 *
 * @param srcDst four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi,
                                                           const f32 twist[3][4]);

/**
 * Planar, 16 bits.
 *
 * @param src three planes, one step for all; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3],
                                                         int dstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Planar, 16 bits, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Interleaved, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, const f32 twist[3][4]);

/**
 * Interleaved, signed 16 bits, in place.
 *
 * @param srcDst three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3IR(s16* srcDst, int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep,
                                                          RoiSize roi, const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, signed 16 bits, in place.
 *
 * @param srcDst four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4IR(s16* srcDst, int srcDstStep, RoiSize roi,
                                                           const f32 twist[3][4]);

/**
 * Planar, signed 16 bits.
 *
 * @param src three planes, one step for all; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_P3R(const s16* const src[3], int srcStep, s16* const dst[3],
                                                         int dstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Planar, signed 16 bits, in place.
 *
 * @param srcDst three planes, one step for all; samples of -32768 to 32767
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_IP3R(s16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                          const f32 twist[3][4]);

/**
 * Interleaved, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                      const f32 twist[3][4]);

/**
 * Interleaved, floats, in place.
 *
 * @param srcDst three samples a pixel, 12 bytes; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                       const f32 twist[3][4]);

/**
 * Interleaved pixels with a fourth sample, floats, in place.
 *
 * @param srcDst four samples a pixel, 16 bytes; samples of any value; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi,
                                                        const f32 twist[3][4]);

/**
 * Planar, floats.
 *
 * @param src three planes, one step for all; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3],
                                                      int dstStep, RoiSize roi, const f32 twist[3][4]);

/**
 * Planar, floats, in place.
 *
 * @param srcDst three planes, one step for all; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: three weights and a constant term for each target channel
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi,
                                                       const f32 twist[3][4]);

/**
 * Four channels of floats through a 4 by 4 matrix. With s0 to s3 a pixel's samples and one rounding a line:
 *
 *     t = s1 twist[c][1]
 *     t = s0 twist[c][0] + t
 *     t = s2 twist[c][2] + t
 *     result c = s3 twist[c][3] + t
 *
 * Where both steps are `4 * roi.width`, a quarter of a row of pixels, the images are taken as one run of
 * `roi.width * roi.height` pixels, `16 * roi.width * roi.height` bytes from either start. With any other steps rows
 * are taken at their steps; a contiguous image has steps of `16 * roi.width`.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 16 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param twist the matrix: `twist[c][i]` is the weight of source channel i in target channel c
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorTwist_32f_C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                      const f32 twist[4][4]);

#ifdef __cplusplus
}
#endif

#endif
