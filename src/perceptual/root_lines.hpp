// What bytes make of the cube roots of Lab and LUV, by lines: to less than a thousandth of a level, which is enough for
// all that is not as near to the middle of two levels, and less work than table and series.
#pragma once

#include "lanes/avx2/fine_levels.hpp"
#include "lanes/avx2/lines_by_float.hpp"
#include "perceptual/cube_root.hpp"
#include "perceptual/xyz_of_rgb.hpp"

#include <limits>

namespace pyxcc::perceptual
{

/// What comes of 0 to 1 of x, y and z is looked up raised: the rows of the table of cube roots begin at 128ths, and
/// black at two of them, so that lines begin where rows do, and are short where roots are steep.
inline constexpr f64 raisedScale = 127.998046875 / 128, raisedBlack = 2.0 / 128;

namespace detail
{

/// Without rounding: the line near black, or else the four terms of the series from the given row on.
constexpr f64 rootFrom(int row, f64 v)
{
    using namespace series;
    if (v <= 0.008856f) return 7.787f * v + 0.13793103f;
    const f64 y = labCubeRootTable[row].a, t = (v - y * y * y) * labCubeRootTable[row].b;
    return y * (1 + t * (c1 - t * (c2 - t * (c3 - t * c4))));
}

constexpr f64 lightnessFrom(int row, f64 v) { return v <= 0.008856f ? 903.3f * v : 116 * rootFrom(row, v) - 16; }

} // namespace detail

/// From black to a little above white.
using RootLines = LinesByFloat<8, 6 * 256 + 5>;

/// Each line as far above what it stands for at its ends as below in its middle. The one that has the limit of dark
/// samples is none.
constexpr RootLines rootLines(f64 (*function)(int row, f64 v))
{
    RootLines lines = {static_cast<f32>(raisedBlack), {}};
    for (int i = 0; i < static_cast<int>(lines.line.size()); ++i) {
        const f64 begin = lines.from(i), end = lines.from(i + 1), middle = (begin + end) / 2;
        const auto v = [](f64 raised) { return (raised - raisedBlack) / raisedScale; };
        const int row = std::min(static_cast<int>((middle - raisedBlack) * 128), 127);
        const f64 first = function(row, v(begin)), last = function(row, v(end));
        const f64 slope = (last - first) / (end - begin), bend = function(row, v(middle)) - (first + last) / 2;
        lines.line[i] = {static_cast<f32>(first - slope * begin + bend / 2), static_cast<f32>(slope)};
        if (v(begin) <= 0.008856f && v(end) >= 0.008856f) lines.line[i].a = std::numeric_limits<f32>::quiet_NaN();
    }
    return lines;
}

inline constexpr RootLines labRootLines = rootLines(detail::rootFrom),
                           lightnessLines = rootLines(detail::lightnessFrom);

/// Weights, and what is added to the sum.
struct WeightsAndMore {
    f32 a, b, c, more;
};

constexpr WeightsAndMore scaledWeights(const Weights& k, f64 scale, f64 more = 0)
{
    return {static_cast<f32>(k.a * scale), static_cast<f32>(k.b * scale), static_cast<f32>(k.c * scale),
            static_cast<f32>(more)};
}

/// Raised, as lines are looked up.
constexpr WeightsAndMore raisedWeights(const Weights& k, f64 scale)
{
    return scaledWeights(k, scale * raisedScale, raisedBlack);
}

template <class F32> PYXCC_INLINE F32 weighted(const WeightsAndMore& k, const F32& a, const F32& b, const F32& c)
{
    return fused(c, F32(k.c), fused(a, F32(k.a), fused(b, F32(k.b), F32(k.more))));
}

/// In 65536ths of a level: as far as results may be off. They have so many too many, and half a level: with twice as
/// many behind the point they are in no doubt.
inline constexpr f32 oneLevel = 65536, inDoubt = 40, aboveLevel = 32768 + inDoubt;

template <class S32> PYXCC_INLINE bool isInDoubt(const Three<FineLevel<S32>>& x)
{
    return anyFractionBelow(x, static_cast<int>(2 * inDoubt));
}

} // namespace pyxcc::perceptual
