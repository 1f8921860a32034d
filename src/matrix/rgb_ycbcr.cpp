// RGB and YCbCr at full resolution, 8 bits.
#include "pyxcc/rgb_ycbcr.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "matrix/bt601_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;

PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c3(dst, dstStep), wideThenTail<16>(fwdRound, fwdExact));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, ac4<Order::any>(src, srcStep), ac4<Order::any>(dst, dstStep), everyPixel(fwdExact));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c3(src, srcStep), p3(dst, dstStep), wideThenTail<8>(fwdHigh, fwdExact));
}

/// The array of target planes is not tested, its elements are.
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, ac4(src, srcStep), p3(dst, dstStep), wideThenTail<8>(fwdHigh, fwdExact));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                           RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), wideThenTail<8>(fwdHigh, fwdExact));
}

PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c3(dst, dstStep), wideThenTail<4>(invHighA, invExactA));
}

PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, ac4<Order::any>(src, srcStep), ac4<Order::any>(dst, dstStep), everyPixel(invExactA));
}

PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                           RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), wideThenTail<4>(invHighB, invExactB));
}

PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return eachRow(roi, p3(src, srcStep), c3(dst, dstStep), wideThenTail<8>(invHighC, invExactC));
}

PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                             u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return eachRow(roi, p3(src, srcStep), c4(dst, dstStep, aval), wideThenTail<8>(invHighD, invExactD));
}

PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c3(dst, dstStep)), everyPixel(invHighC));
}

PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                             u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c4(dst, dstStep, aval)), everyPixel(invHighD));
}
