// BGR to HLS and back, 8 bits, among interleaved and planar layouts.
#include "frame/checks.hpp"
#include "frame/forms.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "perceptual/hls_forms.hpp"
#include "perceptual/hls_to_rgb_blocks.hpp"
#include "perceptual/rgb_to_hls_blocks.hpp"
#include "pyxcc/hls.h"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::perceptual;

namespace
{

constexpr auto bgrToHls = wideThenTail<4>(BgrToHls{}, BgrToHlsTail{});
constexpr auto hlsToBgr = wideThenTail<4>(HlsToBgr{}, HlsToBgrTail{});
constexpr auto bgrToHlsWithAlpha = wideThenTail<4>(withFourth(BgrToHls{}), withFourth(BgrToHlsTail{}));
constexpr auto hlsToBgrWithAlpha = wideThenTail<4>(withFourth(HlsToBgr{}), withFourth(HlsToBgrTail{}));

} // namespace

/// The only one of these that tests its size before its steps.
PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep)))
        return failure;
    return eachRow(roi, ac4<Order::any>(src, srcStep), ac4<Order::any>(dst, dstStep), bgrToHls);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c4(src, srcStep), p4(dst, dstStep), bgrToHlsWithAlpha);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(src),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p4(src, srcStep), c4(dst, dstStep), bgrToHlsWithAlpha);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep,
                                          RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(src), elementsNotNull<4>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p4(src, srcStep), p4(dst, dstStep), bgrToHlsWithAlpha);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c3(src, srcStep), p3(dst, dstStep), bgrToHls);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), c3(dst, dstStep), bgrToHls);
}

PyxStatus PYXCC_CALL pyxiBGRToHLS_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), bgrToHls);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c4(src, srcStep), p4(dst, dstStep), hlsToBgrWithAlpha);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(src),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p4(src, srcStep), c4(dst, dstStep), hlsToBgrWithAlpha);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep,
                                          RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<4>(src), elementsNotNull<4>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p4(src, srcStep), p4(dst, dstStep), hlsToBgrWithAlpha);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, c3(src, srcStep), p3(dst, dstStep), hlsToBgr);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), c3(dst, dstStep), hlsToBgr);
}

PyxStatus PYXCC_CALL pyxiHLSToBGR_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst),
                                               stepsAtLeast1(srcStep, dstStep), sizeAtLeast(roi, 1, 1)))
        return failure;
    return eachRow(roi, p3(src, srcStep), p3(dst, dstStep), hlsToBgr);
}
