// Hue, lightness and saturation of integer samples, and back. Samples of 16 bits with a sign are moved to the range of
// those without before they come here. The order of operations is part of each form, and so is which of them are fused.
#pragma once

#include "frame/float_forms.hpp"
#include "perceptual/hue_scale.hpp"
#include "perceptual/reciprocals.hpp"

namespace pyxcc::perceptual
{

/// The greatest and the least channel of a pixel.
template <class F32> struct Extremes {
    F32 M, m;

    PYXCC_INLINE Extremes(const F32& r, const F32& g, const F32& b)
        : M(greater(greater(r, g), b)), m(lesser(lesser(r, g), b))
    {
    }
};

/// Which third of the circle a hue is in, told by the greatest channel: R before G before B.
template <class F32> struct Third {
    F32 difference; ///< of the other two channels
    F32 offset;     ///< degrees in front of the third's middle

    PYXCC_INLINE Third(const F32& M, const F32& r, const F32& g, const F32& b)
        : difference(whereEqual(M, r, g - b, whereEqual(M, g, b - r, r - g))),
          offset(whereEqual(M, r, F32(0), whereEqual(M, g, F32(120), F32(240))))
    {
    }
};

/// What saturation is measured by: the sum of the extremes, or how far it is from twice the greatest sample, whichever
/// is less. It is 0 for black and white alone, and then 1 does as well, since the saturation is 0 by its numerator.
template <class Sample, class F32> PYXCC_INLINE F32 saturationUnit(const F32& sum)
{
    return greater(lesser(sum, F32(2 * HueScale<Sample>::full) - sum), F32(1));
}

/// RGB to HLS, what is left of a row.
template <class Sample, class Conversion> struct RgbToHlsTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& r, const F32& g, const F32& b) const
    {
        using Scale = HueScale<Sample>;
        constexpr Conversion conversion;
        const Extremes<F32> of(r, g, b);
        const F32 d = of.M - of.m, s = of.M + of.m, l = s * F32(0.5f);
        const F32 w = refined(saturationUnit<Sample>(s)), e = refined(greater(d, F32(1)));
        const Third<F32> third(of.M, r, g, b);
        const F32 h = notBelow0((third.difference * F32(60)) * e + third.offset);
        return lowBits<Sample>(
            Three{conversion(h * F32(Scale::hueScale)), conversion(l), conversion((d * w) * F32(Scale::full))});
    }
};

/// BGR to HLS, what is left of a row.
struct BgrToHlsTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& b, const F32& g, const F32& r) const
    {
        return RgbToHlsTail<u8, Truncated>{}(r, g, b);
    }
};

/// The least and the greatest channel that a pixel is to have.
template <class F32> struct Range {
    F32 m1, m2;
};

/// The angles at which a hue is looked up for R, G and B.
template <class F32> struct Angles {
    F32 r, g, b;
};

/// A channel at the angle h: up from m1 to m2 over the first 60 degrees, at m2 up to 180, down again over 60, and at m1
/// for the rest of the circle. `rest` is what is left up to 240, and `ramp` gives what is so many degrees from m1.
template <class F32, class Ramp>
PYXCC_INLINE F32 trapezium(const F32& h, const F32& rest, const Range<F32>& range, const Ramp& ramp)
{
    const F32 x = ramp(whereLess(h, F32(60), h, rest));
    return whereLess(h, F32(60), x, whereLess(h, F32(180), range.m2, whereLess(h, F32(240), x, range.m1)));
}

/// HLS to RGB, what is left of a row of words.
struct HlsToRgbTailOfWords : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& L, const F32& S) const
    {
        using Scale = HueScale<u16>;
        const F32 h = H * F32(Scale::hk), l = L * F32(Scale::inv), s = S * F32(Scale::inv);
        const F32 P = l * s;
        const F32 m2 = whereLess(F32(0.5f), l, (l + s) - P, l + P);
        const F32 m1 = (l + l) - m2, dd = m2 - m1;
        const F32 hR = notAbove360(h + F32(120)), hB = notBelow0(h - F32(120));
        const auto value = [&](const F32& angle) PYXCC_INLINE_LAMBDA {
            const auto ramp = [&](const F32& x) PYXCC_INLINE_LAMBDA { return (x * F32(c60)) * dd + m1; };
            const F32 v = trapezium(angle, F32(240) - angle, Range<F32>{m1, m2}, ramp);
            return whereEqual(s, F32(0), nearest(L), nearest(v * F32(Scale::full)));
        };
        return lowBits<u16>(Three{value(hR), value(h), value(hB)});
    }
};

/// What the tails that divide have in common: hue as an angle, lightness and saturation as fractions.
template <class F32> PYXCC_INLINE Three<F32> dividedHlsToRgb(const F32& h, const F32& l, const F32& s)
{
    const F32 m2 = whereAtMost(l, F32(0.5f), fused(s, l, l), fused(-s, l, l + s));
    const F32 m1 = fused(l, F32(2), -m2);
    const F32 hR = notAbove360(h + F32(120)), hB = notBelow0(h - F32(120));
    const auto value = [&](const F32& angle) PYXCC_INLINE_LAMBDA {
        const auto ramp = [&](const F32& x) PYXCC_INLINE_LAMBDA { return m1 + ((m2 - m1) * x) / F32(60); };
        return trapezium(angle, F32(240) - angle, Range<F32>{m1, m2}, ramp);
    };
    return {value(hR), value(h), value(hB)};
}

/// HLS to RGB, what is left of a row of bytes.
struct HlsToRgbTailOfBytes : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& L, const F32& S) const
    {
        const F32 full(255);
        const Three<F32> v = dividedHlsToRgb((H * F32(360)) / full, L / full, S / full);
        return lowBits<u8>(Three{trunc(full * v.a), trunc(full * v.b), trunc(full * v.c)});
    }
};

/// HLS to BGR, what is left of a row.
struct HlsToBgrTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& L, const F32& S) const
    {
        using Scale = HueScale<u8>;
        const F32 h = H * F32(Scale::hk), l = L * F32(Scale::inv), s = S * F32(Scale::inv);
        const F32 P = l * s;
        const F32 m2 = whereLess(F32(0.5f), l, (l + s) - P, l + P);
        const F32 m1 = l * F32(2) - m2, dd = m2 - m1;
        const F32 hR = notAbove360(h + F32(120)), hB = notBelow0(h - F32(120));
        const auto value = [&](const F32& angle) PYXCC_INLINE_LAMBDA {
            const auto ramp = [&](const F32& x) PYXCC_INLINE_LAMBDA { return (x * F32(c60)) * dd + m1; };
            const F32 v = trapezium(angle, F32(240) - angle, Range<F32>{m1, m2}, ramp);
            return whereEqual(s, F32(0), trunc(L), trunc(v * F32(Scale::full)));
        };
        return Three{value(hB), value(h), value(hR)};
    }
};

} // namespace pyxcc::perceptual
