// Images at fewer levels, by any method.
#pragma once

#include "frame/checks.hpp"
#include "frame/number_checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/samples_as_floats.hpp"
#include "tone/diffusion.hpp"
#include "tone/reduce_bits_forms.hpp"
#include "tone/reduce_bits_noise.hpp"

#include <algorithm>

namespace pyxcc::tone
{

namespace detail
{

template <class Pixel> constexpr int samplesIn(int pixels) { return pixels * Pixel::samples; }

template <class Pixel, class Depth> PyxStatus takeNearest(const ReduceBits<Depth>& call)
{
    using namespace layouts;
    const RoiSize samples = {samplesIn<Pixel>(call.roi.width), call.roi.height};
    return frame::eachRow(samples, asFloats(call.src, call.srcStep),
                          fromFloats<typename Depth::Source, Pixel::keepsFourth>(call.dst, call.dstStep),
                          frame::wideThenTail<8>(NearestWide<Depth>(call.levels), NearestTail<Depth>(call.levels)));
}

/// Thresholds of a row of samples, the same again after so many. Some from the front follow behind, for a block to be
/// read from any sample on.
struct Thresholds {
    static constexpr int block = 32;

    f32 of[Noise::length * 4 + block];
    int period;
};

template <class Source, class Row> struct RowWithThresholds {
    static constexpr int block = Thresholds::block;
    Row samples;
    const Thresholds& thresholds;

    PYXCC_INLINE auto load(int x) const { return Two{samples.load(x), thresholdsFrom(x)}; }
    PYXCC_INLINE auto load(int x, int count) const { return Two{samples.load(x, count), thresholdsFrom(x)}; }

private:
    PYXCC_INLINE Four<wide::F32> thresholdsFrom(int x) const
    {
        return layouts::loadFloatsInOrderOf<Source>(thresholds.of + x % thresholds.period);
    }
};

/// Entries of the ordered matrix, in fifteenths.
inline constexpr f32 matrix[4][4] = {{0.0f, 8 / 15.0f, 2 / 15.0f, 10 / 15.0f},
                                     {12 / 15.0f, 4 / 15.0f, 14 / 15.0f, 6 / 15.0f},
                                     {3 / 15.0f, 11 / 15.0f, 1 / 15.0f, 9 / 15.0f},
                                     {1.0f, 7 / 15.0f, 13 / 15.0f, 5 / 15.0f}};

template <class Pixel, class At> void setThresholds(Thresholds& thresholds, int pixels, const At& at)
{
    f32* out = thresholds.of;
    for (int x = 0; x < pixels; ++x) {
        const f32 threshold = at(x);
        for (int i = 0; i < Pixel::samples; ++i) *out++ = threshold;
    }
    thresholds.period = samplesIn<Pixel>(pixels);
    for (int i = 0; i < Thresholds::block; ++i) out[i] = thresholds.of[i % thresholds.period];
}

template <class Source, class Image, class RowThresholds> struct ImageWithThresholds {
    Image samples;
    RowThresholds thresholds;

    PYXCC_INLINE auto row(int y) const
    {
        const auto samplesOfRow = samples.row(y);
        return RowWithThresholds<Source, std::remove_const_t<decltype(samplesOfRow)>>{samplesOfRow, thresholds(y)};
    }
};

/// `thresholds` gives those of a row.
template <class Pixel, class Depth, class RowThresholds>
PyxStatus takeByThresholds(const ReduceBits<Depth>& call, const Levels& levels, const RowThresholds& thresholds)
{
    using namespace layouts;
    using Source = typename Depth::Source;
    const auto samples = asFloats(call.src, call.srcStep);
    const ImageWithThresholds<Source, std::remove_const_t<decltype(samples)>, RowThresholds> source{samples,
                                                                                                    thresholds};
    const auto eightPixels = [](int width) { return std::array{width - width % samplesIn<Pixel>(8), width}; };
    return frame::eachRow({samplesIn<Pixel>(call.roi.width), call.roi.height}, source,
                          fromFloats<Source, Pixel::keepsFourth>(call.dst, call.dstStep),
                          frame::spans(eightPixels, OrderedWide<Depth>{levels}, OrderedTail<Depth>{levels}));
}

template <class Pixel, class Depth> PyxStatus takeOrdered(const ReduceBits<Depth>& call)
{
    const Levels levels = levelsOf<typename Depth::Source>(call.levels);
    if (call.noise == 0) {
        Thresholds rows[4];
        for (int y = 0; y < 4; ++y)
            setThresholds<Pixel>(rows[y], 8, [&](int x) { return levels.step * matrix[y][x & 3]; });
        return takeByThresholds<Pixel>(call, levels, [&](int y) -> const Thresholds& { return rows[y & 3]; });
    }
    const f32 amount = static_cast<f32>(call.noise);
    Noise noise;
    if (const PyxStatus failure = noise.make(-amount / 100.0f, amount / 100.0f)) return failure;
    Thresholds ofRow;
    const int pixels = std::min(call.roi.width, Noise::length);
    return takeByThresholds<Pixel>(call, levels, [&](int y) -> const Thresholds& {
        setThresholds<Pixel>(ofRow, pixels,
                             [&](int x) { return levels.step * (matrix[y & 3][x & 3] + noise.at(x, y)); });
        return ofRow;
    });
}

template <class Pixel, class Depth> PyxStatus reduce(const ReduceBits<Depth>& call, u32 ditherType)
{
    switch (ditherType) {
    case 0:
        return takeNearest<Pixel>(call);
    case 1:
        return diffuse<Pixel, FourNeighbours<Depth>>(call);
    case 2:
        return diffuse<Pixel, TwelveNeighbours<in48ths>>(call);
    case 3:
        return diffuse<Pixel, TwelveNeighbours<in42nds>>(call);
    case 4:
        return takeOrdered<Pixel>(call);
    default:
        return pyxOk; // no error, and nothing is done
    }
}

} // namespace detail

/// The tests, and the method that `ditherType` selects.
template <class Pixel, class Source, class Target>
PyxStatus reduceBits(const Source* src, int srcStep, Target* dst, int dstStep, RoiSize roi, u32 noise, u32 ditherType,
                     s32 levels)
{
    using namespace frame;
    using OfDepth = Depth<Source, Target>;
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), within<u32>(noise, 0, 100, pyxErrNoise),
                         within<s32>(levels, 2, OfDepth::maxLevels, pyxErrLevels)))
        return failure;
    return detail::reduce<Pixel>(ReduceBits<OfDepth>{src, srcStep, dst, dstStep, roi, noise, levels}, ditherType);
}

} // namespace pyxcc::tone
