/**
 * @file
 * @brief Gray: one channel as a weighted sum of three, gray as three or four channels, and the luma of packed 4:2:2.
 *
 * `RGBToGray` has the weights 0.299, 0.587 and 0.114, `ColorToGray` those of `coeffs`, in the order of the channels in
 * memory. A null `coeffs` stands for the weights of `RGBToGray`. Weights may have any value and need not add up to 1.
 *
 * Floats are summed up in two fused operations, and nothing is clamped. A fourth channel takes no part:
 *
 *     Y = fused(w2 B + fused(w0 R + w1 G))
 *
 * f64 images have weights in f64; the default ones are the f32 values of 0.299, 0.587 and 0.114 for them, too.
 *
 * 16-bit samples become f32, and the sum is rounded in the caller's rounding mode and held within 0 to 65535. Signed
 * samples are taken with 32768 added, which is taken off the result again.
 *
 * 8-bit samples are summed up in integers, with weights wi = 32768 w + 0.5 truncated, the sum and the product in f32
 * and fused; 9798, 19235 and 3736 are those of `RGBToGray`. The columns below the greatest multiple of 16 that the
 * width has room for take
 *
 *     Y = (256 R w0 / 65536 + 256 G w1 / 65536 + 256 B w2 / 65536 + 64) / 128
 *
 * in which each quotient is truncated by itself, the low 16 bits of each weight count, each sum is held to 65535 and
 * the result to 255. The columns behind them, and all columns if a weight is negative, take
 *
 *     Y = (R w0 + G w1 + B w2 + 16384) / 32768
 *
 * in 32 bits, rounded down, of which the low 8 bits are stored: with weights that add up to more than 1, a bright pixel
 * wraps around.
 *
 * All conversions take sizes from 1 by 1 and steps of any value. Those of 16-bit signed samples to gray leave the low
 * bit of their steps out of account. Tests come in this order: pointers, size; nothing is written when one fails.
 * Statuses: ::pyxOk, ::pyxErrNullPtr, ::pyxErrSize.
 *
 * @code
 * u8 rgb[480 * 640 * 3], gray[480 * 640];
 * RoiSize size = {640, 480};
 * PyxStatus status = pyxiRGBToGray_8u_C3C1R(rgb, 640 * 3, gray, 640, size);
 * @endcode
 *
 * @see @ref family-gray
 */
#ifndef PYXCC_GRAY_H
#define PYXCC_GRAY_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * RGB to gray, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 1 byte
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to gray, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 1 byte
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * RGB to gray, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * RGB to gray, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep,
                                                        RoiSize roi);

/**
 * RGB to gray, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next, of which the low bit does not count
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next, of which the low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi);

/**
 * RGB to gray, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, of which the low bit does not count
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next, of which the low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep,
                                                        RoiSize roi);

/**
 * RGB to gray, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * RGB to gray, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiRGBToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep,
                                                        RoiSize roi);

/**
 * Colour to gray by weights of the caller's, 8 bits.
 *
 * @param src three samples a pixel, 3 bytes; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 1 byte
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, pixels with a fourth sample, 8 bits.
 *
 * @param src four samples a pixel, 4 bytes; samples of 0 to 255; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 1 byte
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                         const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep,
                                                         RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, pixels with a fourth sample, 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of 0 to 65535; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep,
                                                          RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, signed 16 bits.
 *
 * @param src three samples a pixel, 6 bytes; samples of -32768 to 32767
 * @param srcStep bytes from one source row to the next, of which the low bit does not count
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next, of which the low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep,
                                                         RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, pixels with a fourth sample, signed 16 bits.
 *
 * @param src four samples a pixel, 8 bytes; samples of -32768 to 32767; the fourth sample is not used
 * @param srcStep bytes from one source row to the next, of which the low bit does not count
 * @param dst one sample a pixel, 2 bytes
 * @param dstStep bytes from one target row to the next, of which the low bit does not count
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep,
                                                          RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, floats.
 *
 * @param src three samples a pixel, 12 bytes; samples of any value
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep,
                                                         RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, pixels with a fourth sample, floats.
 *
 * @param src four samples a pixel, 16 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep,
                                                          RoiSize roi, const f32 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, doubles.
 *
 * @param src three samples a pixel, 24 bytes; samples of any value
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 8 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_64f_C3C1R(const f64* src, int srcStep, f64* dst, int dstStep,
                                                         RoiSize roi, const f64 coeffs[3]);

/**
 * Colour to gray by weights of the caller's, pixels with a fourth sample, doubles.
 *
 * @param src four samples a pixel, 32 bytes; samples of any value; the fourth sample is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 8 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param coeffs three weights, in the order of the channels; null for 0.299, 0.587 and 0.114
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiColorToGray_64f_AC4C1R(const f64* src, int srcStep, f64* dst, int dstStep,
                                                          RoiSize roi, const f64 coeffs[3]);

/**
 * Gray to RGB, 8 bits: each sample is copied to the three samples of its pixel.
 *
 * @param src one sample a pixel, 1 byte; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 3 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_8u_C1C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);

/**
 * Gray to RGB, the fourth sample set, 8 bits: each sample is copied to the first three samples of its pixel.
 *
 * @param src one sample a pixel, 1 byte; samples of 0 to 255
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 4 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval the fourth sample of each target pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_8u_C1C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                      u8 aval);

/**
 * Gray to RGB, 16 bits: each sample is copied to the three samples of its pixel.
 *
 * @param src one sample a pixel, 2 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 6 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_16u_C1C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi);

/**
 * Gray to RGB, the fourth sample set, 16 bits: each sample is copied to the first three samples of its pixel.
 *
 * @param src one sample a pixel, 2 bytes; samples of 0 to 65535
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 8 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval the fourth sample of each target pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_16u_C1C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                       u16 aval);

/**
 * Gray to RGB, floats: each sample is copied to the three samples of its pixel.
 *
 * @param src one sample a pixel, 4 bytes; samples of any value
 * @param srcStep bytes from one source row to the next
 * @param dst three samples a pixel, 12 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_32f_C1C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi);

/**
 * Gray to RGB, the fourth sample set, floats: each sample is copied to the first three samples of its pixel.
 *
 * @param src one sample a pixel, 4 bytes; samples of any value
 * @param srcStep bytes from one source row to the next
 * @param dst four samples a pixel, 16 bytes
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @param aval the fourth sample of each target pixel
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiGrayToRGB_32f_C1C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                       f32 aval);

/**
 * The luma of packed 4:2:2, 8 bits. The width may be odd, or 1.
 *
 * @param src two samples a pixel, 2 bytes: luma and chroma in turn, luma first; samples of 0 to 255; chroma is not used
 * @param srcStep bytes from one source row to the next
 * @param dst one sample a pixel, 1 byte
 * @param dstStep bytes from one target row to the next
 * @param roi width and height in pixels, each at least 1
 * @return ::pyxOk, ::pyxErrNullPtr or ::pyxErrSize
 */
PYXCC_API PyxStatus PYXCC_CALL pyxiYCbCr422ToGray_8u_C2C1R(const u8* src, int srcStep, u8* dst, int dstStep,
                                                           RoiSize roi);

#ifdef __cplusplus
}
#endif

#endif
