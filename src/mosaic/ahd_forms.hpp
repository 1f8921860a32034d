// The two candidates for each pixel of a mosaic, one made along rows and one along columns, and which is the smoother.
//
// Each form goes along a row, and the compiler makes vector code of it: there is no branch, choices are made by masks
// of all bits or none, and the rows that are written lie apart from all others.
#pragma once

#include "pyxcc/types.h"

#include <cstdlib>
#include <limits>
#include <type_traits>

namespace pyxcc::mosaic
{

/// Which columns of a row are green: those whose lowest bit is this.
using GreenParity = int;

/// Samples of a row and those around it; [1] is the row itself.
template <class T> struct ThreeRows {
    const T* row[3];
};

/// What sums and differences of a few samples fit, and so do luma and chroma: the narrower, the more at once.
template <class T> using NumberFor = std::conditional_t<sizeof(T) == 1, s16, s32>;

namespace detail
{

/// The mean of two neighbours, corrected by how the colour of the place itself bends, and held between them.
template <class Number> Number greenBetween(Number before, Number behind, Number at, Number farBefore, Number farBehind)
{
    const auto mean = static_cast<Number>((before + behind) >> 1);
    const auto bend = static_cast<Number>(2 * at - farBefore - farBehind);
    const auto corrected = static_cast<Number>(mean + (bend >> 2));
    const Number least = before < behind ? before : behind, most = before < behind ? behind : before;
    const Number atMost = corrected < most ? corrected : most;
    return atMost > least ? atMost : least;
}

/// All bits where the column is green.
template <class Number> Number greenMask(int x, GreenParity green)
{
    return static_cast<Number>(-static_cast<Number>((x & 1) == green));
}

template <class Number> Number where(Number mask, Number yes, Number no)
{
    return static_cast<Number>(no ^ ((yes ^ no) & mask));
}

template <class T> T saturated(NumberFor<T> value)
{
    constexpr NumberFor<T> most = std::numeric_limits<T>::max();
    const NumberFor<T> atLeast = value > 0 ? value : NumberFor<T>{0};
    return static_cast<T>(atLeast < most ? atLeast : most);
}

} // namespace detail

/// Green along the row and along the column. `rows` are five, [2] is the row itself.
template <class T>
void interpolateGreen(const T* const rows[5], T* __restrict alongRow, T* __restrict alongColumn, int count,
                      GreenParity green)
{
    const T *const up2 = rows[0], *const up = rows[1], *const at = rows[2], *const down = rows[3],
                   *const down2 = rows[4];
    using Number = NumberFor<T>;
    for (int x = 0; x < count; ++x) {
        const Number own = at[x];
        const Number h = detail::greenBetween<Number>(at[x - 1], at[x + 1], own, at[x - 2], at[x + 2]);
        const Number v = detail::greenBetween<Number>(up[x], down[x], own, up2[x], down2[x]);
        const auto atGreen = detail::greenMask<Number>(x, green);
        alongRow[x] = static_cast<T>(detail::where(atGreen, own, h));
        alongColumn[x] = static_cast<T>(detail::where(atGreen, own, v));
    }
}

/// The colour that a row has besides green, and the one that it has not, by what they differ from green around.
template <class T>
void interpolateColors(const ThreeRows<T>& mosaic, const ThreeRows<T>& greens, T* __restrict ofRow,
                       T* __restrict ofOthers, int count, GreenParity green)
{
    const T *const e0 = mosaic.row[0], *const e1 = mosaic.row[1], *const e2 = mosaic.row[2];
    const T *const g0 = greens.row[0], *const g1 = greens.row[1], *const g2 = greens.row[2];
    using Number = NumberFor<T>;
    for (int x = 0; x < count; ++x) {
        const auto h = static_cast<Number>((e1[x - 1] - g1[x - 1]) + (e1[x + 1] - g1[x + 1]));
        const auto v = static_cast<Number>((e0[x] - g0[x]) + (e2[x] - g2[x]));
        const auto before = static_cast<Number>((e0[x - 1] - g0[x - 1]) + (e2[x - 1] - g2[x - 1]));
        const auto behind = static_cast<Number>((e0[x + 1] - g0[x + 1]) + (e2[x + 1] - g2[x + 1]));
        const auto d = static_cast<Number>(before + behind);
        const auto atGreen = detail::greenMask<Number>(x, green);
        const Number at = e1[x], greenAt = g1[x];
        const auto besides = static_cast<Number>(greenAt + (h >> 1));
        const auto across = static_cast<Number>(v >> 1), diagonal = static_cast<Number>(d >> 2);
        ofRow[x] = detail::saturated<T>(detail::where(atGreen, besides, at));
        ofOthers[x] = detail::saturated<T>(static_cast<Number>(greenAt + detail::where(atGreen, across, diagonal)));
    }
}

/// Luma and chroma of a stretch of a row.
template <class T, int Columns> struct LumaChroma {
    using Number = NumberFor<T>;
    alignas(32) Number y[Columns], cb[Columns], cr[Columns];
};

template <class T, int Columns>
void toLumaChroma(const T* red, const T* green, const T* blue, LumaChroma<T, Columns>& to, int count)
{
    using Number = typename LumaChroma<T, Columns>::Number;
    Number* __restrict const toY = to.y;
    Number* __restrict const toCb = to.cb;
    Number* __restrict const toCr = to.cr;
    for (int x = 0; x < count; ++x) {
        const s32 r = red[x], g = green[x], b = blue[x];
        toY[x] = static_cast<Number>((66 * r + 129 * g + 25 * b + 128) >> 8);
        toCb[x] = static_cast<Number>((-38 * r - 74 * g + 112 * b + 128) >> 8);
        toCr[x] = static_cast<Number>((112 * r - 94 * g - 18 * b + 128) >> 8);
    }
}

namespace detail
{

struct Distance {
    s32 luma, chroma;
};

/// A row of luma and chroma as pointers, which the compiler can tell from what is written.
template <class Number> struct Row {
    const Number* __restrict y, * __restrict cb, * __restrict cr;

    template <class LumaChroma> explicit Row(const LumaChroma& of) : y(of.y), cb(of.cb), cr(of.cr) {}
};

/// The squares of 16-bit chroma may leave 32 bits, and the sum wraps.
inline s32 square(s16 x) { return x * x; }
inline u32 square(s32 x) { return static_cast<u32>(x) * static_cast<u32>(x); }

/// Differences are no wider than the numbers.
template <class Number> Distance between(const Row<Number>& a, int i, const Row<Number>& b, int k)
{
    const auto y = static_cast<Number>(a.y[i] - b.y[k]);
    const auto cb = static_cast<Number>(a.cb[i] - b.cb[k]), cr = static_cast<Number>(a.cr[i] - b.cr[k]);
    return {std::abs(y), static_cast<s32>(square(cb) + square(cr))};
}

inline s32 larger(s32 a, s32 b) { return a > b ? a : b; }
inline s32 smaller(s32 a, s32 b) { return a < b ? a : b; }
inline Distance larger(Distance a, Distance b) { return {larger(a.luma, b.luma), larger(a.chroma, b.chroma)}; }
inline Distance smaller(Distance a, Distance b) { return {smaller(a.luma, b.luma), smaller(a.chroma, b.chroma)}; }

inline s32 isWithin(Distance distance, Distance limit)
{
    return static_cast<s32>(distance.luma <= limit.luma) & static_cast<s32>(distance.chroma <= limit.chroma);
}

/// How far a candidate is from those around it.
struct Around {
    Distance left, right, up, down;

