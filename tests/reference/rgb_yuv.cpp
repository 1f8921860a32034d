#include "reference/rgb_yuv.hpp"

#include "reference/arguments.hpp"
#include "reference/pixels.hpp"
#include "reference/yuv.hpp"

namespace reference
{

PyxStatus pyxiRGBToYUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), interleaved(dst, dstStep, 3), roi, 16, yuvFwdHigh, yuvFwdExactB);
    return pyxOk;
}

PyxStatus pyxiRGBToYUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 4), interleaved(dst, dstStep, 4), roi, yuvFwdExactA);
    return pyxOk;
}

PyxStatus pyxiRGBToYUV_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    convert(interleaved(src, srcStep, 3), planar(dst, dstStep), roi, 8, yuvFwdHigh, yuvFwdExactB);
    return pyxOk;
}

// The plane of alpha is used without a test.
PyxStatus pyxiRGBToYUV_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = planar(dst, dstStep, 4);
    convert(source, target, roi, 8, yuvFwdPlanar, yuvFwdExactA);
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) target[3].set(row, column, source[3].get(row, column));
    }
    return pyxOk;
}

PyxStatus pyxiRGBToYUV_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    convert(planar(src, srcStep), planar(dst, dstStep), roi, 16, yuvFwdHigh, yuvFwdExactC);
    return pyxOk;
}

PyxStatus pyxiYUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), interleaved(dst, dstStep, 3), roi, 8, yuvInvHigh3, yuvInvExactA);
    return pyxOk;
}

PyxStatus pyxiYUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 4), interleaved(dst, dstStep, 4), roi, yuvInvExactA);
    return pyxOk;
}

PyxStatus pyxiYUVToRGB_8u_C3C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 4);
    convert(interleaved(src, srcStep, 3), target, roi, 8, yuvInvHigh7, yuvInvExactC);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYUVToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), interleaved(dst, dstStep, 3), roi, 16, yuvInvHigh4, yuvInvExactB);
    return pyxOk;
}

PyxStatus pyxiYUVToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    convert(planar(src, srcStep), planar(dst, dstStep), roi, yuvInvExactB);
    return pyxOk;
}

} // namespace reference
