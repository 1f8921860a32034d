// Images at fewer levels, by any method.
#pragma once

#include "frame/checks.hpp"
#include "frame/number_checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/samples_as_floats.hpp"
#include "tone/diffusion.hpp"
#include "tone/levels_by_words.hpp"
#include "tone/reduce_bits_forms.hpp"
#include "tone/reduce_bits_noise.hpp"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <optional>

namespace pyxcc::tone
{

namespace detail
{

template <class Pixel> constexpr int samplesIn(int pixels) { return pixels * Pixel::samples; }

/// What belongs to the samples of a row, the same again after `Period` of them. Some from the front follow behind, for
/// a block to be read from any sample on.
template <class Number, int Period> struct Recurring {
    static constexpr int block = 32;

    Number of[Period + block];

    PYXCC_INLINE const Number* from(int x) const { return of + static_cast<u32>(x) % Period; }

    void repeatFront() { std::copy_n(of, block, of + Period); }

    /// `at` gives what belongs to a pixel, of which there are so many.
    template <class Pixel, class At> void set(int pixels, const At& at)
    {
        Number* out = of;
        for (int x = 0; x < pixels; ++x) {
            const Number number = at(x);
            for (int i = 0; i < Pixel::samples; ++i) *out++ = number;
        }
        for (int i = 0, whole = samplesIn<Pixel>(pixels); i < block; ++i) out[i] = of[i % whole];
    }
};

/// Thresholds go by fours of columns, and a block may begin at any eighth one.
template <class Pixel, class Number> using Pattern = Recurring<Number, samplesIn<Pixel>(8)>;

/// `toPlace` gives what the forms take, of samples and their first column.
template <class Row, class ToPlace> struct RowInPlace {
    static constexpr int block = Row::block;
    Row samples;
    ToPlace toPlace;

    PYXCC_INLINE auto load(int x) const { return toPlace(samples.load(x), x); }
    PYXCC_INLINE auto load(int x, int count) const { return toPlace(samples.load(x, count), x); }
};

/// `placesOfRow` gives that of a row.
template <class Image, class PlacesOfRow> struct ImageInPlace {
    Image samples;
    PlacesOfRow placesOfRow;

    PYXCC_INLINE auto row(int y) const
    {
        const auto row = samples.row(y);
        const auto toPlace = placesOfRow(y);
        return RowInPlace<std::remove_const_t<decltype(row)>, std::remove_const_t<decltype(toPlace)>>{row, toPlace};
    }
};

template <class Image, class PlacesOfRow> auto inPlace(const Image& samples, const PlacesOfRow& placesOfRow)
{
    return ImageInPlace<Image, PlacesOfRow>{samples, placesOfRow};
}

/// Columns here are samples.
template <class Pixel, class Depth, class Source, class Plan>
PyxStatus takeSamples(const ReduceBits<Depth>& call, const Source& source, const Plan& plan)
{
    return frame::eachRow({samplesIn<Pixel>(call.roi.width), call.roi.height}, source,
                          layouts::fromFloats<typename Depth::Source, Pixel::keepsFourth>(call.dst, call.dstStep),
                          plan);
}

/// Steps are found for a call, which pays where it has many samples.
template <class Pixel, class Depth> bool maySeekSteps(const ReduceBits<Depth>& call)
{
    constexpr std::int64_t many = 16384;
    return std::int64_t{call.roi.width} * call.roi.height * Pixel::samples >= many;
}

/// Integers to bytes.
template <class Depth>
inline constexpr bool tellsByNumber = std::is_integral_v<typename Depth::Source> && sizeof(typename Depth::Target) == 1;

/// Those that are taken as words, whose samples are seldom near a threshold.
template <class Depth> inline constexpr bool goesByWords = tellsByNumber<Depth> && sizeof(typename Depth::Source) == 2;

/// Takes samples as words. `placesOfRow` gives what gives those of a block their place, `planOf` the plan around a
/// form; the last step has about so many 256ths. Whether there is a line of values, and if there is all is done.
template <class Pixel, class Depth, class Exact, class ValueOf, class PlacesOfRow, class PlanOf>
bool takeByWords(const ReduceBits<Depth>& call, const Exact& exact, u32 in256ths, const ValueOf& valueOf,
                 const PlacesOfRow& placesOfRow, const PlanOf& planOf)
{
    if (!maySeekSteps<Pixel>(call)) return false;
    const auto source = inPlace(layouts::asWords(call.src, call.srcStep), placesOfRow);
    const int steps = call.levels - 1;
    if (call.levels < FewLevels::most) {
        takeSamples<Pixel>(call, source,
                           planOf(ByWords<Exact, FewNumbers>{exact, FewNumbers{FewLevels(valueOf)}, steps}));
        return true;
    }
    ManyNumbers numbers;
    if (!numbers.values.find(steps, in256ths, valueOf)) return false;
    takeSamples<Pixel>(call, source, planOf(ByWords<Exact, ManyNumbers>{exact, numbers, steps}));
    return true;
}

/// Whether there are such steps, and if there are all is done.
template <class Pixel, class Depth, class Steps> bool takeNearestBySteps(const ReduceBits<Depth>& call, Steps steps)
{
    const NearestWide<Depth> wide(call.levels);
    const auto offset = steps.offsetOf(ofEveryByte([&](const auto& p) { return apply(wide, p); }), 127);
    if (!offset) return false;
    Pattern<Pixel, u16> offsets;
    offsets.template set<Pixel>(8, [&](int) { return *offset; });
    const auto places = [&](int) {
        return [&](const Several<wide::U8, 1>& x, int) PYXCC_INLINE_LAMBDA {
            return BytesInPlace{x.part[0], offsets.of, nullptr};
        };
    };
    takeSamples<Pixel>(call, inPlace(layouts::asItLies<1>(call.src, call.srcStep), places),
                       frame::wideThenTail<8>(SteppedBytes<Steps>{steps}, NearestTail<Depth>(call.levels)));
    return true;
}

template <class Pixel, class Depth> PyxStatus takeNearest(const ReduceBits<Depth>& call)
{
    const NearestWide<Depth> wide(call.levels);
    const NearestTail<Depth> tail(call.levels);
    if constexpr (std::is_same_v<Depth, tone::Depth<u8, u8>>) {
        const int steps = call.levels - 1;
        if (maySeekSteps<Pixel>(call) &&
            (call.levels <= ByteSteps::most
                 ? takeNearestBySteps<Pixel>(call, ByteSteps(steps))
                 : takeNearestBySteps<Pixel>(call, FineSteps(steps, [&](int n) { return wide.valueOf(n); }))))
            return pyxOk;
    }
    const auto source = layouts::asFloats(call.src, call.srcStep);
    if constexpr (goesByWords<Depth>) {
        const auto places = [](int) {
            return [](const Two<wide::U16>& words, int) PYXCC_INLINE_LAMBDA {
                return WordsInPlace<typename Depth::Source, void>{words, {32767, 32767}, nullptr, 0, 0};
            };
        };
        if (takeByWords<Pixel>(
                call, wide, 65280, [&](int n) { return wide.valueOf(n); }, places,
                [&](const auto& byWords) { return frame::wideThenTail<8>(byWords, tail); }))
            return pyxOk;
    }
    if constexpr (tellsByNumber<Depth>) {
        if (call.levels <= FewLevels::most)
            return takeSamples<Pixel>(call, source, frame::wideThenTail<8>(NearestOfFew<Depth>(call.levels), tail));
    }
    return takeSamples<Pixel>(call, source, frame::wideThenTail<8>(wide, tail));
}

template <class Pixel, class Wide, class Tail> auto eightPixelsThenTail(const Wide& wide, const Tail& tail)
{
    return frame::spans([](int width) { return std::array{width - width % samplesIn<Pixel>(8), width}; }, wide, tail);
}

/// `thresholds` gives those of a row.
template <class Pixel, class Depth, class ThresholdsOfRow>
PyxStatus takeByThresholds(const ReduceBits<Depth>& call, const Levels& levels, const ThresholdsOfRow& thresholds)
{
    const auto places = [&](int y) {
        return [&ofRow = thresholds(y)](const auto& samples, int x) PYXCC_INLINE_LAMBDA {
            return Two{samples, layouts::loadFloatsInOrderOf<typename Depth::Source>(ofRow.from(x))};
        };
    };
    const auto source = inPlace(layouts::asFloats(call.src, call.srcStep), places);
    const OrderedTail<Depth> tail{levels};
    if constexpr (tellsByNumber<Depth>) {
        // Without noise the last level has nothing left above it.
        if (call.levels < FewLevels::most || (call.levels == FewLevels::most && call.noise == 0))
            return takeSamples<Pixel>(call, source, eightPixelsThenTail<Pixel>(OrderedOfFew<Depth>(levels), tail));
    }
    return takeSamples<Pixel>(call, source, eightPixelsThenTail<Pixel>(OrderedWide<Depth>{levels}, tail));
}

/// `thresholds` gives those of a row in 65535ths of a step, and `exactThresholds` those of a block, by its first column
/// and its row.
template <class Pixel, class Depth, class ThresholdsOfRow, class ExactThresholds>
bool takeOrderedByWords(const ReduceBits<Depth>& call, const Levels& levels, const ThresholdsOfRow& thresholds,
                        const ExactThresholds& exactThresholds)
{
    using Source = typename Depth::Source;
    const auto places = [&](int y) {
        return [&ofRow = thresholds(y), &exactThresholds, y](const Two<wide::U16>& words, int x) PYXCC_INLINE_LAMBDA {
            return WordsInPlace<Source, ExactThresholds>{
                words, layouts::loadAsWords<u16>(layouts::bytes(ofRow.from(x))), &exactThresholds, x, y};
        };
    };
    return takeByWords<Pixel>(
        call, OrderedWide<Depth>{levels}, 65535, [&](int n) { return valueOfStep<Depth>(n, levels.step); }, places,
        [&](const auto& byWords) { return eightPixelsThenTail<Pixel>(byWords, OrderedTail<Depth>{levels}); });
}

/// Entries of the ordered matrix, in fifteenths.
inline constexpr f32 matrix[4][4] = {{0.0f, 8 / 15.0f, 2 / 15.0f, 10 / 15.0f},
                                     {12 / 15.0f, 4 / 15.0f, 14 / 15.0f, 6 / 15.0f},
                                     {3 / 15.0f, 11 / 15.0f, 1 / 15.0f, 9 / 15.0f},
                                     {1.0f, 7 / 15.0f, 13 / 15.0f, 5 / 15.0f}};

/// What is added to the line of steps, for each entry of the matrix. Some may be beyond it.
template <class Steps> struct MatrixOffsets {
    Steps steps;
    u16 of[4][4];

    /// Whether there are any.
    template <class Depth> bool find(const Levels& levels)
    {
        ByteFunction functions[4][4];
        for (int y = 0; y < 4; ++y) {
            for (int x = 0; x < 4; ++x) {
                const wide::F32 threshold = levels.step * matrix[y][x];
                functions[y][x] = ofEveryByte([&](const auto& p) {
                    return apply(OrderedWide<Depth>{levels}, Two{p, Four{threshold, threshold, threshold, threshold}});
                });
            }
        }
        do {
            if (findAll(functions)) return true;
        } while (steps.tryNext());
        return false;
    }

private:
    bool findAll(const ByteFunction (&functions)[4][4])
    {
        for (int y = 0; y < 4; ++y) {
            for (int x = 0; x < 4; ++x) {
                const auto offset = steps.offsetOf(functions[y][x], static_cast<int>(std::lround(255 * matrix[y][x])));
                if (!offset) return false;
                of[y][x] = *offset;
            }
        }
        return true;
    }
};

/// Whether there are such steps, and if there are all is done.
template <class Pixel, class Depth, class Steps>
bool takeOrderedBySteps(const ReduceBits<Depth>& call, const Levels& levels, Steps steps,
                        const Pattern<Pixel, f32> (&thresholds)[4])
{
    MatrixOffsets<Steps> matrixOffsets{steps, {}};
    if (!matrixOffsets.template find<Depth>(levels)) return false;
    Pattern<Pixel, u16> offsets[4];
    for (int y = 0; y < 4; ++y) offsets[y].template set<Pixel>(8, [&](int x) { return matrixOffsets.of[y][x & 3]; });
    const auto places = [&](int y) {
        return [&ofRow = offsets[y & 3], &thresholdsOfRow = thresholds[y & 3]](const Several<wide::U8, 1>& samples,
                                                                               int x) PYXCC_INLINE_LAMBDA {
            return BytesInPlace{samples.part[0], ofRow.from(x), thresholdsOfRow.from(x)};
        };
    };
    takeSamples<Pixel>(
        call, inPlace(layouts::asItLies<1>(call.src, call.srcStep), places),
        eightPixelsThenTail<Pixel>(SteppedBytes<Steps>{matrixOffsets.steps}, OrderedTail<Depth>{levels}));
    return true;
}

/// Entries of the matrix with noise, by fours of rows.
template <class Pixel> class NoisyThresholds
{
public:
    using Row = Recurring<f32, samplesIn<Pixel>(Noise::length)>;

    NoisyThresholds(const Noise& noise, f32 step, int pixels) : noise_(noise), step_(step), pixels_(pixels) {}

    /// From row 0 on, one after the other.
    const Row& ofRow(int y)
    {
        if (y % 4 == 0) make(y);
        return rows_[y & 3];
    }

private:
    void make(int y)
    {
        using wide::F32;
        const auto entries = [](int row) PYXCC_INLINE_LAMBDA { return layouts::loadFoursTwice(matrix[row]); };
        const Four<F32> entriesOf = {entries(0), entries(1), entries(2), entries(3)};
        const F32 step = step_;
        for (int x = 0; x < pixels_; x += F32::count) {
            const Four<F32> amounts = noise_.load(x, y);
            const auto store = [&](int row, F32 entry, F32 noise) PYXCC_INLINE_LAMBDA {
                layouts::storeRepeated<Pixel::samples>(rows_[row].of + samplesIn<Pixel>(x), step * (entry + noise));
            };
            store(0, entriesOf.a, amounts.a);
            store(1, entriesOf.b, amounts.b);
            store(2, entriesOf.c, amounts.c);
            store(3, entriesOf.d, amounts.d);
        }
        for (Row& row : rows_) row.repeatFront();
    }

    NoiseByColumns noise_;
    f32 step_;
    int pixels_;
    Row rows_[4] = {};
};

template <class Pixel, class Depth> PyxStatus takeOrdered(const ReduceBits<Depth>& call)
{
    const Levels levels = levelsOf<typename Depth::Source>(call.levels);
    if (call.noise == 0) {
        Pattern<Pixel, f32> thresholds[4];
        for (int y = 0; y < 4; ++y)
            thresholds[y].template set<Pixel>(8, [&](int x) { return levels.step * matrix[y][x & 3]; });
        if constexpr (std::is_same_v<Depth, tone::Depth<u8, u8>>) {
            const int steps = call.levels - 1;
            const auto valueOf = [&](int n) { return valueOfStep<Depth>(n, levels.step); };
            if (maySeekSteps<Pixel>(call) &&
                (call.levels <= ByteSteps::most
                     ? takeOrderedBySteps<Pixel>(call, levels, ByteSteps(steps), thresholds)
                     : takeOrderedBySteps<Pixel>(call, levels, FineSteps(steps, valueOf), thresholds)))
                return pyxOk;
        }
        if constexpr (goesByWords<Depth>) {
            Pattern<Pixel, u16> in65535ths[4];
            for (int y = 0; y < 4; ++y)
                in65535ths[y].template set<Pixel>(
                    8, [&](int x) { return static_cast<u16>(std::lround(65535 * matrix[y][x & 3])); });
            if (takeOrderedByWords<Pixel>(
                    call, levels, [&](int y) -> const auto& { return in65535ths[y & 3]; },
                    [&](int x, int y) {
                        return layouts::loadFloatsInOrderOf<typename Depth::Source>(thresholds[y & 3].from(x));
                    }))
                return pyxOk;
        }
        return takeByThresholds<Pixel>(
            call, levels, [&](int y) -> const auto& { return thresholds[y & 3]; });
    }
    const f32 amount = static_cast<f32>(call.noise);
    Noise noise;
    if (const PyxStatus failure = noise.make(-amount / 100.0f, amount / 100.0f)) return failure;
    NoisyThresholds<Pixel> thresholds(noise, levels.step, std::min(call.roi.width, Noise::length));
    return takeByThresholds<Pixel>(
        call, levels, [&](int y) -> const auto& { return thresholds.ofRow(y); });
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
