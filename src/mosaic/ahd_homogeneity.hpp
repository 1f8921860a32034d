// How alike a candidate's pixels are to their neighbours, and which of two candidates is the smoother.
//
// What is made of bytes fits 16 bits throughout: those forms go along rows without a branch, and the compiler makes
// vector code of them. Distances between the chroma of 16-bit samples take 32 bits; those are made of the even columns
// and of the odd ones apart, in registers that hold the two numbers of a pixel side by side.
#pragma once

#include "mosaic/ahd_forms.hpp"

#include <algorithm>

namespace pyxcc::mosaic
{

/// Luma and chroma of a row of a candidate.
template <class T, int Columns> struct LumaChroma;

template <int Columns> struct LumaChroma<u8, Columns> {
    Line<s16, Columns> y, cb, cr;
};

/// Luma is 28160 less than it is; distances are the same. Both numbers of chroma are a double word, the first one its
/// lower half.
template <int Columns> struct LumaChroma<u16, Columns> {
    Line<s16, Columns> y;
    Line<s32, Columns / 2> even, odd;
};

/// How far the pixels of a row are from neighbours.
template <class T, int Columns> struct Distances;

/// A sum of two squares of chroma is below 65536: the largest is that of green and magenta. It is kept 32768 less,
/// which is how it is compared in 16 bits.
template <int Columns> struct Distances<u8, Columns> {
    Line<s16, Columns> luma;
    Line<s16, Columns> chroma;
};

/// Distances of luma are 32768 less than they are, too. Sums of squares may leave 32 bits, and wrap.
template <int Columns> struct Distances<u16, Columns> {
    Line<s16, Columns> luma;
    Line<s32, Columns / 2> even, odd;
};

/// (66 R + 129 G + 25 B + 128) >> 8 and so on, by what red and blue have more than green: that takes fewer products.
/// The weights of chroma add up to nothing. 16 bits hold the sums for bytes: that for luma without a sign, those for
/// chroma with one.
template <int Columns>
void toLumaChroma(const u8* red, const u8* green, const u8* blue, LumaChroma<u8, Columns>& to, int count)
{
    s16* __restrict const toY = to.y.at();
    s16* __restrict const toCb = to.cb.at();
    s16* __restrict const toCr = to.cr.at();
    for (int x = 0; x < count; ++x) {
        const s16 g = green[x];
        const auto r = static_cast<s16>(red[x] - g), b = static_cast<s16>(blue[x] - g);
        toY[x] = static_cast<s16>(static_cast<u16>(220 * g + 66 * r + 25 * b + 128) >> 8);
        toCb[x] = static_cast<s16>(static_cast<s16>(112 * b - 38 * r + 128) >> 8);
        toCr[x] = static_cast<s16>(static_cast<s16>(112 * r - 18 * b + 128) >> 8);
    }
}

namespace detail
{

/// Luma and chroma of every other column before they are shifted down: 256 times as large, and the second number of
/// chroma 65536 times, so that its upper half is the result. A word of 2 lies beside blue, for what is added.
struct SumsOfColors {
    wide::S32 y, cb, cr;

    PYXCC_INLINE SumsOfColors(wide::WordPairs redGreen, wide::WordPairs blueTwo)
        : y(sum<66, 129, 25>(redGreen, blueTwo)), cb(sum<-38, -74, 112>(redGreen, blueTwo)),
          cr(sum<112 * 256, -94 * 256, -18 * 256, 256>(redGreen, blueTwo))
    {
    }

