// YCbCr 4:2:0 to and from chroma of quarter width, with chroma interpolated or thinned out.
#include "pyxcc/repack.h"

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "lanes/lanes.hpp"
#include "layouts/avx2/turns.hpp"
#include "layouts/bytes.hpp"

#include <algorithm>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using wide::U8;

namespace
{

struct Source {
    const u8* first;
    std::ptrdiff_t step;

    const u8* row(int y) const { return rowAt(first, step, y); }
};

struct Target {
    u8* first;
    std::ptrdiff_t step;

    u8* row(int y) const { return rowAt(first, step, y); }
};

/// Copies luma, and takes each plane of chroma through `resampled`.
template <class Resampled>
PyxStatus resample(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3], RoiSize roi,
                   const Resampled& resampled)
{
    copyPlane8u(src[0], srcStep[0], dst[0], dstStep[0], roi.width, roi.height);
    for (int i = 1; i < 3; ++i)
        resampled(Source{src[i], srcStep[i]}, Target{dst[i], dstStep[i]}, roi.width / 4, roi.height);
    return pyxOk;
}

auto checks(const u8* const src[3], u8* const dst[3], RoiSize roi, int width, int height)
{
    return firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst),
                        wholeBlocks(roi, width, height));
}

/// Samples of a row, and what lies half way to the next ones.
struct HalfWay {
    U8 own, between;
};

/// Every other sample of a row of half width.
PYXCC_INLINE U8 everyOtherFrom(const u8* p) { return dealt<1>(loadSamples(p), loadSamples(p + U8::count)).a; }

/// To a row of half width.
PYXCC_INLINE void storeTurns(u8* p, U8 even, U8 odd)
{
    const Two<U8> samples = alternated<1>(even, odd);
    storeSamples(p, samples.a);
    storeSamples(p + U8::count, samples.b);
}

/// 32 samples of a row of chroma of quarter width. Halves are rounded up.
struct WholeBlock {
    static PYXCC_INLINE U8 average(U8 x, U8 y) { return wide::avgUp(x, y); }

    static PYXCC_INLINE HalfWay loadHalfWay(const u8* p)
    {
        expectFrom<expectedLoads, 1>(p);
        const U8 own = loadSamples(p);
        return {own, average(own, loadSamples(p + 1))};
    }

    static PYXCC_INLINE U8 loadEveryOther(const u8* p)
    {
        expectFrom<expectedLoads, 1>(p);
        return everyOtherFrom(p);
    }

    static PYXCC_INLINE void store(u8* p, U8 samples)
    {
        expectFrom<expectedStores, 1>(p);
        storeSamples(p, samples);
    }

    static PYXCC_INLINE void storeByTurns(u8* p, U8 even, U8 odd)
    {
        expectFrom<expectedStores, 1>(p);
        storeTurns(p, even, odd);
    }
};

/// The last samples of a row, 32 at the most. Halves are rounded up in the first columns and down in the others, and
/// the last sample is its own neighbour.
struct LastBlock {
    int count;
    int columnsUp;

    PYXCC_INLINE U8 average(U8 x, U8 y) const { return wide::avgUpBelow(columnsUp, x, y); }

    PYXCC_INLINE HalfWay loadHalfWay(const u8* p) const
    {
        u8 buffer[U8::count + 1] = {};
        copyBytes(buffer, p, count);
        buffer[count] = p[count - 1];
        const U8 own = loadSamples(buffer);
        return {own, average(own, loadSamples(buffer + 1))};
    }

    PYXCC_INLINE U8 loadEveryOther(const u8* p) const
    {
        u8 buffer[2 * U8::count] = {};
        copyBytes(buffer, p, 2 * count);
        return everyOtherFrom(buffer);
    }

    PYXCC_INLINE void store(u8* p, U8 samples) const
    {
        u8 buffer[U8::count];
        storeSamples(buffer, samples);
        copyBytes(p, buffer, count);
    }

    PYXCC_INLINE void storeByTurns(u8* p, U8 even, U8 odd) const
    {
        u8 buffer[2 * U8::count];
        storeTurns(buffer, even, odd);
        copyBytes(p, buffer, 2 * count);
    }
};

/// Takes a row of n samples by whole blocks, as far as the columns go that round up, and a last one.
template <class Take> PYXCC_INLINE void eachBlock(int n, int columnsUp, const Take& take)
{
    int k = 0;
    for (; k + U8::count <= columnsUp; k += U8::count) take(k, WholeBlock());
    if (k < n) take(k, LastBlock{n - k, columnsUp - k});
}

