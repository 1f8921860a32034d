#include "reference/lab.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/cube_root_table.hpp"
#include "reference/perceptual.hpp"
#include "reference/primitives.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// The cube root, after a row of the table and the excess over it.
using Series = f32 (*)(f32 t, f32 root);

f32 series32f(f32 t, f32 root) { return cubeRootOf8Terms(t, root, {0.019001169f, 0.015834307f}); }

f32 series8u16u(f32 t, f32 root) { return cubeRootOf8Terms(t, root, {0.0190012f, 0.0158343f}); }

f32 cubeRoot(f32 v, Series series)
{
    const CubeRootRow row = rowAt(cubeRootTable(), truncated(v * 127.998046875f));
    return series(excessOf(v, row), row.root);
}

/// L*, and the differences of which a* is 500 times the first and b* 200 times the second.
struct LabParts {
    f32 lightness, first, second;
};

LabParts labOf(Triple<f32> rgb, Triple<f32> normalisers, Series series, Span span)
{
    const Triple<f32> xyz = xyzOf(rgb, span);
    const auto f = [&](f32 t) { return t <= linearLimit ? std::fma(t, 7.787f, 0.13793103f) : cubeRoot(t, series); };
    const f32 x = xyz[0] * normalisers[0], y = xyz[1] * normalisers[1], z = xyz[2] * normalisers[2];
    const f32 lightness = y <= linearLimit ? y * 903.3f : mulAdd(span, 116.0f, cubeRoot(y, series), -16.0f);
    return {lightness, f(x) - f(y), f(y) - f(z)};
}

constexpr Triple<f32> normalisers8u = {0.0041259914f, 0.003921569f, 0.0036018905f};
constexpr Triple<f32> normalisers32f = {1.0521265f, 1.0f, 0.91848117f};

Triple<f32> floatsOf(Triple<u8> in)
{
    return {static_cast<f32>(in[0]), static_cast<f32>(in[1]), static_cast<f32>(in[2])};
}

Triple<f32> toLab32f(Triple<f32> rgb, Span span)
{
    const LabParts lab = labOf(rgb, normalisers32f, series32f, span);
    return {lab.lightness, lab.first * 500.0f, lab.second * 200.0f};
}

// The pixels after the blocks are not clamped.
Triple<u8> toLab8u(Triple<u8> rgb, Span span)
{
    const LabParts lab = labOf(floatsOf(rgb), normalisers8u, cubeRootOf4Terms, span);
    const auto sample = span == Span::body ? sat8 : low8;
    return {
        sample(nearest(lab.lightness * 2.55f)),
        sample(nearest(mulAdd(span, lab.first, 500.0f, 128.0f))),
        sample(nearest(mulAdd(span, lab.second, 200.0f, 128.0f))),
    };
}

Triple<u16> toLab16u(Triple<u8> rgb, Span span)
{
    const LabParts lab = labOf(floatsOf(rgb), normalisers8u, series8u16u, span);
    const auto sample = [&](s32 x) { return static_cast<u16>(span == Span::body ? std::clamp(x, 0, 65535) : x); };
    return {
        sample(nearest(lab.lightness * 655.35f)),
        sample(nearest(mulAdd(span, lab.first, 500.0f, 128.0f) * 255.0f)),
        sample(nearest(mulAdd(span, lab.second, 200.0f, 128.0f) * 255.0f)),
    };
}

f32 cubed(f32 f) { return (f * f) * f; }

/// R, G, B at the scale of the white point. The cube serves dark colours too.
Triple<f32> rgbOf(f32 fy, f32 a, f32 b, Triple<f32> white, Span span)
{
    const f32 fx = mulAdd(span, a, 0.002f, fy);
    const f32 fz = mulAdd(span, -b, 0.005f, fy);
    const f32 x = cubed(fx) * white[0], y = cubed(fy) * white[1], z = cubed(fz) * white[2];
    return {
        mulAdd(span, z, -0.498535f, mulAdd(span, x, 3.240479f, y * -1.53715f)),
        mulAdd(span, z, 0.041556f, mulAdd(span, x, -0.969256f, y * 1.875991f)),
        mulAdd(span, z, 1.057311f, mulAdd(span, x, 0.055648f, y * -0.204043f)),
    };
}

