// The arithmetic that the statements of all families share.
//
// The 16-bit products take their factors as a vector lane would hold them, so a wider value is cut to its low 16 bits.
#pragma once

#include "pyxcc/types.h"

#include <algorithm>

namespace reference
{

constexpr u8 sat8(s32 x) { return static_cast<u8>(std::clamp(x, 0, 255)); }

/// The low 8 bits of x.
constexpr u8 low8(s32 x) { return static_cast<u8>(x & 255); }

constexpr s32 mulHighU16(u16 a, u16 b) { return static_cast<s32>((u32{a} * u32{b}) >> 16); }

constexpr s32 mulHighS16(s16 a, s16 b) { return (s32{a} * s32{b}) >> 16; }

/// a * b / 2^15, rounded, in a signed 16-bit lane.
constexpr s32 mulRound15(s16 a, s16 b) { return static_cast<s16>((s32{a} * s32{b} + 16384) >> 15); }

} // namespace reference
