// The reversible transform of RGB to YCoCg and back.
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

/// Sums saturate in blocks of 16 columns and wrap behind them.
template <template <class Sums> class Form> auto saturatingThenWrapping()
{
    return wideThenTail<16>(inWords(Form<Saturating>{}), inWords(Form<Wrapping>{}));
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCoCg_Rev_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep,
                                                    RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(ReversibleForward<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiBGRToYCoCg_Rev_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep,
                                                    RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(ReversibleForward<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                      RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(ReversibleForward<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep,
                                                      RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst))) return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3DoubleWidth(dst, dstStep),
                   everyPixel(toDoubleWidth(ReversibleForward<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep,
                                                   RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst))) return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), p3(dst, dstStep), saturatingThenWrapping<ReversibleForward>());
}

PyxStatus PYXCC_CALL pyxiSBGRToYCoCg_Rev_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep,
                                                   RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst))) return failure;
    return eachRow(roi, reversed(ac4(src, srcStep)), p3(dst, dstStep),
                   everyPixel(inWords(ReversibleForward<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToBGR_Rev_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep,
                                                    RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c3(dst, dstStep)),
                   everyPixel(fromDoubleWidth<Results::saturated>(ReversibleInverse<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToBGR_Rev_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep,
                                                    RoiSize roi, u8 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c4(dst, dstStep, alphaValue)),
                   everyPixel(fromDoubleWidth<Results::saturated>(ReversibleInverse<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep,
                                                   RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c3(dst, dstStep)), saturatingThenWrapping<ReversibleInverse>());
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep,
                                                   RoiSize roi, s16 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c4(dst, dstStep, alphaValue)),
                   everyPixel(inWords(ReversibleInverse<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                      RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c3(dst, dstStep)),
                   everyPixel(fromDoubleWidth<Results::lowHalves>(ReversibleInverse<Wrapping>{})));
}

PyxStatus PYXCC_CALL pyxiYCoCgToSBGR_Rev_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep,
                                                      RoiSize roi, s16 alphaValue)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src))) return failure;
    return eachRow(roi, p3DoubleWidth(src, srcStep), reversed(c4(dst, dstStep, alphaValue)),
                   everyPixel(fromDoubleWidth<Results::lowHalves>(ReversibleInverse<Wrapping>{})));
}
