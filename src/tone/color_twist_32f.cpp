// Colour twists of floats: a 3 by 4 matrix of the caller's over every pixel, or a 4 by 4 one.
#include "frame/streamed_rows.hpp"
#include "pyxcc/color_twist.h"
#include "tone/color_twist.hpp"

#include <cstdint>

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::tone;

namespace
{

/// Whether rows start at multiples of a power of two.
bool rowsAligned(const void* first, std::ptrdiff_t step, int to)
{
    return (reinterpret_cast<std::uintptr_t>(first) | static_cast<std::uintptr_t>(step)) % to == 0;
}

/// Whether an image has so many samples that its target is better left out of the cache: more than 137 KiB of floats.
bool isLarge(RoiSize roi, int samples) { return std::int64_t{roi.width} * roi.height * samples > 34992; }

/// The same for planes. Several are written at a time, which pays from 16 MiB on only.
bool isVeryLarge(RoiSize roi, int samples) { return std::int64_t{roi.width} * roi.height * samples > 1 << 22; }

/// Whether the planes' rows have a multiple of 32 bytes in the same column, and where floats begin.
bool rowsAlignedAlike(const f32* const planes[3], std::ptrdiff_t step)
{
    const auto offset = [](const f32* plane) { return reinterpret_cast<std::uintptr_t>(plane) % 32; };
    return rowsAligned(planes[0], step, 4) && offset(planes[1]) == offset(planes[0]) &&
           offset(planes[2]) == offset(planes[0]);
}

/// One row for all of an image without gaps, if such a width can be told.
RoiSize asOneRow(RoiSize roi)
{
    const std::int64_t width = std::int64_t{roi.width} * roi.height;
    return width <= INT32_MAX ? RoiSize{static_cast<s32>(width), 1} : roi;
}

} // namespace

PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                            const f32 twist[3][4])
{
    if (const PyxStatus failure = twistFailure(src, srcStep, dst, dstStep, roi, twist)) return failure;
    if (srcStep == dstStep && srcStep == std::int64_t{roi.width} * 12) roi = asOneRow(roi);

    const TwistOf<f32> form(twist);
    const auto source = c3(src, srcStep);
    const auto target = c3(dst, dstStep);
    if (isLarge(roi, 3) && rowsAligned(dst, dstStep, 4)) return eachRowStreamed(roi, source, streamed(target), form);
    return eachRow(roi, source, target, everyPixel(form));
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistC3(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                             const f32 twist[3][4])
{
    return twistAC4(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep,
                                            RoiSize roi, const f32 twist[3][4])
{
    if (const PyxStatus failure = twistP3Failure(src, srcStep, dst, dstStep, roi, twist)) return failure;
    if (isVeryLarge(roi, 3) && rowsAlignedAlike(dst, dstStep))
        return eachRowStreamed(roi, p3(src, srcStep), streamed(p3(dst, dstStep)), TwistOf<f32>(twist));
    return twistP3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistP3<f32>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

/// Equal steps of 4 bytes a pixel, where a pixel takes 16, make one run of width x height pixels from either start:
/// rows of 16 bytes a pixel, without gaps.
PyxStatus PYXCC_CALL pyxiColorTwist_32f_C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                            const f32 twist[4][4])
{
    if (const PyxStatus failure = twistFailure(src, srcStep, dst, dstStep, roi, twist)) return failure;
    const std::int64_t width = roi.width;
    const bool oneRun = srcStep == dstStep && srcStep == 4 * width;
    const std::ptrdiff_t fromRowToRow = oneRun ? 16 * width : srcStep, toRowToRow = oneRun ? 16 * width : dstStep;

    const TwistFused form(twist);
    const auto source = c4ForFloats(src, fromRowToRow);
    const auto target = c4ForFloats(dst, toRowToRow);
    if (isLarge(roi, 4) && rowsAligned(src, fromRowToRow, 16) && rowsAligned(dst, toRowToRow, 16))
        return eachRowStreamed(roi, source, streamed(target), form);
    return eachRow(roi, source, target, everyPixel(form));
}
