#include "reference/luv_forms.hpp"

#include "reference/conversions.hpp"
#include "reference/cube_root_table.hpp"
#include "reference/primitives.hpp"
#include "reference/reciprocal.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// u' and v' of white.
constexpr f32 un = 0.197839f, vn = 0.468342f;

template <typename T> Triple<f32> floatsOf(Triple<T> in)
{
    return {static_cast<f32>(in[0]), static_cast<f32>(in[1]), static_cast<f32>(in[2])};
}

u16 satU16(s32 x) { return static_cast<u16>(std::clamp(x, 0, 65535)); }

// Signed samples are those of 16 bits moved down by the half of their range.
Triple<u16> moved(Triple<s16> in)
{
    return {static_cast<u16>(in[0] + 32768), static_cast<u16>(in[1] + 32768), static_cast<u16>(in[2] + 32768)};
}
Triple<s16> moved(Triple<u16> in)
{
    return {static_cast<s16>(in[0] - 32768), static_cast<s16>(in[1] - 32768), static_cast<s16>(in[2] - 32768)};
}

constexpr LastTerms lastTerms = {0.01900117f, 0.015834307f};

/// X + 15 Y + 3 Z.
f32 weightedSum(Triple<f32> xyz) { return std::fma(xyz[1], 15.0f, std::fma(3.0f, xyz[2], xyz[0])); }

/// After the blocks: the root by as many terms of the series, and all in plain steps.
f32 plainLightness(f32 y, CubeRootRow row, int terms)
{
    const f32 t = (y - (row.root * row.root) * row.root) * row.inverse;
    const f32 factors[8] = {c1, c2, c3, c4, c5, c6, lastTerms.c7, lastTerms.c8};
    f32 sum = 1.0f, power = t;
    for (int k = 0; k < terms; ++k) {
        const f32 term = factors[k] * power;
        sum = k % 2 == 0 ? sum + term : sum - term;
        power = t * power;
    }
    return (sum * row.root) * 116.0f - 16.0f;
}

/// After the blocks: u* and v*. Where Z is 0 the fractions are taken for 0.
Triple<f32> plainLuv(f32 lightness, Triple<f32> xyz, f32 sum)
{
    f32 up = 0.0f, vp = 0.0f;
    if (xyz[2] != 0.0f) {
        const f32 x = rcp(sum);
        const f32 w = (x + x) - ((sum * x) * x);
        up = (xyz[0] * 4.0f) * w;
        vp = (xyz[1] * 9.0f) * w;
    }
    return {lightness, (up - un) * (lightness * 13.0f), (vp - vn) * (lightness * 13.0f)};
}

Triple<f32> toLuv32f(Triple<f32> rgb, f32 indexScale, Span span)
{
    const Triple<f32> xyz = xyzOf(rgb, span);
    const auto [x, y, z] = xyz;
    if (span == Span::tail) {
        const CubeRootRow row = rowAt(luvCubeRootTable(), truncated(y * 128.0f));
        const f32 lightness = linearLimit >= y ? y * 903.3f : plainLightness(y, row, 8);
        const f32 sum = std::fma(z, 3.0f, std::fma(y, 15.0f, x));
        return plainLuv(lightness, xyz, sum);
    }
    const CubeRootRow row = rowAt(luvCubeRootTable(), truncated(y * indexScale));
    const f32 root = cubeRootOf8Terms(excessOf(y, row), row.root, lastTerms);
    const f32 lightness = y <= linearLimit ? y * 903.3f : std::fma(116.0f, root, -16.0f);
    f32 sum = weightedSum(xyz);
    if (sum == 0.0f) sum = sum + 3.0f;
    const f32 e = refined(rcp(sum), sum);
    const f32 up = std::fma(e, x * 4.0f, -un);
    const f32 vp = std::fma(y * 9.0f, e, -vn);
    return {lightness, up * (lightness * 13.0f), (lightness * 13.0f) * vp};
}

