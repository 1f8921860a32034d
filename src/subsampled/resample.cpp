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

/// Stores `count` samples at the most.
PYXCC_INLINE void storePart(u8* p, int count, U8 samples)
{
    if (count >= U8::count) return storeSamples(p, samples);
    u8 buffer[U8::count];
    storeSamples(buffer, samples);
    copyBytes(p, buffer, count);
}

/// Stores samples of two blocks by turns, 2 `count` at the most.
PYXCC_INLINE void storeByTurns(u8* p, int count, U8 even, U8 odd)
{
    expectFrom<expectedStores, 1>(p);
    const Two<U8> samples = alternated<1>(even, odd);
    storePart(p, std::min(2 * count, 64), samples.a);
    if (2 * count > U8::count) storePart(p + U8::count, 2 * count - U8::count, samples.b);
}

/// Samples of a row and what lies half way to the next ones, with halves rounded up in the first columns and down in
/// the others. The last sample is its own neighbour.
struct HalfWay {
    U8 own, between;
};

/// The columns that round up, of n.
int columnsUp(int n) { return (n - 1) & ~15; }

PYXCC_INLINE HalfWay loadHalfWay(const u8* row, int k, int n)
{
    const auto halfWay = [up = columnsUp(n) - k](const u8* p) PYXCC_INLINE_LAMBDA {
        const U8 own = loadSamples(p);
        return HalfWay{own, wide::avgUpBelow(up, own, loadSamples(p + 1))};
    };
    if (k + U8::count < n) {
        expectFrom<expectedLoads, 1>(row + k);
        return halfWay(row + k);
    }
    u8 buffer[U8::count + 1] = {};
    copyBytes(buffer, row + k, n - k);
    buffer[n - k] = row[n - 1];
    return halfWay(buffer);
}

/// Every other sample of 2 n, from column 2 i on.
PYXCC_INLINE U8 loadEveryOther(const u8* row, int i, int n)
{
    if (i + U8::count <= n) {
        expectFrom<expectedLoads, 1>(row + 2 * i);
        return dealt<1>(loadSamples(row + 2 * i), loadSamples(row + 2 * i + U8::count)).a;
    }
    u8 buffer[2 * U8::count] = {};
    copyBytes(buffer, row + 2 * i, 2 * (n - i));
    return dealt<1>(loadSamples(buffer), loadSamples(buffer + U8::count)).a;
}

// One plane of chroma from one grid to another. n is the width of 4:1:1 or 1620 chroma, and rows are those of luma.

void from411To420(const Source& source, const Target& target, int n, int height)
{
    for (int j = 0; j < height / 2; ++j) {
        const u8* const from = source.row(2 * j);
        u8* const to = target.row(j);
        for (int k = 0; k < n; k += U8::count) {
            const HalfWay x = loadHalfWay(from, k, n);
            storeByTurns(to + 2 * k, n - k, x.own, x.between);
        }
    }
}

/// Rows are interpolated like columns are, but for the last one, which has the source's samples twice.
void from1620To420(const Source& source, const Target& target, int n, int height)
{
    const int last = height / 4 - 1;
    for (int r = 0; r <= last; ++r) {
        const u8 *const from = source.row(r), *const below = source.row(std::min(r + 1, last));
        u8 *const to = target.row(2 * r), *const between = target.row(2 * r + 1);
        for (int k = 0; k < n; k += U8::count) {
            const HalfWay x = loadHalfWay(from, k, n);
            storeByTurns(to + 2 * k, n - k, x.own, x.between);
            if (r == last) {
                storeByTurns(between + 2 * k, n - k, x.own, x.own);
            } else {
                const HalfWay y = loadHalfWay(below, k, n);
                const int up = columnsUp(n) - k;
                storeByTurns(between + 2 * k, n - k, wide::avgUpBelow(up, x.own, y.own),
                             wide::avgUpBelow(up, x.between, y.between));
            }
        }
    }
}

/// Every other row lies half way between the rows of the source, with halves rounded up in whole blocks of columns and
/// down in what is left. Such a row is made of the first two rows in any case: of two rows of luma this takes a second
/// row of chroma, which the source has to have behind its one, and makes four in place of two.
void from420To411(const Source& source, const Target& target, int n, int height)
{
    const int last = std::max(1, height / 2 - 1);
    for (int r = 0; r <= last; ++r) {
        const u8 *const from = source.row(r), *const below = source.row(std::min(r + 1, last));
        u8 *const to = target.row(2 * r), *const between = target.row(2 * r + 1);
        for (int i = 0; i < n; i += U8::count) {
            const U8 x = loadEveryOther(from, i, n), y = loadEveryOther(below, i, n);
            expectFrom<expectedStores, 1>(to + i);
            expectFrom<expectedStores, 1>(between + i);
            storePart(to + i, n - i, x);
            storePart(between + i, n - i, n - i < U8::count ? wide::avgDown(x, y) : wide::avgUp(x, y));
        }
    }
}

/// Every other sample of every other row; nothing is averaged.
void from420To1620(const Source& source, const Target& target, int n, int height)
{
    for (int r = 0; r < height / 4; ++r) {
        const u8* const from = source.row(2 * r);
        u8* const to = target.row(r);
        for (int i = 0; i < n; i += U8::count) {
            expectFrom<expectedStores, 1>(to + i);
            storePart(to + i, n - i, loadEveryOther(from, i, n));
        }
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
