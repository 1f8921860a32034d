/**
 * @file
 * @brief YCbCr 4:2:0 and 4:2:2 with chroma filtered along the columns, and with the fields of a frame kept apart: 8
 * bits.
 *
 * A change between 4:2:0 and 4:2:2 changes the number of chroma rows. Where repacking doubles or drops rows, the
 * conversions here filter them, column by column; nothing is filtered along a row. Luma is copied, but for two
 * conversions that smooth it. Layouts are those of rgb_to_subsampled.h; packed `CbYCr422` rows are Cb Y0 Cr Y1.
 *
 * avgUp(a, b) is (a + b + 1) >> 1. Results that could leave 0..255 are clamped.
 *
 * **Four taps.** Of the chroma rows s(0) to s(M - 1) of the part that is converted, target row 2 m is s(m), and target
 * row 2 m + 1 is (9 (s(m) + s(m + 1)) - s(m - 1) - s(m + 2) + 8) >> 4. The first row stands for those above it, the
 * last one for those below.
 *
 * **Fields.** The rows of even number are the top field of a frame, the others the bottom field. Each field is
 * converted by itself, and its first and last row stand for those beyond. From 4:2:0 to 4:2:2, with s the chroma rows
 * of a source field, row n of the target's field with q = n >> 1 is
 *
 * | field | n even | n odd |
 * |---|---|---|
 * | top | (s(q - 1) + 7 s(q) + 4) >> 3 | (5 s(q) + 3 s(q + 1) + 4) >> 3 |
 * | bottom | (3 s(q - 1) + 5 s(q) + 4) >> 3 | (7 s(q) + s(q + 1) + 4) >> 3 |
 *
 * From 4:2:2 to 4:2:0 each four chroma rows a, b, c, d give two: (3 a + c + 2) >> 2 and (b + 3 d + 2) >> 2.
 *
 * **Bands.** Two conversions take an image whole or in horizontal bands, a call each. `layout` tells which:
 *
 * | `layout` | call | rows of the target, counted from the call's own first row |
 * |---|---|---|
 * | a value with the bits 1, 4 and 16 set, such as 21 | the whole image | 0 to height - 1 |
 * | 1 | the top band | 0 to height - 3 |
 * | 4 | a band in the middle | -2 to height - 3 |
 * | 16 | the bottom band | -2 to height - 1 |
 * | any other | none | none; the result is ::pyxOk |
 *
 * The pointers and the height are those of the band itself. A band so leaves its last two rows to the one below it,
 * whose rows they need, and reads rows of the band above: three of luma and one of chroma. Bands of even height that
 * follow each other without a gap give the bytes of the whole image, in any order. A band of odd height but the bottom
 * one reads the row of chroma below its own ones as well. Height 2 is not special in a band: the top one then gives no
 * row.
 *
 * An odd last column is left alone. Where the table says "warns", ::pyxWarnOddSize comes back for a size off the block.
 *
 * | conversions | block, columns by rows | a size off the block |
 * |---|---|---|
 * | four taps | 2 by 8 | is rounded down |
 * | fields | 2 by 4 | is rounded down, and warns |
 * | bands | 2 by 1 | is rounded down |
 * | to BGR | 2 by 2 | is rounded down, and warns |
 *
 * All conversions take any step, zero and negative ones included, and write nothing when they return an error. Arrays
 * of steps must not be null and are not tested.
 *
 * @code
 * u8 y[480 * 640], cb[240 * 320], cr[240 * 320], yTo[480 * 640], cbTo[480 * 320], crTo[480 * 320];
 * const u8* const from[3] = {y, cb, cr};
 * u8* const to[3] = {yTo, cbTo, crTo};
 * const int steps[3] = {640, 320, 320};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(from, steps, to, steps, size);
 * @endcode
 *
 * @see @ref family-filter-interlace
 */
#ifndef PYXCC_FILTER_INTERLACE_H
#define PYXCC_FILTER_INTERLACE_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Planar YCbCr 4:2:0 to planar YCbCr 4:2:2, chroma by four taps.
 *
 * @param src planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 8
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                                    u8* const dst[3], const int dstStep[3],
                                                                    RoiSize roi);

