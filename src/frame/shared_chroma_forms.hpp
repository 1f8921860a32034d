// How an inverse form meets pixels that share their chroma.
#pragma once

#include "frame/forms.hpp"
#include "layouts/shared_chroma.hpp"

namespace pyxcc::frame
{

/// A form in two parts, the first of which is made once for all the pixels of a chroma sample.
template <class Form>
concept InTwoParts = requires(wide::Sample chroma)
{
    Form::shares(chroma, chroma);
};

namespace detail
{

/// Laid beside the pixels of a block that is widened to two registers of words.
PYXCC_INLINE Two<Three<wide::S16>> besidePixels(const Three<wide::S16>& ofPairs)
{
    const auto a = layouts::doubled(ofPairs.a), b = layouts::doubled(ofPairs.b), c = layouts::doubled(ofPairs.c);
    return {{a.a, b.a, c.a}, {a.b, b.b, c.b}};
}

PYXCC_INLINE Two<wide::Sample> widened(wide::U8 luma) { return widen(luma); }
PYXCC_INLINE Two<wide::Sample> widened(const Two<wide::Sample>& luma) { return luma; }

/// Calls `row` for one row of luma or for two.
template <class Luma, class Row> PYXCC_INLINE auto eachLumaRow(const Luma& luma, const Row& row)
{
    return row(widened(luma));
}
template <class Row> PYXCC_INLINE auto eachLumaRow(const Two<wide::U8>& rows, const Row& row)
{
    return Two{row(widened(rows.a)), row(widened(rows.b))};
}

} // namespace detail

template <std::derived_from<OnWords> Form, class Luma>
PYXCC_INLINE auto apply(const Form& form, const layouts::ChromaOfPairs<Luma>& pixels)
{
    const auto& [cb, cr] = pixels.chroma;
    if constexpr (InTwoParts<Form>) {
        const Two<Three<wide::S16>> shares = detail::besidePixels(Form::shares(cb, cr));
        return detail::eachLumaRow(pixels.luma, [&](const Two<wide::Sample>& y) PYXCC_INLINE_LAMBDA {
            return narrowAll(Form::add(y.a, shares.a), Form::add(y.b, shares.b));
        });
    } else {
        const Two<wide::S16> cbs = layouts::doubled(cb), crs = layouts::doubled(cr);
        return detail::eachLumaRow(pixels.luma, [&](const Two<wide::Sample>& y) PYXCC_INLINE_LAMBDA {
            return narrowAll(form(static_cast<const wide::S16&>(y.a), cbs.a, crs.a),
                             form(static_cast<const wide::S16&>(y.b), cbs.b, crs.b));
        });
    }
}

/// A form that takes chroma of packed pixels where it lies.
template <class Form>
concept OnPackedChroma = requires(layouts::ChromaInPlace<0, false> chroma)
{
    Form::sharesInPlace(chroma);
};

template <OnPackedChroma Form, int First, bool Exchanged>
PYXCC_INLINE auto apply(const Form&, const layouts::PixelsInTurn<First, Exchanged>& pixels)
{
    return narrowAll(Form::addInPlace(pixels.luma.a, Form::sharesInPlace(pixels.inPlace.a)),
                     Form::addInPlace(pixels.luma.b, Form::sharesInPlace(pixels.inPlace.b)));
}

/// One row adds it to its even columns and to its odd ones, which saves laying it beside them.
template <std::derived_from<AddedToLuma> Form>
PYXCC_INLINE auto apply(const Form&, const layouts::ChromaOfPairs<wide::U8>& pixels)
{
    const Three<wide::S16> shares = Form::shares(pixels.chroma.a, pixels.chroma.b);
    const wide::S16 even = layouts::lowBytes(pixels.luma), odd = layouts::highBytes(pixels.luma);
    const auto channel = [&](wide::S16 share) PYXCC_INLINE_LAMBDA {
        return layouts::inTurn(layouts::narrowPairs(Two{sat8(even + share), sat8(odd + share)}));
    };
    return Three{channel(shares.a), channel(shares.b), channel(shares.c)};
}

/// Two rows share what it takes to add in bytes, where the results are clamped for nothing.
template <std::derived_from<AddedToLuma> Form>
PYXCC_INLINE auto apply(const Form&, const layouts::ChromaOfPairs<Two<wide::U8>>& pixels)
{
    const Three<wide::S16> shares = Form::shares(pixels.chroma.a, pixels.chroma.b);
    const auto a = layouts::inBytes(shares.a), b = layouts::inBytes(shares.b), c = layouts::inBytes(shares.c);
    const auto row = [&](wide::U8 luma) PYXCC_INLINE_LAMBDA {
        return Three{addTo(luma, a), addTo(luma, b), addTo(luma, c)};
    };
    return Two{row(pixels.luma.a), row(pixels.luma.b)};
}

} // namespace pyxcc::frame
