// Fewer levels of words in bytes: what a sample is above the level below it, in 65535ths of a step, is compared with a
// threshold in them. Where the two are so near to each other that rounding may have made it otherwise, the form that
// counts decides.
#pragma once

#include "layouts/samples_as_floats.hpp"
#include "tone/reduce_bits_forms.hpp"

namespace pyxcc::tone
{

/// What numbers of levels are stored as, of few levels and of many.
struct FewNumbers {
    FewLevels levels;

    PYXCC_INLINE wide::U8 operator()(wide::U16 low, wide::U16 high) const
    {
        return lookUp(levels.valueOf, narrow(wide::Byte(low.v), wide::Byte(high.v)));
    }
};

struct ManyNumbers {
    StepValues values;

    PYXCC_INLINE wide::U8 operator()(wide::U16 low, wide::U16 high) const
    {
        return values.at((low << 7) + values.start, (high << 7) + values.start);
    }
};

template <class Exact, class Numbers> struct ByWords {
    Exact exact;
    Numbers numbers;
    int steps;
};

/// Words of a row with their thresholds, and what gives those of the form that counts, by first column and row.
template <class Source, class ExactThresholds> struct WordsInPlace {
    Two<wide::U16> words, thresholds;
    const ExactThresholds* exactThresholds;
    int x, y;
};

namespace detail
{

template <class Form, class Source, class ExactThresholds>
PYXCC_INLINE auto exactly(const Form& form, const WordsInPlace<Source, ExactThresholds>& x)
{
    const Two<wide::F32> low = toF32ByDifference(x.words.a), high = toF32ByDifference(x.words.b);
    const Four<wide::F32> samples{low.a, low.b, high.a, high.b};
    if constexpr (requires { Form::takesThreshold; }) {
        return apply(form, Two{samples, (*x.exactThresholds)(x.x, x.y)});
    } else {
        return apply(form, samples);
    }
}

/// Out of the way of what is taken nearly always.
template <class Form, class Place>
[[gnu::noinline, gnu::cold]] Several<wide::U8, 1> exactlyAside(const Form& form, Place x)
{
    return exactly(form, x);
}

} // namespace detail

template <class Exact, class Numbers, class Source, class ExactThresholds>
PYXCC_INLINE Several<wide::U8, 1> apply(const ByWords<Exact, Numbers>& form,
                                        const WordsInPlace<Source, ExactThresholds>& x)
{
    using wide::U16;
    constexpr int near = 4; // 65535ths: rounding makes less than that of a difference, in any mode
    struct Number {
        U16 number, distance;
    };
    const auto take = [&](U16 word, U16 threshold) PYXCC_INLINE_LAMBDA {
        // A product of 65536 n + m is n in full and n + m 65535ths, which may be one step more.
        const U16 whole = mulHighU16(word, form.steps), part = word * U16(form.steps) + whole;
        const U16 below = whole + lesser(subSatU16(whole, part), 1);
        return Number{below + lesser(subSatU16(part, threshold), 1), part - threshold + U16(near)};
    };
    const Number low = take(x.words.a, x.thresholds.a), high = take(x.words.b, x.thresholds.b);
    if (__builtin_expect(anyAtMost(lesser(low.distance, high.distance), 2 * near), false))
        return detail::exactlyAside(form.exact, x);
    return several(form.numbers(low.number, high.number));
}

template <class Depth, class Source, class ExactThresholds>
PYXCC_INLINE auto apply(const NearestTail<Depth>& form, const WordsInPlace<Source, ExactThresholds>& x)
{
    return detail::exactly(form, x);
}

template <class Depth, class Source, class ExactThresholds>
PYXCC_INLINE auto apply(const OrderedTail<Depth>& form, const WordsInPlace<Source, ExactThresholds>& x)
{
    return detail::exactly(form, x);
}

} // namespace pyxcc::tone
