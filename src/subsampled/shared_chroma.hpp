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
    using layouts::sumsOf;
    return layouts::ChromaOfSums<Columns, wide::U8>{
        apply(form.luma, row), form.chroma(sumsOf<Columns>(row.a), sumsOf<Columns>(row.b), sumsOf<Columns>(row.c))};
}

template <int Columns, class Luma, class Chroma>
PYXCC_INLINE auto apply(const SharedForm<Columns, Luma, Chroma>& form, const Two<Three<wide::U8>>& rows)
{
    const auto sums = [](wide::U8 upper, wide::U8 lower) PYXCC_INLINE_LAMBDA {
        return layouts::sumsOf<Columns>(upper) + layouts::sumsOf<Columns>(lower);
    };
    return layouts::ChromaOfSums<Columns, Two<wide::U8>>{
        {apply(form.luma, rows.a), apply(form.luma, rows.b)},
        form.chroma(sums(rows.a.a, rows.b.a), sums(rows.a.b, rows.b.b), sums(rows.a.c, rows.b.c))};
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
