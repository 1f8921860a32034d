// A function of a float as lines, one for each way that its leading bits can be.
#pragma once

#include "lanes/avx2/pairs_of_floats.hpp"

#include <bit>

namespace pyxcc
{

/// The line of a float is told by its exponent and the first `Bits` bits of its mantissa; `first` is where the first
/// line begins. There are to be lines for all that is looked up.
template <int Bits, std::size_t Lines> struct LinesByFloat {
    static constexpr int shift = 23 - Bits;
    f32 first;
    PairsOfFloats<Lines> line; ///< what it is at 0, and how steep it is

    constexpr s32 before() const { return std::bit_cast<s32>(first) >> shift; }

    /// Where a line begins, and the one in front of it ends.
    constexpr f32 from(int i) const { return std::bit_cast<f32>((before() + i) << shift); }
};

namespace scalar
{

template <int Bits, std::size_t Lines> F32 lookUp(const LinesByFloat<Bits, Lines>& lines, F32 x)
{
    const S32 leading = std::bit_cast<s32>(x.v) >> lines.shift;
    const Two<F32> line = lookUpWithin(lines.line, leading - S32(lines.before()));
    return fused(line.b, x, line.a);
}

} // namespace scalar

namespace wide
{

template <int Bits, std::size_t Lines> PYXCC_INLINE F32 lookUp(const LinesByFloat<Bits, Lines>& lines, F32 x)
{
    const S32 leading(_mm256_srli_epi32(_mm256_castps_si256(x.v), lines.shift));
    const Two<F32> line = lookUpWithin(lines.line, leading - S32(lines.before()));
    return fused(line.b, x, line.a);
}

} // namespace wide

} // namespace pyxcc
