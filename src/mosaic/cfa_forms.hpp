// The colours that a place of a mosaic lacks, as means of the samples around it.
//
// A row has by turns a site, which is red or blue, and a green place. The forms take a site and the green place beside
// it together: what is known of the one serves the other, and no lane computes what its place does not need.
#pragma once

#include "lanes/groups.hpp"
#include "lanes/lanes.hpp"

namespace pyxcc::mosaic
{

/// A site, the green place beside it, its partner, and the samples around both. What lies towards the partner is inner,
/// what lies away from it is outer.
template <class Samples> struct Pair {
    Samples site, green;
    Samples innerSite;              ///< beyond the partner
    Samples outerGreen;             ///< next to the site
    Samples above, below;           ///< green, next to the site
    Samples upper, lower;           ///< of the third colour, next to the partner
    Samples outerUpper, outerLower; ///< of the third colour, next to the outer green
};

/// The samples two places away from the site as well, which are of its own colour. The inner one is known already.
template <class Samples> struct WidePair {
    Pair<Samples> near;
    Samples outerSite, farAbove, farBelow;
};

/// A site and its partner as the colour of the site, green and the third colour.
template <class Samples> struct Colors {
    Three<Samples> site, green;
};

/// (a + b + c + d + 2) >> 2 of the means x of a and b and y of c and d, rounded up. The mean of the two is one too
/// large where it is rounded up and one of them is, too.
template <class Samples>
PYXCC_INLINE Samples meanOfFour(Samples a, Samples b, Samples c, Samples d, Samples x, Samples y)
{
    return avgUp(x, y) - (((a ^ b) | (c ^ d)) & (x ^ y) & Samples(1));
}

namespace detail
{

template <class Samples> PYXCC_INLINE Colors<Samples> colors(const Pair<Samples>& x, Samples green)
{
    const Samples across = avgUp(x.upper, x.lower), outerAcross = avgUp(x.outerUpper, x.outerLower);
    const Samples third = meanOfFour(x.upper, x.lower, x.outerUpper, x.outerLower, across, outerAcross);
    return {{x.site, green, third}, {avgUp(x.site, x.innerSite), x.green, across}};
}

} // namespace detail

/// Plain means.
template <class Samples> PYXCC_INLINE Colors<Samples> meansAround(const Pair<Samples>& x)
{
    return detail::colors(
        x, meanOfFour(x.green, x.outerGreen, x.above, x.below, avgUp(x.green, x.outerGreen), avgUp(x.above, x.below)));
}

/// Green is the mean along the direction in which the site's own colour changes less, or of both.
template <class Samples> PYXCC_INLINE Colors<Samples> meansAlongEdges(const WidePair<Samples>& wide)
{
    const Pair<Samples>& x = wide.near;
    const Samples alongRow = avgUp(x.green, x.outerGreen), alongColumn = avgUp(x.above, x.below);
    const Samples ofRow = distance(wide.outerSite, x.innerSite), ofColumn = distance(wide.farAbove, wide.farBelow);
    const Samples between = alongRow ^ alongColumn;
    const Samples first = alongRow ^ (between & equal(lesser(ofRow, ofColumn), ofColumn));
    const Samples second = first ^ (between & equal(ofRow, ofColumn));
    return detail::colors(x, meanOfFour(x.green, x.outerGreen, x.above, x.below, first, second));
}

} // namespace pyxcc::mosaic
