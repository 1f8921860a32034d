#include "reference/cube_root_table.hpp"

#include "reference/rounding.hpp"

#include <algorithm>
#include <cmath>

namespace reference
{

namespace
{

f32 toSixDecimals(f64 x) { return static_cast<f32>(std::nearbyint(x * 1e6) / 1e6); }

CubeRootRow rowOf(int i, f64 scale)
{
    const RoundToNearest mode;
    const f64 v = (i + 1) / scale + 0.0001;
    return {toSixDecimals(std::cbrt(v)), toSixDecimals(1.0 / v)};
}

CubeRootTable rowsOf(f64 lastScale)
{
    CubeRootTable table;
    for (int i = 0; i < 124; ++i) table[i] = rowOf(i, 127.998046875);
    for (int i = 124; i < 128; ++i) table[i] = rowOf(i, lastScale);
    return table;
}

} // namespace

const CubeRootTable& cubeRootTable()
{
    static const CubeRootTable table = rowsOf(127.998046875);
    return table;
}

const CubeRootTable& luvCubeRootTable()
{
    static const CubeRootTable table = rowsOf(128.0);
    return table;
}

CubeRootRow rowAt(const CubeRootTable& table, s32 index) { return table[std::clamp(index, 0, 127)]; }

f32 excessOf(f32 v, CubeRootRow row) { return std::fma(-(row.root * row.root), row.root, v) * row.inverse; }

f32 cubeRootOf8Terms(f32 t, f32 root, LastTerms last)
{
    const f32 t2 = t * t, t3 = t * t2, t4 = t * t3, t5 = t * t4, t6 = t * t5, t7 = t * t6, t8 = t * t7;
    const f32 p = std::fma(c5, t5, std::fma(last.c7, t7, 1.0f));
    const f32 q = std::fma(c6, t6, last.c8 * t8);
    const f32 u = std::fma(c1, t, c3 * t3);
    const f32 w = std::fma(c2, t2, c4 * t4);
    return ((p - q) + (u - w)) * root;
}

f32 cubeRootOf4Terms(f32 t, f32 root)
{
    f32 h = std::fma(c4, t, -c3);
    h = std::fma(h, t, c2);
    h = std::fma(h, t, -c1);
    h = std::fma(h, t, -1.0f);
    return -(h * root);
}

} // namespace reference
