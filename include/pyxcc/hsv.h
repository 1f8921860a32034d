/**
 * @file
 * @brief RGB to hue, saturation and value, and back.
 *
 * With V the greatest of a pixel's R, G, B, m the least and d = V - m, hue counts sextants of the circle:
 *
 *     S = d / V; 0 for black
 *     H = (G - B) / d where V is R, 2 + (B - R) / d where it is G, 4 + (R - G) / d where it is B;
 *         6 more where that is below 0; 0 for grays
 *
 * and back, with f what H is beyond a whole sextant, p = V (1 - S), q = V (1 - S f) and t = V (1 - S (1 - f)):
 *
 * | sextant | 0 | 1 | 2 | 3 | 4 | 5 |
 * | :------ | - | - | - | - | - | - |
 * | R       | V | q | p | p | t | V |
 * | G       | t | V | V | q | p | p |
 * | B       | p | p | t | V | V | q |
 *
 * 8-bit samples are 255 for the circle, for a saturation of 1 and for the greatest value, 16-bit samples are 65535. The
 * greatest H is a full circle and so the same as 0. In memory the order is H, S, V.
 *
 * All is computed in f32, in a fixed order and with fixed fused operations, so that each result is settled to the bit
 * for a given processor. The 8-bit conversions to HSV go through the processor's approximate reciprocal: on processors
 * with another table of it, H and S of a pixel can differ in their last levels, V never. The first `width & ~3` pixels
 * of a row take one form and the rest another, its tail, so that equal pixels at both ends of a row can differ by a
 * level; 16-bit RGB to HSV has one form, with true divisions. All round to nearest, ties to even, 16-bit RGB to HSV by
 * adding a half and cutting. Nothing here sets the rounding mode of the calling thread: it is in force for all floats.
 *
 * In AC4 layouts the fourth sample of the target keeps its value, and that of the source is not used.
 *
 * All conversions take sizes from 1 by 1 and any step, zero and negative ones included. 16-bit samples lie at even
 * distances, so that the lowest bit of a step does not count: a step of 601 bytes is one of 600. Pointers are tested,
 * then the size; nothing is written when a test fails. Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], hsv[480 * 640 * 3];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToHSV_8u_C3R(rgb, 640 * 3, hsv, 640 * 3, size);
 * @endcode
 *
 * @see @ref family-hsv
 */
#ifndef PYXCC_HSV_H
#define PYXCC_HSV_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved RGB to HSV, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst H, S, V triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHSV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HSV, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail.
 *
 * @param src R, G, B, and a fourth sample, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst H, S, V, and a fourth sample, 4 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHSV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB to HSV, 16 bits. All pixels take one form.
 *
 * @param src R, G, B triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, S, V triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHSV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved RGB with a fourth sample to HSV, 16 bits. All pixels take one form.
 *
 * @param src R, G, B, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst H, S, V, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToHSV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HSV to RGB, 8 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail.
 *
 * @param src H, S, V triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHSVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HSV with a fourth sample to RGB, 8 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail.
 *
 * @param src H, S, V, and a fourth sample, 4 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B, and a fourth sample, 4 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHSVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HSV to RGB, 16 bits. The first `width & ~3` pixels of a row take the form of whole blocks, the rest its
 * tail.
 *
 * @param src H, S, V triples, 6 bytes a pixel
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B triples, 6 bytes a pixel
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHSVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Interleaved HSV with a fourth sample to RGB, 16 bits. The first `width & ~3` pixels of a row take the form of whole
 * blocks, the rest its tail.
 *
 * @param src H, S, V, and a fourth sample, 8 bytes a pixel; the fourth is not used
 * @param srcStep bytes from one source row to the next, without its lowest bit
 * @param dst R, G, B, and a fourth sample, 8 bytes a pixel; the fourth keeps its value
 * @param dstStep bytes from one target row to the next, without its lowest bit
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiHSVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
