// Full-range YUV with shared chroma to RGB.
#include "pyxcc/rgb_yuv_subsampled.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/row_pairs.hpp"
#include "subsampled/tight_images.hpp"
#include "subsampled/wide_spans.hpp"
#include "subsampled/yuv_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// 4:2:2 to planes: a last odd column has a form of its own.
template <class Source, class Target> PyxStatus toPlanes422(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target,
                   spans(upTo<blocksOf<16>, wholePairs, everyColumn>, yuvInvHigh4, yuvInvExactD, yuv422OddInv13));
}

template <class Source, class Target> PyxStatus toTriples422(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, wideThenTail<16>(yuvInvHigh4, yuvInvExactD));
}

} // namespace

PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, srcStep), p3(dst, dstStep), yuvInvExactD);
}

PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, stepsOf420(roi.width).data()), p3(dst, roi.width), yuvInvExactD);
}

PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                              RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, srcStep), c3(dst, dstStep), yuvInvHigh4);
}

PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, stepsOf420(roi.width).data()), c3(dst, 3 * std::ptrdiff_t{roi.width}),
                       yuvInvHigh4);
}

PyxStatus PYXCC_CALL pyxiYUV420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                              RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 2, 2), elementsNotNull<3>(src)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, srcStep), reversed(c3(dst, dstStep)), yuvInvHigh4x);
}

PyxStatus PYXCC_CALL pyxiYUV420ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                               RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    eachRowPair(roi, p3<2>(src, srcStep), c4(dst, dstStep, 0),
                spans(upTo<blocksOf<16>, wholePairs>, yuvInvHigh8, yuvInvExactC));
    return warnIfOff(roi, 2, 2);
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c2LumaFirstAlone(src, srcStep), c3(dst, dstStep), wideThenTail<16>(yuvInvHigh4, yuvInvExactC));
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return toPlanes422(roi, p3<2>(src, srcStep), p3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    const RoiSize rows = asOneRow(roi);
    return toPlanes422(rows, p3<2>(src, stepsOf422(rows.width).data()), p3(dst, rows.width));
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                              RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return toTriples422(roi, p3<2>(src, srcStep), c3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    const RoiSize rows = asOneRow(roi);
    return toTriples422(rows, p3<2>(src, stepsOf422(rows.width).data()), c3(dst, 3 * std::ptrdiff_t{rows.width}));
}

PyxStatus PYXCC_CALL pyxiYUV422ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                               RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return eachRow(roi, p3<2>(src, srcStep), c4(dst, dstStep, 0), wideThenTail<4>(yuvInvHigh8, yuvInvExactD));
}
