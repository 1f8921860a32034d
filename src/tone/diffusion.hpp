// Error diffusion over an image: channel by channel, row by row, from left to right. What a channel leaves in the error
// rows the next one finds there.
//
// A sample waits for the one before it, so that one row can hardly go faster than its chain of operations does. Several
// rows go at once, each so far behind the one above that what it needs of it is there.
#pragma once

#include "frame/scratch.hpp"
#include "lanes/rows.hpp"
#include "layouts/bytes.hpp"
#include "tone/diffusion_forms.hpp"
#include "tone/reduce_bits_call.hpp"
#include "tone/reduce_bits_noise.hpp"

#include <algorithm>
#include <cstring>
#include <utility>

namespace pyxcc::tone
{

namespace detail
{

/// The error rows above the row to come, nearest first, and a spare one. Margins of what a kernel reaches stay zero.
template <class Neighbours> struct ErrorRows {
    static constexpr int rows = Neighbours::rows, reach = Neighbours::reach;

    frame::Scratch<f32> memory;
    std::array<f32*, rows> row = {};

    explicit ErrorRows(int width)
    {
        if (width > 0x7fffffff / rows - 2 * reach) return;
        const s32 length = width + 2 * reach;
        memory = frame::allocate<f32>(rows * length);
        if (!memory) return;
        std::fill_n(memory.get(), rows * length, 0.0f);
        for (int i = 0; i < rows; ++i) row[i] = memory.get() + static_cast<std::ptrdiff_t>(i) * length + reach;
    }
};

/// A band of rows of one channel: as many as a register has lanes, or fewer.
struct Band {
    const u8* source;
    std::ptrdiff_t sourceStep;
    u8* target;
    std::ptrdiff_t targetStep;
    int pixelSamples;
    int width, rows, firstRow;
};

template <class Lane> inline constexpr int lanesOf = 1;
template <> inline constexpr int lanesOf<wide::F32> = wide::F32::count;

/// Samples of a band on their way to lanes and back, for some steps: a step is a column of the first row, and one
/// further to the left of each row below.
template <int Lanes, int Lag> struct Stage {
    static constexpr int steps = 64;

    f32 samples[steps][Lanes] = {};
    f32 thresholds[steps][Lanes] = {};
    s32 results[steps][Lanes];

    /// Calls `visit` with the step, the row and the column of each pixel of the steps from `first` on.
    template <class Visit> static void eachPixel(const Band& band, int first, const Visit& visit)
    {
        for (int r = 0; r < band.rows; ++r) {
            const int behind = Lag * r;
            const int from = std::max(first, behind), to = std::min(first + steps, band.width + behind);
            for (int t = from; t < to; ++t) visit(t - first, r, t - behind);
        }
    }

    template <class Source> void fetch(const Band& band, int first)
    {
        eachPixel(band, first, [&](int step, int r, int x) {
            Source sample;
            const u8* const row = band.source + band.sourceStep * r;
            std::memcpy(&sample, row + std::ptrdiff_t{x} * band.pixelSamples * std::ptrdiff_t{sizeof sample},
                        sizeof sample);
            samples[step][r] = workingValue(sample);
        });
    }

    void fetchThresholds(const Band& band, int first, const Noise& noise)
    {
        eachPixel(band, first, [&](int step, int r, int x) { thresholds[step][r] = noise.at(x, band.firstRow + r); });
    }

    template <class Target> void put(const Band& band, int first) const
    {
        eachPixel(band, first, [&](int step, int r, int x) {
            const Target sample = static_cast<Target>(results[step][r]);
            u8* const row = band.target + band.targetStep * r;
            std::memcpy(row + std::ptrdiff_t{x} * band.pixelSamples * std::ptrdiff_t{sizeof sample}, &sample,
                        sizeof sample);
        });
    }
};

/// What a value is stored as.
template <class Depth, class Neighbours, class F32> PYXCC_INLINE auto storedLevel(const F32& level)
{
    const auto integer = stored<Depth, Neighbours::rounded>(level);
    return std::is_same_v<typename Depth::Target, s16> ? integer - 32768 : integer;
}

/// What lies around the lanes' samples. From step to step all of it moves to the left.
template <class F32, class Neighbours> struct Surroundings {
    static constexpr int reach = Neighbours::reach, lag = reach + 1;

    Errors<F32> errors;

    Surroundings()
    {
        errors.left.fill(F32(0));
        errors.above.fill(F32(0));
        errors.twoAbove.fill(F32(0));
    }

    /// Takes in the errors of the samples before, and what the error rows have for the first row's next column.
    PYXCC_INLINE void advance(const F32& error, const f32& above, const f32* twoAbove)
    {
        auto& e = errors;
        constexpr int last = 2 + reach;
        if constexpr (reach == 2) {
            // The row above that of a lane's neighbour was there `lag` steps ago.
            const F32 next = fromLaneInFront(e.above[last - lag + 1], *twoAbove);
            for (int i = 0; i < last; ++i) e.twoAbove[i] = e.twoAbove[i + 1];
            e.twoAbove[last] = next;
        }
        for (int i = 2 - reach; i < last; ++i) e.above[i] = e.above[i + 1];
        e.above[last] = fromLaneInFront(error, above);
        e.left[1] = e.left[0];
        e.left[0] = error;
    }
};

template <class F32, class Depth, class Neighbours>
void diffuseBand(const Band& band, const Levels& levels, const Noise* noise, ErrorRows<Neighbours>& errorRows)
{
    using Around = Surroundings<F32, Neighbours>;
    constexpr int lanes = lanesOf<F32>, lag = Around::lag, reach = Around::reach;
    auto& row = errorRows.row;
    f32* const above = row[0];
    f32* const twoAbove = Neighbours::rows == 3 ? row[1] : nullptr;

    // Errors are read further to the right than they are written, so that they can take the place of those before. But
    // after a lone row the one above it is still needed.
    const bool rotates = Neighbours::rows == 3 && band.rows == 1;
    f32* const newAbove = rotates ? row[Neighbours::rows - 1] : above;

    Around around;
    const auto columnBehind = [&](int t) { return std::min(t + reach, band.width + reach - 1); };
    const auto advance = [&](int t, const F32& error) PYXCC_INLINE_LAMBDA {
        const int x = columnBehind(t);
        around.advance(error, above[x], Neighbours::rows == 3 ? twoAbove + x : nullptr);
    };
    for (int t = -2 * reach; t < 0; ++t) advance(t, F32(0));

    Stage<lanes, lag> stage;
    for (auto& ofStep : stage.thresholds) std::fill_n(ofStep, lanes, levels.step * 0.5f);
    F32 error = 0;
    const int end = band.width + lag * (band.rows - 1);
    for (int first = 0; first < end; first += stage.steps) {
        stage.template fetch<typename Depth::Source>(band, first);
        if (noise) stage.fetchThresholds(band, first, *noise);
        const int steps = std::min(stage.steps, end - first);
        for (int i = 0; i < steps; ++i) {
            const int t = first + i;
            advance(t, error);
            const F32 v = Neighbours::value(loadLanes(stage.samples[i], F32()), around.errors);
            const auto result = quantised<typename Depth::Source>(levels, v, loadLanes(stage.thresholds[i], F32()));
            storeLanes(stage.results[i], storedLevel<Depth, Neighbours>(result.level));
            error = zeroOutside(result.error, t, lag, band.width);

            f32 errors[lanes];
            storeLanes(errors, error);
            const auto keep = [&](f32* to, int r) {
                const int x = t - lag * r;
                if (x >= 0 && x < band.width) to[x] = errors[r];
            };
            keep(newAbove, band.rows - 1);
            if (Neighbours::rows == 3 && band.rows > 1) keep(twoAbove, band.rows - 2);
        }
        stage.template put<typename Depth::Target>(band, first);
    }
    if (rotates) std::rotate(row.begin(), row.end() - 1, row.end());
}

template <class Pixel, class Neighbours, class Depth> PyxStatus diffuse(const ReduceBits<Depth>& call)
{
    const Levels levels = levelsOf<typename Depth::Source>(call.levels);
    Noise noise;
    if (call.noise > 0) {
        const s32 amount = static_cast<s32>(call.noise);
        const f32 low = static_cast<f32>(50 - amount) * levels.step / 100.0f;
        const f32 high = static_cast<f32>(amount + 50) * levels.step / 100.0f;
        if (const PyxStatus failure = noise.make(low, high)) return failure;
    }
    ErrorRows<Neighbours> errorRows(call.roi.width);
    if (!errorRows.memory) {
        noise.abandon(); // what there was of memory by then has never been given back
        return pyxErrNoMemory;
    }
    for (int channel = 0; channel < Pixel::channels; ++channel) {
        const u8* const source = layouts::bytes(call.src + channel);
        u8* const target = layouts::bytes(call.dst + channel);
        constexpr int lanes = lanesOf<wide::F32>;
        for (int y = 0; y < call.roi.height; y += lanes) {
            const Band band = {layouts::rowAt(source, call.srcStep, y),
                               call.srcStep,
                               layouts::rowAt(target, call.dstStep, y),
                               call.dstStep,
                               Pixel::samples,
                               call.roi.width,
                               std::min(lanes, call.roi.height - y),
                               y};
            diffuseBand<wide::F32, Depth>(band, levels, call.noise > 0 ? &noise : nullptr, errorRows);
        }
    }
    return pyxOk;
}

} // namespace detail

} // namespace pyxcc::tone