constexpr Triple<f32> whiteOfBytes = {242.366f, 255.0f, 277.632f};

Triple<u8> bytesOf(Triple<f32> rgb) { return {sat8(nearest(rgb[0])), sat8(nearest(rgb[1])), sat8(nearest(rgb[2]))}; }

Triple<f32> fromLab32f(Triple<f32> lab, Span span)
{
    const f32 fy = (lab[0] + 16.0f) * 0.00862069f;
    return rgbOf(fy, lab[1], lab[2], {0.950456f, 1.0f, 1.0887539f}, span);
}

Triple<u8> fromLab8u(Triple<u8> lab, Span span)
{
    const f32 fy = (lab[0] * 0.39215687f + 16.0f) * 0.00862069f;
    return bytesOf(rgbOf(fy, lab[1] - 128.0f, lab[2] - 128.0f, whiteOfBytes, span));
}

Triple<u8> fromLab16u(Triple<u16> lab, Span span)
{
    const f32 fy = mulAdd(span, lab[0], 0.0015259022f, 16.0f) * 0.00862069f;
    const f32 a = mulAdd(span, lab[1], 0.003921569f, -128.0f);
    const f32 b = mulAdd(span, lab[2], 0.003921569f, -128.0f);
    return bytesOf(rgbOf(fy, a, b, whiteOfBytes, span));
}

enum class Order { rgb, bgr };

template <typename T> Image<T> colourImage(T* first, int step, Order order)
{
    const auto image = interleaved(first, step, 3);
    return order == Order::rgb ? image : reversed(image);
}

template <typename S, typename D>
PyxStatus toLab(Triple<D> (*form)(Triple<S>, Span), int block, const S* src, int srcStep, Order order, D* dst,
                int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(
        colourImage(src, srcStep, order), interleaved(dst, dstStep, 3), roi, block,
        [&](Triple<S> in) { return form(in, Span::body); }, [&](Triple<S> in) { return form(in, Span::tail); });
    return pyxOk;
}

template <typename S, typename D>
PyxStatus fromLab(Triple<D> (*form)(Triple<S>, Span), int block, const S* src, int srcStep, D* dst, int dstStep,
                  Order order, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(
        interleaved(src, srcStep, 3), colourImage(dst, dstStep, order), roi, block,
        [&](Triple<S> in) { return form(in, Span::body); }, [&](Triple<S> in) { return form(in, Span::tail); });
    return pyxOk;
}

} // namespace

PyxStatus pyxiBGRToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toLab(toLab32f, 8, src, srcStep, Order::bgr, dst, dstStep, roi);
}

PyxStatus pyxiBGRToLab_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return toLab(toLab16u, 4, src, srcStep, Order::bgr, dst, dstStep, roi);
}

PyxStatus pyxiBGRToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toLab(toLab8u, 8, src, srcStep, Order::bgr, dst, dstStep, roi);
}

PyxStatus pyxiLabToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLab(fromLab16u, 4, src, srcStep, dst, dstStep, Order::bgr, roi);
}

PyxStatus pyxiLabToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromLab(fromLab32f, 8, src, srcStep, dst, dstStep, Order::bgr, roi);
}

PyxStatus pyxiLabToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLab(fromLab8u, 8, src, srcStep, dst, dstStep, Order::bgr, roi);
}

PyxStatus pyxiLabToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromLab(fromLab32f, 8, src, srcStep, dst, dstStep, Order::rgb, roi);
}

PyxStatus pyxiLabToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLab(fromLab8u, 8, src, srcStep, dst, dstStep, Order::rgb, roi);
}

PyxStatus pyxiRGBToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toLab(toLab32f, 8, src, srcStep, Order::rgb, dst, dstStep, roi);
}

PyxStatus pyxiRGBToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toLab(toLab8u, 8, src, srcStep, Order::rgb, dst, dstStep, roi);
}

} // namespace reference
