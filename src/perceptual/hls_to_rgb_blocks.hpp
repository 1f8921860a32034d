// HLS to RGB and BGR, whole blocks. Of the three channels one is the greatest that the lightness and saturation allow,
// one the least, and only the one between them depends on the hue: so three floats make a pixel, and the sextant tells
// which channel is which.
#pragma once

#include "frame/channel_forms.hpp"
#include "perceptual/sextants.hpp"

namespace pyxcc::perceptual
{

/// The sextant of a hue, as the angles of it come out: at the border of two, where the middle channel meets another
/// one, either will do by the numbers, but only one of them by their last bits.
template <class Sample> struct SextantOf;

/// The greatest byte has one of its own, 6, where all channels are at one end of their range.
template <> struct SextantOf<u8> {
    template <class U8> PYXCC_INLINE U8 operator()(const U8& H) const { return mulHighU16(H, 1543); }
};

/// 4/6 of the circle are a little below 240 degrees, which a mode that does not round down leads to.
template <> struct SextantOf<u16> {
    static constexpr int fourth = 43690;
    int lead = (scalar::F32(fourth) * scalar::F32(HueScale<u16>::hk)).v < 240 ? -1 : 0;

    template <class U16> PYXCC_INLINE U16 operator()(const U16& H) const
    {
        return mulHighU16(addSatU16(H, H >> 15) + (equal(H, U16(fourth)) & U16(lead)), 6);
    }
};

/// How far the middle one of the channels is from the least one, in degrees of the 60 there are: by sextants it is G,
/// R, B, G, R, B in turn, each going up, down, up and so on. Its angle is H times `scale` plus `shift`, and `origin`
/// away from there.
template <class Sample> struct MiddleChannel {
    static constexpr f32 hk = HueScale<Sample>::hk;
    static constexpr std::array<f32, 8> scale = {hk, hk, hk, -hk, hk, hk, 0, 0};
    static constexpr std::array<f32, 8> shift = {0, 120, -120, 240, 120, -120, 0, 0};
    static constexpr std::array<f32, 8> origin = {0, 240, 0, 0, 360, 240, 0, 0};

    template <class F32, class S32> static PYXCC_INLINE F32 distance(const F32& H, const S32& sextant)
    {
        return magnitude(fused(lookUp(scale, sextant), H, lookUp(shift, sextant)) - lookUp(origin, sextant));
    }
};

/// R, G and B by `levels`, which gives the least, the middle and the greatest channel from how far the middle one is, L
/// and S, all of them floats.
template <class Sample, class Samples, class Levels>
PYXCC_INLINE Three<Samples> channelsOf(const Samples& sextant, const Samples& H, const Samples& L, const Samples& S,
                                       const Levels& levels)
{
    const auto result = each(
        [&](const auto& i, const auto& h, const auto& l, const auto& s)
            PYXCC_INLINE_LAMBDA { return levels(MiddleChannel<Sample>::distance(toF32(h), i), toF32(l), toF32(s)); },
        toS32(sextant), toS32(H), toS32(L), toS32(S));
    return bySextant(sextant, saturate<Samples>(thirdOf(result)), saturate<Samples>(secondOf(result)),
                     saturate<Samples>(firstOf(result)));
}

/// HLS to RGB, whole blocks. A saturation of 0 needs no case of its own: the channels meet in L.
template <class Sample> struct HlsToRgb : frame::OnChannels {
    SextantOf<Sample> sextantOf;

    template <class Samples>
    PYXCC_INLINE Three<Samples> operator()(const Samples& H, const Samples& L, const Samples& S) const
    {
        const auto levels = []<class F32>(const F32& x, const F32& l, const F32& s) PYXCC_INLINE_LAMBDA {
            const F32 inv(HueScale<Sample>::inv), full(HueScale<Sample>::full);
            const F32 Ls = l * inv, Ss = s * inv, P = Ls * Ss;
            const F32 q = lesser(P, fused(inv, s, -P)); // the former if L is up to a half, by more than a last bit
            const F32 m2 = fused(inv, l, q), m1 = fused(Ls, F32(2), -m2), dd = m2 - m1;
            const F32 v = fused(F32(c60), dd * x, m1);
            return Three{nearest(m1 * full), nearest(v * full), nearest(m2 * full)};
        };
        return channelsOf<Sample>(sextantOf(H), H, L, S, levels);
    }
};

/// HLS to BGR, whole blocks. A saturation of 0 needs no case of its own here either.
struct HlsToBgr : frame::OnChannels {
    SextantOf<u8> sextantOf;

    template <class U8> PYXCC_INLINE Three<U8> operator()(const U8& H, const U8& L, const U8& S) const
    {
        const auto levels = []<class F32>(const F32& x, const F32& l, const F32& s) PYXCC_INLINE_LAMBDA {
            const F32 inv(HueScale<u8>::inv), full(255);
            const F32 Ld = l * inv, Sd = s * inv, a = fused(Sd, inv, -inv);
            const F32 m2 = lesser(fused(Sd, Ld, Ld), fused(-l, a, Sd)); // likewise
            const F32 m1 = fused(Ld, F32(2), -m2), dd = m2 - m1;
            const F32 v = fused(dd, x * F32(c60), m1);
            return Three{trunc(m1 * full), trunc(v * full), trunc(m2 * full)};
        };
        const Three<U8> rgb = channelsOf<u8>(sextantOf(H), H, L, S, levels);
        return {rgb.c, rgb.b, rgb.a};
    }
};

} // namespace pyxcc::perceptual
