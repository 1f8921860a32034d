/**
 * @file
 * @brief RGB and BGR to hue, lightness and saturation, and back.
 *
 * With M the greatest of a pixel's R, G, B, m the least, d = M - m, and all three between 0 and 1:
 *
 *     L = (M + m) / 2
 *     S = d / (M + m) for L up to 1/2, otherwise d / (2 - M - m); 0 for grays
 *     H = 60 (G - B) / d degrees where M is R, otherwise 120 + 60 (B - R) / d where it is G,
 *         otherwise 240 + 60 (R - G) / d; 360 more where that is below 0; 0 for grays
 *
 * and back, with m2 = L + L S for L up to 1/2, otherwise L + S - L S, and m1 = 2 L - m2: G is what lies at the angle H,
 * R what lies 120 degrees further on, and B what lies 120 degrees back, on a circle that goes from m1 to m2 over the
 * first 60 degrees, stays there up to 180, goes down to m1 over the next 60 and stays there.
 *
 * In samples:
 *
 * | depth | H                    | L                 | S         |
 * | :---- | :------------------- | :---------------- | :-------- |
 * | 8u    | 255 for the circle   | 255 for white     | 255 for 1 |
 * | 16u   | 65535 for the circle | 65535 for white   | 65535 for 1 |
 * | 16s   | as 16u, less 32768   | as 16u, less 32768, as are R, G and B | as 16u, less 32768 |
 * | 32f   | 1 for the circle     | 1 for white       | 1 for 1   |
 *
 * In memory the order is H, L, S; in an array of planes it is too.
 *
 * All is computed in f32, in a fixed order and with fixed fused operations, so that each result is settled to the bit
 * for a given processor. The integer conversions to HLS go through the processor's approximate reciprocal: on
 * processors with another table of it, H and S of a pixel can differ in their last levels, L never. The first pixels of
 * a row, up to a multiple that each conversion names, take one form, and the rest another, its tail: equal pixels at
 * both ends of a row can differ by a level. The conversions of RGB round to nearest, ties to even, the tails of
 * #pyxiRGBToHLS_8u_C3R, of the 16-bit conversions to HLS and of 8-bit HLS to RGB excepted, which cut; those of BGR
 * always cut. Nothing here sets the rounding mode of the calling thread: it is in force for all floats.
 *
 * In AC4 layouts the fourth sample of the target keeps its value, and that of the source is not used. Where a layout
 * with four planes takes part, alpha is copied.
 *
 * All conversions take sizes from 1 by 1. Those of RGB take any step, zero and negative ones included, and test
 * pointers, then the size; 16-bit and float samples lie at whole multiples of their size, so that the low bits of a
 * step do not count: a step of 601 bytes is one of 600. Those of BGR take steps from 1, and test pointers, then steps,
 * then the size, #pyxiBGRToHLS_8u_AC4R excepted, which tests the size before the steps. Nothing is written when a test
 * fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize, and ::pyxErrStep for BGR.
 *
 * @code
 * u8 rgb[480 * 640 * 3], hls[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToHLS_8u_C3R(rgb, 640 * 3, hls, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-hls
 */
