// Colour twists: a 3 by 4 matrix of the caller's over every pixel, or a 4 by 4 one.
#include "pyxcc/color_twist.h"

#include "frame/checks.hpp"
#include "frame/rounding_mode.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "tone/color_twist_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::tone;

namespace
{

/// Integer samples do not depend on the caller's rounding mode, floats follow it.
template <class Sample, class Source, class Target>
PyxStatus twistRows(RoiSize roi, const Source& source, const Target& target, const f32 twist[3][4])
{
    if constexpr (std::is_integral_v<Sample>) {
        roundingToNearest([&] {
            if (TwistWithinIntegers<Sample>::suits(twist)) {
                eachRow(roi, source, target, everyPixel(TwistWithinIntegers<Sample>(twist)));
            } else {
                eachRow(roi, source, target, everyPixel(TwistToInteger<Sample>(twist)));
            }
        });
    } else {
        eachRow(roi, source, target, everyPixel(TwistOf<Sample>(twist)));
    }
    return pyxOk;
}

/// Interleaved layouts.
struct AsC3 {
    template <class Sample> static auto image(Sample* first, int step) { return c3(first, step); }
};
struct AsAC4 {
    template <class Sample> static auto image(Sample* first, int step) { return ac4(first, step); }
};

template <class Layout, class Sample>
PyxStatus interleaved(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst, twist), sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep)))
        return failure;
    return twistRows<Sample>(roi, Layout::image(src, srcStep), Layout::image(dst, dstStep), twist);
}

template <class Sample>
PyxStatus planar(const Sample* const src[3], int srcStep, Sample* const dst[3], int dstStep, RoiSize roi,
                 const f32 twist[3][4])
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst, twist), elementsNotNull<3>(src), elementsNotNull<3>(dst),
                         sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep)))
        return failure;
    return twistRows<Sample>(roi, p3(src, srcStep), p3(dst, dstStep), twist);
}

} // namespace

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                              const f32 twist[3][4])
{
    return interleaved<AsC3>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsC3>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return interleaved<AsAC4>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsAC4>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                              RoiSize roi, const f32 twist[3][4])
{
    return planar(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return planar<u8>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                              const f32 twist[3][4])
{
    return interleaved<AsC3>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsC3>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return interleaved<AsAC4>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsAC4>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_P3R(const s8* const src[3], int srcStep, s8* const dst[3], int dstStep,
                                              RoiSize roi, const f32 twist[3][4])
{
    return planar(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_IP3R(s8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return planar<s8>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return interleaved<AsC3>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsC3>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return interleaved<AsAC4>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsAC4>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep,
                                               RoiSize roi, const f32 twist[3][4])
{
    return planar(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return planar<u16>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return interleaved<AsC3>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsC3>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return interleaved<AsAC4>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsAC4>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_P3R(const s16* const src[3], int srcStep, s16* const dst[3], int dstStep,
                                               RoiSize roi, const f32 twist[3][4])
{
    return planar(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_IP3R(s16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return planar<s16>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                            const f32 twist[3][4])
{
    return interleaved<AsC3>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsC3>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                             const f32 twist[3][4])
{
    return interleaved<AsAC4>(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return interleaved<AsAC4>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep,
                                            RoiSize roi, const f32 twist[3][4])
{
    return planar(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return planar<f32>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

/// Equal steps of 4 bytes a pixel, where a pixel takes 16, make one run of width x height pixels from either start.
PyxStatus PYXCC_CALL pyxiColorTwist_32f_C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                            const f32 twist[4][4])
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst, twist), sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep)))
        return failure;
    const std::ptrdiff_t width = roi.width;
    const bool oneRun = srcStep == dstStep && srcStep == 4 * width;
    return eachRow(roi, c4(src, oneRun ? 16 * width : srcStep), c4(dst, oneRun ? 16 * width : dstStep),
                   everyPixel(TwistFused(twist)));
}
