// What the colour twists of all sample types share.
#pragma once

#include "frame/checks.hpp"
#include "frame/rounding_mode.hpp"
#include "frame/row_driver.hpp"
#include "layouts/float_images.hpp"
#include "tone/color_twist_forms.hpp"

namespace pyxcc::tone
{

/// Integer samples through a form, whatever the caller's rounding mode.
template <class Source, class Target, class Form>
PyxStatus twistRowsByNearest(RoiSize roi, const Source& source, const Target& target, const Form& form)
{
    frame::roundingToNearest([&] { frame::eachRow(roi, source, target, frame::everyPixel(form)); });
    return pyxOk;
}

/// Integer samples do not depend on the caller's rounding mode, floats follow it.
template <class Sample, class Source, class Target>
PyxStatus twistRows(RoiSize roi, const Source& source, const Target& target, const f32 twist[3][4])
{
    if constexpr (!std::is_integral_v<Sample>) {
        return frame::eachRow(roi, source, target, frame::everyPixel(TwistOf<Sample>(twist)));
    } else if (TwistWithinIntegers<Sample>::suits(twist)) {
        return twistRowsByNearest(roi, source, target, TwistWithinIntegers<Sample>(twist));
    } else {
        return twistRowsByNearest(roi, source, target, TwistToInteger<Sample>(twist));
    }
}

template <class Sample>
PyxStatus twistFailure(const Sample* src, int srcStep, const Sample* dst, int dstStep, RoiSize roi,
                       const f32 (*twist)[4])
{
    using namespace frame;
    return firstFailure(notNull(src, dst, twist), sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep));
}

template <class Sample>
PyxStatus twistC3(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    if (const PyxStatus failure = twistFailure(src, srcStep, dst, dstStep, roi, twist)) return failure;
    if constexpr (sizeof(Sample) == 1) {
        if (TwistOfBytes<Sample>::suits(twist))
            return twistRowsByNearest(roi, layouts::c3ForFactors(src, srcStep), layouts::c3ForFactors(dst, dstStep),
                                      TwistOfBytes<Sample>(twist));
    }
    return twistRows<Sample>(roi, layouts::c3ForFloats(src, srcStep), layouts::c3ForFloats(dst, dstStep), twist);
}

template <class Sample>
PyxStatus twistAC4(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, const f32 twist[3][4])
{
    if (const PyxStatus failure = twistFailure(src, srcStep, dst, dstStep, roi, twist)) return failure;
    return twistRows<Sample>(roi, layouts::ac4ForFloats(src, srcStep), layouts::ac4ForFloats(dst, dstStep), twist);
}

template <class Sample>
PyxStatus twistP3Failure(const Sample* const src[3], int srcStep, const Sample* const dst[3], int dstStep, RoiSize roi,
                         const f32 twist[3][4])
{
    using namespace frame;
    return firstFailure(notNull(src, dst, twist), elementsNotNull<3>(src), elementsNotNull<3>(dst),
                        sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep));
}

template <class Sample>
PyxStatus twistP3(const Sample* const src[3], int srcStep, Sample* const dst[3], int dstStep, RoiSize roi,
                  const f32 twist[3][4])
{
    if (const PyxStatus failure = twistP3Failure<Sample>(src, srcStep, dst, dstStep, roi, twist)) return failure;
    if constexpr (sizeof(Sample) == 1) {
        if (TwistOfBytes<Sample>::suits(twist))
            return twistRowsByNearest(roi, layouts::p3(src, srcStep), layouts::p3(dst, dstStep),
                                      TwistOfPlanes<Sample>(twist));
    }
    return twistRows<Sample>(roi, layouts::p3(src, srcStep), layouts::p3(dst, dstStep), twist);
}

} // namespace pyxcc::tone
