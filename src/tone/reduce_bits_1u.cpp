// Bytes to one bit a pixel.
#include "pyxcc/reduce_bits_1u.h"

#include "frame/checks.hpp"
#include "frame/number_checks.hpp"
#include "lanes/avx2/bits.hpp"
#include "layouts/avx2/columns.hpp"
#include "layouts/bit_rows.hpp"
#include "layouts/rows.hpp"
#include "tone/diffusion.hpp"

#include <algorithm>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;

namespace
{

constexpr int block = 32;

/// Blocks begin where a byte of the target does. What a long row has in front of the first one and behind the last
/// comes out of blocks as well, which begin and end where the row does, and bits that are set already are set once
/// more.
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

/// Samples of a band, and a byte for each step with a bit for each row. Those of the steps before stay for a while, for
/// rows to be written where blocks of the target end.
template <int Lanes, int Lag> struct BitStage : tone::detail::Steps<Lag> {
    using tone::detail::Steps<Lag>::steps;

    u8 samples[steps][Lanes] = {};
    u8 results[block + steps + block] = {}; ///< from those of the last steps before on
};

/// Errors are eighths of a sample's unit, spread by 42nds. A set bit pays 2047 of them, where white gains 2040. All
/// sums wrap.
struct BitDiffusion {
    static constexpr int reach = 2;
    template <int Lanes> using StageOf = BitStage<Lanes, reach + 1>;

    u8 threshold;
    int bitOffset;

    template <int Lanes, int Lag>
    void fetch(BitStage<Lanes, Lag>& stage, const tone::detail::Band& band, int first) const
    {
        constexpr int some = 8;
        for (int i = 0; i < stage.steps; i += some) {
            const int t = first + i;
            if (Lanes == some && band.rows == some && t >= Lag * (some - 1) && t <= band.width - some) {
                turnEights(band.source + t, band.sourceStep - Lag, stage.samples[i]);
                continue;
            }
            for (int r = 0; r < band.rows; ++r) {
                const u8* const row = rowAt(band.source, band.sourceStep, r) - std::ptrdiff_t{Lag} * r;
                const int from = std::max(t, Lag * r), to = std::min(t + some, band.width + Lag * r);
                for (int column = from; column < to; ++column) stage.samples[column - first][r] = row[column];
            }
        }
    }

    template <class Stage, class S32> PYXCC_INLINE S32 take(Stage& stage, int i, const tone::Errors<S32>& errors) const
    {
        const auto& [left, above, twoAbove] = errors;
        const S32 twice = twoAbove[1] + twoAbove[3] + above[0] + above[4];
        const S32 once = twoAbove[0] + twoAbove[4];
        const S32 fourfold = twoAbove[2] + above[1] + above[3] + left[1];
        const S32 sum = once + (above[2] << 3) + (fourfold << 2) + (twice << 1);
        const S32 w = (loadLanes(stage.samples[i], S32()) << 13) + sum * S32(23);
        // What all wait for comes last: 23 times eight times the error before.
        const S32 withLeft = (w - (left[0] << 3)) + ((left[0] << 7) + (left[0] << 6));
        const S32 isSet = isAbove(withLeft, S32(threshold * 8192));
        stage.results[block + i] = signsOf(isSet);
        return (withLeft >> 10) - (isSet & S32(2047));
    }

    /// By blocks of the target. What is left of a row behind its last one stays for the next steps, but for the end of
    /// the row.
    template <class Stage> void put(Stage& stage, const tone::detail::Band& band, int first) const
    {
        const auto writtenOf = [&](int x) { // of so many pixels that are there
            return x >= band.width ? band.width : std::max(((x + bitOffset) & -block) - bitOffset, 0);
        };
        stage.eachRow(band, first, [&](int r, int from, int to, int step) {
            const BitRow row{band.target + band.targetStep * r, bitOffset};
            const u8* const results = stage.results + block + step - from;
            const int end = writtenOf(to);
            for (int x = writtenOf(from); x < end;) {
                const int count = std::min(block - (x + bitOffset) % block, end - x);
                row.store(x, count, wide::bitOfEach(loadSamples<wide::U8>(results + x), r));
                x += count;
            }
        });
        std::copy_n(stage.results + stage.steps, block, stage.results);
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
