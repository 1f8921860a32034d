// Rows of a source that are made of several rows of an image as they are loaded, column by column. `form` takes a
// register of each and gives one.
#pragma once

#include "layouts/moved_chroma.hpp"

#include <utility>

namespace pyxcc::layouts
{

namespace detail
{

template <class Form, class... Chroma>
PYXCC_INLINE ChromaApart ofColumns(const Form& form, const ChromaApart& x, const Chroma&... rest)
{
    return {form(x.a, rest.a...), form(x.b, rest.b...)};
}

template <class Form, class... Chroma>
PYXCC_INLINE ChromaInPairs ofColumns(const Form& form, const ChromaInPairs& x, const Chroma&... rest)
{
    return {form(x.first, rest.first...), form(x.second, rest.second...)};
}

template <class Form, int N, class... Luma>
PYXCC_INLINE Several<wide::U8, N> ofColumns(const Form& form, const Several<wide::U8, N>& x, const Luma&... rest)
{
    return each(form, x, rest...);
}

/// Luma is that of the first row.
template <class Form, int Columns, class Chroma, class... Pixels>
PYXCC_INLINE WithLuma<Columns, Chroma> ofColumns(const Form& form, const WithLuma<Columns, Chroma>& x,
                                                 const Pixels&... rest)
{
    return {x.luma, ofColumns(form, x.chroma, rest.chroma...)};
}

} // namespace detail

template <class Form, class Row, int N> struct ComputedRow {
    Form form;
    std::array<Row, N> rows;

    PYXCC_INLINE auto load(std::ptrdiff_t i) const
    {
        return eachRow([&](const auto&... row) PYXCC_INLINE_LAMBDA { return detail::ofColumns(form, row.load(i)...); });
    }

    template <class F> PYXCC_INLINE ComputedRow mapped(const F& f) const
    {
        ComputedRow copy = *this;
        for (Row& row : copy.rows) row = row.mapped(f);
        return copy;
    }

private:
    template <class F> PYXCC_INLINE auto eachRow(const F& f) const
    {
        return [&]<std::size_t... I>(std::index_sequence<I...>) PYXCC_INLINE_LAMBDA { return f(rows[I]...); }
        (std::make_index_sequence<N>{});
    }
};

template <class Form, class Row, class... Rows>
PYXCC_INLINE auto computed(const Form& form, const Row& first, const Rows&... rest)
{
    return ComputedRow<Form, Row, 1 + sizeof...(Rows)>{form, {first, rest...}};
}

/// A row of luma by itself, two columns to a chroma sample.
template <class Byte> struct LumaByTwos {
    Byte* luma;

    PYXCC_INLINE Several<wide::U8, 2> load(std::ptrdiff_t i) const { return detail::loadLuma<2>(luma + 2 * i); }
    PYXCC_INLINE void store(std::ptrdiff_t i, const Several<wide::U8, 2>& samples) const
    {
        detail::storeLuma(luma + 2 * i, samples);
    }
    template <class F> PYXCC_INLINE LumaByTwos mapped(const F& f) const { return {f(luma, 2)}; }
};

template <class Byte> PYXCC_INLINE auto lumaByTwos(Byte* luma) { return LumaByTwos<Byte>{luma}; }

/// A row of luma, which may be computed, beside one of chroma.
template <class LumaRow, class ChromaRow> struct BesideRow {
    LumaRow luma;
    ChromaRow chroma;

    PYXCC_INLINE auto load(std::ptrdiff_t i) const
    {
        return WithLuma<2, decltype(chroma.load(i))>{luma.load(i), chroma.load(i)};
    }
    template <class F> PYXCC_INLINE BesideRow mapped(const F& f) const { return {luma.mapped(f), chroma.mapped(f)}; }
};

template <class LumaRow, class ChromaRow> BesideRow(LumaRow, ChromaRow) -> BesideRow<LumaRow, ChromaRow>;

} // namespace pyxcc::layouts