#ifndef PYXCC_HLS_H
#define PYXCC_HLS_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to HLS, 8 bits. The first `width & ~7` pixels of a row round to nearest, the rest is cut.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst H, L, S triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HLS, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail; both round to nearest.
 *
 * @param src R, G, B, and a fourth sample, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst H, L, S, and a fourth sample, 4 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to HLS, 16 bits. The first `width & ~3` pixels of a row round to nearest, the rest is cut.
 *
 * @param src R, G, B triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, L, S triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HLS, 16 bits. The first `width & ~3` pixels of a row round to nearest, the
 * rest is cut.
 *
 * @param src R, G, B, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, L, S, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to HLS, 16 bits with a sign. The first `width & ~3` pixels of a row round to nearest, the rest is
 * cut.
 *
 * @param src R, G, B triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, L, S triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HLS, 16 bits with a sign. The first `width & ~3` pixels of a row round to
 * nearest, the rest is cut.
 *
 * @param src R, G, B, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, L, S, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to HLS, floats. All pixels go by true divisions, without fused operations. A pixel whose extremes
 * differ by 2^-23 or less has H and S of 0.
 *
 * @param src R, G, B triples, 12 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its two lowest bits
 * @param dst H, L, S triples, 12 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its two lowest bits
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HLS, floats. All pixels go by true divisions, without fused operations. A
 * pixel whose extremes differ by 2^-23 or less has H and S of 0.
 *
 * @param src R, G, B, and a fourth sample, 16 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its two lowest bits
 * @param dst H, L, S, and a fourth sample, 16 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its two lowest bits
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHLS_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS to RGB, 8 bits. The first `width & ~7` pixels of a row round to nearest, the rest goes by true
 * divisions and is cut.
 *
 * @param src H, L, S triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS with a fourth sample to RGB, 8 bits. The first `width & ~7` pixels of a row round to nearest, the
 * rest goes by true divisions and is cut.
 *
 * @param src H, L, S, and a fourth sample, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, and a fourth sample, 4 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS to RGB, 16 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail; both round to nearest. In the tail a pixel without saturation is L in all channels.
 *
 * @param src H, L, S triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS with a fourth sample to RGB, 16 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail; both round to nearest. In the tail a pixel without saturation is L in all channels.
 *
 * @param src H, L, S, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS to RGB, 16 bits with a sign. The first `width & ~3` pixels of a row take the form of whole blocks,
 * the rest its tail; both round to nearest. In the tail a pixel without saturation is L in all channels.
 *
 * @param src H, L, S triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS with a fourth sample to RGB, 16 bits with a sign. The first `width & ~3` pixels of a row take the
 * form of whole blocks, the rest its tail; both round to nearest. In the tail a pixel without saturation is L in all
 * channels.
 *
 * @param src H, L, S, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS to RGB, floats. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail, with true divisions. A pixel without saturation is L in all channels.
 *
 * @param src H, L, S triples, 12 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its two lowest bits
 * @param dst R, G, B triples, 12 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its two lowest bits
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HLS with a fourth sample to RGB, floats. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail, with true divisions. A pixel without saturation is L in all channels.
 *
 * @param src H, L, S, and a fourth sample, 16 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its two lowest bits
 * @param dst R, G, B, and a fourth sample, 16 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its two lowest bits
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Interleaved BGR with a fourth sample to HLS, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail; both cut. The size is tested before the steps.
 *
 * @param src B, G, R, and a fourth sample, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst H, L, S, and a fourth sample, 4 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize or ::pyxErrStep
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved BGR with alpha to planar HLS with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of
 * whole blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src B, G, R, A, 4 bytes a pixel
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes H, L, S, A, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep,
                                                      RoiSize roi);

/**
 * Planar BGR with alpha to interleaved HLS with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of
 * whole blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src planes B, G, R, A, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst H, L, S, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep,
                                                      RoiSize roi);

/**
 * Planar BGR with alpha to planar HLS with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src planes B, G, R, A, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes H, L, S, A, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep,
                                                    RoiSize roi);

/**
 * Interleaved BGR to planar HLS, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest
 * its tail; both cut.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes H, L, S, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                     RoiSize roi);

/**
 * Planar BGR to interleaved HLS, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest
 * its tail; both cut.
 *
 * @param src planes B, G, R, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst H, L, S triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                     RoiSize roi);

/**
 * Planar BGR to planar HLS, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail; both cut.
 *
 * @param src planes B, G, R, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes H, L, S, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

/**
 * Interleaved HLS with alpha to planar BGR with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of
 * whole blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src H, L, S, A, 4 bytes a pixel
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes B, G, R, A, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep,
                                                      RoiSize roi);

/**
 * Planar HLS with alpha to interleaved BGR with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of
 * whole blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src planes H, L, S, A, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep,
                                                      RoiSize roi);

/**
 * Planar HLS with alpha to planar BGR with alpha, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail; both cut. Alpha is copied.
 *
 * @param src planes H, L, S, A, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes B, G, R, A, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep,
                                                    RoiSize roi);

/**
 * Interleaved HLS to planar BGR, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest
 * its tail; both cut.
 *
 * @param src H, L, S triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes B, G, R, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                     RoiSize roi);

/**
 * Planar HLS to interleaved BGR, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest
 * its tail; both cut.
 *
 * @param src planes H, L, S, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                     RoiSize roi);

/**
 * Planar HLS to planar BGR, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail; both cut.
 *
 * @param src planes H, L, S, one step for all
 * @param srcStep bytes from one source row to the next, at least 1
 * @param dst planes B, G, R, one step for all
 * @param dstStep bytes from one target row to the next, at least 1
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr, ::pyxErrStep or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                                   RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
