/**
 * @file
 * @brief RGB to and from YCoCg: luma Y, orange chroma Co and green chroma Cg, by additions and shifts.
 *
 * The plain transform rounds each output; the reversible one (`Rev`) keeps what it takes, so that its inverse gives the
 * source back. A shift rounds towards minus infinity:
 *
 *     plain         Y = (R + 2 G + B + 2) >> 2        R = Y + Co - Cg
 *                   Co = (R - B + 1) >> 1             G = Y + Cg
 *                   Cg = (2 G - R - B + 2) >> 2       B = Y - Co - Cg
 *
 *     reversible    Co = R - B                        t = Y - (Cg >> 1)
 *                   t = B + (Co >> 1)                 G = Cg + t
 *                   Cg = G - t                        B = t - (Co >> 1)
 *                   Y = t + (Cg >> 1)                 R = B + Co
 *
 * Pixels are in the order B, G, R, but in the pair of 8 bits to 8, where they are R, G, B: there 128 is added to Co and
 * Cg, and all results are clamped to 0 to 255. SBGR in a name means that the pixels' samples are signed.
 *
 * Each channel of 8 bits gives Co and Cg of up to 9 bits with a sign, which 16 bits hold; those of signed 16 bits need
 * 32, and conversions that stay at 16 say what becomes of what does not fit.
 *
 * Sizes below 1 by 1 are an error in some conversions, and an empty region in others, as they say. Pointers are tested
 * first: the image, the array, its elements. Nothing is written when a test fails. Steps are not tested.
 *
 * @code
 * u8 bgr[480 * 640 * 3];
 * s16 y[480 * 640], co[480 * 640], cg[480 * 640];
 * s16* planes[3] = {y, co, cg};
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiBGRToYCoCg_Rev_8u16s_C3P3R(bgr, 640 * 3, planes, 640 * sizeof(s16), size);
 * @endcode
 *
 * @see @ref family-ycocg
 */
#ifndef PYXCC_YCOCG_H
#define PYXCC_YCOCG_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * BGR to YCoCg, plain: 8 bits to 16.
 *
 * @param src three samples a pixel, 3 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCoCg_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep,
                                                          RoiSize roi);

