#include "reference/color_twist.hpp"

#include "reference/arguments.hpp"
#include "reference/pixels.hpp"
#include "reference/rounding.hpp"

#include <cmath>
#include <limits>
#include <optional>
#include <type_traits>

namespace reference
{

namespace
{

/// One channel of a pixel by its row of the matrix: three weights and a constant.
f32 twisted(Triple<f32> s, const f32 row[4])
{
    const f32 a = row[3] + s[0] * row[0];
    const f32 b = s[2] * row[2] + s[1] * row[1];
    return a + b;
}

/// The same of signed bytes, which add up in another order.
f32 twistedInTurn(Triple<f32> s, const f32 row[4])
{
    return ((s[0] * row[0] + s[1] * row[1]) + s[2] * row[2]) + row[3];
}

/// A result as a sample: rounded to nearest and clamped in the integer depths, which take what is not a number for the
/// upper bound.
template <typename T> T sampleOf(f32 r)
{
    if constexpr (std::is_floating_point_v<T>) {
        return r;
    } else {
        constexpr f32 low = std::numeric_limits<T>::min();
        constexpr f32 high = std::numeric_limits<T>::max();
        const f32 bounded = r < high ? r : high;
        return static_cast<T>(std::nearbyint(bounded > low ? bounded : low));
    }
}

/// The integer depths do not follow the rounding mode of the caller, f32 does.
template <typename T>
void twistImage(const Image<const T>& src, const Image<T>& dst, RoiSize roi, const f32 (*twist)[4])
{
    std::optional<RoundToNearest> mode;
    if (std::is_integral_v<T>) mode.emplace();
    const auto channel = std::is_same_v<T, s8> ? twistedInTurn : twisted;
    convert(src, dst, roi, [=](Triple<T> pixel) {
        const Triple<f32> s = {static_cast<f32>(pixel[0]), static_cast<f32>(pixel[1]), static_cast<f32>(pixel[2])};
        return Triple<T>{
            sampleOf<T>(channel(s, twist[0])),
            sampleOf<T>(channel(s, twist[1])),
            sampleOf<T>(channel(s, twist[2])),
        };
    });
}

/// Pixels of `count` samples, the fourth of which stays as it is.
template <typename T>
PyxStatus twistPixels(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, const f32 (*twist)[4])
{
    if (anyNull(src, dst, twist)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    twistImage(interleaved(src, srcStep, count), interleaved(dst, dstStep, count), roi, twist);
    return pyxOk;
}

template <typename T>
PyxStatus twistPlanes(const T* const* src, int srcStep, T* const* dst, int dstStep, RoiSize roi, const f32 (*twist)[4])
{
    if (anyNull(src, dst, twist) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    twistImage(planar(src, srcStep), planar(dst, dstStep), roi, twist);
    return pyxOk;
}

} // namespace

PyxStatus pyxiColorTwist32f_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPixels(4, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi,
                                   const f32 twist[3][4])
{
    return twistPlanes(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_C3R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_C3IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_AC4R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPixels(4, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_AC4IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_P3R(const s8* const src[3], int srcStep, s8* const dst[3], int dstStep, RoiSize roi,
                                   const f32 twist[3][4])
{
    return twistPlanes(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_8s_IP3R(s8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPixels(3, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                     const f32 twist[3][4])
{
    return twistPixels(4, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPlanes(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPixels(3, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_C3IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                     const f32 twist[3][4])
{
    return twistPixels(4, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_AC4IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_P3R(const s16* const src[3], int srcStep, s16* const dst[3], int dstStep, RoiSize roi,
                                    const f32 twist[3][4])
{
    return twistPlanes(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist32f_16s_IP3R(s16* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                  const f32 twist[3][4])
{
    return twistPixels(4, src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                                 const f32 twist[3][4])
{
    return twistPlanes(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus pyxiColorTwist_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

// Steps of 4 bytes a pixel, a quarter of what a pixel takes, make one run of all pixels: it goes on past the extent
// that the steps describe.
PyxStatus pyxiColorTwist_32f_C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, const f32 twist[4][4])
{
    if (anyNull(src, dst, twist)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = interleaved(dst, dstStep, 4);
    const bool isOneRun = srcStep == dstStep && srcStep == roi.width * 4;
    const RoiSize run = isOneRun ? RoiSize{roi.width * roi.height, 1} : roi;
    for (int row = 0; row < run.height; ++row) {
        for (int column = 0; column < run.width; ++column) {
            f32 s[4];
            for (int k = 0; k < 4; ++k) s[k] = source[k].get(row, column);
            for (int k = 0; k < 4; ++k) {
                f32 t = s[1] * twist[k][1];
                t = std::fma(s[0], twist[k][0], t);
                t = std::fma(s[2], twist[k][2], t);
                t = std::fma(s[3], twist[k][3], t);
                target[k].set(row, column, t);
            }
        }
    }
    return pyxOk;
}

} // namespace reference
