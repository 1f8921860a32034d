// The two candidates for each pixel of a mosaic, one made along rows and one along columns, and which is the smoother.
//
// Each form goes along a row, without a branch, so that the compiler makes vector code of it. Rows do not overlap.
#pragma once

#include "pyxcc/types.h"

#include <algorithm>
#include <cstdlib>
#include <limits>

namespace pyxcc::mosaic
{

/// Which columns of a row are green: those whose lowest bit is this.
using GreenParity = int;

/// Samples of a row and those around it; [1] is the row itself.
template <class T> struct ThreeRows {
    const T* row[3];
};

namespace detail
{

/// The mean of two neighbours, corrected by how the colour of the place itself bends, and held between them.
inline s32 greenBetween(s32 before, s32 behind, s32 at, s32 farBefore, s32 farBehind)
{
    const s32 corrected = ((before + behind) >> 1) + ((2 * at - farBefore - farBehind) >> 2);
    return std::max(std::min(corrected, std::max(before, behind)), std::min(before, behind));
}

template <class T> T saturated(s32 value)
{
    return static_cast<T>(std::max(std::min<s32>(value, std::numeric_limits<T>::max()), 0));
}

} // namespace detail

/// Green along the row and along the column. `rows` are five, [2] is the row itself.
template <class T>
void interpolateGreen(const T* const rows[5], T* __restrict alongRow, T* __restrict alongColumn, int count,
                      GreenParity green)
{
    const T *const up2 = rows[0], *const up = rows[1], *const at = rows[2], *const down = rows[3],
                   *const down2 = rows[4];
    for (int x = 0; x < count; ++x) {
        const s32 own = at[x];
        const s32 h = detail::greenBetween(at[x - 1], at[x + 1], own, at[x - 2], at[x + 2]);
        const s32 v = detail::greenBetween(up[x], down[x], own, up2[x], down2[x]);
        const bool isGreen = (x & 1) == green;
        alongRow[x] = static_cast<T>(isGreen ? own : h);
        alongColumn[x] = static_cast<T>(isGreen ? own : v);
    }
}

/// The colour that a row has besides green, and the one that it has not, by what they differ from green around.
template <class T>
void interpolateColors(const ThreeRows<T>& mosaic, const ThreeRows<T>& greens, T* __restrict ofRow,
                       T* __restrict ofOthers, int count, GreenParity green)
{
    const T *const e0 = mosaic.row[0], *const e1 = mosaic.row[1], *const e2 = mosaic.row[2];
    const T *const g0 = greens.row[0], *const g1 = greens.row[1], *const g2 = greens.row[2];
    for (int x = 0; x < count; ++x) {
        const s32 h = (e1[x - 1] - g1[x - 1]) + (e1[x + 1] - g1[x + 1]);
        const s32 v = (e0[x] - g0[x]) + (e2[x] - g2[x]);
        const s32 d = (e0[x - 1] + e0[x + 1] + e2[x - 1] + e2[x + 1]) - (g0[x - 1] + g0[x + 1] + g2[x - 1] + g2[x + 1]);
        const bool isGreen = (x & 1) == green;
        const s32 own = isGreen ? g1[x] + (h >> 1) : e1[x];
        const s32 other = g1[x] + (isGreen ? v >> 1 : d >> 2);
        ofRow[x] = detail::saturated<T>(own);
        ofOthers[x] = detail::saturated<T>(other);
    }
}

/// Luma and chroma of a stretch of a row.
template <int Columns> struct LumaChroma {
    alignas(32) s32 y[Columns], cb[Columns], cr[Columns];
};

template <class T, int Columns>
void toLumaChroma(const T* red, const T* green, const T* blue, LumaChroma<Columns>& to, int count)
{
    s32* const toY = to.y;
    s32* const toCb = to.cb;
    s32* const toCr = to.cr;
    for (int x = 0; x < count; ++x) {
        const s32 r = red[x], g = green[x], b = blue[x];
        toY[x] = (66 * r + 129 * g + 25 * b + 128) >> 8;
        toCb[x] = (-38 * r - 74 * g + 112 * b + 128) >> 8;
        toCr[x] = (112 * r - 94 * g - 18 * b + 128) >> 8;
    }
}

/// Three rows of a candidate's luma and chroma; [1] is the one that is scored.
template <int Columns> struct Window {
    const LumaChroma<Columns>* row[3];
};

namespace detail
{

struct Distance {
    s32 luma, chroma;
};

/// The squares of 16-bit chroma may leave 32 bits, and the sum wraps.
template <int Columns> inline Distance between(const LumaChroma<Columns>& a, int x, const LumaChroma<Columns>& b, int y)
{
    const u32 cb = static_cast<u32>(a.cb[x] - b.cb[y]), cr = static_cast<u32>(a.cr[x] - b.cr[y]);
    return {std::abs(a.y[x] - b.y[y]), static_cast<s32>(cb * cb + cr * cr)};
}

inline Distance larger(Distance a, Distance b) { return {std::max(a.luma, b.luma), std::max(a.chroma, b.chroma)}; }
inline Distance smaller(Distance a, Distance b) { return {std::min(a.luma, b.luma), std::min(a.chroma, b.chroma)}; }

inline s32 isWithin(Distance distance, Distance limit)
{
    return static_cast<s32>(distance.luma <= limit.luma) & static_cast<s32>(distance.chroma <= limit.chroma);
}

template <int Columns> struct Around {
    Distance left, right, up, down;

    Around(const Window<Columns>& window, int x)
        : left(between(*window.row[1], x - 1, *window.row[1], x)),
          right(between(*window.row[1], x + 1, *window.row[1], x)), up(between(*window.row[0], x, *window.row[1], x)),
          down(between(*window.row[2], x, *window.row[1], x))
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
void scoreCandidates(const Window<Columns>& alongRow, const Window<Columns>& alongColumn, T* __restrict scores,
                     int count)
{
    for (int x = 0; x < count; ++x) {
        const detail::Around<Columns> h(alongRow, x + 1), v(alongColumn, x + 1);
        const detail::Distance limit = smaller(larger(h.left, h.right), larger(v.up, v.down));
        scores[x] = static_cast<T>(h.countWithin(limit) - v.countWithin(limit) + noScore);
    }
}

/// Sums of three by three scores.
template <class T> void sumScores(const ThreeRows<T>& scores, s32* __restrict sums, int count)
{
    for (int x = 0; x < count; ++x) {
        s32 sum = -9 * noScore;
        for (const T* row : scores.row) sum += row[x - 1] + row[x] + row[x + 1];
        sums[x] = sum;
    }
}

/// Turns sums into masks of where to take the candidate along the column. A sum of zero follows the one in front of it.
/// Returns the last that was not zero.
inline s32 decide(s32* sums, int count, s32 last)
{
    for (int x = 0; x < count; ++x) {
        last = sums[x] != 0 ? sums[x] : last;
        sums[x] = last >> 31;
    }
    return last;
}

template <class T>
void choose(const s32* masks, const T* alongRow, const T* alongColumn, T* __restrict chosen, int count)
{
    for (int x = 0; x < count; ++x) chosen[x] = masks[x] != 0 ? alongColumn[x] : alongRow[x];
}

} // namespace pyxcc::mosaic
