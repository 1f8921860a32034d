#include "reference/gamma.hpp"

#include "reference/arguments.hpp"
#include "reference/gamma_curves.hpp"
#include "reference/image.hpp"

namespace reference
{

namespace
{

/// One channel of a row, sample by sample.
template <typename T, typename Curve>
void mapRow(const Channel<const T>& src, const Channel<T>& dst, int row, int width, Curve curve)
{
    for (int column = 0; column < width; ++column) dst.set(row, column, curve(src.get(row, column)));
}

/// Three samples out of `count` a pixel. The fourth one, where there is one, stays as it is.
template <typename T, typename Curve>
PyxStatus mapPixels(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, Curve curve)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    const auto source = interleaved(src, srcStep, count);
    const auto target = interleaved(dst, dstStep, count);
    for (int row = 0; row < roi.height; ++row) {
        for (int k = 0; k < 3; ++k) mapRow(source[k], target[k], row, roi.width, curve);
    }
    return pyxOk;
}

/// Three planes, one after the other.
template <typename T, typename Curve>
PyxStatus mapPlanes(const T* const* src, int srcStep, T* const* dst, int dstStep, RoiSize roi, Curve curve)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    const auto source = planar(src, srcStep);
    const auto target = planar(dst, dstStep);
    for (int k = 0; k < 3; ++k) {
        for (int row = 0; row < roi.height; ++row) mapRow(source[k], target[k], row, roi.width, curve);
    }
    return pyxOk;
}

/// Bounds of which one is not a number are not empty.
bool isEmpty(GammaBounds bounds) { return 0.0f >= bounds.vMax - bounds.vMin; }

auto fwdBetween(GammaBounds bounds)
{
    return [bounds](f32 s) { return gammaFwd32f(s, bounds); };
}

auto invBetween(GammaBounds bounds)
{
    return [bounds](f32 s) { return gammaInv32f(s, bounds); };
}

} // namespace

PyxStatus pyxiGammaFwd_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return mapPixels(3, src, srcStep, dst, dstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return mapPixels(4, src, srcStep, dst, dstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    return mapPlanes(src, srcStep, dst, dstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd8u);
}

PyxStatus pyxiGammaFwd_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return mapPixels(3, src, srcStep, dst, dstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return mapPixels(4, src, srcStep, dst, dstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi)
{
    return mapPlanes(src, srcStep, dst, dstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaFwd16u);
}

PyxStatus pyxiGammaFwd_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(3, src, srcStep, dst, dstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaFwd_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaFwd_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(4, src, srcStep, dst, dstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaFwd_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaFwd_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                               f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPlanes(src, srcStep, dst, dstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaFwd_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, fwdBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return mapPixels(3, src, srcStep, dst, dstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return mapPixels(4, src, srcStep, dst, dstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    return mapPlanes(src, srcStep, dst, dstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv8u);
}

PyxStatus pyxiGammaInv_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return mapPixels(3, src, srcStep, dst, dstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return mapPixels(4, src, srcStep, dst, dstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep, RoiSize roi)
{
    return mapPlanes(src, srcStep, dst, dstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, gammaInv16u);
}

PyxStatus pyxiGammaInv_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(3, src, srcStep, dst, dstStep, roi, invBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(3, srcDst, srcDstStep, srcDst, srcDstStep, roi, invBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(4, src, srcStep, dst, dstStep, roi, invBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPixels(4, srcDst, srcDstStep, srcDst, srcDstStep, roi, invBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep, RoiSize roi,
                               f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPlanes(src, srcStep, dst, dstStep, roi, invBetween({vMin, vMax}));
}

PyxStatus pyxiGammaInv_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    if (isEmpty({vMin, vMax})) return pyxErrRange;
    return mapPlanes(srcDst, srcDstStep, srcDst, srcDstStep, roi, invBetween({vMin, vMax}));
}

} // namespace reference
