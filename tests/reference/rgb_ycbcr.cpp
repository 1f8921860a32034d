#include "reference/rgb_ycbcr.hpp"

#include "reference/arguments.hpp"
#include "reference/bt601.hpp"
#include "reference/pixels.hpp"

namespace reference
{

PyxStatus pyxiRGBToYCbCr_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), interleaved(dst, dstStep, 3), roi, 16, fwdRound, fwdExact);
    return pyxOk;
}

PyxStatus pyxiRGBToYCbCr_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 4), interleaved(dst, dstStep, 4), roi, fwdExact);
    return pyxOk;
}

PyxStatus pyxiRGBToYCbCr_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), planar(dst, dstStep), roi, 8, fwdHigh, fwdExact);
    return pyxOk;
}

// The array of targets is read without a test of its own.
PyxStatus pyxiRGBToYCbCr_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 4), planar(dst, dstStep), roi, 8, fwdHigh, fwdExact);
    return pyxOk;
}

PyxStatus pyxiRGBToYCbCr_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    convert(planar(src, srcStep), planar(dst, dstStep), roi, 8, fwdHigh, fwdExact);
    return pyxOk;
}

PyxStatus pyxiYCbCrToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), interleaved(dst, dstStep, 3), roi, 4, invHighA, invExactA);
    return pyxOk;
}

PyxStatus pyxiYCbCrToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 4), interleaved(dst, dstStep, 4), roi, invExactA);
    return pyxOk;
}

PyxStatus pyxiYCbCrToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    convert(planar(src, srcStep), planar(dst, dstStep), roi, 4, invHighB, invExactB);
    return pyxOk;
}

PyxStatus pyxiYCbCrToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), interleaved(dst, dstStep, 3), roi, 8, invHighC, invExactC);
    return pyxOk;
}

PyxStatus pyxiYCbCrToRGB_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = interleaved(dst, dstStep, 4);
    convert(planar(src, srcStep), target, roi, 8, invHighD, invExactD);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCbCrToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    convert(planar(src, srcStep), target, roi, invHighC);
    return pyxOk;
}

PyxStatus pyxiYCbCrToBGR_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    convert(planar(src, srcStep), target, roi, invHighD);
    fill(target[3], roi, aval);
    return pyxOk;
}

} // namespace reference