/// The columns that round up where samples are interpolated along a row: the last sample is never one of them.
int columnsUpAlong(int n) { return (n - 1) & ~15; }

/// Those where samples are interpolated between rows.
int columnsUpBetween(int n) { return n & ~31; }

// One plane of chroma from one grid to another. n is the width of 4:1:1 or 1620 chroma, and rows are those of luma.

void from411To420(const Source& source, const Target& target, int n, int height)
{
    for (int j = 0; j < height / 2; ++j) {
        const u8* const from = source.row(2 * j);
        u8* const to = target.row(j);
        eachBlock(n, columnsUpAlong(n), [&](std::ptrdiff_t k, const auto& block) PYXCC_INLINE_LAMBDA {
            const HalfWay x = block.loadHalfWay(from + k);
            block.storeByTurns(to + 2 * k, x.own, x.between);
        });
    }
}

/// Rows are interpolated as columns are, but for the last one, which has the source's samples twice.
void from1620To420(const Source& source, const Target& target, int n, int height)
{
    const int last = height / 4 - 1;
    for (int r = 0; r < last; ++r) {
        const u8 *const from = source.row(r), *const below = source.row(r + 1);
        u8 *const to = target.row(2 * r), *const between = target.row(2 * r + 1);
        eachBlock(n, columnsUpAlong(n), [&](std::ptrdiff_t k, const auto& block) PYXCC_INLINE_LAMBDA {
            const HalfWay x = block.loadHalfWay(from + k), y = block.loadHalfWay(below + k);
            block.storeByTurns(to + 2 * k, x.own, x.between);
            block.storeByTurns(between + 2 * k, block.average(x.own, y.own), block.average(x.between, y.between));
        });
    }
    const u8* const from = source.row(last);
    u8 *const to = target.row(2 * last), *const below = target.row(2 * last + 1);
    eachBlock(n, columnsUpAlong(n), [&](std::ptrdiff_t k, const auto& block) PYXCC_INLINE_LAMBDA {
        const HalfWay x = block.loadHalfWay(from + k);
        block.storeByTurns(to + 2 * k, x.own, x.between);
        block.storeByTurns(below + 2 * k, x.own, x.own);
    });
}

/// Every other row lies half way between two of the source; the last one is the one above it. A first such row is made
/// in any case: of two rows of luma it takes a second row of chroma, which the source has to have behind its one, and
/// makes four rows in place of two.
void from420To411(const Source& source, const Target& target, int n, int height)
{
    const int last = std::max(1, height / 2 - 1);
    for (int r = 0; r <= last; ++r) {
        const u8 *const from = source.row(r), *const below = source.row(std::min(r + 1, last));
        u8 *const to = target.row(2 * r), *const between = target.row(2 * r + 1);
        eachBlock(n, columnsUpBetween(n), [&](std::ptrdiff_t i, const auto& block) PYXCC_INLINE_LAMBDA {
            const U8 x = block.loadEveryOther(from + 2 * i), y = block.loadEveryOther(below + 2 * i);
            block.store(to + i, x);
            block.store(between + i, block.average(x, y));
        });
    }
}

/// Every other sample of every other row; nothing is averaged.
void from420To1620(const Source& source, const Target& target, int n, int height)
{
    for (int r = 0; r < height / 4; ++r) {
        const u8* const from = source.row(2 * r);
        u8* const to = target.row(r);
        eachBlock(n, columnsUpBetween(n), [&](std::ptrdiff_t i, const auto& block) PYXCC_INLINE_LAMBDA {
            block.store(to + i, block.loadEveryOther(from + 2 * i));
        });
    }
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr411To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                              const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = checks(src, dst, roi, 4, 4)) return failure;
    return resample(src, srcStep, dst, dstStep, roi, from411To420);
}

PyxStatus PYXCC_CALL pyxiYCbCr1620To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = checks(src, dst, roi, 4, 4)) return failure;
    return resample(src, srcStep, dst, dstStep, roi, from1620To420);
}

PyxStatus PYXCC_CALL pyxiYCbCr420To411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                              const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = checks(src, dst, roi, 4, 2)) return failure;
    return resample(src, srcStep, dst, dstStep, roi, from420To411);
}

PyxStatus PYXCC_CALL pyxiYCbCr420To1620_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = checks(src, dst, roi, 4, 4)) return failure;
    return resample(src, srcStep, dst, dstStep, roi, from420To1620);
}
