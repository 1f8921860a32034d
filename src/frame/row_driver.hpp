// Walks the rows of a region and tells which columns take which form.
//
// A row is anything that loads and stores blocks of pixels: one row of an image, or the pair of rows that shares a row
// of chroma. The width of a block is the layouts' own affair; which form a column takes follows from the rule alone.
#pragma once

#include "frame/forms.hpp"
#include "pyxcc/types.h"

namespace pyxcc::frame
{

/// The columns [0, wide) take the wide form, [wide, end) the tail form; what lies behind is left alone.
struct Spans {
    int wide;
    int end;
};

/// What a row goes through: which columns, and which forms. The rule takes the width and gives Spans.
template <class Rule, class Wide, class Tail> struct Plan {
    Rule rule;
    Wide wide;
    Tail tail;
};

/// Whole blocks of `Block` pixels in the wide form, the rest in the tail form.
template <int Block, class Wide, class Tail> constexpr auto wideThenTail(Wide wide, Tail tail)
{
    static_assert((Block & (Block - 1)) == 0);
    const auto rule = [](int width) { return Spans{width & ~(Block - 1), width}; };
    return Plan<decltype(rule), Wide, Tail>{rule, wide, tail};
}

template <class Form> constexpr auto everyPixel(Form form)
{
    const auto rule = [](int width) { return Spans{width, width}; };
    return Plan<decltype(rule), Form, Form>{rule, form, form};
}

/// Takes the columns [from, to) of a row through a form: whole blocks, then what is left as one partial block, which
/// reads and writes nothing beyond it.
template <class Source, class Target, class Form>
PYXCC_INLINE void convertColumns(const Source& source, const Target& target, int from, int to, const Form& form)
{
    constexpr int block = Source::block;
    static_assert(block == Target::block);
    int x = from;
    for (; x <= to - block; x += block) target.store(x, apply(form, source.load(x)));
    if (x < to) target.store(x, to - x, apply(form, source.load(x, to - x)));
}

template <class Source, class Target, class Rule, class Wide, class Tail>
PYXCC_INLINE void convertRows(int width, int rows, const Source& sourceRow, const Target& targetRow,
                              const Plan<Rule, Wide, Tail>& plan)
{
    const Spans spans = plan.rule(width);
    for (int y = 0; y < rows; ++y) {
        const auto source = sourceRow(y);
        const auto target = targetRow(y);
        convertColumns(source, target, 0, spans.wide, plan.wide);
        if (spans.wide < spans.end) convertColumns(source, target, spans.wide, spans.end, plan.tail);
    }
}

/// Takes every row of a region, top to bottom, from one image to another.
template <class Source, class Target, class Plan>
PYXCC_INLINE PyxStatus eachRow(RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    convertRows(
        roi.width, roi.height, [&](int y) { return source.row(y); }, [&](int y) { return target.row(y); }, plan);
    return pyxOk;
}

/// Takes every pair of rows of a region, top to bottom; an odd last row is left alone.
template <class Source, class Target, class Plan>
PYXCC_INLINE PyxStatus eachRowPair(RoiSize roi, const Source& source, const Target& target, const Plan& plan)
{
    convertRows(
        roi.width, roi.height >> 1, [&](int j) { return source.rowPair(j); }, [&](int j) { return target.rowPair(j); },
        plan);
    return pyxOk;
}

} // namespace pyxcc::frame