/**
 * BGR to YCoCg, plain: 8 bits to 16, pixels with a fourth sample.
 *
 * @param src four samples a pixel, 4 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCoCg_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep,
                                                          RoiSize roi);

/**
 * RGB to YCoCg, plain: 8 bits, Co and Cg counted from 128.
 *
 * @param src three samples a pixel, 3 bytes, in the order R, G, B
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 1 byte
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToYCoCg_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep,
                                                       RoiSize roi);

/**
 * BGR to YCoCg, plain: signed 16 bits to 32.
 *
 * @param src three samples a pixel, 6 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 4 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                            RoiSize roi);

/**
 * BGR to YCoCg, plain: signed 16 bits to 32, pixels with a fourth sample.
 *
 * @param src four samples a pixel, 8 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 4 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                            RoiSize roi);

/**
 * BGR to YCoCg, plain: signed 16 bits.
 *
 * Columns before `width & ~3` are clamped to -32768 to 32767; of what the others have beyond that, the low 16 bits are
 * kept.
 *
 * @param src three samples a pixel, 6 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep,
                                                         RoiSize roi);

/**
 * BGR to YCoCg, plain: signed 16 bits, pixels with a fourth sample.
 *
 * Columns before `width & ~3` are clamped to -32768 to 32767; of what the others have beyond that, the low 16 bits are
 * kept.
 *
 * @param src four samples a pixel, 8 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep,
                                                         RoiSize roi);

/**
 * YCoCg to BGR, plain: 16 bits to 8.
 *
 * Sums wrap in 16 bits; what comes out is clamped to 0 to 255.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 3 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToBGR_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi);

/**
 * YCoCg to BGR, plain: 16 bits to 8, pixels with a fourth sample.
 *
 * Sums wrap in 16 bits; what comes out is clamped to 0 to 255.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 4 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @param alphaValue fourth sample of every target pixel, 0 to 255
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToBGR_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep,
                                                          RoiSize roi, u8 alphaValue);

/**
 * YCoCg to RGB, plain: 8 bits, Co and Cg counted from 128.
 *
 * @param src three planes, Y, Co and Cg; a sample is 1 byte
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 3 bytes, in the order R, G, B
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                       RoiSize roi);

/**
 * YCoCg to BGR, plain: signed 16 bits.
 *
 * Sums wrap.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 6 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi);

/**
 * YCoCg to BGR, plain: signed 16 bits, pixels with a fourth sample.
 *
 * Sums wrap.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 8 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param alphaValue fourth sample of every target pixel, -32768 to 32767
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, s16 alphaValue);

/**
 * YCoCg to BGR, plain: 32 bits to signed 16.
 *
 * Sums wrap in 32 bits; the low 16 bits of what comes out are kept.
 *
 * @param src three planes, Y, Co and Cg; a sample is 4 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 6 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                            RoiSize roi);

/**
 * YCoCg to BGR, plain: 32 bits to signed 16, pixels with a fourth sample.
 *
 * Sums wrap in 32 bits; the low 16 bits of what comes out are kept.
 *
 * @param src three planes, Y, Co and Cg; a sample is 4 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 8 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param alphaValue fourth sample of every target pixel, -32768 to 32767
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                            RoiSize roi, s16 alphaValue);

/**
 * BGR to YCoCg, reversible: 8 bits to 16.
 *
 * @param src three samples a pixel, 3 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCoCg_Rev_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3],
                                                              int dstStep, RoiSize roi);

/**
 * BGR to YCoCg, reversible: 8 bits to 16, pixels with a fourth sample.
 *
 * @param src four samples a pixel, 4 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiBGRToYCoCg_Rev_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3],
                                                              int dstStep, RoiSize roi);

/**
 * BGR to YCoCg, reversible: signed 16 bits to 32.
 *
 * @param src three samples a pixel, 6 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 4 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3],
                                                                int dstStep, RoiSize roi);

/**
 * BGR to YCoCg, reversible: signed 16 bits to 32, pixels with a fourth sample.
 *
 * @param src four samples a pixel, 8 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 4 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3],
                                                                int dstStep, RoiSize roi);

/**
 * BGR to YCoCg, reversible: signed 16 bits.
 *
 * Sums saturate in columns before `width & ~15`, and wrap in the others: only there is the transform reversible for
 * all samples.
 *
 * @param src three samples a pixel, 6 bytes, in the order B, G, R
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3],
                                                             int dstStep, RoiSize roi);

/**
 * BGR to YCoCg, reversible: signed 16 bits, pixels with a fourth sample.
 *
 * Sums wrap, so that the transform is reversible for all samples.
 *
 * @param src four samples a pixel, 8 bytes, in the order B, G, R; the fourth sample is not read
 * @param srcStep bytes from one source row to the next
 * @param dst three planes, Y, Co and Cg; a sample is 2 bytes
 * @param dstStep bytes from one row to the next in each plane
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3],
                                                             int dstStep, RoiSize roi);

/**
 * YCoCg to BGR, reversible: 16 bits to 8.
 *
 * Sums wrap in 16 bits; what comes out is clamped to 0 to 255.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 3 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToBGR_Rev_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst,
                                                              int dstStep, RoiSize roi);

/**
 * YCoCg to BGR, reversible: 16 bits to 8, pixels with a fourth sample.
 *
 * Sums wrap in 16 bits; what comes out is clamped to 0 to 255.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 4 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @param alphaValue fourth sample of every target pixel, 0 to 255
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToBGR_Rev_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst,
                                                              int dstStep, RoiSize roi, u8 alphaValue);

/**
 * YCoCg to BGR, reversible: signed 16 bits.
 *
 * Sums saturate in columns before `width & ~15`, and wrap in the others: only there is the transform reversible for
 * all samples.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 6 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst,
                                                             int dstStep, RoiSize roi);

/**
 * YCoCg to BGR, reversible: signed 16 bits, pixels with a fourth sample.
 *
 * Sums wrap, so that the transform is reversible for all samples.
 *
 * @param src three planes, Y, Co and Cg; a sample is 2 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 8 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @param alphaValue fourth sample of every target pixel, -32768 to 32767
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst,
                                                             int dstStep, RoiSize roi, s16 alphaValue);

/**
 * YCoCg to BGR, reversible: 32 bits to signed 16.
 *
 * Sums wrap in 32 bits; the low 16 bits of what comes out are kept.
 *
 * @param src three planes, Y, Co and Cg; a sample is 4 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst three samples a pixel, 6 bytes, in the order B, G, R
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst,
                                                                int dstStep, RoiSize roi);

/**
 * YCoCg to BGR, reversible: 32 bits to signed 16, pixels with a fourth sample.
 *
 * Sums wrap in 32 bits; the low 16 bits of what comes out are kept.
 *
 * @param src three planes, Y, Co and Cg; a sample is 4 bytes
 * @param srcStep bytes from one row to the next in each plane
 * @param dst four samples a pixel, 8 bytes, in the order B, G, R, alpha
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels; nothing is done if one is below 1
 * @param alphaValue fourth sample of every target pixel, -32768 to 32767
 * @return ::pyxOk or ::pyxErrNullPtr
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst,
                                                                int dstStep, RoiSize roi, s16 alphaValue);

#ifdef __cplusplus
}
#endif

#endif
