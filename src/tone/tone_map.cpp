// Floats of any range to bytes, by one scale for the whole image.
#include "pyxcc/tone_map.h"

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "layouts/gray_images.hpp"
#include "tone/tone_map_forms.hpp"
#include "tone/tone_map_statistics.hpp"

#include <cstdint>
#include <cstring>
#include <limits>

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::tone;

namespace
{

/// Where source and target share memory the result is that of one sample after the other. Blocks give the same unless
/// the target's row begins among the source's samples, and so is ahead of their reading.
bool runsAheadOf(const u8* source, const u8* target, int width)
{
    const auto s = reinterpret_cast<std::uintptr_t>(source), d = reinterpret_cast<std::uintptr_t>(target);
    return d > s && d - s < std::uintptr_t{4} * static_cast<std::uintptr_t>(width);
}

template <class Form> void mapOneByOne(const u8* source, u8* target, int width, const Form& form)
{
    for (int x = 0; x < width; ++x) {
        f32 sample;
        std::memcpy(&sample, source + std::ptrdiff_t{x} * 4, sizeof sample);
        target[x] = pyxcc::scalar::saturate<u8>(form(pyxcc::scalar::F32(sample)));
    }
}

/// Rows of the source begin a whole number of samples from the first, whatever the step.
template <class Form> void mapSamples(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, const Form& form)
{
    for (int y = 0; y < roi.height; ++y) {
        const u8* const source = bytes(src) + (std::ptrdiff_t{srcStep} * y & ~std::ptrdiff_t{3});
        u8* const target = rowAt(dst, dstStep, y);
        if (runsAheadOf(source, target, roi.width)) {
            mapOneByOne(source, target, roi.width, form);
        } else {
            convertColumns(floatsForBytes(source), bytesOfFloats(target), 0, roi.width, form);
        }
    }
}

template <class Form, class Level>
PyxStatus mapByLevel(Level level, const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (level < 0) return pyxWarnNegativeLevel;
    if (level > std::numeric_limits<f32>::min()) {
        mapSamples(src, srcStep, dst, dstStep, roi, Form{static_cast<f32>(255 / level)});
    } else {
        fillPlane8u(0, dst, dstStep, roi.width, roi.height);
    }
    return pyxOk;
}

/// The count of samples is a product in 32 bits.
f64 meanOfSamples(const f32* src, int srcStep, RoiSize roi)
{
    return sumOfSamples(src, srcStep, roi) /
           static_cast<s32>(static_cast<u32>(roi.width) * static_cast<u32>(roi.height));
}

} // namespace

PyxStatus PYXCC_CALL pyxiToneMapLinear_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return mapByLevel<ScaledLowByte>(largestSample(src, srcStep, roi), src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiToneMapMean_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return mapByLevel<ScaledSaturated>(2 * meanOfSamples(src, srcStep, roi), src, srcStep, dst, dstStep, roi);
}
