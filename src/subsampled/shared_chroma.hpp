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

/// A form whose chroma is a difference to luma as it is before it comes to whole steps: `fine` luma of a pixel, `luma`
/// of that, and `chroma` of sums of R, of B and of fine luma.
template <class Form>
concept OfFineLuma = requires(wide::Sample x)
{
    Form::luma(Form::fine(x, x, x));
};

namespace detail
{

template <class Form> PYXCC_INLINE Two<wide::S16> fineLuma(const Three<wide::U8>& row)
{
    const Two<wide::Sample> r = widen(row.a), g = widen(row.b), b = widen(row.c);
    return {Form::fine(r.a, g.a, b.a), Form::fine(r.b, g.b, b.b)};
}

template <class Form> PYXCC_INLINE wide::U8 lumaOf(const Two<wide::S16>& fine)
{
    return narrow(Form::luma(fine.a), Form::luma(fine.b));
}

} // namespace detail

template <OfFineLuma Form> PYXCC_INLINE auto apply(const Form&, const Three<wide::U8>& row)
{
    using Sums = layouts::Sums<2, wide::U8>;
    const Two<wide::S16> fine = detail::fineLuma<Form>(row);
    return layouts::ChromaOfSums<2, wide::U8>{
        detail::lumaOf<Form>(fine),
        layouts::narrowPairs(Form::chroma(Sums(row.a), Sums(row.c), layouts::sumsOfPairs(fine)))};
}

template <OfFineLuma Form> PYXCC_INLINE auto apply(const Form&, const Two<Three<wide::U8>>& rows)
{
    const auto& [upper, lower] = rows;
    using Rows = Two<wide::U8>;
    using Sums = layouts::Sums<2, Rows>;
    const Two<wide::S16> fineUpper = detail::fineLuma<Form>(upper), fineLower = detail::fineLuma<Form>(lower);
    const Two<wide::S16> fine = {fineUpper.a + fineLower.a, fineUpper.b + fineLower.b};
    return layouts::ChromaOfSums<2, Rows>{
        {detail::lumaOf<Form>(fineUpper), detail::lumaOf<Form>(fineLower)},
        layouts::narrowPairs(
            Form::chroma(Sums(Rows{upper.a, lower.a}), Sums(Rows{upper.c, lower.c}), layouts::sumsOfPairs(fine)))};
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
