/**
 * @file
 * @brief YCbCr and YUV to packed RGB: 8-bit samples, at full resolution or with shared chroma, to 16-bit pixels.
 *
 * A pixel is one `u16`. Its model names the channels from the low bits up, and their widths: `BGR565` has B in bits
 * 0-4, G in 5-10 and R in 11-15. Bits that a model leaves over are 0. Each channel is found in 8 bits, and its field is
 * the upper 4, 5 or 6 of them; there is no rounding.
 *
 * The 8-bit channels come of BT.601, studio range, or of YUV, full range, by fixed-point forms that are part of the
 * result. Where a wide form for the first columns of a row is followed by an exact one, the rule is told for each
 * conversion; it goes by the width alone. `invHighE` is `invHighD` of rgb_ycbcr.h without rounding, so that Y 235 with
 * Cb and Cr 128 is 254 in all channels. In `yuvInvHighPacked`, with mh(a, b) the upper half of a 32-bit product:
 *
 *     R = (16 Y + mh(128 (V - 128), 9338)) >> 4
 *     G = (16 Y - mh(128 (V - 128), 4759) - mh(128 (U - 128), 3227)) >> 4
 *     B = (16 Y + mh(128 (U - 128), 16646)) >> 4
 *
 * clamped to 0..255.
 *
 * Chroma is not interpolated: a sample serves all the pixels of its block. All columns and rows are converted. Where
 * the last block is not whole, 4:2:0 and 4:2:2 have a chroma sample for it, so that rows of Cb and Cr hold
 * (width + 1) / 2 samples and, in 4:2:0, planes (height + 1) / 2 rows; 4:1:1 has none, and up to three columns take the
 * one before. In packed 4:2:2 rows a last odd pixel has its Cb behind its Y and its Cr where it would be if the pair
 * were whole, at byte 2 * width + 1: past the row's own bytes, and it must be readable. Nothing else is read outside of
 * the rows.
 *
 * All conversions take any step, zero and negative ones included; an odd target step loses its last bit, by an
 * arithmetic shift: 641 counts as 640, and -641 as -642. They write nothing when they return an error. Null pointers
 * are tested first, then the size, then the elements of an array of planes. Arrays of steps must not be null and are
 * not tested.
 *
 * @code
 * u8 y[480 * 640], cb[240 * 320], cr[240 * 320];
 * u16 pixels[480 * 640];
 * const u8* const planes[3] = {y, cb, cr};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiYCbCr420ToBGR565_8u16u_P3C3R(planes, steps, pixels, 640 * 2, size);
 * @endcode
 *
 * @see @ref family-ycbcr-to-packed
 */
#ifndef PYXCC_YCBCR_TO_PACKED_H
#define PYXCC_YCBCR_TO_PACKED_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Interleaved YCbCr to BGR444, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved YCbCr to BGR555, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved YCbCr to BGR565, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved YCbCr to RGB444, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved YCbCr to RGB555, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Interleaved YCbCr to RGB565, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y, Cb, Cr triples, 3 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                           RoiSize roi);

/**
 * Planar YCbCr to BGR444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr to BGR555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr to BGR565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToBGR565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr to RGB444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr to RGB555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Planar YCbCr to RGB565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, Cb and Cr
 * @param srcStep bytes from one row of a plane to the next, for all planes
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCrToRGB565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep,
                                                             RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR444, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR555, cut. Columns below `width & ~7` take `invHighD`, the rest `invExactD`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to BGR565, cut. Columns below `width & ~7` take `invHighD`, the rest `invExactD`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB444, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB555, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Packed YCbCr 4:2:2 to RGB565, cut. Columns below `width & ~7` take `invHighE`, the rest `invExactA`.
 *
 * @param src Y0, Cb, Y1, Cr, 4 bytes for two pixels
 * @param srcStep bytes from one source row to the next
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep,
                                                                RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to BGR565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to RGB565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to BGR565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB444, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB555, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to RGB565, cut. Every pixel takes `invHighE`.
 *
 * @param src planes of Y, and of Cb and Cr, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to BGR555, cut. Columns below `width & ~3` take `invHighE`, the rest `invExactB` with the last
 * whole chroma sample.
 *
 * @param src planes of Y, and of Cb and Cr, of a quarter of the width, rounded down
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width of at least 4 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YCbCr 4:1:1 to BGR565, cut. Columns below `width & ~3` take `invHighE`, the rest `invExactB` with the last
 * whole chroma sample.
 *
 * @param src planes of Y, and of Cb and Cr, of a quarter of the width, rounded down
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width of at least 4 and height of at least 1, in pixels
 * @return ::pyxOk, ::pyxWarnOddSize for a width that is not a multiple of 4, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR444, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-3, G in 4-7, R in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR555, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-9, R in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to BGR565, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, B in bits 0-4, G in 5-10, R in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB444, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-3, G in 4-7, B in 8-11; bits 12-15 are 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB555, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-9, B in 10-14; bit 15 is 0
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

/**
 * Planar YUV 4:2:0 to RGB565, cut. Every pixel takes `yuvInvHighPacked`.
 *
 * @param src planes of Y, and of U and V, of half the width and height, rounded up
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst pixels of 16 bits, R in bits 0-4, G in 5-10, B in 11-15
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYUV420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,
                                                              int dstStep, RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