    template <class Row>
    Around(const Row& upper, const Row& middle, const Row& lower, int x)
        : left(between(middle, x - 1, middle, x)), right(between(middle, x + 1, middle, x)),
          up(between(upper, x, middle, x)), down(between(lower, x, middle, x))
    {
    }

    s32 countWithin(Distance limit) const
    {
        return isWithin(left, limit) + isWithin(right, limit) + isWithin(up, limit) + isWithin(down, limit);
    }
};

} // namespace detail

/// What is added to scores, so that they fit samples.
inline constexpr s32 noScore = 4;

/// How many more of its neighbours the candidate along the row resembles than the one along the column. The column in
/// front of the first is at index 0.
template <class T, int Columns>
void scoreCandidates(const LumaChroma<T, Columns> alongRow[3], const LumaChroma<T, Columns> alongColumn[3],
                     T* __restrict scores, int count)
{
    using Row = detail::Row<typename LumaChroma<T, Columns>::Number>;
    const Row h0(alongRow[0]), h1(alongRow[1]), h2(alongRow[2]);
    const Row v0(alongColumn[0]), v1(alongColumn[1]), v2(alongColumn[2]);
    for (int x = 0; x < count; ++x) {
        const detail::Around h(h0, h1, h2, x + 1), v(v0, v1, v2, x + 1);
        const detail::Distance limit = smaller(larger(h.left, h.right), larger(v.up, v.down));
        scores[x] = static_cast<T>(h.countWithin(limit) - v.countWithin(limit) + noScore);
    }
}

/// Sums of three by three scores.
template <class T> void sumScores(const ThreeRows<T>& scores, s32* __restrict sums, int count)
{
    const T *const s0 = scores.row[0], *const s1 = scores.row[1], *const s2 = scores.row[2];
    for (int x = 0; x < count; ++x) {
        const s32 before = s0[x - 1] + s1[x - 1] + s2[x - 1], behind = s0[x + 1] + s1[x + 1] + s2[x + 1];
        sums[x] = before + (s0[x] + s1[x] + s2[x]) + behind - 9 * noScore;
    }
}

/// Turns sums into masks of where to take the candidate along the column. A sum of zero follows the one in front of it.
/// Returns the last that was not zero.
inline s32 decide(s32* sums, int count, s32 last)
{
    for (int x = 0; x < count; ++x) {
        const s32 sum = sums[x];
        last = sum != 0 ? sum : last;
        sums[x] = last >> 31;
    }
    return last;
}

template <class T>
void choose(const s32* __restrict masks, const T* alongRow, const T* alongColumn, T* __restrict chosen, int count)
{
    for (int x = 0; x < count; ++x)
        chosen[x] = static_cast<T>(detail::where<s32>(masks[x], alongColumn[x], alongRow[x]));
}

} // namespace pyxcc::mosaic
