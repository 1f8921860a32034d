// Gray as a weighted sum of R, G and B, with weights of the caller's.
#pragma once

#include "frame/float_forms.hpp"
#include "frame/forms.hpp"

#include <algorithm>
#include <cmath>

namespace pyxcc::matrix
{

/// Of R, G and B.
template <class Number> using GrayWeights = Three<Number>;

inline constexpr GrayWeights<f32> defaultGray{0.299f, 0.587f, 0.114f};

/// The defaults stand for weights that are not given. They are floats, for doubles too.
template <class Float> GrayWeights<Float> grayWeights(const Float* coeffs)
{
    if (!coeffs) return {defaultGray.a, defaultGray.b, defaultGray.c};
    return {coeffs[0], coeffs[1], coeffs[2]};
}

/// A weight in 32768ths, to which half of one is added with the same rounding, towards zero.
inline int in32768ths(f32 weight) { return trunc(scalar::F32(std::fma(weight, 32768.0f, 0.5f))).v; }

inline GrayWeights<int> in32768ths(const GrayWeights<f32>& weights)
{
    return {in32768ths(weights.a), in32768ths(weights.b), in32768ths(weights.c)};
}

/// A 32-bit sum, which wraps.
struct GrayExact : frame::OnWords {
    GrayWeights<int> weights;

    explicit GrayExact(const GrayWeights<int>& in32768ths) : weights(in32768ths) {}

    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        return low8(exactSumBy<15, 16384>(weights, R, G, B));
    }
};

/// High halves of 16-bit products, in 128ths of a step; the sum saturates. The low 16 bits of the weights count.
struct GrayHigh : frame::OnWords {
    GrayWeights<int> weights;

    explicit GrayHigh(const GrayWeights<int>& in32768ths)
        : weights{in32768ths.a & 0xffff, in32768ths.b & 0xffff, in32768ths.c & 0xffff}
    {
    }

    /// A negative weight has no product without a sign.
    static bool suits(const GrayWeights<int>& in32768ths)
    {
        return std::min({in32768ths.a, in32768ths.b, in32768ths.c}) >= 0;
    }

    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto r = mulHighU16(asU16(R << 8), weights.a), g = mulHighU16(asU16(G << 8), weights.b),
                   b = mulHighU16(asU16(B << 8), weights.c);
        const auto y = addSatU16(addSatU16(addSatU16(r, g), b), 64);
        return sat8(asS16(y >> 7));
    }
};

/// Floats: green, then red, then blue, the last two fused.
template <class Float> struct GraySum : frame::OnFloats {
    GrayWeights<Float> weights;

    explicit GraySum(const GrayWeights<Float>& w) : weights(w) {}

    template <class Lane> PYXCC_INLINE Lane operator()(const Lane& R, const Lane& G, const Lane& B) const
    {
        return fused(Lane(weights.c), B, fused(Lane(weights.a), R, Lane(weights.b) * G));
    }
};

/// The same to an integer for samples from 0 to 65535. The upper bound is held before the conversion, which so cannot
/// overflow upwards; what overflows downwards saturates like all that is below 0.
struct GrayOfWords : GraySum<f32> {
    using GraySum::GraySum;

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        return nearest(lesser(GraySum::operator()(R, G, B), F32(65535.0f)));
    }
};

} // namespace pyxcc::matrix
