// RGB to BT.601 YCbCr with chroma shared by two columns of a row.
#include "pyxcc/rgb_to_subsampled.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// To planes; `wholeColumns` tells whether a last odd column is left alone or gets luma.
template <auto wholeColumns, class Source, class Target>
PyxStatus toPlanes(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target,
                   spans(upTo<blocksByTwosThenHalf<16>, wholeColumns>, pairs(lumaHigh7, chromaHighU2),
                         pairs(lumaExact, chromaEighth<2>)));
}

/// To packed rows, the pairs in one form; a lone last pixel rounds its chroma as `lastChroma` does.
template <class Source, class Target, class LastChroma>
PyxStatus toPacked(RoiSize roi, const Source& source, const Target& target, LastChroma lastChroma)
{
    return eachRow(
        roi, source, target,
        spans(upTo<wholePairs, everyColumn>, pairs(lumaHigh7, chromaHighS<64>), pairs(lumaExact, lastChroma)));
}

/// To packed rows; only luma differs between blocks and tail.
template <class Source, class Target> PyxStatus exactToPacked(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target,
                   spans(upTo<blocksOf<8>, wholePairs, everyColumn>, pairs(lumaHigh8, chromaNearest<2>),
                         pairs(lumaExactByColumn, chromaNearest<2>), pairs(lumaExact, chromaNearest<1>)));
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 1)))
        return failure;
    return toPlanes<everyColumn>(roi, reversed(c3(src, srcStep)), p3<2>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                 RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 1)))
        return failure;
    return toPlanes<everyColumn>(roi, reversed(ac4<Order::any>(src, srcStep)), p3<2, Order::any>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 1)))
        return failure;
    toPlanes<wholePairs>(roi, c3(src, srcStep), p3<2>(dst, dstStep));
    return warnIfOff(roi, 2, 1);
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 2, 1))) return failure;
    return toPacked(roi, reversed(c3(src, srcStep)), c2LumaFirst(dst, dstStep), chromaEighth<1>);
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 2, 1))) return failure;
    return toPacked(roi, reversed(ac4<Order::any>(src, srcStep)), c2LumaFirst<Order::any>(dst, dstStep),
                    chromaNearest<1>);
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return exactToPacked(roi, c3(src, srcStep), c2LumaFirst(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYCrCb422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return exactToPacked(roi, c3(src, srcStep), chromaExchanged(c2LumaFirst(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return exactToPacked(roi, p3(src, srcStep), c2LumaFirst(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYCrCb422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return exactToPacked(roi, p3(src, srcStep), chromaExchanged(c2LumaFirst(dst, dstStep)));
}
