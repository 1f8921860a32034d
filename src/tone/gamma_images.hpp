// The images of the gamma exports: their argument tests, and how each layout goes through a map.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "layouts/table_rows.hpp"

namespace pyxcc::tone
{

/// Layouts, as rows for forms and for tables.
struct InC3 {
    template <class Sample> static auto image(Sample* first, int step) { return layouts::asItLies<3>(first, step); }
    static void lookUp(const u16* table, const u8* from, u8* to, int width)
    {
        layouts::lookUpSamples(table, from, to, std::ptrdiff_t{3} * width);
    }
};

struct InPlane {
    template <class Sample> static auto image(Sample* first, int step) { return layouts::asItLies<1>(first, step); }
    static void lookUp(const u16* table, const u8* from, u8* to, int width)
    {
        layouts::lookUpSamples(table, from, to, width);
    }
};

/// Where a sample costs more than moving it, pixels are taken apart, so that no work goes into fourth samples.
struct InAC4 {
    template <class Sample> static auto image(Sample* first, int step)
    {
        if constexpr (sizeof(Sample) == 1) {
            return layouts::asItLies<4>(first, step);
        } else {
            return layouts::ac4(first, step);
        }
    }
    static void lookUp(const u16* table, const u8* from, u8* to, int width)
    {
        layouts::lookUpThreeOfFour(table, from, to, width);
    }
};

template <class Layout, class Sample> struct Interleaved {
    const Sample* src;
    int srcStep;
    Sample* dst;
    int dstStep;
    RoiSize roi;

    PyxStatus failure() const
    {
        using namespace frame;
        return firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), stepsAtLeast1(srcStep, dstStep));
    }

    template <class Map> void through(const Map& map) const { map(Layout{}, roi, src, srcStep, dst, dstStep); }
};

/// One plane after the other, so that planes which share memory are mapped as often.
template <class Sample> struct Planar {
    const Sample* const* src;
    int srcStep;
    Sample* const* dst;
    int dstStep;
    RoiSize roi;

    PyxStatus failure() const
    {
        using namespace frame;
        return firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst), sizeAtLeast(roi, 1, 1),
                            stepsAtLeast1(srcStep, dstStep));
    }

    template <class Map> void through(const Map& map) const
    {
        for (int i = 0; i < 3; ++i) map(InPlane{}, roi, src[i], srcStep, dst[i], dstStep);
    }
};

template <class Sample>
auto onC3(const Sample* src, int srcStep, std::type_identity_t<Sample>* dst, int dstStep, RoiSize roi)
{
    return Interleaved<InC3, Sample>{src, srcStep, dst, dstStep, roi};
}

template <class Sample>
auto onAC4(const Sample* src, int srcStep, std::type_identity_t<Sample>* dst, int dstStep, RoiSize roi)
{
    return Interleaved<InAC4, Sample>{src, srcStep, dst, dstStep, roi};
}

template <class Sample>
auto onP3(const Sample* const src[3], int srcStep, Sample* const dst[3], int dstStep, RoiSize roi)
{
    return Planar<Sample>{src, srcStep, dst, dstStep, roi};
}

/// Takes every sample through a form.
template <class Form> struct EachSample {
    Form form;

    template <class Layout, class Sample>
    void operator()(Layout, RoiSize roi, const Sample* src, int srcStep, Sample* dst, int dstStep) const
    {
        frame::eachRow(roi, Layout::image(src, srcStep), Layout::image(dst, dstStep), frame::everyPixel(form));
    }
};

} // namespace pyxcc::tone
