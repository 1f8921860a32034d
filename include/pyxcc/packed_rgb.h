/**
 * @file
 * @brief Packed RGB as a source, and 565 as a target of RGB: 16-bit pixels to 8-bit RGB, YCbCr and YUV.
 *
 * A pixel is one `u16`. Its model names the channels from the low bits up, and their widths: `BGR565` has B in bits
 * 0-4, G in 5-10 and R in 11-15. A field of 5 bits counts as 8 times its value, one of 6 bits as 4 times, so that the
 * brightest ones are 248 and 252; the other way, the last bits of a byte are dropped. What follows is computed on such
 * bytes.
 *
 * YCbCr is BT.601, studio range, and YUV full range. Every pixel takes the same forms, whatever its column. With R, G,
 * B of a pixel, SR, SG, SB their sums over the pixels that share a chroma sample, and N 16 for 1 pixel, 17 for 2 and 18
 * for 4:
 *
 *     Y  = (16843 R + 33030 G + 6423 B + 0x108000) >> 16
 *     Cb = (28770 SB - 19071 SG - 9699 SR + (1025 << (N - 3))) >> N
 *     Cr = (28770 SR - 24117 SG - 4653 SB + (1025 << (N - 3))) >> N
 *
 * In YUV, with s = 19595 R + 38470 G + 7471 B and S its sum over those pixels:
 *
 *     Y = s >> 16, or (s + 32768) >> 16 from BGR555 and BGR565
 *     U = ((((65536 SB - S + c) >> 16) * 32244) >> N) + 128, without a clamp
 *     V = ((((65536 SR - S + c) >> 16) * 57475) >> N) + 128, clamped to 0..255
 *
 * and c = 0x1ffff in 4:2:0, 65535 in 4:2:2.
 *
 * | target | what is left over at the end of a row | an odd last row |
 * |---|---|---|
 * | YCbCr 4:2:2 planes | converted; chroma of the one pixel | rows are independent |
 * | YCbCr 4:2:2 packed | converted; Cb of the one pixel, and no place for Cr | rows are independent |
 * | YCbCr 4:2:0 | converted; chroma of the pixels that there are, 2 or 1 | converted likewise |
 * | YCbCr 4:1:1 | stays untouched, ::pyxWarnOddSize | rows are independent |
 * | YUV 4:2:0 | stays untouched, ::pyxWarnOddSize | stays untouched, ::pyxWarnOddSize |
 * | YUV 4:2:2 | stays untouched, ::pyxWarnOddSize | rows are independent |
 *
 * All conversions take any step, zero and negative ones included; an odd step of packed sources loses its last bit, by
 * an arithmetic shift: 641 counts as 640, and -641 as -642. They write nothing when they return an error. Null
 * pointers, those in arrays included, are tested before the size. Arrays of steps must not be null and are not tested.
 *
 * @code
 * u16 pixels[480 * 640];
 * u8 y[480 * 640], cb[240 * 320], cr[240 * 320];
 * u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiBGR565ToYCbCr420_16u8u_C3P3R(pixels, 640 * 2, planes, steps, size);
 * @endcode
 *
 * @see @ref family-packed-rgb
 */
#ifndef PYXCC_PACKED_RGB_H
#define PYXCC_PACKED_RGB_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * BGR565 to interleaved BGR.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst B, G, R triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep,
                                                         RoiSize roi);

/**
 * RGB565 to interleaved RGB. The same as ::pyxiBGR565ToBGR_16u8u_C3R.
 *
 * @param src pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst R, G, B triples, 3 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGB565ToRGB_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep,
                                                         RoiSize roi);

/**
 * Interleaved BGR to BGR565.
 *
 * @param src B, G, R triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi);

/**
 * Interleaved RGB to RGB565. The same as ::pyxiBGRToBGR565_8u16u_C3R.
 *
 * @param src R, G, B triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi);

/**
 * BGR555 to packed YCbCr 4:2:2.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst Y0, Cb, Y1, Cr, 4 bytes for two pixels; a last odd pixel has Y and Cb
 * @param dstStep bytes from one target row to the next
 * @param roi width of at least 2 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep,
                                                                RoiSize roi);

/**
 * BGR565 to packed YCbCr 4:2:2.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst Y0, Cb, Y1, Cr, 4 bytes for two pixels; a last odd pixel has Y and Cb
 * @param dstStep bytes from one target row to the next
 * @param roi width of at least 2 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep,
                                                                RoiSize roi);

/**
 * BGR555 to planar YCbCr 4:2:2.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width of at least 2 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR565 to planar YCbCr 4:2:2.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width of at least 2 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR555 to planar YCbCr 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR565 to planar YCbCr 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR555 to planar YCrCb 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cr and Cb, of half the width and height, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR565 to planar YCrCb 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cr and Cb, of half the width and height, rounded up
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR555 to planar YCbCr 4:1:1.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of a quarter of the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width of at least 4 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR565 to planar YCbCr 4:1:1.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of Cb and Cr, of a quarter of the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width of at least 4 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                                const int dstStep[3], RoiSize roi);

/**
 * BGR555 to planar YUV 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is not read
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of U and V, of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR555ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                              const int dstStep[3], RoiSize roi);

/**
 * BGR565 to planar YUV 4:2:0.
 *
 * @param src pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of U and V, of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGR565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                              const int dstStep[3], RoiSize roi);

/**
 * RGB565 to planar YUV 4:2:0.
 *
 * @param src pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of U and V, of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGB565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                              const int dstStep[3], RoiSize roi);

/**
 * RGB565 to planar YUV 4:2:2.
 *
 * @param src pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, and of U and V, of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGB565ToYUV422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                              const int dstStep[3], RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
