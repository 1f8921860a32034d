/**
 * @file
 * @brief YCbCr and YUV to packed RGB with ordered dithering: 8-bit samples, at full resolution or with shared chroma,
 * to 16-bit pixels.
 *
 * Pixels, sources and chroma are those of ycbcr_to_packed.h, and so is what is said of odd sizes and steps there. Every
 * pixel is found in 8 bits by `invHighE`, or by `yuvInvHighPacked` from YUV. Each channel is then taken to its field
 * against a threshold, so that flat colours keep their mean. With c the channel in 8 bits:
 *
 * | field | q | step | result |
 * |---|---|---|---|
 * | 4 bits | (c * 15) >> 8 | 4352 | q, or q + 1 if c * 256 - q * 4352 is above the threshold |
 * | 5 bits | (c * 31) >> 8 | 2105 | q, or q + 1 if c * 256 - q * 2105 is above the threshold |
 * | 6 bits | (c * 63) >> 8 | 1036 | q, or q + 1 if c * 256 - q * 1036 is above the threshold |
 *
 * The thresholds of row j and column i of the region are those of row j & 3 and column i & 3 here:
 *
 * | field | row 0 | row 1 | row 2 | row 3 |
 * |---|---|---|---|---|
 * | 4 bits | 0, 2312, 578, 2890 | 3468, 1156, 4046, 1734 | 867, 3179, 289, 2601 | 4335, 2023, 3757, 1445 |
 * | 5 bits | 0, 1118, 279, 1398 | 1678, 559, 1957, 839 | 419, 1538, 139, 1258 | 2097, 978, 1817, 699 |
 *
 * 6 bits have half of those of 5 bits, rounded down. The pattern begins at the region's first pixel, whatever the image
 * that it is cut from: parts of an image fit together where they are cut at multiples of 4 columns and rows. 0 gives 0
 * everywhere, and 255 the largest field, but for 62 of 63 in column 0 of row 3.
 *
 * @code
 * u8 y[480 * 640], cb[240 * 320], cr[240 * 320];
 * u16 pixels[480 * 640];
 * const u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiYCbCr420ToBGR565Dither_8u16u_P3C3R(planes, steps, pixels, 640 * 2, size);
 * @endcode
 *
 * @see @ref family-dithered-packed
 */
#ifndef PYXCC_DITHERED_PACKED_H
#define PYXCC_DITHERED_PACKED_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved YCbCr to BGR444, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Interleaved YCbCr to BGR555, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Interleaved YCbCr to BGR565, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Interleaved YCbCr to RGB444, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Interleaved YCbCr to RGB555, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Interleaved YCbCr to RGB565, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                 RoiSize roi);

/**
 * Planar YCbCr to BGR444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Planar YCbCr to BGR555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Planar YCbCr to BGR565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Planar YCbCr to RGB444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Planar YCbCr to RGB555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Planar YCbCr to RGB565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst,
                                                                   int dstStep, RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR444, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR555, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR565, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB444, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB555, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB565, dithered. Every pixel takes `invHighE`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                      RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB444, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB555, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB565, dithered. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                      u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR444, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR555, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR565, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB444, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB555, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB565, dithered. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3],
                                                                    u16* dst, int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
