// Error diffusion, one sample: its value with what the samples before have left, the level that is taken for it, and
// what it leaves itself.
#pragma once

#include "tone/reduce_bits_depths.hpp"

#include <array>

namespace pyxcc::tone
{

/// What was left to the left of a sample, nearest first, and in the two rows above, from two columns in front on.
template <class F32> struct Errors {
    std::array<F32, 2> left;
    std::array<F32, 5> above, twoAbove;
};

/// Four neighbours, in sixteenths.
template <class Depth> struct FourNeighbours {
    static constexpr int rows = 2, reach = 1;
    static constexpr bool rounded = Depth::rounds;

    template <class F32> static PYXCC_INLINE F32 value(const F32& p, const Errors<F32>& errors)
    {
        const auto& [left, above, twoAbove] = errors;
        if constexpr (Depth::rounds) {
            const F32 b = fused(F32(5.0f), above[2], fused(F32(7.0f), left[0], above[1]));
            return fused(F32(0.0625f), b, fused(F32(3.0f), F32(0.0625f) * above[3], p));
        } else {
            const F32 b = above[3] * F32(3.0f) + above[1] + above[2] * F32(5.0f);
            return p + (b + left[0] * F32(7.0f)) * F32(0.0625f);
        }
    }
};

/// Weights of twelve neighbours, by rows from the upper one on, and what they are divided by.
struct TwelveWeights {
    std::array<f32, 5> twoAbove, above;
    std::array<f32, 2> left; // nearest first
    f32 divisor;
};

inline constexpr TwelveWeights in48ths{{1, 3, 5, 3, 1}, {3, 5, 7, 5, 3}, {7, 5}, 0.020833334f};
inline constexpr TwelveWeights in42nds{{1, 2, 4, 2, 1}, {2, 4, 8, 4, 2}, {8, 4}, 0.023809524f};

template <const TwelveWeights& weights> struct TwelveNeighbours {
    static constexpr int rows = 3, reach = 2;
    static constexpr bool rounded = false;

    template <class F32> static PYXCC_INLINE F32 value(const F32& p, const Errors<F32>& errors)
    {
        const auto rowsAbove = [&](int i) PYXCC_INLINE_LAMBDA {
            return fused(F32(weights.twoAbove[i]), errors.twoAbove[i], F32(weights.above[i]) * errors.above[i]);
        };
        const F32 l0 = fused(F32(weights.left[1]), errors.left[1], rowsAbove(0));
        const F32 l1 = fused(F32(weights.left[0]), errors.left[0], rowsAbove(1));
        const F32 sum = (l0 + rowsAbove(2)) + (l1 + rowsAbove(3));
        return p + (sum + errors.twoAbove[4] + errors.above[4] * F32(weights.above[4])) * F32(weights.divisor);
    }
};

/// A level, and what the sample was more. At the limits nothing is left.
template <class F32> struct Quantised {
    F32 level, error;
};

template <class Source, class F32>
PYXCC_INLINE Quantised<F32> quantised(const Levels& levels, const F32& v, const F32& threshold)
{
    const F32 step = levels.step, q = toF32(trunc(v * F32(levels.inv))) * step;
    const F32 level = whereLess(threshold, v - q, q + step, q);
    return {whereWithin<Source>(v, level, Working<Source>::top, 0.0f), whereWithin<Source>(v, v - level, 0.0f, 0.0f)};
}

} // namespace pyxcc::tone