/// Of the raw samples, in floats.
Triple<f32> toLuv16(Triple<u16> rgb, Span span)
{
    constexpr f32 unit = 1.5259022e-5f;
    const Triple<f32> xyz = xyzOf(floatsOf(rgb), span);
    const auto [x, y, z] = xyz;
    const bool linear = y <= 580.378f;
    const CubeRootRow row = rowAt(luvCubeRootTable(), truncated(y) >> 9);
    if (span == Span::tail) {
        const f32 lightness = linear ? (y * unit) * 903.3f : plainLightness(y * unit, row, 6);
        return plainLuv(lightness, xyz, z * 3.0f + (y * 15.0f + x));
    }
    const f32 t = excessOf(y * unit, row);
    const f32 t2 = t * t, t3 = t * t2, t4 = t * t3, t5 = t * t4, t6 = t * t5;
    const f32 odd = std::fma(c1, t, std::fma(c3, t3, c5 * t5));
    const f32 even = std::fma(c2, t2, std::fma(c4, t4, std::fma(c6, t6, -1.0f)));
    const f32 root = (odd - even) * row.root;
    const f32 lightness = linear ? (y * unit) * 903.3f : 116.0f * root - 16.0f;
    f32 sum = weightedSum(xyz);
    if (sum == 0.0f) sum = sum + 3.0f;
    const f32 e = refined(rcp(sum), sum);
    const f32 up = std::fma(e, x * 4.0f, -un);
    const f32 vp = std::fma(y * 9.0f, e, -vn);
    return {lightness, up * (lightness * 13.0f), (lightness * 13.0f) * vp};
}

/// L*, u* and v* at the scale of 16 bits.
Triple<f32> scaled16(Triple<f32> luv)
{
    return {luv[0] * 655.35f, (luv[1] + 134.0f) * 185.12712f, (luv[2] + 140.0f) * 250.13359f};
}

Triple<u16> nearest16(Triple<f32> scaled)
{
    return {satU16(nearest(scaled[0])), satU16(nearest(scaled[1])), satU16(nearest(scaled[2]))};
}

} // namespace

Triple<f32> toLuv32fC3(Triple<f32> rgb, Span span) { return toLuv32f(rgb, 127.998046875f, span); }

Triple<f32> toLuv32fAC4(Triple<f32> rgb, Span span) { return toLuv32f(rgb, 128.0f, span); }

// The steps are the same after the blocks.
Triple<u8> toLuv8uC3(Triple<u8> rgb, Span)
{
    constexpr f32 unit = 0.003921569f;
    const Triple<f32> xyz = xyzOf({rgb[0] * unit, rgb[1] * unit, rgb[2] * unit}, Span::body);
    const auto [x, y, z] = xyz;
    const CubeRootRow row = rowAt(cubeRootTable(), truncated(y * 127.998046875f));
    const f32 root = cubeRootOf4Terms(excessOf(y, row), row.root);
    const f32 lightness = y <= linearLimit ? y * 903.3f : std::fma(116.0f, root, -16.0f);
    f32 sum = weightedSum(xyz);
    if (sum <= 0.0f) sum = sum + 3.0f;
    const f32 e = refined(rcp(sum), sum);
    const f32 p = std::fma(x * 4.0f, e, -un);
    const f32 q = std::fma(e, y * 9.0f, -vn);
    return {
        sat8(nearest(lightness * 2.55f)),
        sat8(nearest(std::fma(p, lightness * 13.0f, 134.0f) * 0.720339f)),
        sat8(nearest(std::fma(lightness * 13.0f, q, 140.0f) * 0.9732825f)),
    };
}

// By the power and true divisions.
Triple<u8> toLuv8uAC4(Triple<u8> rgb, Span)
{
    const Triple<f32> raw = xyzOf(floatsOf(rgb), Span::body);
    const f32 x = raw[0] / 255.0f, y = raw[1] / 255.0f;
    const f32 root = static_cast<f32>(std::pow(f64{y}, 0.3333333432674408));
    const f32 lightness = y > linearLimit ? std::fma(root, 116.0f, -16.0f) : y * 903.3f;
    f32 up = 0.0f, vp = 0.0f;
    if (y != 0.0f) {
        const f32 z = raw[2] / 255.0f;
        const f32 sum = std::fma(y, 15.0f, std::fma(z, 3.0f, x));
        up = (x * 4.0f) / sum;
        vp = (y * 9.0f) / sum;
    }
    const f32 w = lightness * 13.0f;
    const f32 u = std::fma(up - un, w, 134.0f), v = std::fma(vp - vn, w, 140.0f);
    return {
        low8(truncated((255.0f * lightness) / 100.0f)),
        low8(truncated(0.5f + (255.0f * u) / 354.0f)),
        low8(truncated(0.5f + (v * 255.0f) / 262.0f)),
    };
}

Triple<u16> toLuv16uC3(Triple<u16> rgb, Span span) { return nearest16(scaled16(toLuv16(rgb, span))); }

Triple<u16> toLuv16uAC4(Triple<u16> rgb, Span span)
{
    const Triple<f32> scaled = scaled16(toLuv16(rgb, span));
    if (span == Span::body) return nearest16(scaled);
    return {
        satU16(truncated(scaled[0])),
        satU16(truncated(scaled[1] + 0.5f)),
        satU16(truncated(scaled[2] + 0.5f)),
    };
}

