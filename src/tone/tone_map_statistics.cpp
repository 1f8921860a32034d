#include "tone/tone_map_statistics.hpp"

#include "lanes/lanes.hpp"
#include "layouts/avx2/interleave.hpp"
#include "layouts/bytes.hpp"

#include <cstring>
#include <limits>

namespace pyxcc::tone
{

namespace
{

/// So many registers at once that none waits for its sum or its comparison.
constexpr int registers = 4;
constexpr int block = registers * wide::F32::count;
using Block = Several<wide::F32, registers>;
using Sums = Several<wide::F64, 2 * registers>;

PYXCC_INLINE Block loadBlock(const u8* row, int x)
{
    const u8* const p = row + std::ptrdiff_t{x} * 4;
    layouts::expectFrom<4096>(p);
    Block samples;
    for (int i = 0; i < registers; ++i) samples.part[i] = layouts::loadSamples<wide::F32>(p + std::ptrdiff_t{32} * i);
    return samples;
}

f32 largerOrLater(f32 level, f32 sample) { return level > sample ? level : sample; }

/// One sample after the other.
f32 largestInTurn(const f32* src, int srcStep, RoiSize roi)
{
    f32 level = std::numeric_limits<f32>::lowest();
    for (int y = 0; y < roi.height; ++y) {
        const u8* const row = layouts::rowAt(layouts::bytes(src), srcStep, y);
        for (int x = 0; x < roi.width; ++x) level = largerOrLater(level, layouts::sampleAt<f32>(row, x));
    }
    return level;
}

} // namespace

/// Which of finite samples is the largest does not depend on their order.
f32 largestSample(const f32* src, int srcStep, RoiSize roi)
{
    Block best(std::numeric_limits<f32>::lowest()), zeros(0.0f); // zeros: NaN from the first that is not finite on
    f32 level = std::numeric_limits<f32>::lowest(), zero = 0;
    for (int y = 0; y < roi.height; ++y) {
        const u8* const row = layouts::rowAt(layouts::bytes(src), srcStep, y);
        int x = 0;
        for (; x <= roi.width - block; x += block) {
            const Block samples = loadBlock(row, x);
            best = greater(best, samples);
            zeros = fused(samples, Block(0.0f), zeros);
        }
        for (; x < roi.width; ++x) {
            level = largerOrLater(level, layouts::sampleAt<f32>(row, x));
            zero += layouts::sampleAt<f32>(row, x) * 0;
        }
    }
    f32 lanes[block], checks[block];
    std::memcpy(lanes, &best, sizeof lanes);
    std::memcpy(checks, &zeros, sizeof checks);
    for (int i = 0; i < block; ++i) {
        level = largerOrLater(level, lanes[i]);
        zero += checks[i];
    }
    return zero == 0 ? level : largestInTurn(src, srcStep, roi);
}

f64 sumOfSamples(const f32* src, int srcStep, RoiSize roi)
{
    Sums sums(0.0);
    f64 sum = 0;
    for (int y = 0; y < roi.height; ++y) {
        const u8* const row = layouts::rowAt(layouts::bytes(src), srcStep, y);
        int x = 0;
        for (; x <= roi.width - block; x += block) sums = sums + toF64(loadBlock(row, x));
        for (; x < roi.width; ++x) sum += static_cast<f64>(layouts::sampleAt<f32>(row, x));
    }
    f64 lanes[block];
    std::memcpy(lanes, &sums, sizeof lanes);
    for (const f64 lane : lanes) sum += lane;
    return sum;
}

} // namespace pyxcc::tone
