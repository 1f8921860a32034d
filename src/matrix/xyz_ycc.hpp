// What the exports of XYZ and YCC share: argument tests, layouts, and one form for all pixels.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/pixel_images.hpp"
#include "matrix/xyz_ycc_forms.hpp"

#include <concepts>

namespace pyxcc::matrix
{

/// Layouts, as the form takes them.
struct InC3 {
    template <class Form, class Sample> static auto image(Sample* first, int step)
    {
        if constexpr (std::derived_from<Form, frame::OnPixels>) {
            return layouts::c3Pixels(first, step);
        } else {
            return layouts::c3(first, step);
        }
    }
};

struct InAC4 {
    template <class Form, class Sample> static auto image(Sample* first, int step)
    {
        if constexpr (std::derived_from<Form, frame::OnPixels>) {
            return layouts::ac4Pixels(first, step);
        } else {
            return layouts::ac4<layouts::Order::any>(first, step);
        }
    }
};

template <class Layout, class Form, class Sample>
PyxStatus convert(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    using namespace frame;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, Layout::template image<Form>(src, srcStep), Layout::template image<Form>(dst, dstStep),
                   everyPixel(Form{}));
}

} // namespace pyxcc::matrix
