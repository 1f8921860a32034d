#include "reference/xyz_ycc.hpp"

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

// Bytes, in whole numbers.

Triple<u8> xyzOfBytes(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return {
        low8((27030 * r + 23434 * g + 11824 * b) >> 16),
        low8((13937 * r + 46868 * g + 4729 * b) >> 16),
        sat8((1267 * r + 7811 * g + 62274 * b) >> 16),
    };
}

Triple<u8> bytesOfXyz(Triple<u8> xyz)
{
    const auto [x, y, z] = xyz;
    return {
        sat8((212368 * x - 100738 * y - 32671 * z) >> 16),
        sat8((-63521 * x + 122944 * y + 2723 * z) >> 16),
        sat8((3646 * x - 13372 * y + 69291 * z) >> 16),
    };
}

// Chroma zero is at 156 and 137, of which the byte is that of -100 and -119.
Triple<u8> yccOfBytes(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    const s32 s = 4898 * r + 9617 * g + 1867 * b;
    return {
        low8((s >> 10) * 2921 >> 16),
        low8((((b * 16384 - s) >> 10) * 1789 >> 16) - 100),
        low8((((r * 16384 - s) >> 10) * 2178 >> 16) - 119),
    };
}

Triple<u8> bytesOfYcc(Triple<u8> ycc)
{
    const s32 y = 5564 * ycc[0], a = 9084 * ycc[1] - 1417104, b = 7460 * ycc[2] - 1022020;
    return {
        sat8((y + b) >> 12),
        sat8((16 * y - 794 * (a >> 8) - 2084 * (b >> 8)) >> 16),
        sat8((y + a) >> 12),
    };
}

// Floats. A sum of three takes its first term as it is and the others fused; a sum of two is not fused.

/// a0 x0 + a1 x1 + a2 x2
f32 sum(f32 a0, f32 x0, f32 a1, f32 x1, f32 a2, f32 x2)
{
    const f32 first = a0 * x0;
    return std::fma(a2, x2, std::fma(a1, x1, first));
}

Triple<f32> xyzOf(Triple<f32> rgb)
{
    const auto [r, g, b] = rgb;
    return {
        sum(0.412453f, r, 0.35758f, g, 0.180423f, b),
        sum(0.212671f, r, 0.71516f, g, 0.072169f, b),
        sum(0.019334f, r, 0.119193f, g, 0.950227f, b),
    };
}

Triple<f32> rgbOfXyz(Triple<f32> xyz)
{
    const auto [x, y, z] = xyz;
    return {
        sum(3.240479f, x, -1.53715f, y, -0.498535f, z),
        sum(-0.969256f, x, 1.875991f, y, 0.041556f, z),
        sum(0.055648f, x, -0.204043f, y, 1.057311f, z),
    };
}

/// Where chroma is zero, in units of the samples.
struct ChromaZero {
    f32 c1, c2;
};

constexpr ChromaZero zeroOfOne = {0.6117647f, 0.5372549f};
constexpr ChromaZero zeroOfWords = {40092, 35209};

Triple<f32> yccOf(Triple<f32> rgb, ChromaZero zero)
{
    const auto [r, g, b] = rgb;
    const f32 s = sum(0.299f, r, 0.587f, g, 0.114f, b);
    const f32 blue = 0.4368627f * (b - s);
    const f32 red = 0.53192f * (r - s);
    return {0.7132668f * s, blue + zero.c1, red + zero.c2};
}

Triple<f32> rgbOfYcc(Triple<f32> ycc, ChromaZero zero)
{
    const f32 y = 1.3584f * ycc[0];
    const f32 c1 = 2.2179f * (ycc[1] - zero.c1);
    const f32 c2 = 1.8215f * (ycc[2] - zero.c2);
    return {y + c2, std::fma(-0.509f, c2, std::fma(-0.194f, c1, y)), y + c1};
}

/// What is no number is taken for 0.
f32 clamped(f32 x) { return x > 0 ? std::min(x, 1.0f) : 0.0f; }

Triple<f32> clampedAll(Triple<f32> x) { return {clamped(x[0]), clamped(x[1]), clamped(x[2])}; }

// Floats in 0..1. Of XYZ the last alone is clamped, of YCC none.

Triple<f32> xyzOfFloats(Triple<f32> rgb)
{
    const auto [x, y, z] = xyzOf(rgb);
    return {x, y, clamped(z)};
}

Triple<f32> floatsOfXyz(Triple<f32> xyz) { return clampedAll(rgbOfXyz(xyz)); }

Triple<f32> yccOfFloats(Triple<f32> rgb) { return yccOf(rgb, zeroOfOne); }

