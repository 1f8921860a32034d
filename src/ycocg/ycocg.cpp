// The plain transform of RGB to YCoCg and back. Some exports test the size and others, by their nature, do nothing if
// there is nothing to do.
#include "pyxcc/ycocg.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/double_width.hpp"
#include "ycocg/depths.hpp"
#include "ycocg/ycocg_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::ycocg;

namespace
{

/// What does not fit a word is clamped, but in the last three columns or less, which keep the low 16 bits.
auto saturatedThenCut()
{
    return wideThenTail<4>(inDoubleWidth<Results::saturated>(PlainForward{}),
                           inDoubleWidth<Results::lowHalves>(PlainForward{}));
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCoCg_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(PlainForward{})));
}

PyxStatus PYXCC_CALL pyxiBGRToYCoCg_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(PlainForward{})));
}

PyxStatus PYXCC_CALL pyxiRGBToYCoCg_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c3(src, srcStep), p3(dst, dstStep),
                   everyPixel(inDoubleWidth<Results::saturated>(OffsetForward{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                  RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(PlainForward{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                  RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst))) return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(PlainForward{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3(dst, dstStep), saturatedThenCut());
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3(dst, dstStep), saturatedThenCut());
}

PyxStatus PYXCC_CALL pyxiYCoCgToBGR_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c3(dst, dstStep)),
                   everyPixel(fromDoubleWidth<Results::saturated>(PlainInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToBGR_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                u8 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c4(dst, dstStep, alphaValue)),
                   everyPixel(fromDoubleWidth<Results::saturated>(PlainInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3(src, srcStep), c3(dst, dstStep),
                   everyPixel(inDoubleWidth<Results::saturated>(OffsetInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c3(dst, dstStep)), everyPixel(inWords(PlainInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               s16 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c4(dst, dstStep, alphaValue)), everyPixel(inWords(PlainInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                  RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c3(dst, dstStep)),
                   everyPixel(fromDoubleWidth<Results::lowHalves>(PlainInverse{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                  RoiSize roi, s16 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c4(dst, dstStep, alphaValue)),
                   everyPixel(fromDoubleWidth<Results::lowHalves>(PlainInverse{})));
}
