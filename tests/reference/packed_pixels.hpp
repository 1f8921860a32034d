// Pixels packed into 16 bits: three fields, of which the name of a model tells the lowest first.
#pragma once

#include "reference/image.hpp"
#include "reference/pixels.hpp"

namespace reference
{

/// How many bits the fields have, and where red lies. Bits above the fields are 0.
struct PackedModel {
    int outerBits, middleBits;
    bool redIsHigh;
};

inline constexpr PackedModel bgr444 = {4, 4, true}, rgb444 = {4, 4, false};
inline constexpr PackedModel bgr555 = {5, 5, true}, rgb555 = {5, 5, false};
inline constexpr PackedModel bgr565 = {5, 6, true}, rgb565 = {5, 6, false};

/// From a sample of 8 bits at a place of the region to a field of so many bits.
using Narrowing = s32 (*)(s32 sample, int bits, int row, int column);

/// The low bits are dropped.
s32 cut(s32 sample, int bits, int row, int column);

/// The sample is held against a threshold that goes by its place.
s32 dithered(s32 sample, int bits, int row, int column);

/// What a target of packed pixels is made of.
struct PackedTarget {
    Channel<u16> pixels;
    PackedModel model;
    Narrowing narrowing;

    void set(int row, int column, Triple<u8> rgb) const;
};

/// Rows are counted in whole pixels, so that an odd step loses its low bit.
template <typename T> Channel<T> packedRows(T* first, int step) { return Channel<T>(first, step & ~1, 1); }

} // namespace reference
