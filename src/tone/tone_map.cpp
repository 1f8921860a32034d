// Floats of any range to bytes, by one scale for the whole image.
#include "pyxcc/tone_map.h"

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "layouts/gray_images.hpp"
#include "layouts/streamed_images.hpp"
#include "tone/tone_map_forms.hpp"
#include "tone/tone_map_statistics.hpp"

#include <algorithm>
#include <cstdint>
#include <limits>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::tone;

namespace
{

/// A row of floats on their way to bytes. The row that is taken next lies somewhere else, and is expected there.
struct FloatsOfRow {
    static constexpr int block = wide::U8::count;
    const u8* at;
    std::ptrdiff_t toNextRow;

    PYXCC_INLINE auto load(int x) const
    {
        const u8* const p = at + std::ptrdiff_t{x} * 4;
        expectFrom<0>(p + toNextRow);
        return FloatsForBytes::load(p);
    }

    PYXCC_INLINE auto load(int x, int count) const { return floatsForBytes(at).load(x, count); }
};

/// The image of a call. Rows of the source begin a whole number of samples from the first, whatever the step.
struct Images {
    const f32* src;
    int srcStep;
    u8* dst;
    int dstStep;
    RoiSize roi;

    const u8* source(int y) const { return bytes(src) + (std::ptrdiff_t{srcStep} * y & ~std::ptrdiff_t{3}); }
    u8* target(int y) const { return rowAt(dst, dstStep, y); }
};

/// Where source and target share memory the result is that of one sample after the other. Blocks give the same unless
/// the target's row begins among the source's samples, and so is ahead of their reading.
bool runsAheadOf(const u8* source, const u8* target, int width)
{
    const auto s = reinterpret_cast<std::uintptr_t>(source), d = reinterpret_cast<std::uintptr_t>(target);
    return d > s && d - s < std::uintptr_t{4} * static_cast<std::uintptr_t>(width);
}

template <class Form> void mapOneByOne(const u8* source, u8* target, int width, const Form& form)
{
    for (int x = 0; x < width; ++x) target[x] = scalar::saturate<u8>(form(scalar::F32(sampleAt<f32>(source, x))));
}

/// Rows from top to bottom, as they may share memory.
template <class Form> void mapDownwards(const Images& images, const Form& form)
{
    for (int y = 0; y < images.roi.height; ++y) {
        const u8* const source = images.source(y);
        u8* const target = images.target(y);
        if (runsAheadOf(source, target, images.roi.width)) {
            mapOneByOne(source, target, images.roi.width, form);
        } else {
            convertColumns(floatsForBytes(source), bytesOfFloats(target), 0, images.roi.width, form);
        }
    }
}

/// Rows from bottom to top: what the statistic has read last is still near. The target goes past the cache, which it
/// would only take from the source.
template <class Form> void mapUpwards(const Images& images, const Form& form)
{
    for (int y = images.roi.height - 1; y >= 0; --y) {
        const u8* const source = images.source(y);
        const FloatsOfRow from{source, images.source(std::max(y - 1, 0)) - source};
        const StreamedRow<decltype(bytesOfFloats(images.target(y)))> to{bytesOfFloats(images.target(y))};
        const int aligned = std::min(to.firstAligned(), images.roi.width);
        convertColumns(from, to, 0, aligned, form);
        convertColumns(from, to, aligned, images.roi.width, form);
    }
    fenceStreams();
}

/// Whether an image is larger than the nearer caches, and takes up memory that the target has no part of. Rows of a
/// target may share memory as well, and then the last of them counts.
bool allowsUpwards(const Images& images)
{
    const auto [src, srcStep, dst, dstStep, roi] = images;
    constexpr std::int64_t nearCaches = 2 << 20;
    const std::int64_t width = roi.width, height = roi.height;
    if (width * height * 4 < nearCaches || srcStep < width * 4 || dstStep < width) return false;
    const auto s = reinterpret_cast<std::uintptr_t>(src), d = reinterpret_cast<std::uintptr_t>(dst);
    return d + static_cast<std::uint64_t>(dstStep * height) <= s ||
           s + static_cast<std::uint64_t>(srcStep * height) <= d;
}

template <class Form> void mapSamples(const Images& images, const Form& form)
{
    if (allowsUpwards(images)) {
        mapUpwards(images, form);
    } else {
        mapDownwards(images, form);
    }
}

template <class Form, class Level>
PyxStatus mapByLevel(Level level, const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (level < 0) return pyxWarnNegativeLevel;
    if (level > std::numeric_limits<f32>::min()) {
        mapSamples(Images{src, srcStep, dst, dstStep, roi}, Form{static_cast<f32>(255 / level)});
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
