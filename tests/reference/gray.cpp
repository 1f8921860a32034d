#include "reference/gray.hpp"

#include "reference/arguments.hpp"
#include "reference/pixels.hpp"
#include "reference/primitives.hpp"

#include <algorithm>
#include <cmath>
#include <limits>
#include <type_traits>

namespace reference
{

namespace
{

constexpr Triple<f32> standardWeights = {0.299f, 0.587f, 0.114f};

/// Those of the caller, if there are any.
template <typename T> Triple<T> weightsOf(const T* coeffs)
{
    if (coeffs == nullptr) return {standardWeights[0], standardWeights[1], standardWeights[2]};
    return {coeffs[0], coeffs[1], coeffs[2]};
}

/// A weight in 1/32768. What no 32 bits hold becomes the least value that they do.
s32 weight15(f32 c)
{
    const f32 w = std::trunc(std::fma(32768.0f, c, 0.5f));
    return w >= -2147483648.0f && w < 2147483648.0f ? static_cast<s32>(w) : std::numeric_limits<s32>::min();
}

/// The sum in 32 bits, which wrap, and of that a byte, which wraps too.
u8 grayTail(Triple<u8> rgb, Triple<s32> w)
{
    u32 sum = 16384;
    for (int k = 0; k < 3; ++k) sum += static_cast<u32>(w[k]) * rgb[k];
    return low8(static_cast<s32>(sum) >> 15);
}

/// In 16-bit lanes, whose sums saturate. A lane has no negative weights: with such the tail's arithmetic serves.
u8 grayWide(Triple<u8> rgb, Triple<s32> w)
{
    if (std::any_of(w.begin(), w.end(), [](s32 weight) { return weight < 0; })) return grayTail(rgb, w);
    s32 sum = 0;
    for (int k = 0; k < 3; ++k) sum = std::min(sum + mulHighU16(rgb[k] * 256, static_cast<u16>(w[k])), 65535);
    return sat8(std::min(sum + 64, 65535) >> 7);
}

/// The nearest sample, in the rounding mode of the caller. What is no number is taken for the lower bound.
template <typename T> T sampleOf(f32 x)
{
    constexpr f32 low = std::numeric_limits<T>::min();
    constexpr f32 high = std::numeric_limits<T>::max();
    const f32 rounded = std::nearbyint(x);
    return static_cast<T>(rounded > low ? std::min(rounded, high) : low);
}

/// Two of the three products are fused with the sum; the one in the middle is rounded first.
template <typename T> T weighted(Triple<T> rgb, Triple<T> w)
{
    return std::fma(w[2], rgb[2], std::fma(w[0], rgb[0], w[1] * rgb[1]));
}

template <typename T, typename W> T grayOf(Triple<T> rgb, Triple<W> w)
{
    if constexpr (std::is_floating_point_v<T>) {
        return weighted(rgb, w);
    } else {
        // Signed samples are weighted as distances from the lower bound.
        constexpr s32 offset = std::is_signed_v<T> ? 32768 : 0;
        Triple<f32> samples;
        for (int k = 0; k < 3; ++k) samples[k] = static_cast<f32>(rgb[k] + offset);
        return static_cast<T>(sampleOf<u16>(weighted(samples, w)) - offset);
    }
}

/// Of pixels of `count` samples, the fourth of which does not matter.
template <typename T, typename W>
PyxStatus toGray(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, const W* coeffs)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (std::is_same_v<T, s16>) {
        // Steps are counted in samples here, so that odd ones lose a byte.
        srcStep = (srcStep >> 1) * 2;
        dstStep = (dstStep >> 1) * 2;
    }
    const auto source = interleaved(src, srcStep, count);
    const Channel<T> target(dst, dstStep, 1);
    const Triple<W> weights = weightsOf(coeffs);
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const Triple<T> rgb = {source[0].get(row, column), source[1].get(row, column), source[2].get(row, column)};
            if constexpr (std::is_same_v<T, u8>) {
                const Triple<s32> w = {weight15(weights[0]), weight15(weights[1]), weight15(weights[2])};
                target.set(row, column, column < roi.width / 16 * 16 ? grayWide(rgb, w) : grayTail(rgb, w));
            } else {
                target.set(row, column, grayOf(rgb, weights));
            }
        }
    }
    return pyxOk;
}

/// By the weights of the family.
template <typename T> PyxStatus toGray(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi)
{
    const f32* const standard = nullptr;
    return toGray(count, src, srcStep, dst, dstStep, roi, standard);
}

/// Every sample three times.
template <typename T> void spread(const T* src, int srcStep, const Image<T>& target, RoiSize roi)
{
    const Channel<const T> source(src, srcStep, 1);
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            for (int k = 0; k < 3; ++k) target[k].set(row, column, source.get(row, column));
        }
    }
}

template <typename T> PyxStatus fromGray(const T* src, int srcStep, T* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    spread(src, srcStep, interleaved(dst, dstStep, 3), roi);
    return pyxOk;
}

template <typename T> PyxStatus fromGray(const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, T aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 4);
    spread(src, srcStep, target, roi);
    fill(target[3], roi, aval);
    return pyxOk;
}

} // namespace

PyxStatus pyxiColorToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3])
{
    return toGray(4, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3])
{
    return toGray(3, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3])
{
    return toGray(4, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3])
{
    return toGray(3, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                     const f32 coeffs[3])
{
    return toGray(4, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                    const f32 coeffs[3])
{
    return toGray(3, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_64f_AC4C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                     const f64 coeffs[3])
{
    return toGray(4, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_64f_C3C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                    const f64 coeffs[3])
{
    return toGray(3, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32 coeffs[3])
{
    return toGray(4, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiColorToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32 coeffs[3])
{
    return toGray(3, src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus pyxiGrayToRGB_16u_C1C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return fromGray(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiGrayToRGB_16u_C1C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u16 aval)
{
    return fromGray(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus pyxiGrayToRGB_32f_C1C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromGray(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiGrayToRGB_32f_C1C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 aval)
{
    return fromGray(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus pyxiGrayToRGB_8u_C1C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromGray(src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiGrayToRGB_8u_C1C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    return fromGray(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus pyxiRGBToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return toGray(4, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return toGray(3, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return toGray(4, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return toGray(3, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toGray(4, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toGray(3, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toGray(4, src, srcStep, dst, dstStep, roi);
}

PyxStatus pyxiRGBToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toGray(3, src, srcStep, dst, dstStep, roi);
}

// Luma is every other byte, from the first on.
PyxStatus pyxiYCbCr422ToGray_8u_C2C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const Channel<const u8> source(src, srcStep, 2);
    const Channel<u8> target(dst, dstStep, 1);
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) target.set(row, column, source.get(row, column));
    }
    return pyxOk;
}

} // namespace reference