Triple<s16> toLuv16sC3(Triple<s16> rgb, Span span) { return moved(nearest16(scaled16(toLuv16(moved(rgb), span)))); }

// Unlike those without a sign, the pixels after the blocks are rounded to nearest too.
Triple<s16> toLuv16sAC4(Triple<s16> rgb, Span span) { return moved(nearest16(scaled16(toLuv16(moved(rgb), span)))); }

namespace
{

constexpr f32 blackLimit = 9e-5f;      ///< the lightness below which there is nothing but black
constexpr f32 cubicLimit = 7.9996247f; ///< the lightness from which Y is a cube
constexpr f32 lift = 9e-5f;            ///< of a v' that is next to 0

f32 cubed(f32 f) { return (f * f) * f; }

Triple<f32> rgbOf(f32 x, f32 y, f32 z)
{
    return {
        std::fma(z, -0.498535f, std::fma(x, 3.240479f, y * -1.53715f)),
        std::fma(z, 0.041556f, std::fma(x, -0.969256f, y * 1.875991f)),
        std::fma(z, 1.057311f, std::fma(x, 0.055648f, y * -0.204043f)),
    };
}

f32 unitClamped(f32 v)
{
    if (0.0f > v) return 0.0f;
    return 1.0f < v ? 1.0f : v;
}

/// After the blocks: X, Y and Z at the scale of white.
struct Xyz {
    f32 x, y, z;
};

Xyz plainXyz(f32 lightness, f32 u, f32 v, f32 un, f32 vn, f32 epsilon, f32 white)
{
    const f32 y = (lightness >= cubicLimit ? cubed((lightness + 16.0f) / 116.0f) : lightness / 903.3f) * white;
    const f32 q = lightness * 13.0f;
    const f32 vv = v / q + vn;
    const f32 uu = u / q + un;
    const f32 d = epsilon > std::fabs(vv) ? y / (vv + lift) : y / vv;
    const f32 x = (uu * 2.25f) * d;
    const f32 z = std::fma(3.0f, d, -std::fma(y, 5.0f, x / 3.0f));
    return {x, y, z};
}

/// After the blocks, of integers: samples of 0 .. white. Blue is put together in double precision.
Triple<s32> plainSamples(Triple<f32> in, f32 white)
{
    const f32 lightness = (100.0f * in[0]) / white;
    if (lightness < blackLimit) return {0, 0, 0};
    const f32 u = (in[1] * 354.0f) / white - 134.0f;
    const f32 v = (in[2] * 262.0f) / white - 140.0f;
    const auto [x, y, z] = plainXyz(lightness, u, v, 0.19783941f, 0.4683422f, 1.1920929e-5f, white);
    const f32 r = std::fma(-z, 0.498535f, std::fma(x, 3.240479f, 0.5f - y * 1.53715f));
    const f32 g = std::fma(z, 0.041556f, std::fma(y, 1.875991f, 0.5f + x * -0.969256f));
    const f64 b = std::fma(f64{z}, 1.057311, f64{std::fma(x, 0.055648f, -(y * 0.204043f))}) + 0.5;
    const s32 top = static_cast<s32>(white);
    const auto bounded = [top](s32 sample) { return std::clamp(sample, 0, top); };
    return {bounded(truncated(r)), bounded(truncated(g)), bounded(truncated(b))};
}

/// In the blocks: X, Y and Z by refined reciprocals. `f` is what Y is the cube of.
Xyz refinedXyz(f32 lightness, f32 f, f32 u, f32 v)
{
    const f32 y = lightness >= cubicLimit ? cubed(f) : lightness * 0.001107052f;
    const f32 q = lightness * 13.0f;
    const f32 rq = refined(rcp(q), q);
    const f32 uu = std::fma(rq, u, un);
    f32 vv = std::fma(rq, v, vn);
    if (std::fabs(vv) <= 1.1920929e-5f) vv = vv + lift;
    const f32 x = rcp(vv);
    const f32 e = std::fma(x, vv, -1.0f);
    const f32 d = std::fma(-x, e, x) * y;
    const f32 w = std::fma(x, std::fma(3.0f, e, -3.0f), 5.0f);
    const f32 bigX = (d * 2.25f) * uu;
    return {bigX, y, std::fma(-bigX, 0.33333334f, -(w * y))};
}

/// In the blocks of 16-bit samples.
Triple<u16> refinedSamples16(Triple<f32> in)
{
    const f32 lightness = in[0] * 0.0015259022f;
    if (lightness < blackLimit) return {0, 0, 0};
    const f32 f = std::fma(in[0], 0.0015259022f, 16.0f) * 0.00862069f;
    const auto [x, y, z] = refinedXyz(lightness, f, in[1] * 0.0054016938f - 134.0f, in[2] * 0.0039978637f - 140.0f);
    const Triple<f32> rgb = rgbOf(x, y, z);
    const auto sample = [](f32 c) { return satU16(truncated(c * 65535.0f)); };
    return {sample(rgb[0]), sample(rgb[1]), sample(rgb[2])};
}

/// L*, u* and v* of bytes in the blocks, and what Y is the cube of.
struct ByteLuv {
    f32 lightness, f, u, v;
};

ByteLuv luvOfBytes(Triple<u8> in)
{
    const auto [l, u, v] = floatsOf(in);
    return {
        l * 0.39215687f,
        std::fma(0.39215687f, l, 16.0f) * 0.00862069f,
        std::fma(1.3882353f, u, -134.0f),
        std::fma(v, 1.027451f, -140.0f),
    };
}

/// In the blocks of bytes: R, G and B at the scale of bytes.
Triple<f32> rgbOfBytes(Triple<u8> luv, f32 (*reciprocal)(f32))
{
    const auto [lightness, f, u, v] = luvOfBytes(luv);
    if (lightness < blackLimit) return {0.0f, 0.0f, 0.0f};
    const f32 rq = reciprocal(lightness * 13.0f);
    const f32 uu = std::fma(rq, u, un);
    f32 vv = std::fma(v, rq, vn);
    const f32 y = lightness < cubicLimit ? lightness * 0.001107052f : cubed(f);
    if (std::fabs(vv) <= 1.1920929e-5f) vv = vv + lift;
    const f32 x = reciprocal(vv);
    const f32 w = std::fma(3.0f, x, -5.0f);
    const f32 bigX = uu * ((x * y) * 2.25f);
    const f32 z = std::fma(-bigX, 0.33333334f, w * y);
    const auto [r, g, b] = rgbOf(bigX, y, z);
    return {r * 255.0f, g * 255.0f, b * 255.0f};
}

Triple<u8> plainBytes(Triple<u8> in)
{
    const Triple<s32> rgb = plainSamples(floatsOf(in), 255.0f);
    return {sat8(rgb[0]), sat8(rgb[1]), sat8(rgb[2])};
}

} // namespace

