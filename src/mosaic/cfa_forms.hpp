// The colours that a place of a mosaic lacks, as means of the samples around it.
#pragma once

#include "lanes/groups.hpp"
#include "lanes/inline.hpp"

namespace pyxcc::mosaic
{

/// A sample and those around it.
template <class Samples> struct Near {
    Samples at, left, right, up, down, upLeft, upRight, downLeft, downRight;
};

/// Those two places away as well, which are of the sample's own colour.
template <class Samples> struct Far {
    Near<Samples> near;
    Samples farLeft, farRight, farUp, farDown;
};

/// (a + b + c + d + 2) >> 2 of two means that are rounded up, x of a and b and y of c and d. The mean of the two is one
/// too large where it is rounded up and one of them is, too.
template <class Samples>
PYXCC_INLINE Samples meanOfFour(Samples a, Samples b, Samples c, Samples d, Samples x, Samples y)
{
    return avgUp(x, y) - (((a ^ b) | (c ^ d)) & (x ^ y) & Samples(1));
}

template <class Samples> PYXCC_INLINE Samples meanOfFour(Samples a, Samples b, Samples c, Samples d)
{
    return meanOfFour(a, b, c, d, avgUp(a, b), avgUp(c, d));
}

namespace detail
{

/// R, G and B of a row of red and green, or B, G and R of one of blue and green. `atGreen` is a mask of green places.
template <class Samples>
PYXCC_INLINE Three<Samples> colors(const Near<Samples>& near, Samples alongRow, Samples alongColumn, Samples green,
                                   Samples atGreen)
{
    const Samples diagonal = meanOfFour(near.upLeft, near.upRight, near.downLeft, near.downRight);
    return {where(atGreen, alongRow, near.at), where(atGreen, near.at, green), where(atGreen, alongColumn, diagonal)};
}

template <bool redRow, class Samples> PYXCC_INLINE Three<Samples> asRgb(const Three<Samples>& colors)
{
    if constexpr (redRow) return colors;
    return {colors.c, colors.b, colors.a};
}

} // namespace detail

/// Plain means.
template <bool redRow, class Samples> struct MeansAround {
    Samples atGreen;

    PYXCC_INLINE Three<Samples> operator()(const Near<Samples>& x) const
    {
        const Samples alongRow = avgUp(x.left, x.right), alongColumn = avgUp(x.up, x.down);
        const Samples green = meanOfFour(x.left, x.right, x.up, x.down, alongRow, alongColumn);
        return detail::asRgb<redRow>(detail::colors(x, alongRow, alongColumn, green, atGreen));
    }
};

/// Green is the mean along the direction in which the place's own colour changes less.
template <bool redRow, class Samples> struct MeansAlongEdges {
    Samples atGreen;

    PYXCC_INLINE Three<Samples> operator()(const Far<Samples>& far) const
    {
        const Near<Samples>& x = far.near;
        const Samples alongRow = avgUp(x.left, x.right), alongColumn = avgUp(x.up, x.down);
        const Samples alongBoth = meanOfFour(x.left, x.right, x.up, x.down, alongRow, alongColumn);
        const Samples ofRow = distance(far.farLeft, far.farRight), ofColumn = distance(far.farUp, far.farDown);
        const Samples columnAtMost = equal(lesser(ofRow, ofColumn), ofColumn);
        const Samples along = where(columnAtMost, alongColumn, alongRow);
        const Samples green = where(equal(ofRow, ofColumn), alongBoth, along);
        return detail::asRgb<redRow>(detail::colors(x, alongRow, alongColumn, green, atGreen));
    }
};

template <bool redRow, class Samples>
PYXCC_INLINE auto apply(const MeansAround<redRow, Samples>& form, const Near<Samples>& samples)
{
    return form(samples);
}
template <bool redRow, class Samples>
PYXCC_INLINE auto apply(const MeansAlongEdges<redRow, Samples>& form, const Far<Samples>& samples)
{
    return form(samples);
}

} // namespace pyxcc::mosaic
