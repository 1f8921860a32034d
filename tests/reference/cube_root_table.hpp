// The cube root by a table and a series about its rows.
#pragma once

#include "pyxcc/types.h"

#include <array>

namespace reference
{

struct CubeRootRow {
    f32 root;    ///< of the row's argument, to six decimals
    f32 inverse; ///< of the row's argument, to six decimals
};

using CubeRootTable = std::array<CubeRootRow, 128>;

/// Row i is that of the argument (i + 1) / 127.998046875 + 0.0001.
const CubeRootTable& cubeRootTable();

/// The same, but that its last four rows are those of (i + 1) / 128 + 0.0001.
const CubeRootTable& luvCubeRootTable();

/// The row of an index, which is bounded to the table.
CubeRootRow rowAt(const CubeRootTable& table, s32 index);

/// The series is that of (1 + t)^(1/3).
inline constexpr f32 c1 = 0.33333334f, c2 = 0.11111111f, c3 = 0.061728396f, c4 = 0.041152265f, c5 = 0.030178327f,
                     c6 = 0.023472032f;

/// The last factors of a series of eight terms, which not all users have alike.
struct LastTerms {
    f32 c7, c8;
};

/// How far v is from the argument of the row, as a share of it.
f32 excessOf(f32 v, CubeRootRow row);

f32 cubeRootOf8Terms(f32 t, f32 root, LastTerms last);
f32 cubeRootOf4Terms(f32 t, f32 root);

} // namespace reference
