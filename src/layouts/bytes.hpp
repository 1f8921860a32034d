// Bytes of a row: where it starts, and short copies.
#pragma once

#include "lanes/inline.hpp"
#include "pyxcc/types.h"

#include <cstddef>
#include <cstring>

namespace pyxcc::layouts
{

/// The start of row `y`, for steps of any sign.
template <class Byte> PYXCC_INLINE Byte* rowAt(Byte* first, std::ptrdiff_t step, int y) { return first + step * y; }

/// Images are walked in bytes, since a row need not be aligned to its samples.
template <class T> PYXCC_INLINE const u8* bytes(const T* samples) { return reinterpret_cast<const u8*>(samples); }
template <class T> PYXCC_INLINE u8* bytes(T* samples) { return reinterpret_cast<u8*>(samples); }

/// Sample `x` of a row, which need not be aligned to its samples.
template <class Sample> PYXCC_INLINE Sample sampleAt(const u8* row, std::ptrdiff_t x)
{
    Sample sample;
    std::memcpy(&sample, row + x * std::ptrdiff_t{sizeof sample}, sizeof sample);
    return sample;
}

/// Hints at cache lines some distance behind `p`. Interleaved rows go through memory fast, and those that share a loop
/// with other rows outrun the processor's own look-ahead. A hint neither reads nor faults, so that it may reach behind
/// the last row.
template <int Distance, int Lines = 2> PYXCC_INLINE void expectFrom(const u8* p)
{
    for (int i = 0; i < Lines; ++i) __builtin_prefetch(p + Distance + std::ptrdiff_t{64} * i);
}

/// How far ahead of its loads and of its stores a loop hints that does hardly more than copy.
inline constexpr int expectedLoads = 4096, expectedStores = 2048;

/// Rows hint that far. Those of a pair hint at what is near: whatever the upper one hints at behind its end is the
/// lower one, which is under way already, and the start of a row that nobody hinted at is the longer the farther they
/// look.
enum class Hints { far, near };

template <Hints hints> inline constexpr int hintedLoads = hints == Hints::far ? expectedLoads : 512;
template <Hints hints> inline constexpr int hintedStores = hints == Hints::far ? expectedStores : 256;

/// Copies a partial block: few bytes, where a call of memcpy would cost more than the copy.
void copyBytes(u8* to, const u8* from, int count);

} // namespace pyxcc::layouts
