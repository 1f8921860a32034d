// Bytes to one bit a pixel.
#include "pyxcc/reduce_bits_1u.h"

#include "frame/checks.hpp"
#include "frame/number_checks.hpp"
#include "lanes/avx2/bits.hpp"
#include "layouts/bit_rows.hpp"
#include "layouts/rows.hpp"
#include "tone/diffusion.hpp"

#include <algorithm>
#include <iterator>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;

namespace
{

constexpr int block = 32;

/// Blocks begin where a byte of the target does. What a long row has in front of the first one and behind the last comes
/// out of blocks as well, which begin and end where the row does, and bits that are set already are set once more.
void takeByThreshold(const u8* source, const BitRow& target, int width, u8 threshold)
{
    const SampleRow<wide::U8, const u8> samples{source};
    const wide::U8 limit(threshold);
    const auto bitsFrom = [&](int x) PYXCC_INLINE_LAMBDA { return bitsAbove(samples.load(x), limit); };
    const auto take = [&](int x) PYXCC_INLINE_LAMBDA { target.store(x, bitsFrom(x)); };
    int x = std::min(target.pixelsInFrontOfByte(), width);
    if (width < x + block) {
        target.store(0, x, bitsAbove(samples.load(0, x), limit));
        target.store(x, width - x, bitsAbove(samples.load(x, width - x), limit));
        return;
    }
    target.store(0, x, bitsFrom(0));
    for (; x <= width - 4 * block; x += 4 * block) {
        expectFrom<expectedLoads>(source + x);
        for (int i = 0; i < 4; ++i) take(x + i * block);
    }
    for (; x <= width - block; x += block) take(x);
    const int bits = (width - x) % 8;
    if (x < width - bits) take(width - bits - block);
    if (bits > 0) target.store(width - bits, bits, bitsFrom(width - block) << (block - bits));
}

/// Errors are eighths of a sample's unit, spread by 42nds. A set bit pays 2047 of them, where white gains 2040. All
/// sums wrap.
struct BitDiffusion {
    static constexpr int reach = 2;

    u8 threshold;
    int bitOffset;

    template <class Stage> void fetch(Stage& stage, const tone::detail::Band& band, int first) const
    {
        stage.fetch(band, first, [](const u8* row, int x) { return s32{row[x]}; });
        for (auto& ofStep : stage.thresholds) std::fill(std::begin(ofStep), std::end(ofStep), threshold * 8192);
    }

    template <class S32>
    PYXCC_INLINE auto operator()(const S32& sample, const S32& limit, const tone::Errors<S32>& errors) const
    {
        const auto& [left, above, twoAbove] = errors;
        const S32 twice = twoAbove[1] + twoAbove[3] + above[0] + above[4];
        const S32 once = twoAbove[0] + twoAbove[4];
        const S32 fourfold = twoAbove[2] + above[1] + above[3] + left[1];
        const S32 eightfold = above[2] + left[0];
        const S32 sum = once + (eightfold << 3) + (fourfold << 2) + (twice << 1);
        const S32 w = (sample << 13) + sum * S32(23);
        const S32 isSet = isAbove(w, limit);
        return tone::detail::Diffused<S32, S32>{(w >> 10) - (isSet & S32(2047)), isSet};
    }

    template <class Stage> void put(const Stage& stage, const tone::detail::Band& band, int first) const
    {
        stage.eachRow(band, first, [&](int r, int from, int to, int step) {
            const BitRow row{band.target + band.targetStep * r, bitOffset};
            while (from < to) {
                const int count = std::min(block, to - from);
                u32 bits = 0;
                for (int i = 0; i < count; ++i) bits |= (stage.results[step + i][r] & 1u) << (31 - i);
                row.store(from, count, bits);
                from += count;
                step += count;
            }
        });
    }
};

} // namespace

PyxStatus PYXCC_CALL pyxiReduceBits_8u1u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, s32 dstBitOffset,
                                             RoiSize roi, s32, s32, s32 ditherType, u8 threshold)
{
    const auto isKnown = [=]() -> PyxStatus { return ditherType == 0 || ditherType == 3 ? pyxOk : pyxErrDitherType; };
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1),
                                               within(dstBitOffset, 0, 0x7fffffff, pyxErrSize), isKnown))
        return failure;
    const auto target = [&](int y) { return BitRow{rowAt(dst, dstStep, y), dstBitOffset & 7}; };
    if (ditherType == 0) {
        for (int y = 0; y < roi.height; ++y) takeByThreshold(rowAt(src, srcStep, y), target(y), roi.width, threshold);
        return pyxOk;
    }
    // Rows are of this length, and not all of it is needed.
    const s32 length = roi.width > 0x7fffffff - 4 ? roi.width : (roi.width + 4) & ~4;
    tone::detail::ErrorRows<s32, 3> errors(length, BitDiffusion::reach);
    if (!errors.memory) return pyxErrNoMemory;
    constexpr int lanes = wide::S32::count;
    for (int y = 0; y < roi.height; y += lanes) {
        const tone::detail::Band band = {
            rowAt(src, srcStep, y),          srcStep, rowAt(dst, dstStep, y), dstStep, 1, roi.width,
            std::min(lanes, roi.height - y), y};
        tone::detail::diffuseBand<wide::S32>(band, BitDiffusion{threshold, target(y).offset}, errors);
    }
    return pyxOk;
}
