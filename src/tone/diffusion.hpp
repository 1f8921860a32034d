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
template <class Number, int Rows> struct ErrorRows {
    frame::Scratch<Number> memory;
    std::array<Number*, Rows> row = {};

    /// Of so many numbers each, from the first column on, with margins around them.
    ErrorRows(s32 length, int margin)
    {
        if (length > 0x7fffffff / Rows - 2 * margin) return;
        const s32 whole = length + 2 * margin;
        memory = frame::allocate<Number>(Rows * whole);
        if (!memory) return;
        std::fill_n(memory.get(), Rows * whole, Number{0});
        for (int i = 0; i < Rows; ++i) row[i] = memory.get() + static_cast<std::ptrdiff_t>(i) * whole + margin;
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
template <> inline constexpr int lanesOf<wide::S32> = wide::S32::count;

/// Work on a band goes by some steps: a step is a column of the first row, and one further to the left of each row
/// below.
template <int Lag> struct Steps {
    static constexpr int steps = 64;

    /// Calls `visit` with the row, its first and its last but one column and the step of the first one, for the steps
    /// from `first` on.
    template <class Visit> static void eachRow(const Band& band, int first, const Visit& visit)
    {
        for (int r = 0; r < band.rows; ++r) {
            const int behind = Lag * r;
            const int from = std::max(first, behind), to = std::min(first + steps, band.width + behind);
            if (from < to) visit(r, from - behind, to - behind, from - first);
        }
    }
};

/// Samples of a band on their way to lanes and back.
template <class Number, int Lanes, int Lag> struct Stage : Steps<Lag> {
    using Steps<Lag>::steps;

    Number samples[steps][Lanes] = {};
    Number thresholds[steps][Lanes] = {};
    s32 results[steps][Lanes];

    /// `sampleAt(row, x)` is the number of a pixel, in bytes from the row's start on.
    template <class SampleAt> void fetch(const Band& band, int first, const SampleAt& sampleAt)
    {
        this->eachRow(band, first, [&](int r, int from, int to, int step) {
            const u8* const row = band.source + band.sourceStep * r;
            for (int x = from; x < to; ++x, ++step) samples[step][r] = sampleAt(row, x);
        });
    }
};

/// What lies around the lanes' samples. From step to step all of it moves to the left.
template <class Lane, int Reach> struct Surroundings {
    Errors<Lane> errors;

    Surroundings()
    {
        errors.left.fill(Lane(0));
        errors.above.fill(Lane(0));
        errors.twoAbove.fill(Lane(0));
    }

    /// Takes in the errors of the samples before, and what the error rows have for the first row's next column.
    template <class Number> PYXCC_INLINE void advance(const Lane& error, const Number& above, const Number* twoAbove)
    {
        auto& e = errors;
        constexpr int last = 2 + Reach, lag = Reach + 1;
        if constexpr (Reach == 2) {
            // The row above that of a lane's neighbour was there `lag` steps ago.
            const Lane next = fromLaneInFront(e.above[last - lag + 1], *twoAbove);
            for (int i = 0; i < last; ++i) e.twoAbove[i] = e.twoAbove[i + 1];
            e.twoAbove[last] = next;
        }
        for (int i = 2 - Reach; i < last; ++i) e.above[i] = e.above[i + 1];
        e.above[last] = fromLaneInFront(error, above);
        e.left[1] = e.left[0];
        e.left[0] = error;
    }
};

/// What the samples of some lanes leave, and what they become.
template <class Lane, class Result> struct Diffused {
    Lane error;
    Result result;
};

template <class Lane, class Kernel, class Number, int Rows>
void diffuseBand(const Band& band, const Kernel& kernel, ErrorRows<Number, Rows>& errorRows)
{
    constexpr int lanes = lanesOf<Lane>, reach = Kernel::reach, lag = reach + 1;
    auto& row = errorRows.row;
    Number* const above = row[0];
    Number* const twoAbove = Rows == 3 ? row[1] : nullptr;

    // Errors are read further to the right than they are written, so that they can take the place of those before. But
    // after a lone row the one above it is still needed.
    const bool rotates = Rows == 3 && band.rows == 1;
    Number* const newAbove = rotates ? row[Rows - 1] : above;

    Surroundings<Lane, reach> around;
    const auto advance = [&](int t, const Lane& error) PYXCC_INLINE_LAMBDA {
        const int x = std::min(t + reach, band.width + reach - 1);
        around.advance(error, above[x], Rows == 3 ? twoAbove + x : nullptr);
    };
    for (int t = -2 * reach; t < 0; ++t) advance(t, Lane(0));

    typename Kernel::template StageOf<lanes> stage;
    Lane error(0);
    const auto take = [&](int i, int t) PYXCC_INLINE_LAMBDA {
        advance(t, error);
        return kernel.take(stage, i, around.errors);
    };
    // What the rows below the last ones are to find.
    const auto keep = [&](int t) PYXCC_INLINE_LAMBDA {
        Number errors[lanes];
        storeLanes(errors, error);
        const auto keepRow = [&](Number* to, int r) PYXCC_INLINE_LAMBDA {
            const int x = t - lag * r;
            if (x >= 0 && x < band.width) to[x] = errors[r];
        };
        keepRow(newAbove, band.rows - 1);
        if (Rows == 3 && band.rows > 1) keepRow(twoAbove, band.rows - 2);
    };
    const int end = band.width + lag * (band.rows - 1);
    for (int first = 0; first < end; first += stage.steps) {
        kernel.fetch(stage, band, first);
        // Between the steps at both ends every lane has a column.
        const int steps = std::min(stage.steps, end - first);
        const int full = std::clamp(lag * (lanes - 1) - first, 0, steps);
        const int fullTo = std::clamp(band.width - first, full, steps);
        const auto takeEnds = [&](int from, int to) {
            for (int i = from; i < to; ++i) {
                error = zeroOutside(take(i, first + i), first + i, lag, band.width);
                keep(first + i);
            }
        };
        takeEnds(0, full);
        for (int i = full; i < fullTo; ++i) {
            error = take(i, first + i);
            keep(first + i);
        }
        takeEnds(fullTo, steps);
        kernel.put(stage, band, first);
    }
    if (rotates) std::rotate(row.begin(), row.end() - 1, row.end());
}

/// Samples of a depth become levels.
template <class Depth, class Neighbours> struct LevelDiffusion {
    static constexpr int reach = Neighbours::reach;
    template <int Lanes> using StageOf = Stage<f32, Lanes, reach + 1>;

    Levels levels;
    const Noise* noise; ///< or null

    template <class Stage> void fetch(Stage& stage, const Band& band, int first) const
    {
        stage.fetch(band, first, [&](const u8* row, int x) {
            return workingValue(layouts::sampleAt<typename Depth::Source>(row, std::ptrdiff_t{x} * band.pixelSamples));
        });
        if (!noise) {
            for (auto& ofStep : stage.thresholds) std::fill(std::begin(ofStep), std::end(ofStep), levels.step * 0.5f);
            return;
        }
        stage.eachRow(band, first, [&](int r, int from, int to, int step) {
            for (int x = from; x < to; ++x, ++step) stage.thresholds[step][r] = noise->at(x, band.firstRow + r);
        });
    }

    template <class F32>
    PYXCC_INLINE auto operator()(const F32& p, const F32& threshold, const Errors<F32>& errors) const
    {
        const F32 v = Neighbours::value(p, errors);
        const Quantised<F32> to = quantised<typename Depth::Source>(levels, v, threshold);
        const auto integer = stored<Depth, Neighbours::rounded>(to.level);
        return Diffused<F32, std::remove_const_t<decltype(integer)>>{
            to.error, std::is_same_v<typename Depth::Target, s16> ? integer - 32768 : integer};
    }

    /// One step. Returns what it leaves.
    template <class Stage, class F32> PYXCC_INLINE F32 take(Stage& stage, int i, const Errors<F32>& errors) const
    {
        const auto done = (*this)(loadLanes(stage.samples[i], F32()), loadLanes(stage.thresholds[i], F32()), errors);
        storeLanes(stage.results[i], done.result);
        return done.error;
    }

    template <class Stage> void put(const Stage& stage, const Band& band, int first) const
    {
        using Target = typename Depth::Target;
        stage.eachRow(band, first, [&](int r, int from, int to, int step) {
            u8* const row = band.target + band.targetStep * r;
            for (int x = from; x < to; ++x, ++step) {
                const Target sample = static_cast<Target>(stage.results[step][r]);
                std::memcpy(row + std::ptrdiff_t{x} * band.pixelSamples * std::ptrdiff_t{sizeof sample}, &sample,
                            sizeof sample);
            }
        });
    }
};

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
    ErrorRows<f32, Neighbours::rows> errorRows(call.roi.width, Neighbours::reach);
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
            diffuseBand<wide::F32>(band, LevelDiffusion<Depth, Neighbours>{levels, call.noise > 0 ? &noise : nullptr},
                                   errorRows);
        }
    }
    return pyxOk;
}

} // namespace detail

} // namespace pyxcc::tone
