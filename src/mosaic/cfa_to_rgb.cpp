// A sensor's mosaic to RGB by means of the samples around each.
#include "pyxcc/cfa_to_rgb.h"

#include "frame/row_driver.hpp"
#include "mosaic/mosaic_rows.hpp"
#include "mosaic/sites.hpp"

#include <algorithm>
#include <cstdint>

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
};

template <class Samples> using Target = InterleavedRow<C3<Samples>, u8>;

/// Takes columns of a row from a source of neighbourhoods through the form for the row's colours.
template <template <bool, class> class Form, class T, class Source>
void convertSpan(const Work<T>& work, s32 y, s32 from, s32 to, const Source& source)
{
    using Samples = pyxcc::wide::RegisterOf<T>;
    const Target<Samples> target{work.pixel(from, y), {}};
    const Site first = siteAt(work.grid, from, y);
    const Samples atGreen = pyxcc::wide::everyOther<Samples>(isGreen(first));
    if (isOfRedRow(first)) {
        convertColumns(source, target, 0, to - from, Form<true, Samples>{atGreen});
    } else {
        convertColumns(source, target, 0, to - from, Form<false, Samples>{atGreen});
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
    const Near<Sample> near = {middle[x],   middle[left], middle[right], upper[x],    lower[x],
                               upper[left], upper[right], lower[left],   lower[right]};
    const Site site = siteAt(work.grid, x, y);
    const Sample atGreen = isGreen(site) ? -1 : 0;
    const pyxcc::Three<Sample> rgb =
        isOfRedRow(site) ? MeansAround<true, Sample>{atGreen}(near) : MeansAround<false, Sample>{atGreen}(near);
    const T samples[] = {rgb.a.v, rgb.b.v, rgb.c.v};
    copyBytes(work.pixel(x, y), bytes(samples), sizeof samples);
}

/// A row of the frame: plain means, of mirrored samples at its ends.
template <class T> void convertFrameRow(const Work<T>& work, s32 y)
{
    const s32 from = std::clamp(1, work.left, work.right), to = std::clamp(work.width - 1, from, work.right);
    for (s32 x = work.left; x < from; ++x) convertPixel(work, x, y);
    convertSpan<MeansAround>(
        work, y, from, to,
        NearRows<T>{work.row(before(y)) + from, work.row(y) + from, work.row(behind(y, work.height)) + from});
    for (s32 x = to; x < work.right; ++x) convertPixel(work, x, y);
}

/// A column of the frame, without its two first and its two last samples.
template <class T> void convertFrameColumn(const Work<T>& work, s32 x)
{
    const s32 to = std::min(work.bottom, work.height - 2);
    for (s32 y = std::max(work.top, 2); y < to; ++y) convertPixel(work, x, y);
}

/// Two samples along each edge, as far as they are asked for. A region in front of the mosaic has no part in its first
/// edge.
template <class T> void convertFrame(const Work<T>& work)
{
    const s32 w = work.width, h = work.height;
    if (work.top == 0) convertFrameRow(work, 0);
    if (h >= 3 && (work.top == 1 || (work.top == 0 && work.bottom >= 2))) convertFrameRow(work, 1);
    if (work.left == 0) convertFrameColumn(work, 0);
    if (w >= 3 && (work.left == 1 || (work.left == 0 && work.right >= 2))) convertFrameColumn(work, 1);
    if (w >= 3 && work.right >= w - 1 && work.left < w - 1) convertFrameColumn(work, w - 2);
    if (work.right == w) convertFrameColumn(work, w - 1);
    if (h >= 3 && work.bottom >= h - 1 && work.top < h - 1) convertFrameRow(work, h - 2);
    if (work.bottom == h) convertFrameRow(work, h - 1);
}

template <class T> void convertInside(const Work<T>& work)
{
    const s32 from = std::max(work.left, 2), to = std::min(work.right, work.width - 2);
    const s32 bottom = std::min(work.bottom, work.height - 2);
    if (from >= to) return;
    for (s32 y = std::max(work.top, 2); y < bottom; ++y) {
        const FarRows<T> rows = {{work.row(y - 2) + from, work.row(y - 1) + from, work.row(y) + from,
                                  work.row(y + 1) + from, work.row(y + 2) + from}};
        convertSpan<MeansAlongEdges>(work, y, from, to, rows);
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
    convertFrame(work);
    convertInside(work);
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
