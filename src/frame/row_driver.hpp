// Walks the rows of a region and tells which columns take which form.
//
// A row is anything that loads and stores blocks of pixels: one row of an image, or the pair of rows that shares a row
// of chroma. The width of a block is the layouts' own affair; which form a column takes follows from the rule alone.
#pragma once

#include "frame/forms.hpp"
#include "pyxcc/types.h"

#include <array>
#include <tuple>
#include <utility>

namespace pyxcc::frame
{

/// Which columns take which form: a span ends where the next begins, and what lies behind the last is left alone. The
/// rule takes the width and gives the ends of the spans, one a form, none below the one before it.
template <class Rule, class... Forms> struct Plan {
    Rule rule;
    std::tuple<Forms...> forms;
};

template <class Rule, class... Forms> constexpr auto spans(Rule rule, Forms... forms)
{
    return Plan<Rule, Forms...>{rule, {forms...}};
}

/// Whole blocks of `Block` pixels in the wide form, the rest in the tail form.
template <int Block, class Wide, class Tail> constexpr auto wideThenTail(Wide wide, Tail tail)
{
    static_assert((Block & (Block - 1)) == 0);
    return spans([](int width) { return std::array{width & ~(Block - 1), width}; }, wide, tail);
}

template <class Form> constexpr auto everyPixel(Form form)
{
    return spans([](int width) { return std::array{width}; }, form);
}

/// A form that says so is a long chain of operations. Each of its blocks is stored while the next one is computed:
/// what waits for a result keeps the processor from taking up what could go on meanwhile.
template <class Form>
concept StoredLate = requires
{
    requires Form::storedLate;
};

/// A source that takes little to load: a block of it need not be on its way while the one in front is computed, but
/// takes up registers.
template <class Source>
concept LoadedAtOnce = requires
{
    requires Source::loadedAtOnce;
};

/// Takes whole blocks through such a form, from `x` on, and returns where they end.
template <class Source, class Target, class Form>
PYXCC_INLINE int convertBlocksStoredLate(const Source& source, const Target& target, int x, int to, const Form& form)
{
    constexpr int block = Source::block;
    auto result = apply(form, source.load(x));
    if (x <= to - 2 * block) {
        auto pixels = source.load(x + block);
        for (; x <= to - 3 * block; x += block) {
            target.store(x, result);
            result = apply(form, pixels);
            pixels = source.load(x + 2 * block);
        }
        target.store(x, result);
        result = apply(form, pixels);
        x += block;
    }
    target.store(x, result);
    return x + block;
}

/// Takes the columns [from, to) of a row through a form: whole blocks, then what is left as one partial block, which
/// reads and writes nothing beyond it.
template <class Source, class Target, class Form>
PYXCC_INLINE void convertColumns(const Source& source, const Target& target, int from, int to, const Form& form)
{
    constexpr int block = Source::block;
    static_assert(block == Target::block);
    int x = from;
    if (x > to - block) {
        // None is whole.
    } else if constexpr (StoredLate<Form>) {
        x = convertBlocksStoredLate(source, target, x, to, form);
    } else if constexpr (LoadedAtOnce<Source>) {
        for (; x <= to - block; x += block) target.store(x, apply(form, source.load(x)));
    } else {
        // Each block is loaded before the one in front of it is stored: taking interleaved pixels apart is a long chain
        // of shuffles, which so runs beside the form's instead of in front of it.
        auto pixels = source.load(x);
        for (; x <= to - 2 * block; x += block) {
            const auto next = source.load(x + block);
            target.store(x, apply(form, pixels));
            pixels = next;
        }
        target.store(x, apply(form, pixels));
        x += block;
    }
    if (x < to) target.store(x, to - x, apply(form, source.load(x, to - x)));
}

template <class Source, class Target, class Rule, class... Forms>
PYXCC_INLINE void convertRows(int width, int rows, const Source& sourceRow, const Target& targetRow,
                              const Plan<Rule, Forms...>& plan)
{
    if (width < 1) return; // as exports that do not test the size have it
    const auto ends = plan.rule(width);
    static_assert(std::tuple_size_v<decltype(ends)> == sizeof...(Forms));
    for (int y = 0; y < rows; ++y) {
        const auto source = sourceRow(y);
        const auto target = targetRow(y);
        [&]<std::size_t... I>(std::index_sequence<I...>) PYXCC_INLINE_LAMBDA
        {
            (convertColumns(source, target, I ? ends[I - 1] : 0, ends[I], std::get<I>(plan.forms)), ...);
        }
        (std::index_sequence_for<Forms...>{});
    }
}

/// Takes every row of a region, top to bottom, from one image to another.
template <class Source, class Target, class Plan>
PYXCC_INLINE PyxStatus eachRow(RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    convertRows(
        roi.width, roi.height, [&](int y) PYXCC_INLINE_LAMBDA { return source.row(y); },
        [&](int y) PYXCC_INLINE_LAMBDA { return target.row(y); }, plan);
    return pyxOk;
}

/// Takes every pair of rows of a region, top to bottom; an odd last row is left alone.
template <class Source, class Target, class Plan>
PYXCC_INLINE PyxStatus eachRowPair(RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    convertRows(
        roi.width, roi.height >> 1, [&](int j) PYXCC_INLINE_LAMBDA { return source.rowPair(j); },
        [&](int j) PYXCC_INLINE_LAMBDA { return target.rowPair(j); }, plan);
    return pyxOk;
}

/// The same, but an odd last row is taken as well: as a pair without its second row, and by a plan of its own.
template <class Source, class Target, class Plan, class LastPlan>
PYXCC_INLINE PyxStatus eachRowByPairs(RoiSize roi, const Source& source, const Target& target, const Plan& plan,
                                      const LastPlan& lastPlan)
{
    eachRowPair(roi, source, target, plan);
    convertRows(
        roi.width, roi.height & 1, [&](int) PYXCC_INLINE_LAMBDA { return source.halfPair(roi.height >> 1); },
        [&](int) PYXCC_INLINE_LAMBDA { return target.halfPair(roi.height >> 1); }, lastPlan);
    return pyxOk;
}

template <class Source, class Target, class Plan>
PYXCC_INLINE PyxStatus eachRowByPairs(RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    return eachRowByPairs(roi, source, target, plan, plan);
}

} // namespace pyxcc::frame
