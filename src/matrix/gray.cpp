// Colour to gray.
#include "pyxcc/gray.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/gray_images.hpp"
#include "matrix/gray_forms.hpp"

#include <type_traits>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;

namespace
{

/// Layouts of a source, with the target that goes with them.
struct FromC3 {
    template <class Sample> static auto source(const Sample* src, std::ptrdiff_t step) { return c3(src, step); }
    static auto words(const u8* src, std::ptrdiff_t step) { return c3AsWords(src, step); }
    template <class Sample> static auto target(Sample* dst, std::ptrdiff_t step) { return c1(dst, step); }
};
struct FromAC4 {
    template <class Sample> static auto source(const Sample* src, std::ptrdiff_t step)
    {
        return ac4<Order::any>(src, step);
    }
    static auto words(const u8* src, std::ptrdiff_t step) { return ac4AsWords(src, step); }
    template <class Sample> static auto target(Sample* dst, std::ptrdiff_t step) { return c1<Order::any>(dst, step); }
};

template <class Sample> PyxStatus grayFailure(const Sample* src, const Sample* dst, RoiSize roi)
{
    return firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1));
}

template <class Layout> PyxStatus gray(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const f32* coeffs)
{
    if (const PyxStatus failure = grayFailure(src, dst, roi)) return failure;
    const GrayWeights<int> weights = in32768ths(grayWeights(coeffs));
    const GrayExact exact(weights);
    const auto source = Layout::words(src, srcStep);
    const auto target = c1<Order::any>(dst, dstStep);
    if (!GrayHigh::suits(weights)) return eachRow(roi, source, target, everyPixel(exact));
    return eachRow(roi, source, target, wideThenTail<16>(GrayHigh(weights), exact));
}

template <class Layout>
PyxStatus gray(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, const f32* coeffs)
{
    if (const PyxStatus failure = grayFailure(src, dst, roi)) return failure;
    return eachRow(roi, Layout::source(src, srcStep), Layout::target(dst, dstStep),
                   everyPixel(GrayOfWords(grayWeights(coeffs))));
}

/// Steps count in samples: an odd one loses its low bit.
template <class Layout>
PyxStatus gray(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi, const f32* coeffs)
{
    if (const PyxStatus failure = grayFailure(src, dst, roi)) return failure;
    return eachRow(roi, Layout::source(src, srcStep & ~1), Layout::target(dst, dstStep & ~1),
                   everyPixel(OnRaisedWords<GrayOfWords>{GrayOfWords(grayWeights(coeffs))}));
}

template <class Layout, class Float>
PyxStatus gray(const Float* src, int srcStep, Float* dst, int dstStep, RoiSize roi,
               const std::type_identity_t<Float>* coeffs)
{
    if (const PyxStatus failure = grayFailure(src, dst, roi)) return failure;
    return eachRow(roi, Layout::source(src, srcStep), Layout::target(dst, dstStep),
                   everyPixel(GraySum<Float>(grayWeights(coeffs))));
}

} // namespace

PyxStatus PYXCC_CALL pyxiRGBToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiRGBToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, nullptr);
}

PyxStatus PYXCC_CALL pyxiColorToGray_8u_C3C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                              const f32 coeffs[3])
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_8u_AC4C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                               const f32 coeffs[3])
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_16u_C3C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               const f32 coeffs[3])
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_16u_AC4C1R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                const f32 coeffs[3])
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_16s_C3C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               const f32 coeffs[3])
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_16s_AC4C1R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                const f32 coeffs[3])
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_32f_C3C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                               const f32 coeffs[3])
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_32f_AC4C1R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi,
                                                const f32 coeffs[3])
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_64f_C3C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                               const f64 coeffs[3])
{
    return gray<FromC3>(src, srcStep, dst, dstStep, roi, coeffs);
}

PyxStatus PYXCC_CALL pyxiColorToGray_64f_AC4C1R(const f64* src, int srcStep, f64* dst, int dstStep, RoiSize roi,
                                                const f64 coeffs[3])
{
    return gray<FromAC4>(src, srcStep, dst, dstStep, roi, coeffs);
}
