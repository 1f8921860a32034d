// RGB to BT.601 YCbCr with chroma shared by two columns of two rows.
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

constexpr auto tail = pairs(lumaExact, chromaEighth<4>);

// The schools. Siblings with exchanged channels or planes come here with those layouts.

template <class Source, class Target> PyxStatus signedHigh(RoiSize roi, const Source& source, const Target& target)
{
    eachRowPair(roi, source, target, spans(upTo<blocksOf<16>, wholePairs>, pairs(lumaHigh7, chromaHighS<32>), tail));
    return warnIfOff(roi, 2, 2);
}

template <class Source, class Target> PyxStatus unsignedHigh(RoiSize roi, const Source& source, const Target& target)
{
    eachRowPair(roi, source, target,
                spans(upTo<blocksByTwosThenHalf<8>, wholePairs>, pairs(lumaHigh7, chromaHighU4), tail));
    return warnIfOff(roi, 2, 2);
}

template <class Source, class Target> PyxStatus rounded(RoiSize roi, const Source& source, const Target& target)
{
    eachRowPair(roi, source, target, spans(upTo<blocksOf<8>, wholePairs>, pairs(lumaRound, chromaRound4), tail));
    return warnIfOff(roi, 2, 2);
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return signedHigh(roi, reversed(c3(src, srcStep)), p3<2>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCbCr420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                 RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return unsignedHigh(roi, reversed(ac4<Order::any>(src, srcStep)), p3<2, Order::any>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return signedHigh(roi, reversed(c3(src, srcStep)), chromaExchanged(p3<2>(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiBGRToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                 RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return unsignedHigh(roi, reversed(ac4<Order::any>(src, srcStep)), chromaExchanged(p3<2, Order::any>(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiRGBToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                 RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return unsignedHigh(roi, ac4<Order::any>(src, srcStep), chromaExchanged(p3<2, Order::any>(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return rounded(roi, c3(src, srcStep), p3<2>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                                int dstCbCrStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dstY, dstCbCr), sizeAtLeast(roi, 1, 1))) return failure;
    return rounded(roi, c3(src, srcStep), p2(dstY, dstYStep, dstCbCr, dstCbCrStep));
}

/// The fourth byte of a source pixel is not read.
PyxStatus PYXCC_CALL pyxiRGBToYCbCr420_8u_C4P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                                int dstCbCrStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dstY, dstCbCr), sizeAtLeast(roi, 1, 1))) return failure;
    return rounded(roi, ac4<Order::any>(src, srcStep), p2<Order::any>(dstY, dstYStep, dstCbCr, dstCbCrStep));
}
