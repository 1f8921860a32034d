// Cube roots from a table and a series: with v = y^3 (1 + e), the root is y (1 + e)^(1/3).
#pragma once

#include "lanes/lanes.hpp"
#include "perceptual/cube_root_table.hpp"

namespace pyxcc::perceptual
{

template <class F32> struct RootStart {
    F32 t; ///< about e
    F32 y; ///< a root near by
};

template <class F32> PYXCC_INLINE RootStart<F32> rootStart(const Two<F32>& row, const F32& v)
{
    const F32 y = row.a;
    return {fused(-(y * y), y, v) * row.b, y};
}

template <class F32, class Index>
PYXCC_INLINE RootStart<F32> rootStart(const CubeRootTable& table, const Index& index, const F32& v)
{
    return rootStart(lookUp(table, index), v);
}

/// For what comes of integer samples: no sum of theirs is beyond the table.
template <class F32, class Index>
PYXCC_INLINE RootStart<F32> rootStartWithin(const CubeRootTable& table, const Index& index, const F32& v)
{
    return rootStart(lookUpWithin(table, index), v);
}

/// Each operation by itself.
template <class F32, class Index>
PYXCC_INLINE RootStart<F32> plainRootStart(const CubeRootTable& table, const Index& index, const F32& v)
{
    const auto row = lookUp(table, index);
    const F32 y = row.a;
    return {(v - (y * y) * y) * row.b, y};
}

/// The magnitudes of the first coefficients of the binomial series; their signs alternate.
namespace series
{
inline constexpr f32 c1 = 0.33333334f, c2 = 0.11111111f, c3 = 0.061728396f, c4 = 0.041152265f, c5 = 0.030178327f,
                     c6 = 0.023472032f;
}

/// The last two coefficients of eight, which the conversions have to different digits.
struct LastTerms {
    f32 c7, c8;
};

template <class F32> PYXCC_INLINE F32 rootByEightTerms(const RootStart<F32>& start, const LastTerms& last)
{
    using namespace series;
    const F32 t = start.t, t2 = t * t, t3 = t * t2, t4 = t * t3, t5 = t * t4, t6 = t * t5, t7 = t * t6, t8 = t * t7;
    const F32 p = fused(F32(c5), t5, fused(F32(last.c7), t7, F32(1.0f)));
    const F32 q = fused(F32(c6), t6, F32(last.c8) * t8);
    const F32 u = fused(F32(c1), t, F32(c3) * t3);
    const F32 w = fused(F32(c2), t2, F32(c4) * t4);
    return ((p - q) + (u - w)) * start.y;
}

/// Terms in ascending order, each operation by itself.
template <int Terms, class F32> PYXCC_INLINE F32 rootByPlainTerms(const RootStart<F32>& start, const LastTerms& last)
{
    using namespace series;
    const f32 coefficients[] = {c1, -c2, c3, -c4, c5, -c6, last.c7, -last.c8};
    F32 sum = 1.0f, power = start.t;
    for (int i = 0; i < Terms; ++i) {
        sum = sum + power * coefficients[i];
        power = start.t * power;
    }
    return sum * start.y;
}

template <class F32> PYXCC_INLINE F32 rootBySixTerms(const RootStart<F32>& start)
{
    using namespace series;
    const F32 t = start.t, t2 = t * t, t3 = t * t2, t4 = t * t3, t5 = t * t4, t6 = t * t5;
    const F32 odd = fused(F32(c1), t, fused(F32(c3), t3, F32(c5) * t5));
    const F32 even = fused(F32(c2), t2, fused(F32(c4), t4, fused(F32(c6), t6, F32(-1.0f))));
    return (odd - even) * start.y;
}

template <class F32> PYXCC_INLINE F32 rootByFourTerms(const RootStart<F32>& start)
{
    using namespace series;
    const F32 t = start.t;
    const F32 h = fused(fused(fused(fused(F32(c4), t, F32(-c3)), t, F32(c2)), t, F32(-c1)), t, F32(-1.0f));
    return -(h * start.y);
}

} // namespace pyxcc::perceptual
