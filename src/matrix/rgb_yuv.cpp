// RGB and YUV at full resolution, 8 bits.
#include "pyxcc/rgb_yuv.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "matrix/yuv_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;

PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c3(dst, dstStep), wideThenTail<16>(yuvFwdHigh, yuvFwdExactB));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, ac4<Order::any>(src, srcStep), ac4<Order::any>(dst, dstStep), everyPixel(yuvFwdExactA));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, c3(src, srcStep), p3(dst, dstStep), wideThenTail<8>(yuvFwdHigh, yuvFwdExactB));
}

/// The plane of alpha is not tested.
PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, c4(src, srcStep), p4(dst, dstStep),
                   wideThenTail<8>(withFourth(yuvFwdPlanar), withFourth(yuvFwdExactA)));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), wideThenTail<16>(yuvFwdHigh, yuvFwdExactC));
}

PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c3(dst, dstStep), wideThenTail<8>(yuvInvHigh3, yuvInvExactA));
}

PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, ac4<Order::any>(src, srcStep), ac4<Order::any>(dst, dstStep), everyPixel(yuvInvExactA));
}

PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_C3C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c4(dst, dstStep, aval), wideThenTail<8>(yuvInvHigh7, yuvInvExactC));
}

PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return eachRow(roi, p3(src, srcStep), c3(dst, dstStep), wideThenTail<16>(yuvInvHigh4, yuvInvExactB));
}

PyxStatus PYXCC_CALL pyxiYUVToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), everyPixel(yuvInvExactB));
}
