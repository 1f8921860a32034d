// A sensor's mosaic to RGB by means of the samples around each.
#include "pyxcc/cfa_to_rgb.h"

#include "frame/checks.hpp"
#include "layouts/avx2/pairs_of_triples.hpp"
#include "mosaic/halved_rows.hpp"
#include "mosaic/sites.hpp"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::mosaic;

namespace
{

/// The mosaic and the part of it that is converted: columns from `left` up to `right` and rows from `top` up to
/// `bottom`, both ends in front of the last. Steps are of whole samples.
template <class T> struct Work {
    const T* source;
    std::ptrdiff_t sourcePitch;
    s32 width, height;
    T* target;
    std::ptrdiff_t targetPitch;
    s32 left, top, right, bottom;
    s32 grid;

    const T* row(s32 y) const { return source + sourcePitch * y; }

    u8* pixel(s32 x, s32 y) const
    {
        return bytes(target + targetPitch * (std::ptrdiff_t{y} - top) + (std::ptrdiff_t{x} - left) * 3);
    }

    bool rowsAreApart() const { return std::abs(targetPitch) >= 3 * (std::ptrdiff_t{right} - left); }

    /// The first column that is not in the frame.
    s32 innerLeft() const { return std::max(left, 2); }
};

enum class Green { plain, alongEdges };

/// Converts `count` columns of a row from an even number of columns behind `from` on.
template <Green green, bool siteFirst, bool redRow, class T>
// NOLINTNEXTLINE(readability-non-const-parameter): it is written through the row of pixels
void convertPairs(const RowsAround<T>& rows, u8* target, int count)
{
    using Samples = pyxcc::wide::RegisterOf<T>;
    const InterleavedRow<PairsOfC3<Samples>, u8> pixels{target, {}};
    const auto colors = [&rows](std::ptrdiff_t pair) PYXCC_INLINE_LAMBDA {
        if constexpr (green == Green::plain) {
            return meansAround(rows.template pairs<siteFirst>(pair));
        } else {
            return meansAlongEdges(rows.template widePairs<siteFirst>(pair));
        }
    };
    const auto inOrder = [](const Colors<Samples>& x) PYXCC_INLINE_LAMBDA {
        const auto rgb = [](const Three<Samples>& place) PYXCC_INLINE_LAMBDA {
            return redRow ? place : Three<Samples>{place.c, place.b, place.a};
        };
        return siteFirst ? Two{rgb(x.site), rgb(x.green)} : Two{rgb(x.green), rgb(x.site)};
    };
    constexpr int block = pixels.block;
    const int whole = count / block * block;
    for (int x = 0; x < whole; x += block) {
        expectFrom<64, 1>(bytes(rows.next + x));
        expectFrom<expectedStores + 128, 1>(pixels.pixel(x)); // the third line of the block
        pixels.store(x, inOrder(colors(x / 2)));
    }
    if (whole < count) pixels.store(whole, count - whole, inOrder(colors(whole / 2)));
}

template <Green green, class T>
void convertSpan(const Work<T>& work, s32 y, s32 from, int count, const RowsAround<T>& rows)
{
    u8* const target = work.pixel(from, y);
    switch (siteAt(work.grid, from, y)) {
    case Site::red:
        return convertPairs<green, true, true>(rows, target, count);
    case Site::blue:
        return convertPairs<green, true, false>(rows, target, count);
    case Site::greenOfRedRow:
        return convertPairs<green, false, true>(rows, target, count);
    case Site::greenOfBlueRow:
        return convertPairs<green, false, false>(rows, target, count);
    }
}

/// The place that lies as far inside as one beyond the first or the last lies outside.
constexpr s32 before(s32 place) { return place == 0 ? 1 : place - 1; }
constexpr s32 behind(s32 place, s32 count) { return place == count - 1 ? place - 1 : place + 1; }

template <class T> void convertPixel(const Work<T>& work, s32 x, s32 y)
{
    using Sample = pyxcc::scalar::Lane<T>;
    const T* const upper = work.row(before(y));
    const T* const middle = work.row(y);
    const T* const lower = work.row(behind(y, work.height));
    const s32 left = before(x), right = behind(x, work.width);
    const Site site = siteAt(work.grid, x, y);
    Three<Sample> colors;
    if (isGreen(site)) {
        colors = {avgUp(Sample(middle[left]), Sample(middle[right])), middle[x],
                  avgUp(Sample(upper[x]), Sample(lower[x]))};
    } else {
        const Pair<Sample> pair = {middle[x], middle[right], middle[x],    middle[left], upper[x],
                                   lower[x],  upper[right],  lower[right], upper[left],  lower[left]};
        colors = meansAround(pair).site;
    }
    const bool redRow = isOfRedRow(site);
    const T samples[] = {(redRow ? colors.a : colors.c).v, colors.b.v, (redRow ? colors.c : colors.a).v};
    std::memcpy(work.pixel(x, y), samples, sizeof samples);
}

/// The columns of the region without two along each edge of the mosaic, in stretches: one at least, but it may be
/// empty.
template <class T, class Stretch> void eachStretch(const Work<T>& work, const Stretch& of)
{
    const s32 to = std::max(std::min(work.right, work.width - 2), work.innerLeft());
    s32 x = work.innerLeft();
    do {
        const int count = std::min(to - x, stretch);
        of(x, count);
        x += count;
    } while (x < to);
}

/// A row of the frame: plain means, of mirrored samples at its ends.
template <class T> void convertFrameRow(const Work<T>& work, s32 y)
{
    const s32 from = std::clamp(2, work.left, work.right), to = std::clamp(work.width - 2, from, work.right);
    for (s32 x = work.left; x < from; ++x) convertPixel(work, x, y);
    eachStretch(work, [&](s32 x, int count) {
        if (count == 0) return;
        HalvedRow<T> upper, middle, lower;
        upper.take(work.row(before(y)) + x, count);
        middle.take(work.row(y) + x, count);
        lower.take(work.row(behind(y, work.height)) + x, count);
        convertSpan<Green::plain>(work, y, x, count, {{nullptr, &upper, &middle, &lower, nullptr}, work.row(y)});
    });
    for (s32 x = to; x < work.right; ++x) convertPixel(work, x, y);
}

/// Two samples at both ends of a row, as far as they are asked for.
template <class T> void convertFrameColumns(const Work<T>& work, s32 y)
{
    const s32 w = work.width;
    if (work.left == 0) convertPixel(work, 0, y);
    if (w >= 3 && (work.left == 1 || (work.left == 0 && work.right >= 2))) convertPixel(work, 1, y);
    if (w >= 3 && work.right >= w - 1 && work.left < w - 1) convertPixel(work, w - 2, y);
    if (work.right == w) convertPixel(work, w - 1, y);
}

/// Rows that are not in the frame, with or without what of them is. A row is taken apart once, for five of the target.
template <class T> void convertRows(const Work<T>& work, s32 top, s32 bottom, bool withFrame)
{
    if (top >= bottom) return;
    eachStretch(work, [&](s32 x, int count) {
        constexpr int ring = 8;
        HalvedRow<T> rows[ring];
        const auto take = [&](s32 y) {
            if (count > 0) rows[y % ring].take(work.row(y) + x, count);
        };
        const auto around = [&](s32 y) {
            RowsAround<T> of;
            for (int i = 0; i < 5; ++i) of.row[i] = &rows[(y + i - 2) % ring];
            of.next = work.row(y + 3) + x;
            return of;
        };
        for (s32 y = top - 2; y < top + 2; ++y) take(y);
        for (s32 y = top; y < bottom; ++y) {
            take(y + 2);
            if (count > 0) convertSpan<Green::alongEdges>(work, y, x, count, around(y));
            if (withFrame && x == work.innerLeft()) convertFrameColumns(work, y);
        }
    });
}

/// First two samples along each edge, as far as they are asked for, then what is inside. A region in front of the
/// mosaic has no part in its first edge. Columns of the frame go along with the rows inside, unless rows of the target
/// overlap: each piece is then written over those in front of it, and each row over the one above.
template <class T> void convertPieces(const Work<T>& work)
{
    const s32 h = work.height;
    const s32 top = std::max(work.top, 2), bottom = std::min(work.bottom, h - 2);
    const bool apart = work.rowsAreApart();
    if (work.top == 0) convertFrameRow(work, 0);
    if (h >= 3 && (work.top == 1 || (work.top == 0 && work.bottom >= 2))) convertFrameRow(work, 1);
    for (s32 y = top; y < bottom && !apart; ++y) convertFrameColumns(work, y);
    if (h >= 3 && work.bottom >= h - 1 && work.top < h - 1) convertFrameRow(work, h - 2);
    if (work.bottom == h) convertFrameRow(work, h - 1);
    if (apart) {
        convertRows(work, top, bottom, true);
    } else {
        for (s32 y = top; y < bottom; ++y) convertRows(work, y, y + 1, false);
    }
}

/// The end of a region that goes no further than the mosaic.
constexpr s32 endOf(s32 start, s32 length, s32 limit)
{
    return static_cast<s32>(std::min(std::int64_t{start} + length, std::int64_t{limit}));
}

template <class T>
PyxStatus convert(const T* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, T* dst, int dstStep, s32 grid)
{
    const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(srcSize, 2, 2), knownGrid(grid));
    if (failure) return failure;
    constexpr int shift = sizeof(T) - 1;
    const Work<T> work = {.source = src,
                          .sourcePitch = srcStep >> shift,
                          .width = srcSize.width,
                          .height = srcSize.height,
                          .target = dst,
                          .targetPitch = dstStep >> shift,
                          .left = srcRoi.x,
                          .top = srcRoi.y,
                          .right = endOf(srcRoi.x, srcRoi.width, srcSize.width),
                          .bottom = endOf(srcRoi.y, srcRoi.height, srcSize.height),
                          .grid = grid};
    if (work.left >= work.right || work.top >= work.bottom) return pyxOk;
    convertPieces(work);
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiCFAToRGB_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst,
                                           int dstStep, s32 grid, s32)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}

PyxStatus PYXCC_CALL pyxiCFAToRGB_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst,
                                            int dstStep, s32 grid, s32)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}