Triple<f32> fromLuv32fAC4(Triple<f32> luv, Span)
{
    if (luv[0] < blackLimit) return {0.0f, 0.0f, 0.0f};
    const auto [x, y, z] = plainXyz(luv[0], luv[1], luv[2], un, vn, 1.1920929e-7f, 1.0f);
    return {
        unitClamped(std::fma(-z, 0.498535f, std::fma(x, 3.240479f, -(y * 1.53715f)))),
        unitClamped(std::fma(z, 0.041556f, std::fma(y, 1.875991f, x * -0.969256f))),
        unitClamped(std::fma(z, 1.057311f, std::fma(x, 0.055648f, -(y * 0.204043f)))),
    };
}

Triple<f32> fromLuv32fC3(Triple<f32> luv, Span span)
{
    if (span == Span::tail) return fromLuv32fAC4(luv, span);
    if (luv[0] < blackLimit) return {0.0f, 0.0f, 0.0f};
    const auto [x, y, z] = refinedXyz(luv[0], (luv[0] + 16.0f) * 0.00862069f, luv[1], luv[2]);
    const Triple<f32> rgb = rgbOf(x, y, z);
    return {unitClamped(rgb[0]), unitClamped(rgb[1]), unitClamped(rgb[2])};
}

// In the blocks the reciprocals are taken as they come.
Triple<u8> fromLuv8uC3(Triple<u8> luv, Span span)
{
    if (span == Span::tail) return plainBytes(luv);
    const auto [r, g, b] = rgbOfBytes(luv, rcp);
    return {sat8(nearest(r)), sat8(nearest(g)), sat8(nearest(b))};
}

Triple<u8> fromLuv8uAC4(Triple<u8> luv, Span span)
{
    if (span == Span::tail) return plainBytes(luv);
    const auto [r, g, b] = rgbOfBytes(luv, [](f32 v) { return refined(rcp(v), v); });
    return {sat8(truncated(r)), sat8(truncated(g)), sat8(truncated(b))};
}

Triple<u16> fromLuv16u(Triple<u16> luv, Span span)
{
    if (span == Span::body) return refinedSamples16(floatsOf(luv));
    const Triple<s32> rgb = plainSamples(floatsOf(luv), 65535.0f);
    return {satU16(rgb[0]), satU16(rgb[1]), satU16(rgb[2])};
}

Triple<s16> fromLuv16s(Triple<s16> luv, Span span) { return moved(fromLuv16u(moved(luv), span)); }

} // namespace reference
