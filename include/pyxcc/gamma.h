/**
 * @file
 * @brief Gamma: the transfer curve of video over the three colour channels of an image, and its inverse.
 *
 * With x from 0 to 1:
 *
 *     forward   4.5 x                      below 0.018       1.099 x^0.45 - 0.099           from there
 *     inverse   x / 4.5                    below 0.0812      ((x + 0.099) / 1.099)^(1/0.45) from there
 *
 * 8-bit samples are taken as x = sample / 255 and rounded to nearest, ties to even. 16-bit samples are taken as
 * sample / 65535 in doubles. Half a step is added to the result, which becomes a float in the caller's rounding mode
 * and then an integer towards zero; where the float is an odd integer exactly, the even one below it. In an image of
 * more than 65536 samples (3 a pixel, whatever the layout) they are mapped through a table that is made for the call.
 *
 * Floats are taken between the caller's bounds, x = (sample - vMin) / (vMax - vMin), and put back between them:
 *
 *     d = sample - vMin                    as floats, then in doubles throughout
 *     x = d / (vMax - vMin)                by the reciprocal of the difference of the floats
 *     forward   4.5 d + vMin               or (1.099 x^0.45 - 0.099) (vMax - vMin) + vMin
 *     inverse   0.2222222222222222 d + vMin
 *                                          or ((x + 0.099) 0.9099181073703366)^2.2222222222222223 (vMax - vMin) + vMin
 *
 * Every multiplication that is followed by an addition is fused with it, but x + 0.099 and what it is multiplied by
 * round apart. Nothing is clamped: samples below `vMin` follow the line, those above `vMax` the curve. The last
 * rounding, to a float, follows the caller's mode like all others. The power is within one unit in the last place of
 * the exact one, before rounding in modes other than to nearest.
 *
 * All conversions take sizes from 1 by 1 and steps from 1. In the in-place ones each sample is replaced; planes are
 * done one after the other. They write nothing when they return an error. Statuses: ::pyxOk; ::pyxErrRange, before
 * anything else, for float bounds with `vMax - vMin` not above 0 (a NaN passes, and makes every sample NaN);
 * ::pyxErrNullPtr;
 * ::pyxErrSize; ::pyxErrStep; ::pyxErrNoMemory if a table cannot be allocated.
 *
 * @code
 * f32 rgb[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiGammaFwd_32f_C3IR(rgb, 640 * 3 * sizeof(f32), size, 0.0f, 1.0f);
 * @endcode
 *
 * @see @ref family-gamma
 */
#ifndef PYXCC_GAMMA_H
#define PYXCC_GAMMA_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved, 8 bits, forward curve.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved, 8 bits, forward curve, in place.
 *
 * @param srcDst three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 8 bits, forward curve.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 8 bits, forward curve, in place.
 *
 * @param srcDst four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi);

/**
 * Planar, 8 bits, forward curve.
 *
 * @param src three planes, one step for all; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

/**
 * Planar, 8 bits, forward curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi);

/**
 * Interleaved, 16 bits, forward curve.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved, 16 bits, forward curve, in place.
 *
 * @param srcDst three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 16 bits, forward curve.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 16 bits, forward curve, in place.
 *
 * @param srcDst four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi);

/**
 * Planar, 16 bits, forward curve.
 *
 * @param src three planes, one step for all; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3],
                                                    int dstStep, RoiSize roi);

/**
 * Planar, 16 bits, forward curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi);

/**
 * Interleaved, floats, forward curve.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                    f32 vMin, f32 vMax);

/**
 * Interleaved, floats, forward curve, in place.
 *
 * @param srcDst three samples a pixel, 12 bytes; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Interleaved pixels with a fourth sample, floats, forward curve.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                     f32 vMin, f32 vMax);

/**
 * Interleaved pixels with a fourth sample, floats, forward curve, in place.
 *
 * @param srcDst four samples a pixel, 16 bytes; samples of any value; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Planar, floats, forward curve.
 *
 * @param src three planes, one step for all; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3],
                                                    int dstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Planar, floats, forward curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaFwd_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin,
                                                     f32 vMax);

/**
 * Interleaved, 8 bits, inverse curve.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved, 8 bits, inverse curve, in place.
 *
 * @param srcDst three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 8 bits, inverse curve.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 4 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 8 bits, inverse curve, in place.
 *
 * @param srcDst four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi);

/**
 * Planar, 8 bits, inverse curve.
 *
 * @param src three planes, one step for all; samples of 0 to 255
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

/**
 * Planar, 8 bits, inverse curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 255
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi);

/**
 * Interleaved, 16 bits, inverse curve.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved, 16 bits, inverse curve, in place.
 *
 * @param srcDst three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 16 bits, inverse curve.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 8 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved pixels with a fourth sample, 16 bits, inverse curve, in place.
 *
 * @param srcDst four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi);

/**
 * Planar, 16 bits, inverse curve.
 *
 * @param src three planes, one step for all; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3],
                                                    int dstStep, RoiSize roi);

/**
 * Planar, 16 bits, inverse curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of 0 to 65535
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, ::pyxErrStep or ::pyxErrNoMemory
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi);

/**
 * Interleaved, floats, inverse curve.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                    f32 vMin, f32 vMax);

/**
 * Interleaved, floats, inverse curve, in place.
 *
 * @param srcDst three samples a pixel, 12 bytes; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Interleaved pixels with a fourth sample, floats, inverse curve.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst four samples a pixel, 16 bytes; the fourth sample keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                     f32 vMin, f32 vMax);

/**
 * Interleaved pixels with a fourth sample, floats, inverse curve, in place.
 *
 * @param srcDst four samples a pixel, 16 bytes; samples of any value; the fourth sample keeps its value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Planar, floats, inverse curve.
 *
 * @param src three planes, one step for all; samples of any value
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst three planes, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3],
                                                    int dstStep, RoiSize roi, f32 vMin, f32 vMax);

/**
 * Planar, floats, inverse curve, in place.
 *
 * @param srcDst three planes, one step for all; samples of any value
 * @param srcDstStep bytes from one row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @param vMin the sample at which the curve has 0
 * @param vMax the sample at which the curve has 1, above `vMin`
 * @return ::pyxOk, ::pyxErrRange, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGammaInv_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin,
                                                     f32 vMax);

#ifdef __cplusplus
}
#endif

#endif
