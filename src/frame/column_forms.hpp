// Forms over the samples of a column, one from each of several rows.
#pragma once

#include "frame/forms.hpp"
#include "layouts/chroma_pairs.hpp"

#include <concepts>

namespace pyxcc::frame
{

/// A form over bytes, as many in as rows are read together, and as many out as rows are written.
struct OnColumns {
};

template <std::derived_from<OnColumns> Form, int N>
PYXCC_INLINE auto apply(const Form& form, const Several<wide::U8, N>& rows)
{
    return [&]<std::size_t... I>(std::index_sequence<I...>) PYXCC_INLINE_LAMBDA { return form(rows.part[I]...); }
    (std::make_index_sequence<N>{});
}

template <std::derived_from<OnColumns> Form> PYXCC_INLINE auto apply(const Form& form, const Two<wide::U8>& rows)
{
    return form(rows.a, rows.b);
}

/// Luma through one form, and the pairs of chroma through another.
template <class LumaForm, class PairsForm> struct ByKind {
    LumaForm luma;
    PairsForm pairs;
};

template <class LumaForm, class PairsForm> constexpr auto byKind(LumaForm luma, PairsForm pairs)
{
    return ByKind<LumaForm, PairsForm>{luma, pairs};
}

template <class LumaForm, class PairsForm, class Luma, class Pairs>
PYXCC_INLINE auto apply(const ByKind<LumaForm, PairsForm>& form, const layouts::LumaAndPairs<Luma, Pairs>& samples)
{
    return layouts::LumaAndPairs{apply(form.luma, samples.luma), apply(form.pairs, samples.pairs)};
}

} // namespace pyxcc::frame
