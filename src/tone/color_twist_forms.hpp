// Affine colour matrices over floats: three source channels and a constant term, or four source channels.
#pragma once

#include "frame/float_forms.hpp"
#include "lanes/avx2/byte_factors.hpp"

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
            return sum(s0 * F32(k[0]), s1 * F32(k[1]), s2 * F32(k[2]), F32(k[3]));
        };
        return Three{channel(twist.k[0]), channel(twist.k[1]), channel(twist.k[2])};
    }

    template <class F32> static PYXCC_INLINE F32 sum(const F32& p0, const F32& p1, const F32& p2, const F32& constant)
    {
        const F32 a = constant + p0;
        const F32 b = p2 + p1;
        return a + b;
    }
};

/// One channel after the other, and the constant term last.
struct TwistInTurn : frame::OnFloats {
    Matrix<3> twist;

    explicit TwistInTurn(const f32 (*rows)[4]) : twist(rows) {}

    template <class F32> PYXCC_INLINE auto operator()(const F32& s0, const F32& s1, const F32& s2) const
    {
        const auto channel = [&](const f32* k) PYXCC_INLINE_LAMBDA {
            return sum(s0 * F32(k[0]), s1 * F32(k[1]), s2 * F32(k[2]), F32(k[3]));
        };
        return Three{channel(twist.k[0]), channel(twist.k[1]), channel(twist.k[2])};
    }

    template <class F32> static PYXCC_INLINE F32 sum(const F32& p0, const F32& p1, const F32& p2, const F32& constant)
    {
        return ((p0 + p1) + p2) + constant;
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

/// The same for bytes as factors, in interleaved pixels.
template <class Byte> struct TwistOfBytes {
    struct Channel {
        wide::ByteWeight<Byte> k[3];
        f32 constant;

        explicit Channel(const f32* row)
            : k{wide::ByteWeight<Byte>(row[0]), wide::ByteWeight<Byte>(row[1]), wide::ByteWeight<Byte>(row[2])},
              constant(row[3])
        {
        }
    };
    Channel channels[3];

    explicit TwistOfBytes(const f32 (*rows)[4]) : channels{Channel(rows[0]), Channel(rows[1]), Channel(rows[2])} {}

    /// A weight of a factor is not to lose bits to its being small.
    static bool suits(const f32 (*rows)[4])
    {
        constexpr f32 least = 0x1p-90f;
        return TwistWithinIntegers<Byte>::suits(rows) &&
               std::all_of(&rows[0][0], &rows[0][0] + 12, [](f32 k) { return k == 0 || std::fabs(k) >= least; });
    }

    /// One target channel of several registers of pixels.
    template <class Factor, int N>
    PYXCC_INLINE Several<wide::S32, N> channel(int c, const Three<Several<Factor, N>>& x) const
    {
        const Channel& of = channels[c];
        const wide::ByteWeightInRegisters<Byte> k0(of.k[0]), k1(of.k[1]), k2(of.k[2]);
        const wide::F32 constant = wide::keptInRegister(of.constant);
        return each(
            [&](const auto& s0, const auto& s1, const auto& s2) PYXCC_INLINE_LAMBDA {
                return nearest(TwistOf<Byte>::sum(product(s0, k0), product(s1, k1), product(s2, k2), constant));
            },
            x.a, x.b, x.c);
    }
};

/// The same in planes.
template <class Byte> struct TwistOfPlanes : TwistOfBytes<Byte> {
    using TwistOfBytes<Byte>::TwistOfBytes;
    static constexpr bool storedLate = true;
};

namespace detail
{

template <class Byte, class Samples>
PYXCC_INLINE Three<Samples> twisted(const TwistOfBytes<Byte>& form, const Three<Samples>& pixels)
{
    const auto factors = [](const Samples& x) PYXCC_INLINE_LAMBDA {
        const auto four = wide::byteFactors(x);
        return several(four.a, four.b, four.c, four.d);
    };
    const Three x{factors(pixels.a), factors(pixels.b), factors(pixels.c)};
    const auto channel = [&](int c) PYXCC_INLINE_LAMBDA { return wide::saturate<Samples>(form.channel(c, x)); };
    return {channel(0), channel(1), channel(2)};
}

} // namespace detail

PYXCC_INLINE auto apply(const TwistOfPlanes<u8>& form, const Three<wide::U8>& pixels)
{
    return detail::twisted(form, pixels);
}
PYXCC_INLINE auto apply(const TwistOfPlanes<s8>& form, const Three<wide::S8>& pixels)
{
    return detail::twisted(form, pixels);
}

template <class Byte, class Factor>
PYXCC_INLINE auto apply(const TwistOfBytes<Byte>& form, const Two<Three<Factor>>& pixels)
{
    const auto& [p, q] = pixels;
    const Three x{several(p.a, q.a), several(p.b, q.b), several(p.c, q.c)};
    const auto a = form.channel(0, x), b = form.channel(1, x), c = form.channel(2, x);
    return Two{Three{a.part[0], b.part[0], c.part[0]}, Three{a.part[1], b.part[1], c.part[1]}};
}

} // namespace pyxcc::tone
