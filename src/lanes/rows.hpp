// Lanes that are rows of an image, over a register and over one value.
#pragma once

#include "lanes/avx2/rows.hpp"
#include "lanes/lanes.hpp"

namespace pyxcc::scalar
{

inline F32 fromLaneInFront(F32, const f32& first) { return first; }
inline S32 fromLaneInFront(S32, const s32& first) { return first; }
inline F32 zeroOutside(F32 x, int column, int, int width) { return column >= 0 && column < width ? x : F32(0); }

inline S32 zeroOutside(S32 x, int column, int, int width) { return column >= 0 && column < width ? x : S32(0); }

inline S32 isAbove(S32 x, S32 y) { return x.v > y.v ? -1 : 0; }

inline F32 loadLanes(const f32* p, F32) { return *p; }
inline S32 loadLanes(const s32* p, S32) { return *p; }
inline void storeLanes(f32* p, F32 x) { *p = x.v; }
inline void storeLanes(s32* p, S32 x) { *p = x.v; }

} // namespace pyxcc::scalar
