// Affine colour matrices over floats: three source channels and a constant term, or four source channels.
#pragma once

#include "frame/float_forms.hpp"

#include <algorithm>
#include <cmath>
#include <limits>
#include <type_traits>

namespace pyxcc::tone
{

/// A copy of the caller's matrix: `k[c][i]` is the weight of source channel i in target channel c, `k[c][3]` the
/// constant term or the weight of the fourth channel.
template <int Rows> struct Matrix {
    f32 k[Rows][4];

    explicit Matrix(const f32 (*rows)[4]) { std::copy_n(&rows[0][0], 4 * Rows, &k[0][0]); }
};

/// The constant term and the first channel, the other two channels, then both sums together.
struct TwistByPairs : frame::OnFloats {
    Matrix<3> twist;

    explicit TwistByPairs(const f32 (*rows)[4]) : twist(rows) {}

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2) const
    {
        const auto channel = [&](const f32* k) PYXCC_INLINE_LAMBDA {
            const F32 a = F32(k[3]) + s0 * F32(k[0]);
            const F32 b = s2 * F32(k[2]) + s1 * F32(k[1]);
            return a + b;
        };
        return Three{channel(twist.k[0]), channel(twist.k[1]), channel(twist.k[2])};
    }
};

/// One channel after the other, and the constant term last.
struct TwistInTurn : frame::OnFloats {
    Matrix<3> twist;

    explicit TwistInTurn(const f32 (*rows)[4]) : twist(rows) {}

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2) const
    {
        const auto channel = [&](const f32* k) PYXCC_INLINE_LAMBDA {
            return ((s0 * F32(k[0]) + s1 * F32(k[1])) + s2 * F32(k[2])) + F32(k[3]);
        };
        return Three{channel(twist.k[0]), channel(twist.k[1]), channel(twist.k[2])};
    }
};

/// Four channels, without a constant term; one rounding a line.
struct TwistFused : frame::OnFloats {
    Matrix<4> twist;

    explicit TwistFused(const f32 (*rows)[4]) : twist(rows) {}

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2, const F32& s3) const
    {
        const auto channel = [&](const f32* k) PYXCC_INLINE_LAMBDA {
            F32 t = s1 * F32(k[1]);
            t = fused(s0, F32(k[0]), t);
            t = fused(s2, F32(k[2]), t);
            return fused(s3, F32(k[3]), t);
        };
        return Four{channel(twist.k[0]), channel(twist.k[1]), channel(twist.k[2]), channel(twist.k[3])};
    }
};

/// A twist in the order of additions that its sample type has.
template <class Sample> using TwistOf = std::conditional_t<std::is_same_v<Sample, s8>, TwistInTurn, TwistByPairs>;

/// Results as integers, which saturate to samples.
///
/// Before the conversion only the upper bound is held: it is what a NaN becomes, and it keeps the conversion from
/// overflowing upwards. Below, a result that no integer can hold becomes the lowest integer, which saturates to the
/// lowest sample as every other result below that one does.
template <class Sample> struct TwistToInteger : TwistOf<Sample> {
    using TwistOf<Sample>::TwistOf;

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2) const
    {
        const F32 highest(static_cast<f32>(std::numeric_limits<Sample>::max()));
        const auto r = TwistOf<Sample>::operator()(s0, s1, s2);
        return Three{nearest(lesser(r.a, highest)), nearest(lesser(r.b, highest)), nearest(lesser(r.c, highest))};
    }
};

/// The same for a matrix that keeps every result within the integers, where saturation does for both bounds. The bound
/// in floats competes with additions and conversions for the same units, which are what such a loop is short of.
template <class Sample> struct TwistWithinIntegers : TwistOf<Sample> {
    using TwistOf<Sample>::TwistOf;

    /// Half of the integers' range is let go for the roundings of results, and of this sum.
    static bool suits(const f32 (*rows)[4])
    {
        constexpr f64 farthest =
            std::max<f64>(std::numeric_limits<Sample>::max(), -f64{std::numeric_limits<Sample>::min()});
        return std::all_of(rows, rows + 3, [](const f32* k) {
            const f64 weights = std::fabs(f64{k[0]}) + std::fabs(f64{k[1]}) + std::fabs(f64{k[2]});
            return farthest * weights + std::fabs(f64{k[3]}) < 0x1p30;
        });
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2) const
    {
        const auto r = TwistOf<Sample>::operator()(s0, s1, s2);
        return Three{nearest(r.a), nearest(r.b), nearest(r.c)};
    }
};

} // namespace pyxcc::tone