Triple<f32> floatsOfYcc(Triple<f32> ycc) { return clampedAll(rgbOfYcc(ycc, zeroOfOne)); }

// Words go through the floats, with the nearest word for a result in the rounding mode of the caller. Signed words are
// taken as distances from their lower bound.

template <typename T> T wordOf(f32 x)
{
    constexpr s32 offset = std::is_signed_v<T> ? 32768 : 0;
    return static_cast<T>(static_cast<s32>(std::clamp(std::nearbyint(x), 0.0f, 65535.0f)) - offset);
}

template <typename T, typename Form> Triple<T> throughFloats(Triple<T> words, Form form)
{
    constexpr s32 offset = std::is_signed_v<T> ? 32768 : 0;
    Triple<f32> samples;
    for (int k = 0; k < 3; ++k) samples[k] = static_cast<f32>(words[k] + offset);
    const Triple<f32> out = form(samples);
    return {wordOf<T>(out[0]), wordOf<T>(out[1]), wordOf<T>(out[2])};
}

template <typename T> Triple<T> xyzOfWords(Triple<T> rgb) { return throughFloats(rgb, xyzOf); }

template <typename T> Triple<T> wordsOfXyz(Triple<T> xyz) { return throughFloats(xyz, rgbOfXyz); }

template <typename T> Triple<T> yccOfWords(Triple<T> rgb)
{
    return throughFloats(rgb, [](Triple<f32> samples) { return yccOf(samples, zeroOfWords); });
}

template <typename T> Triple<T> wordsOfYcc(Triple<T> ycc)
{
    return throughFloats(ycc, [](Triple<f32> samples) { return rgbOfYcc(samples, zeroOfWords); });
}

/// Pixels of `count` samples, the fourth of which takes no part.
template <typename T, typename Form>
PyxStatus convertPixels(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, Form form)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, count), interleaved(dst, dstStep, count), roi, form);
    return pyxOk;
}

} // namespace

PyxStatus pyxiRGBToXYZ_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, xyzOfWords<s16>);
}

PyxStatus pyxiRGBToXYZ_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, xyzOfWords<s16>);
}

PyxStatus pyxiRGBToXYZ_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, xyzOfWords<u16>);
}

PyxStatus pyxiRGBToXYZ_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, xyzOfWords<u16>);
}

PyxStatus pyxiRGBToXYZ_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, xyzOfFloats);
}

PyxStatus pyxiRGBToXYZ_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, xyzOfFloats);
}

PyxStatus pyxiRGBToXYZ_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, xyzOfBytes);
}

PyxStatus pyxiRGBToXYZ_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, xyzOfBytes);
}

PyxStatus pyxiRGBToYCC_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, yccOfWords<s16>);
}

PyxStatus pyxiRGBToYCC_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, yccOfWords<s16>);
}

PyxStatus pyxiRGBToYCC_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, yccOfWords<u16>);
}

PyxStatus pyxiRGBToYCC_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, yccOfWords<u16>);
}

PyxStatus pyxiRGBToYCC_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, yccOfFloats);
}

PyxStatus pyxiRGBToYCC_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, yccOfFloats);
}

PyxStatus pyxiRGBToYCC_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, yccOfBytes);
}

PyxStatus pyxiRGBToYCC_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, yccOfBytes);
}

PyxStatus pyxiXYZToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, wordsOfXyz<s16>);
}

PyxStatus pyxiXYZToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, wordsOfXyz<s16>);
}

PyxStatus pyxiXYZToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, wordsOfXyz<u16>);
}

PyxStatus pyxiXYZToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, wordsOfXyz<u16>);
}

PyxStatus pyxiXYZToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, floatsOfXyz);
}

PyxStatus pyxiXYZToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, floatsOfXyz);
}

PyxStatus pyxiXYZToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, bytesOfXyz);
}

PyxStatus pyxiXYZToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, bytesOfXyz);
}

PyxStatus pyxiYCCToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, wordsOfYcc<s16>);
}

PyxStatus pyxiYCCToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, wordsOfYcc<s16>);
}

PyxStatus pyxiYCCToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, wordsOfYcc<u16>);
}

PyxStatus pyxiYCCToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, wordsOfYcc<u16>);
}

PyxStatus pyxiYCCToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, floatsOfYcc);
}

PyxStatus pyxiYCCToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, floatsOfYcc);
}

PyxStatus pyxiYCCToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, bytesOfYcc);
}

PyxStatus pyxiYCCToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, bytesOfYcc);
}

} // namespace reference
