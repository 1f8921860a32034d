// What the exports of XYZ and YCC share: argument tests, layouts, and one form for all pixels.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/pixel_images.hpp"
#include "matrix/xyz_ycc_forms.hpp"

namespace pyxcc::matrix
{

/// The layouts that a form takes.
template <class Form> struct LayoutsFor {
    template <class Sample> static auto c3(Sample* first, int step) { return layouts::c3(first, step); }
    template <class Sample> static auto ac4(Sample* first, int step)
    {
        return layouts::ac4<layouts::Order::any>(first, step);
    }
};
template <std::derived_from<frame::OnPixels> Form> struct LayoutsFor<Form> {
    template <class Byte> static auto c3(Byte* first, int step) { return layouts::c3Pixels(first, step); }
    template <class Byte> static auto ac4(Byte* first, int step) { return layouts::ac4Pixels(first, step); }
};

template <class Form, class Sample>
PyxStatus convertC3(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    using namespace frame;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    using Layouts = LayoutsFor<Form>;
    return eachRow(roi, Layouts::c3(src, srcStep), Layouts::c3(dst, dstStep), everyPixel(Form{}));
}

template <class Form, class Sample>
PyxStatus convertAC4(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    using namespace frame;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    using Layouts = LayoutsFor<Form>;
    return eachRow(roi, Layouts::ac4(src, srcStep), Layouts::ac4(dst, dstStep), everyPixel(Form{}));
}

} // namespace pyxcc::matrix
