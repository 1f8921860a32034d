// Hue, lightness and saturation of floats, all three as fractions, and back.
#pragma once

#include "perceptual/hls_forms.hpp"

namespace pyxcc::perceptual
{

/// RGB to HLS, every pixel, by true divisions.
struct RgbToHlsOfFloats : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& r, const F32& g, const F32& b) const
    {
        const Extremes<F32> of(r, g, b);
        const F32 d = of.M - of.m, s = of.M + of.m, L = s * F32(0.5f);
        const F32 S = d / whereAtMost(L, F32(0.5f), s, F32(2) - s);
        const Third<F32> third(of.M, r, g, b);
        const F32 fromMiddle = (third.difference * F32(60)) / d;
        const F32 h = notBelow0(whereEqual(of.M, r, fromMiddle, fromMiddle + third.offset));
        const F32 epsilon(0x1p-23f), zero(0);
        return Three{whereAtMost(d, epsilon, zero, h / F32(360)), L, whereAtMost(d, epsilon, zero, S)};
    }
};

/// HLS to RGB, whole blocks.
struct HlsToRgbOfFloats : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& L, const F32& S) const
    {
        const F32 m2 = whereAtMost(L, F32(0.5f), fused(L, S, L), fused(-L, S - F32(1), S));
        const F32 m1 = fused(L, F32(2), -m2), dd = m2 - m1;
        const F32 circle(360);
        const F32 hR = notAbove360(fused(circle, H, F32(120))), hG = H * circle,
                  hB = notBelow0(fused(circle, H, F32(-120)));
        const auto value = [&](const F32& h, const F32& rest) PYXCC_INLINE_LAMBDA {
            const auto ramp = [&](const F32& x) PYXCC_INLINE_LAMBDA { return fused(dd, x * F32(c60), m1); };
            return whereEqual(S, F32(0), L, trapezium(h, rest, Range<F32>{m1, m2}, ramp));
        };
        return Three{value(hR, F32(240) - hR), value(hG, fused(-H, circle, F32(240))), value(hB, F32(240) - hB)};
    }
};

/// HLS to RGB, what is left of a row.
struct HlsToRgbTailOfFloats : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& L, const F32& S) const
    {
        const Three<F32> v = dividedHlsToRgb(F32(360) * H, L, S);
        const F32 zero(0);
        return Three{whereEqual(S, zero, L, v.a), whereEqual(S, zero, L, v.b), whereEqual(S, zero, L, v.c)};
    }
};

} // namespace pyxcc::perceptual
