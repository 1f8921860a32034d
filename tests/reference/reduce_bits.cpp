#include "reference/reduce_bits.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/error_rows.hpp"
#include "reference/image.hpp"
#include "reference/noise.hpp"

#include <algorithm>
#include <cmath>
#include <limits>
#include <type_traits>

namespace reference
{

namespace
{

/// How many samples of a pixel are converted, and how many it has.
struct Layout {
    int channels, stride;
};

constexpr Layout c1Layout = {1, 1}, c3Layout = {3, 3}, ac4Layout = {3, 4}, c4Layout = {4, 4};

struct Parameters {
    u32 noise, method;
    s32 levels;
};

/// What the levels of a depth come to, at the scale of its working values.
struct Levels {
    f32 count; ///< of the steps between levels
    f32 step, inverse;
    f32 top, low;
    f32 unit; ///< brings a working value to 0 .. 1
};

template <typename S> Levels levelsOf(s32 levels)
{
    const f32 s = static_cast<f32>(levels - 1);
    if constexpr (std::is_same_v<S, u8>) {
        return {s, (65280.0f / s) * 0.00390625f, s / 255.0f, 255.0f, 0.0f, 0.003921569f};
    } else if constexpr (std::is_same_v<S, f32>) {
        return {s, 1.0f / s, s, 1.0f, 1.1920929e-7f, 1.0f};
    } else {
        return {s, 65535.0f / s, s / 65535.0f, 65535.0f, 0.0f, 1.5259022e-5f};
    }
}

template <typename S> f32 workingValue(S x)
{
    if constexpr (std::is_same_v<S, s16>) return static_cast<f32>(x + 32768);
    return static_cast<f32>(x);
}

template <typename D> constexpr s32 topOf = std::is_same_v<D, u8> ? 255 : 65535;

/// A level of 0 .. top as a sample.
template <typename D> D sampleOf(s32 level) { return static_cast<D>(std::is_same_v<D, s16> ? level - 32768 : level); }

/// Held to the range of the target's samples at the end. What is taken off before wraps, as all of 32 bits do.
template <typename D> D heldSampleOf(s32 level)
{
    const u32 less = std::is_same_v<D, s16> ? 32768 : 0;
    const s32 sample = static_cast<s32>(static_cast<u32>(level) - less);
    return static_cast<D>(std::clamp<s32>(sample, std::numeric_limits<D>::min(), std::numeric_limits<D>::max()));
}

/// A quantised value as a level of the target. The half that rounds is left out but in the first diffusion, and there
/// too in most depths.
template <typename S, typename D> s32 levelOf(f32 v, u32 method)
{
    constexpr f32 scale = topOf<D>;
    const bool halfAdded = method == 1;
    if constexpr (std::is_same_v<S, f32>) {
        return truncated(halfAdded ? std::fma(v, scale, 0.5f) : v * scale);
    } else if constexpr (std::is_same_v<S, D>) {
        return truncated(v);
    } else {
        return truncated(std::is_same_v<S, s16> && halfAdded ? v + 0.5f : v) >> 8;
    }
}

/// The image sample by sample of each channel.
template <typename S, typename D> struct Images {
    Image<const S> src;
    Image<D> dst;
    RoiSize roi;
    Layout layout;
};

// The samples of a row are counted through in runs of eight, those of pixels with alpha two pixels at a time.
template <typename S, typename D> void toNearest(const Images<S, D>& images, const Levels& levels)
{
    const auto [src, dst, roi, layout] = images;
    const f32 iv = 1.0f / levels.count, half = 0.5f / levels.count;
    constexpr f32 scale = topOf<D>;
    const bool hasAlpha = layout.channels != layout.stride;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            for (int k = 0; k < layout.channels; ++k) {
                const bool inBody = hasAlpha ? column < (roi.width & ~1)
                                             : column * layout.channels + k < ((roi.width * layout.channels) & ~7);
                const f32 p = workingValue(src[k].get(row, column));
                const f32 u = levels.unit * p;
                const f32 q = static_cast<f32>(truncated(u * levels.count));
                const f32 pr = iv * q;
                const f32 r = std::fma(p, levels.unit, -pr);
                const f32 up = half < r ? iv : 0.0f;
                const f32 value = inBody ? std::fma(q, iv, up) : pr + up;
                dst[k].set(row, column, heldSampleOf<D>(truncated(value * scale)));
            }
        }
    }
}