    PYXCC_INLINE wide::S32 chroma() const { return wide::S32(lowerAndUpperHalves(cb >> 8, cr).v); }

private:
    template <int R, int G, int B, int scale = 1>
    static PYXCC_INLINE wide::S32 sum(wide::WordPairs redGreen, wide::WordPairs blueTwo)
    {
        return wide::sumOfProducts<R, G>(redGreen) + wide::sumOfProducts<B, 64 * scale>(blueTwo);
    }
};

} // namespace detail

/// What samples of 16 bits are above 32768 fits multiply-adds. It is nothing to chroma.
template <int Columns>
void toLumaChroma(const u16* red, const u16* green, const u16* blue, LumaChroma<u16, Columns>& to, int count)
{
    using wide::evenPairs, wide::oddPairs, wide::S16;
    for (int x = 0; x < count; x += S16::count) {
        const S16 r = lowered(registerOf(red + x)), g = lowered(registerOf(green + x)),
                  b = lowered(registerOf(blue + x));
        const detail::SumsOfColors even(evenPairs(r, g), evenPairs(b, S16(2))),
            odd(oddPairs(r, g), oddPairs(b, S16(2)));
        storeRegister(to.y.at(x), lowerAndUpperHalves(even.y >> 8, odd.y << 8));
        storeRegister(to.even.at(x / 2), even.chroma());
        storeRegister(to.odd.at(x / 2), odd.chroma());
    }
}

/// Between two rows, the second from some columns further on; then between a row and itself.
template <int Columns>
void measure(const LumaChroma<u8, Columns>& a, const LumaChroma<u8, Columns>& b, Distances<u8, Columns>& to, int count,
             int further = 0)
{
    const s16 *const ay = a.y.at(), *const acb = a.cb.at(), *const acr = a.cr.at();
    const s16 *const by = b.y.at(further), *const bcb = b.cb.at(further), *const bcr = b.cr.at(further);
    s16* __restrict const luma = to.luma.at();
    s16* __restrict const chroma = to.chroma.at();
    for (int x = 0; x < count; ++x) {
        const auto y = static_cast<s16>(ay[x] - by[x]);
        luma[x] = static_cast<s16>(y < 0 ? -y : y);
        const auto cb = static_cast<s16>(acb[x] - bcb[x]), cr = static_cast<s16>(acr[x] - bcr[x]);
        chroma[x] = static_cast<s16>(cb * cb + cr * cr - 32768);
    }
}

template <int Columns> void measureBeside(const LumaChroma<u8, Columns>& a, Distances<u8, Columns>& to, int count)
{
    measure(a, a, to, count, 1);
}

namespace detail
{

/// max - min, 32768 less.
PYXCC_INLINE wide::S16 loweredDistance(wide::S16 x, wide::S16 y)
{
    return lowered(asU16(greater(x, y) - lesser(x, y)));
}

/// The sum of the squares of both words' differences, by products that fit: x x + y y - 2 x y. All of it may wrap.
PYXCC_INLINE wide::S32 sumOfSquares(wide::WordPairs x, wide::WordPairs y)
{
    const wide::S32 product = sumOfProducts(x, y);
    return (sumOfProducts(x, x) - product) + (sumOfProducts(y, y) - product);
}

PYXCC_INLINE wide::WordPairs chromaOf(const s32* from) { return wide::WordPairs(registerOf(from).v); }

} // namespace detail

template <int Columns> void measureBeside(const LumaChroma<u16, Columns>& a, Distances<u16, Columns>& to, int count)
{
    using detail::chromaOf;
    for (int x = 0; x < count; x += wide::S16::count) {
        const int i = x / 2;
        storeRegister(to.luma.at(x), detail::loweredDistance(registerOf(a.y.at(x)), registerOf(a.y.at(x + 1))));
        const auto even = chromaOf(a.even.at(i)), odd = chromaOf(a.odd.at(i)), nextEven = chromaOf(a.even.at(i + 1));
        storeRegister(to.even.at(i), detail::sumOfSquares(even, odd));
        storeRegister(to.odd.at(i), detail::sumOfSquares(odd, nextEven));
    }
}

template <int Columns>
void measure(const LumaChroma<u16, Columns>& a, const LumaChroma<u16, Columns>& b, Distances<u16, Columns>& to,
             int count)
{
    using detail::chromaOf;
    for (int x = 0; x < count; x += wide::S16::count) {
        const int i = x / 2;
        storeRegister(to.luma.at(x), detail::loweredDistance(registerOf(a.y.at(x)), registerOf(b.y.at(x))));
        storeRegister(to.even.at(i), detail::sumOfSquares(chromaOf(a.even.at(i)), chromaOf(b.even.at(i))));
        storeRegister(to.odd.at(i), detail::sumOfSquares(chromaOf(a.odd.at(i)), chromaOf(b.odd.at(i))));
    }
}

/// Those of a row of a candidate: beside at x is between the columns x and x + 1; then those to the rows above and
/// below.
template <class T, int Columns> struct DistancesAround {
    const Distances<T, Columns>&beside, &above, &below;
};

/// How many more of its neighbours the candidate along the row resembles than the one along the column, and noScore.
template <int Columns>
void scoreCandidates(const DistancesAround<u8, Columns>& h, const DistancesAround<u8, Columns>& v,
                     Line<u8, Columns>& scores, int count)
{
    const s16 *const hBeside = h.beside.luma.at(-1), *const hAbove = h.above.luma.at(),
                     *const hBelow = h.below.luma.at();
    const s16 *const vBeside = v.beside.luma.at(-1), *const vAbove = v.above.luma.at(),
                     *const vBelow = v.below.luma.at();
    const s16 *const hBesideC = h.beside.chroma.at(-1), *const vBesideC = v.beside.chroma.at(-1);
    const s16 *const hAboveC = h.above.chroma.at(), *const hBelowC = h.below.chroma.at();
    const s16 *const vAboveC = v.above.chroma.at(), *const vBelowC = v.below.chroma.at();
    alignas(32) s16 more[Columns]; // in a row of its own, or else the compiler narrows each comparison
    for (int x = 0; x < count; ++x) {
        const s16 limit = std::min(std::max(hBeside[x], hBeside[x + 1]), std::max(vAbove[x], vBelow[x]));
        const s16 limitC = std::min(std::max(hBesideC[x], hBesideC[x + 1]), std::max(vAboveC[x], vBelowC[x]));
        // -1 for what is too far: comparisons are masks.
        const auto isBeyond = [&](s16 luma, s16 chroma) {
            const s16 far = luma > limit ? -1 : 0, farC = chroma > limitC ? -1 : 0;
            return static_cast<s16>(far | farC);
        };
        const auto alongRow =
            static_cast<s16>(isBeyond(hBeside[x], hBesideC[x]) + isBeyond(hBeside[x + 1], hBesideC[x + 1]) +
                             isBeyond(hAbove[x], hAboveC[x]) + isBeyond(hBelow[x], hBelowC[x]));
        const auto alongColumn =
            static_cast<s16>(isBeyond(vBeside[x], vBesideC[x]) + isBeyond(vBeside[x + 1], vBesideC[x + 1]) +
                             isBeyond(vAbove[x], vAboveC[x]) + isBeyond(vBelow[x], vBelowC[x]));
        more[x] = static_cast<s16>(alongRow - alongColumn);
    }
    u8* __restrict const to = scores.at();
    for (int x = 0; x < count; ++x) to[x] = static_cast<u8>(more[x] + noScore);
}

namespace detail
{

/// How far a register of pixels is from one of its four neighbours.
struct DistancesOfWords {
    wide::S16 luma;
    wide::S32 even, odd;

