// Forms for pixels that share their chroma.
#pragma once

#include "frame/forms.hpp"
#include "layouts/shared_chroma.hpp"

namespace pyxcc::subsampled
{

/// Luma of every pixel, and chroma of the sums over those that share it: `Columns` of a row, or of both rows of a pair.
/// Chroma is never averaged, R, G and B are. In a partial block the lanes without a pixel add nothing, so that the sums
/// of a lone last pixel are that pixel itself.
template <int Columns, class Luma, class Chroma> struct SharedForm {
    Luma luma;
    Chroma chroma;
};

template <class Luma, class Chroma> constexpr auto pairs(Luma luma, Chroma chroma)
{
    return SharedForm<2, Luma, Chroma>{luma, chroma};
}

template <class Luma, class Chroma> constexpr auto fours(Luma luma, Chroma chroma)
{
    return SharedForm<4, Luma, Chroma>{luma, chroma};
}

/// Luma by one form in the even columns, by another in the odd ones.
template <class Even, class Odd> struct ByColumn {
    Even even;
    Odd odd;
};

template <class Even, class Odd>
PYXCC_INLINE wide::U8 apply(const ByColumn<Even, Odd>& form, const Three<wide::U8>& pixels)
{
    return layouts::inTurn(apply(form.even, pixels), apply(form.odd, pixels));
}

template <int Columns, class Luma, class Chroma>
PYXCC_INLINE auto apply(const SharedForm<Columns, Luma, Chroma>& form, const Three<wide::U8>& row)
{
    using Sums = layouts::Sums<Columns, wide::U8>;
    return layouts::ChromaOfSums<Columns, wide::U8>{
        apply(form.luma, row), layouts::narrowPairs(form.chroma(Sums(row.a), Sums(row.b), Sums(row.c)))};
}

template <int Columns, class Luma, class Chroma>
PYXCC_INLINE auto apply(const SharedForm<Columns, Luma, Chroma>& form, const Two<Three<wide::U8>>& rows)
{
    const auto& [upper, lower] = rows;
    using Rows = Two<wide::U8>;
    using Sums = layouts::Sums<Columns, Rows>;
    return layouts::ChromaOfSums<Columns, Two<wide::U8>>{
        {apply(form.luma, upper), apply(form.luma, lower)},
        layouts::narrowPairs(
            form.chroma(Sums(Rows{upper.a, lower.a}), Sums(Rows{upper.b, lower.b}), Sums(Rows{upper.c, lower.c})))};
}

/// A form that takes the one for the other.
template <class Form> struct RedAndBlueExchanged {
    Form form;
};

template <class Form> constexpr auto redAndBlueExchanged(Form form) { return RedAndBlueExchanged<Form>{form}; }

template <class Form> PYXCC_INLINE auto apply(const RedAndBlueExchanged<Form>& form, const Three<wide::U8>& row)
{
    return apply(form.form, Three{row.c, row.b, row.a});
}

} // namespace pyxcc::subsampled
