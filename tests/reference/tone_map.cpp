#include "reference/tone_map.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/image.hpp"
#include "reference/pixels.hpp"

#include <cstddef>
#include <cstring>
#include <limits>

namespace reference
{

namespace
{

/// The largest sample. Of two that do not compare it is the later that counts.
f32 largest(const Channel<const f32>& image, RoiSize roi)
{
    f32 level = std::numeric_limits<f32>::lowest();
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const f32 sample = image.get(row, column);
            level = level > sample ? level : sample;
        }
    }
    return level;
}

/// The count of samples is a product in 32 bits.
f64 mean(const Channel<const f32>& image, RoiSize roi)
{
    f64 sum = 0;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) sum += static_cast<f64>(image.get(row, column));
    }
    const u32 count = static_cast<u32>(roi.width) * static_cast<u32>(roi.height);
    return sum / static_cast<f64>(static_cast<s32>(count));
}

/// Rows of the source begin at multiples of 4 bytes from the first one. One sample after the other, as source and
/// target may share memory.
void mapSamples(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi, f32 scale, u8 (*stored)(s32))
{
    for (int row = 0; row < roi.height; ++row) {
        const std::ptrdiff_t offset = std::ptrdiff_t{row} * srcStep & ~std::ptrdiff_t{3};
        const std::byte* const source = reinterpret_cast<const std::byte*>(src) + offset;
        u8* const target = dst + std::ptrdiff_t{row} * dstStep;
        for (int column = 0; column < roi.width; ++column) {
            f32 sample;
            std::memcpy(&sample, source + std::ptrdiff_t{column} * 4, sizeof sample);
            target[column] = stored(truncated(scale * sample));
        }
    }
}

} // namespace

// Bytes wrap.
PyxStatus pyxiToneMapLinear_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const f32 level = largest(Channel<const f32>(src, srcStep, 1), roi);
    if (level < 0) return pyxWarnNegativeLevel;
    if (level > std::numeric_limits<f32>::min()) {
        mapSamples(src, srcStep, dst, dstStep, roi, 255.0f / level, lowBits<u8>);
    } else {
        fill(Channel<u8>(dst, dstStep, 1), roi, u8{0});
    }
    return pyxOk;
}

// Bytes saturate.
PyxStatus pyxiToneMapMean_32f8u_C1R(const f32* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const f64 average = mean(Channel<const f32>(src, srcStep, 1), roi);
    const f64 level = average + average;
    if (level < 0) return pyxWarnNegativeLevel;
    if (level > static_cast<f64>(std::numeric_limits<f32>::min())) {
        mapSamples(src, srcStep, dst, dstStep, roi, static_cast<f32>(255.0 / level), saturated<u8>);
    } else {
        fill(Channel<u8>(dst, dstStep, 1), roi, u8{0});
    }
    return pyxOk;
}

} // namespace reference