    /// All bits where one of them is beyond the limit.
    PYXCC_INLINE wide::S16 beyond(const DistancesOfWords& limit) const
    {
        return isAbove(luma, limit.luma) |
               lowerAndUpperHalves(wide::isAbove(even, limit.even), wide::isAbove(odd, limit.odd));
    }

    friend PYXCC_INLINE DistancesOfWords lesser(const DistancesOfWords& x, const DistancesOfWords& y)
    {
        return {wide::lesser(x.luma, y.luma), wide::lesser(x.even, y.even), wide::lesser(x.odd, y.odd)};
    }
    friend PYXCC_INLINE DistancesOfWords greater(const DistancesOfWords& x, const DistancesOfWords& y)
    {
        return {wide::greater(x.luma, y.luma), wide::greater(x.even, y.even), wide::greater(x.odd, y.odd)};
    }
};

struct FourDistances {
    DistancesOfWords left, right, above, below;

    template <int Columns>
    PYXCC_INLINE FourDistances(const DistancesAround<u16, Columns>& around, int x)
        : left{registerOf(around.beside.luma.at(x - 1)), registerOf(around.beside.odd.at(x / 2 - 1)),
               registerOf(around.beside.even.at(x / 2))},
          right{registerOf(around.beside.luma.at(x)), left.odd, registerOf(around.beside.odd.at(x / 2))},
          above(of(around.above, x)), below(of(around.below, x))
    {
    }

    PYXCC_INLINE wide::S16 beyond(const DistancesOfWords& limit) const
    {
        return (left.beyond(limit) + right.beyond(limit)) + (above.beyond(limit) + below.beyond(limit));
    }

private:
    template <int Columns> static PYXCC_INLINE DistancesOfWords of(const Distances<u16, Columns>& distances, int x)
    {
        return {registerOf(distances.luma.at(x)), registerOf(distances.even.at(x / 2)),
                registerOf(distances.odd.at(x / 2))};
    }
};

} // namespace detail

template <int Columns>
void scoreCandidates(const DistancesAround<u16, Columns>& h, const DistancesAround<u16, Columns>& v,
                     Line<u16, Columns>& scores, int count)
{
    for (int x = 0; x < count; x += wide::U16::count) {
        const detail::FourDistances alongRow(h, x), alongColumn(v, x);
        const detail::DistancesOfWords limit =
            lesser(greater(alongRow.left, alongRow.right), greater(alongColumn.above, alongColumn.below));
        const wide::S16 more = alongRow.beyond(limit) - alongColumn.beyond(limit);
        storeRegister(scores.at(x), asU16(more + wide::S16(noScore)));
    }
}

} // namespace pyxcc::mosaic
