// BT.709 YCbCr to RGB.
#include "pyxcc/bt709.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/bt709_inverse_forms.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;
using namespace pyxcc::subsampled::bt709;

namespace
{

constexpr auto hdtvRow = wideThenTail<8>(InvHighHdtv{}, InvExactHdtv{});

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCrToBGR_709CSC_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                    RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c3(dst, dstStep)),
                   wideThenTail<16>(InvHighStudio<4>{}, InvExactStudio{}));
}

PyxStatus PYXCC_CALL pyxiYCbCrToBGR_709CSC_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep,
                                                    RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), reversed(c4(dst, dstStep, aval)),
                   wideThenTail<16>(InvHighStudio<4>{}, InvExactStudio{}));
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_709CSC_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                       int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    eachRowPair(roi, p3<2>(src, srcStep), reversed(c3(dst, dstStep)),
                spans(upTo<blocksOf<16>, wholePairs>, InvHighStudio<0>{}, InvExactStudio{}));
    return warnIfOff(roi, 2, 2);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                        int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    eachRowPair(roi, p3<2>(src, srcStep), reversed(c4(dst, dstStep, aval)),
                spans(upTo<blocksOf<16>, wholePairs>, InvHighHdtv{}, InvExactHdtv{}));
    return warnIfOff(roi, 2, 2);
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c2ChromaFirst(src, srcStep), reversed(c3(dst, dstStep)), hdtvRow);
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                                        u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c2ChromaFirst<Order::ofWords>(src, srcStep), reversed(c4<Order::ofWords>(dst, dstStep, aval)),
                   hdtvRow);
}