/**
 * Planar YCrCb 4:2:0 to planar YCbCr 4:2:2, chroma by four taps.
 *
 * @param src planes of Y, of Cr and of Cb, chroma of half the width and height
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 8
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                                    u8* const dst[3], const int dstStep[3],
                                                                    RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to planar YCbCr 4:2:2, chroma by four taps.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 8
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                                      int srcCbCrStep, u8* const dst[3],
                                                                      const int dstStep[3], RoiSize roi);

/**
 * Semi-planar YCbCr 4:2:0 to packed YCbCr 4:2:2, whole or in bands; luma and chroma are smoothed.
 *
 * Y in row j is avgUp(avgUp(y(j - 1), y(j)), avgUp(y(j), y(j + 1))). In the first row of the image it is
 * (3 y(0) + y(1) + 4) >> 2, in the last one (3 y(h - 1) + y(h - 2) + 4) >> 2, which raises a flat area by 1. Rows 2 k
 * and 2 k + 1 have avgUp(c(k), c(k + 1)) of the chroma rows c; at the bottom of the image the last row of chroma stands
 * for those below it, also for an odd last row of luma.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst Y0 Cb Y1 Cr, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 2
 * @param layout which band of the image this is
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                                      int srcCbCrStep, u8* dst, int dstStep,
                                                                      RoiSize roi, s32 layout);

/**
 * Semi-planar YCbCr 4:2:0 to planar 4:2:0, whole or in bands; luma is smoothed, and chroma is moved by half a row.
 *
 * Y in row j is avgUp(avgUp(y(j - 1), y(j)), avgUp(y(j), y(j + 1))), in the first row of the image
 * avgUp(y(0), avgUp(y(0), y(1))), and in the last one likewise of its own and the row above. Row j of chroma is
 * avgUp(c(j), c(j + 1)) of the chroma rows c; at the bottom of the image the last row stands for the one below it.
 *
 * The first byte of each pair goes to `dst[1]` and the second to `dst[2]`: the planes are Cb and Cr in this order, in
 * spite of the name. A height below 1 or a width below 1 is tested before the elements of `dst`, a size below 2 after
 * them.
 *
 * @param srcY plane of Y
 * @param srcYStep bytes from one row of Y to the next
 * @param srcCbCr plane of Cb, Cr pairs, of half the width and height
 * @param srcCbCrStep bytes from one row of pairs to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, each at least 2
 * @param layout which band of the image this is
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                                      int srcCbCrStep, u8* const dst[3],
                                                                      const int dstStep[3], RoiSize roi, s32 layout);

/**
 * Planar YCrCb 4:2:0 to interleaved BGR with a fourth byte. Chroma of the rows 2 k and 2 k + 1 is avgUp(c(k), c(k + 1))
 * of the chroma rows c, the last of which stands for the one below it. All whole blocks take `inv3D`, as
 * subsampled_to_rgb.h has it.
 *
 * @param src planes of Y, of Cr and of Cb, chroma of half the width and height
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst B, G, R, A, 4 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval value of the fourth byte of every pixel that is written
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or height, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_Filter_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                                 int dstStep, RoiSize roi, u8 aval);

/**
 * Planar YCbCr 4:2:0 to planar YCbCr 4:2:2 by fields.
 *
 * @param src planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 4
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or a height that is not a multiple of 4, ::pyxErrNullPtr or
 * ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420To422_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                                  u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:2:2 to planar YCbCr 4:2:0 by fields.
 *
 * @param src planes of Y, of Cb and of Cr, chroma of half the width
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 4
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or a height that is not a multiple of 4, ::pyxErrNullPtr or
 * ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422To420_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                                  u8* const dst[3], const int dstStep[3], RoiSize roi);

/**
 * Planar YCbCr 4:2:0 to packed CbYCr 4:2:2 by fields.
 *
 * @param src planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param srcStep bytes from one row to the next, for each plane
 * @param dst Cb Y0 Cr Y1, 2 bytes a pixel
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, at least 2 and 4
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or a height that is not a multiple of 4, ::pyxErrNullPtr or
 * ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(const u8* const src[3], const int srcStep[3],
                                                                         u8* dst, int dstStep, RoiSize roi);

/**
 * Packed CbYCr 4:2:2 to planar YCbCr 4:2:0 by fields.
 *
 * @param src Cb Y0 Cr Y1, 2 bytes a pixel
 * @param srcStep bytes from one source row to the next
 * @param dst planes of Y, of Cb and of Cr, chroma of half the width and height
 * @param dstStep bytes from one row to the next, for each plane
 * @param roi width and height in pixels, at least 2 and 4
 * @return ::pyxOk, ::pyxWarnOddSize for an odd width or a height that is not a multiple of 4, ::pyxErrNullPtr or
 * ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                                         const int dstStep[3], RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
