// RGB to full-range YUV with shared chroma.
#include "pyxcc/rgb_yuv_subsampled.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
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

// Siblings with and without steps meet here.

template <class Source, class Target> PyxStatus rounded420(RoiSize roi, const Source& source, const Target& target)
{
    eachRowPair(roi, source, target, spans(upTo<blocksOf<8>, wholePairs>, yuv420Round, yuv420Exact14));
    return warnIfOff(roi, 2, 2);
}

template <class Source, class Target> PyxStatus rounded422(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target,
                   spans(upTo<blocksOf<16>, wholePairs, everyColumn>, yuv422Round, yuv422Exact65535, yuv422Odd15));
}

template <class Source, class Target> PyxStatus exact422(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, spans(upTo<wholePairs, everyColumn>, yuv422Exact65535, yuv422OddFloor15));
}

/// Planes of 4:2:2, in which an odd last column has chroma of its own.
auto planes422(u8* const dst[3], const int dstStep[3])
{
    return p3<2, Order::ofMemory, Rest::withChroma>(dst, dstStep);
}

} // namespace

PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                              RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return rounded420(roi, c3(src, srcStep), p3<2>(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return rounded420(roi, c3(src, 3 * std::ptrdiff_t{roi.width}), p3<2>(dst, stepsOf420(roi.width).data()));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return wholeBlocks(roi, p3(src, srcStep), p3<2>(dst, dstStep), yuv420Exact16);
}

PyxStatus PYXCC_CALL pyxiRGBToYUV420_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return wholeBlocks(roi, p3(src, roi.width), p3<2>(dst, stepsOf420(roi.width).data()), yuv420Exact16);
}

PyxStatus PYXCC_CALL pyxiBGRToYUV420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                               RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return wholeBlocks(roi, reversed(ac4<Order::any>(src, srcStep)), p3<2, Order::any>(dst, dstStep), yuv420Exact16);
}

PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), c2LumaFirst(dst, dstStep),
                   spans(upTo<wholePairs, everyColumn>, yuv422Exact32768, yuv422Alone));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                              RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return rounded422(roi, c3(src, srcStep), planes422(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    const RoiSize rows = asOneRow(roi);
    return rounded422(rows, c3(src, 3 * std::ptrdiff_t{rows.width}), planes422(dst, stepsOf422(rows.width).data()));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    return exact422(roi, p3(src, srcStep), planes422(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiRGBToYUV422_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src), elementsNotNull<3>(dst)))
        return failure;
    const RoiSize rows = asOneRow(roi);
    return exact422(rows, p3(src, rows.width), planes422(dst, stepsOf422(rows.width).data()));
}
