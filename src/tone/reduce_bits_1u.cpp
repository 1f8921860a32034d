// Bytes to one bit a pixel.
#include "pyxcc/reduce_bits_1u.h"

#include "frame/checks.hpp"
#include "frame/number_checks.hpp"
#include "frame/scratch.hpp"
#include "lanes/avx2/bits.hpp"
#include "layouts/bit_rows.hpp"
#include "layouts/rows.hpp"

#include <algorithm>
#include <array>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;

namespace
{

constexpr int block = 32;

/// Takes a row by blocks, most of which begin where a byte of the target does. `bitsOf(x, count)` gives the bits of
/// some pixels from x on, the first as the highest.
template <class BitsOf> void eachBlock(const BitRow& target, int width, const BitsOf& bitsOf)
{
    int x = 0;
    const auto take = [&](int count) {
        target.store(x, count, bitsOf(x, count));
        x += count;
    };
    if (target.offset != 0) take(std::min(target.pixelsInFrontOfByte(), width));
    while (x <= width - block) take(block);
    if (x < width) take(width - x);
}

void takeByThreshold(const u8* source, const BitRow& target, int width, u8 threshold)
{
    const SampleRow<wide::U8, const u8> samples{source};
    eachBlock(target, width, [&](int x, int count) PYXCC_INLINE_LAMBDA {
        return bitsAbove(count == block ? samples.load(x) : samples.load(x, count), wide::U8(threshold));
    });
}

/// Rows of errors, the oldest last, with margins of zeros.
struct ErrorRows {
    Scratch<s32> memory;
    std::array<s32*, 3> row = {};

    explicit ErrorRows(int width)
    {
        if (width > 0x7fffffff / 4 - 12) return;
        const s32 length = (width + 4) & ~4;
        memory = allocate<s32>(3 * length + 12);
        if (!memory) return;
        std::fill_n(memory.get(), 3 * length + 12, 0);
        row = {memory.get() + 2, memory.get() + length + 6, memory.get() + 2 * length + 10};
    }
};

/// What the neighbours of a sample left, by weights of 42nds.
s32 weightedErrors(const s32* current, const s32* above, const s32* twoAbove)
{
    const auto sum = [](auto... errors) { return (0u + ... + static_cast<u32>(errors)); }; // wraps
    const u32 twice = sum(twoAbove[-1], twoAbove[1], above[-2], above[2]);
    const u32 once = sum(twoAbove[-2], twoAbove[2]);
    const u32 fourfold = sum(twoAbove[0], above[-1], above[1], current[-2]);
    const u32 eightfold = sum(above[0], current[-1]);
    return static_cast<s32>(once + 8 * eightfold + 4 * fourfold + 2 * twice);
}

/// Errors are eighths of a sample's unit. A set bit pays 2047 of them, where white gains 2040.
void diffuse(const u8* source, const BitRow& target, int width, u8 threshold, const ErrorRows& errors)
{
    const auto& [current, above, twoAbove] = errors.row;
    eachBlock(target, width, [&](int from, int count) {
        u32 bits = 0;
        for (int x = from; x < from + count; ++x) {
            const u32 left = static_cast<u32>(weightedErrors(current + x, above + x, twoAbove + x)) * 23u;
            const s32 w = static_cast<s32>((u32{source[x]} << 13) + left);
            const bool isSet = w > threshold * 8192;
            current[x] = (w >> 10) - (isSet ? 2047 : 0);
            bits |= u32{isSet} << (31 - (x - from));
        }
        return bits;
    });
}

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
    ErrorRows errors(roi.width);
    if (!errors.memory) return pyxErrNoMemory;
    for (int y = 0; y < roi.height; ++y) {
        diffuse(rowAt(src, srcStep, y), target(y), roi.width, threshold, errors);
        std::rotate(errors.row.begin(), errors.row.end() - 1, errors.row.end());
    }
    return pyxOk;
}
