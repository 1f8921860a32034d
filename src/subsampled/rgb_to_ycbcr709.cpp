// RGB to BT.709 YCbCr with shared chroma.
#include "pyxcc/bt709.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/bt709_forward_forms.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;
using namespace pyxcc::subsampled::bt709;

namespace
{

constexpr auto studioTail = pairs(LumaExactStudio{}, ChromaExactStudio{});

template <class Target> PyxStatus fromC3(RoiSize roi, const u8* src, int srcStep, const Target& target)
{
    eachRowPair(roi, reversed(c3(src, srcStep)), target,
                spans(upTo<blocksOf<16>, wholePairs>, pairs(LumaHighStudio{}, ChromaHighU{}), studioTail));
    return warnIfOff(roi, 2, 2);
}

template <class Target> PyxStatus fromAC4(RoiSize roi, const u8* src, int srcStep, const Target& target)
{
    eachRowPair(roi, reversed(ac4<Order::any>(src, srcStep)), target,
                spans(upTo<blocksOf<8>, wholePairs>, pairs(LumaHighStudio{}, ChromaHighS{}), studioTail));
    return warnIfOff(roi, 2, 2);
}

constexpr auto hdtvPairs = pairs(LumaHighHdtv{}, ChromaHighHdtv<64>{});
constexpr auto hdtvLone = pairs(LumaExactHdtv{}, ChromaLoneHdtv{});

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                       const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return fromC3(roi, src, srcStep, p3<2>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                                       int dstCbCrStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dstY, dstCbCr), sizeAtLeast(roi, 2, 2))) return failure;
    return fromC3(roi, src, srcStep, p2(dstY, dstYStep, dstCbCr, dstCbCrStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3],
                                                       const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return fromC3(roi, src, srcStep, chromaExchanged(p3<2>(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return fromAC4(roi, src, srcStep, p3<2, Order::any>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return fromAC4(roi, src, srcStep, chromaExchanged(p3<2, Order::any>(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3],
                                                         const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    eachRowPair(roi, reversed(ac4<Order::any>(src, srcStep)), p3<2, Order::any>(dst, dstStep),
                spans(upTo<blocksOf<8>, wholePairs>, pairs(LumaHighHdtv{}, ChromaHighHdtv<32>{}),
                      pairs(LumaExactHdtv{}, ChromaExactHdtv{})));
    return warnIfOff(roi, 2, 2);
}

PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_709HDTV_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, reversed(c3(src, srcStep)), c2ChromaFirst(dst, dstStep),
                   spans(upTo<wholePairs, everyColumn>, hdtvPairs, hdtvLone));
}

/// The lone last pixel is taken for R, G, B.
PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, reversed(ac4<Order::any>(src, srcStep)), c2ChromaFirst<Order::any>(dst, dstStep),
                   spans(upTo<wholePairs, everyColumn>, hdtvPairs, redAndBlueExchanged(hdtvLone)));
}
