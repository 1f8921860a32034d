// What the exports of XYZ and YCC share: argument tests, layouts, and one form for all pixels.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "matrix/xyz_ycc_forms.hpp"

namespace pyxcc::matrix
{

template <class Form, class Sample>
PyxStatus convertC3(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    using namespace frame;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, layouts::c3(src, srcStep), layouts::c3(dst, dstStep), everyPixel(Form{}));
}

template <class Form, class Sample>
PyxStatus convertAC4(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    using namespace frame;
    using layouts::Order;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, layouts::ac4<Order::any>(src, srcStep), layouts::ac4<Order::any>(dst, dstStep),
                   everyPixel(Form{}));
}

} // namespace pyxcc::matrix
