// Hue, saturation and value of integer samples, and back. Hue is counted in sextants, from 0 to 6.
#pragma once

#include "frame/float_forms.hpp"
#include "perceptual/hls_forms.hpp"
#include "perceptual/hue_scale.hpp"

namespace pyxcc::perceptual
{

inline constexpr f32 bytesASextant = 42.5f;

/// RGB to HSV of bytes, what is left of a row. B goes before G, and G before R.
struct RgbToHsvTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& r, const F32& g, const F32& b) const
    {
        const Extremes<F32> of(r, g, b);
        const F32 M = of.M, d = M - of.m;
        const F32 sv = (rcp(greater(M, F32(1))) * d) * F32(255);
        const F32 e = rcp(greater(d, F32(1)));
        const F32 A = (M - r) * e, B = (M - g) * e, C = (M - b) * e;
        const F32 h = whereEqual(M, b, (B - A) + F32(4), whereEqual(M, g, (A - C) + F32(2), C - B));
        const F32 t = h * F32(bytesASextant);
        const F32 positive = whereLess(t, F32(0), t + F32(255), t);
        return Three{lowBits<u8>(nearest(whereEqual(d, F32(0), F32(0), positive))), nearest(sv), nearest(M)};
    }
};

/// x / 6 as a division rounds it, in every mode, for results that are not subnormal: the product is off by its last bit
/// at the most, and what is left of x tells by how much.
template <class F32> PYXCC_INLINE F32 sixthOf(const F32& x)
{
    const F32 sixth(0x1.555556p-3f), q = x * sixth;
    return fused(fused(F32(-6), q, x), sixth, q);
}

/// RGB to HSV of words, every pixel, by true divisions. B goes before G, and G before R.
struct RgbToHsvOfWords : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& r, const F32& g, const F32& b) const
    {
        const F32 full(65535);
        const Extremes<F32> of(r, g, b);
        const F32 V = of.M, fd = V - of.m;
        const F32 s = fd / greater(V, F32(1)), i = F32(1) / greater(fd, F32(1));
        const F32 A = (V - r) * i, B = (V - g) * i, C = (V - b) * i;
        const F32 sextant = whereEqual(V, b, (F32(4) - A) + B, whereEqual(V, g, (A + F32(2)) - C, C - B));
        // What is just below 0 stays there, to become 0.
        const F32 h = whereLess(sextant + F32(0x1p-23f), F32(0), sextant + F32(6), sextant);
        const F32 H = F32(0.5f) + sixthOf(full * h);
        return Three{trunc(whereEqual(fd, F32(0), F32(0), H)), trunc(fused(full, s, F32(0.5f))), trunc(V)};
    }
};

/// What the channels are in a sextant: V itself, p, which is the least of them, q in odd sextants and t in even ones.
template <class F32, class S32>
PYXCC_INLINE Three<F32> bySextant(const S32& sextant, const F32& V, const F32& p, const F32& q, const F32& t)
{
    const F32 i = toF32(sextant);
    const auto from = [&](int first, const F32& above, const F32& below)
                          PYXCC_INLINE_LAMBDA { return whereLess(i, F32(static_cast<f32>(first)), below, above); };
    return {from(1, from(2, from(4, from(5, V, t), p), q), V), from(1, from(3, from(4, p, q), V), t),
            from(2, from(3, from(5, q, V), t), p)};
}

/// HSV to RGB, what is left of a row.
template <class Sample> struct HsvToRgbTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& H, const F32& S, const F32& V) const
    {
        using Scale = HueScale<Sample>;
        const F32 a = whereEqual(H, F32(Scale::full), F32(0), H * F32(c60)), sec = a * F32(Scale::hk);
        const auto sextant = trunc(sec);
        const F32 f = sec - toF32(sextant);
        const F32 vs = V * (S * F32(Scale::inv)), p = V - vs, fv = f * vs, q = V - fv, t = p + fv;
        const Three<F32> v = bySextant(sextant, V, p, q, t);
        return lowBits<Sample>(Three{nearest(v.a), nearest(v.b), nearest(v.c)});
    }
};

} // namespace pyxcc::perceptual