// Depths that come from signed words to bytes and from floats add up in another order, and fused.
template <typename S, typename D> f32 diffusedToFour(f32 p, ErrorRows<f32>& rows, int x)
{
    ErrorRow<f32>& current = rows[0];
    ErrorRow<f32>& above = rows[1];
    if constexpr (std::is_same_v<S, f32> || (std::is_same_v<S, s16> && std::is_same_v<D, u8>)) {
        const f32 a = std::fma(7.0f, current[x - 1], above[x - 1]);
        const f32 b = std::fma(5.0f, above[x], a);
        const f32 c = std::fma(3.0f, 0.0625f * above[x + 1], p);
        return std::fma(0.0625f, b, c);
    } else {
        const f32 a = above[x + 1] * 3.0f + above[x - 1];
        const f32 b = a + above[x] * 5.0f;
        return p + (b + current[x - 1] * 7.0f) * 0.0625f;
    }
}

/// The weights of the columns from two before to two after, in the row of the pixel, the one above it and the one above
/// that.
struct Kernel {
    f32 current[4], above[5], second[5];
    f32 unit;
};

constexpr Kernel kernel48 = {{5, 7, 0, 0}, {3, 5, 7, 5, 3}, {1, 3, 5, 3, 1}, 0.020833334f};
constexpr Kernel kernel42 = {{4, 8, 0, 0}, {2, 4, 8, 4, 2}, {1, 2, 4, 2, 1}, 0.023809524f};

f32 diffusedToTwelve(const Kernel& kernel, f32 p, ErrorRows<f32>& rows, int x)
{
    f32 lanes[4];
    for (int k = 0; k < 4; ++k) {
        const int column = x - 2 + k;
        const f32 above = std::fma(kernel.second[k], rows[2][column], kernel.above[k] * rows[1][column]);
        lanes[k] = k < 2 ? std::fma(kernel.current[k], rows[0][column], above) : above;
    }
    f32 sum = (lanes[0] + lanes[2]) + (lanes[1] + lanes[3]);
    sum = sum + rows[2][x + 2] + rows[1][x + 2] * kernel.above[4];
    return p + sum * kernel.unit;
}

// Channel by channel. What the last rows of a channel leave is there for the first rows of the next.
template <typename S, typename D>
void diffuse(const Images<S, D>& images, const Levels& levels, const Parameters& parameters)
{
    const auto [src, dst, roi, layout] = images;
    const int percent = static_cast<int>(parameters.noise);
    const Noise noise(
        {static_cast<f32>(50 - percent) * levels.step / 100.0f, static_cast<f32>(percent + 50) * levels.step / 100.0f});
    auto rows = errorRows<f32>(roi.width);
    for (int k = 0; k < layout.channels; ++k) {
        for (int y = 0; y < roi.height; ++y) {
            for (int x = 0; x < roi.width; ++x) {
                const f32 p = workingValue(src[k].get(y, x));
                const f32 v = parameters.method == 1   ? diffusedToFour<S, D>(p, rows, x)
                              : parameters.method == 2 ? diffusedToTwelve(kernel48, p, rows, x)
                                                       : diffusedToTwelve(kernel42, p, rows, x);
                s32 level = 0;
                f32 error = 0.0f;
                if (v >= levels.top) {
                    level = topOf<D>;
                } else if (!(v < levels.low)) {
                    const f32 q = static_cast<f32>(truncated(v * levels.inverse)) * levels.step;
                    const f32 threshold = parameters.noise == 0 ? levels.step * 0.5f : noise.at(x, y);
                    const f32 value = v - q > threshold ? q + levels.step : q;
                    error = v - value;
                    level = levelOf<S, D>(value, parameters.method);
                }
                rows[0][x] = error;
                dst[k].set(y, x, sampleOf<D>(level));
            }
            std::rotate(rows.begin(), rows.end() - 1, rows.end());
        }
    }
}

