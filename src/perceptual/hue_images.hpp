// Interleaved images of the hue and the perceptual models, for which no step is tested: their arguments, and their
// rows.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"

namespace pyxcc::perceptual
{

/// Rows lie as far apart as the step of their image says.
template <class Source, class Target, class Plan, class From, class To>
PyxStatus convert(const From* src, To* dst, RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    using namespace frame;
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, source, target, plan);
}

/// Rows are as many whole samples apart as fit the step, towards the lower address: the low bits of a step do not
/// count.
template <class Sample> std::ptrdiff_t inWholeSamples(int step) { return step & -static_cast<int>(sizeof(Sample)); }

template <class Sample, class Plan>
PyxStatus eachOfC3(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, const Plan& plan)
{
    return convert(src, dst, roi, layouts::c3(src, inWholeSamples<Sample>(srcStep)),
                   layouts::c3(dst, inWholeSamples<Sample>(dstStep)), plan);
}

template <class Sample, class Plan>
PyxStatus eachOfAC4(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, const Plan& plan)
{
    using layouts::Order;
    return convert(src, dst, roi, layouts::ac4<Order::any>(src, inWholeSamples<Sample>(srcStep)),
                   layouts::ac4<Order::any>(dst, inWholeSamples<Sample>(dstStep)), plan);
}

} // namespace pyxcc::perceptual
