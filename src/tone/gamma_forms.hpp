// The video transfer curve, a line near black and a power above it, and its inverse.
#pragma once

#include "frame/sample_forms.hpp"
#include "tone/power.hpp"

namespace pyxcc::tone
{

/// The curves over doubles from 0 to 1 and beyond: a line of this slope below the threshold, and from there, for NaN
/// too, what curved() says; curvedOfWords() does for words. It goes as the power of x + offset, less a constant.
struct ForwardCurve {
    static constexpr f64 threshold = 0.018;
    static constexpr f64 slope = 4.5;
    static constexpr f64 exponent = 0.45, offset = 0, less = 0.099;
    static constexpr int firstRun = 1184; ///< of words, behind the 1180 of the line
    template <class F64> static PYXCC_INLINE F64 curved(const F64& x) { return fused(power045(x), 1.099, -0.099); }
    template <class F64> static PYXCC_INLINE F64 curvedOfWords(const F64& x)
    {
        return fused(power045OfWords(x), 1.099, -0.099);
    }
};

struct InverseCurve {
    static constexpr f64 threshold = 0.0812;
    static constexpr f64 slope = 0.2222222222222222;
    static constexpr f64 exponent = 2.2222222222222223, offset = 0.099, less = 0;
    static constexpr int firstRun = 5376; ///< of words, behind the 5322 of the line
    template <class F64> static PYXCC_INLINE F64 curved(const F64& x)
    {
        return power222((x + 0.099) * 0.9099181073703366); // one unit in the last place from 1 / 1.099
    }
    template <class F64> static PYXCC_INLINE F64 curvedOfWords(const F64& x)
    {
        return power222OfWords((x + 0.099) * 0.9099181073703366);
    }
};

/// Bytes, by a table.
template <const ByteCurve& curve> struct GammaOfBytes : frame::OnSamples {
    template <class Samples> PYXCC_INLINE auto operator()(const Samples& samples) const
    {
        return each([](auto x) PYXCC_INLINE_LAMBDA { return lookUp<curve>(x); }, samples);
    }
};

/// What a word has on the curve, before it is rounded.
template <class Curve, class F64> PYXCC_INLINE F64 gammaOfWord(const F64& v)
{
    const auto x = v * 1.5259021896696422e-5;
    const auto curved = Curve::curvedOfWords(greater(Curve::threshold, x)) * 65535.0;
    return whereLess(x, Curve::threshold, v * Curve::slope, curved);
}

/// Rounding goes by way of a float: what is near below a half can so get to the next integer, and one that is met
/// exactly becomes even.
template <class F64> PYXCC_INLINE auto roundedToWord(const F64& y)
{
    const auto z = toF32(y + 0.5);
    const auto t = trunc(z);
    return whereEqual(z, toF32(t), t & ~1, t);
}

/// Words, which come as floats.
template <class Curve> struct GammaOfWords : frame::OnSamples {
    template <class F32> PYXCC_INLINE auto operator()(const F32& samples) const
    {
        return roundedToWord(gammaOfWord<Curve>(toF64(samples)));
    }
};

/// Floats between two bounds, which are where the curve has 0 and 1.
template <class Curve> struct GammaBetween : frame::OnSamples {
    f32 vMin;
    f64 range, inverse;

    GammaBetween(f32 low, f32 high) : vMin(low), range(high - low), inverse(1.0 / range) {}

    template <class F32> PYXCC_INLINE auto operator()(const F32& samples) const
    {
        const auto d = toF64(samples - vMin);
        const auto x = d * inverse;
        const f64 base = vMin;
        const auto line = fused(d, Curve::slope, base);
        const auto curved = fused(Curve::curved(greater(Curve::threshold, x)), range, base);
        return toF32(whereLess(x, Curve::threshold, line, curved));
    }
};

} // namespace pyxcc::tone