/// Fifteenths.
constexpr f32 matrix[4][4] = {
    {0.0f, 0.533333333f, 0.133333333f, 0.6666667f},
    {0.8f, 0.26666667f, 0.93333333f, 0.4f},
    {0.2f, 0.73333333f, 0.06666667f, 0.6f},
    {1.0f, 0.46666667f, 0.8666667f, 0.33333333f},
};

// The pixels of a row in runs of eight.
template <typename S, typename D>
void order(const Images<S, D>& images, const Levels& levels, const Parameters& parameters)
{
    const auto [src, dst, roi, layout] = images;
    const int percent = static_cast<int>(parameters.noise);
    const Noise noise({static_cast<f32>(-percent) / 100.0f, static_cast<f32>(percent) / 100.0f});
    for (int y = 0; y < roi.height; ++y) {
        for (int x = 0; x < roi.width; ++x) {
            const f32 entry = matrix[y & 3][x & 3];
            const f32 threshold = levels.step * (parameters.noise == 0 ? entry : entry + noise.at(x, y));
            for (int k = 0; k < layout.channels; ++k) {
                const f32 p = workingValue(src[k].get(y, x));
                s32 level = 0;
                if (std::is_same_v<S, f32> && p >= levels.top) {
                    level = topOf<D>;
                } else if (!std::is_same_v<S, f32> || !(p < levels.low)) {
                    const f32 q = static_cast<f32>(truncated(p * levels.inverse));
                    const f32 pr = q * levels.step;
                    const bool inBody = x < (roi.width & ~7);
                    const f32 r = inBody ? std::fma(-q, levels.step, p) : p - pr;
                    const f32 up = threshold < r ? levels.step : 0.0f;
                    const f32 value = inBody ? std::fma(q, levels.step, up) : pr + up;
                    level = std::clamp(levelOf<S, D>(value, 4), 0, topOf<D>);
                }
                dst[k].set(y, x, sampleOf<D>(level));
            }
        }
    }
}

// A method that is not known is no error, and does nothing.
template <typename S, typename D>
PyxStatus reduceBits(const S* src, int srcStep, D* dst, int dstStep, RoiSize roi, Layout layout,
                     const Parameters& parameters)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (parameters.noise > 100) return pyxErrNoise;
    if (parameters.levels < 2 || parameters.levels > topOf<D> + 1) return pyxErrLevels;

    const Images<S, D> images = {interleaved(src, srcStep, layout.stride), interleaved(dst, dstStep, layout.stride),
                                 roi, layout};
    const Levels levels = levelsOf<S>(parameters.levels);
    switch (parameters.method) {
    case 0:
        toNearest(images, levels);
        break;
    case 1:
    case 2:
    case 3:
        diffuse(images, levels, parameters);
        break;
    case 4:
        order(images, levels, parameters);
        break;
    default:
        break;
    }
    return pyxOk;
}

} // namespace

PyxStatus pyxiReduceBits_16s8u_AC4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s8u_C1R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s8u_C3R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s8u_C4R(const s16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                  u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s_C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16s_C4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u8u_AC4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u8u_C1R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u8u_C4R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                  u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u_C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_16u_C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16s_AC4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                     u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16s_C1R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16s_C3R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16s_C4R(const f32* src, int srcStep, s16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16u_AC4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                     u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16u_C1R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16u_C3R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f16u_C4R(const f32* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f8u_AC4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                    u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f8u_C3R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_32f8u_C4R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                   u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                 u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, ac4Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_8u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c1Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c3Layout, {noise, ditherType, levels});
}

PyxStatus pyxiReduceBits_8u_C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u32 noise,
                                u32 ditherType, s32 levels)
{
    return reduceBits(src, srcStep, dst, dstStep, roi, c4Layout, {noise, ditherType, levels});
}

} // namespace reference
