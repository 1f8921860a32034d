// HSV and RGB, whole blocks. What can be told of samples is done on samples, where floats come by 8.
#pragma once

#include "frame/channel_forms.hpp"
#include "perceptual/hsv_forms.hpp"
#include "perceptual/sextants.hpp"

namespace pyxcc::perceptual
{

/// RGB to HSV of bytes, whole blocks. Of two channels that are the greatest, R goes before G, G before B, and B before
/// R.
struct RgbToHsv : frame::OnChannels {
    template <class U8> PYXCC_INLINE Three<U8> operator()(const U8& r, const U8& g, const U8& b) const
    {
        const U8 M = greater(greater(r, g), b), m = lesser(lesser(r, g), b), d = M - m;
        const U8 isGray = equal(d, U8(0));
        const U8 equalsG = equal(M, g);
        const U8 isG = exceptWhere(equal(M, r), equalsG), isB = exceptWhere(equalsG, equal(M, b));
        const U8 isR = equal(isG | isB, U8(0));
        // R: (M - b) e - (M - g) e; G: (b - r) e + 2; B: (r - g) e + 4. M is r where R is taken.
        const U8 plus = where(isG, b, r), minus = where(isG, r, where(isB, g, b));
        const U8 taken = isR & (M - g), offset = (isG & U8(2)) | (isB & U8(4));
        const auto core = []<class S32>(const S32& difference, const S32& fromG, const S32& sextants, const S32& extent,
                                        const S32& greatest) PYXCC_INLINE_LAMBDA {
            const auto spread = toF32(extent);
            using F32 = std::remove_cv_t<decltype(spread)>;
            const F32 e = rcp(spread);
            const F32 o = toF32(sextants) - e * toF32(fromG);
            const F32 c = fused(toF32(difference), e * F32(HueScale<u8>::difference), o), t = c * F32(bytesASextant);
            const F32 h = whereLess(t, F32(0), fused(F32(bytesASextant), c, F32(255)), t);
            return Two{nearest(h), nearest((rcp(toF32(greatest)) * spread) * F32(255))};
        };
        const auto result = each(core, scaledDifference(plus, minus), toS32(taken), toS32(offset),
                                 toS32(greater(d, U8(1))), toS32(greater(M, U8(1))));
        return {exceptWhere(isGray, saturate<U8>(firstOf(result))), exceptWhere(isGray, saturate<U8>(secondOf(result))),
                M};
    }
};

/// HSV to RGB, whole blocks: V itself, p, which is the least channel, and a middle one, q in odd sextants and t in even
/// ones. A saturation of 0 needs no case of its own: p, q and t are then V.
template <class Sample> struct HsvToRgb : frame::OnChannels {
    template <class Samples>
    PYXCC_INLINE Three<Samples> operator()(const Samples& H, const Samples& S, const Samples& V) const
    {
        using Scale = HueScale<Sample>;
        const Samples hue = exceptWhere(equal(H, Samples(std::numeric_limits<Sample>::max())), H);
        const auto core = []<class S32>(const S32& h, const S32& s, const S32& v) PYXCC_INLINE_LAMBDA {
            const auto hf = toF32(h), sf = toF32(s), vf = toF32(v);
            using F32 = std::remove_cv_t<decltype(hf)>;
            const F32 inv(Scale::inv);
            const S32 sextant = trunc((hf * F32(c60)) * F32(Scale::hk));
            const F32 f = fused(hf, F32(Scale::ck), -toF32(sextant));
            const F32 p = -(fused(inv, sf, F32(-1)) * vf);
            if constexpr (sizeof(Sample) == 1) {
                const F32 vs = (inv * vf) * sf, q = fused(-vs, f, vf);
                const F32 w = fused(f, inv, -inv), t = fused(w, sf, F32(1)) * vf;
                return Three{sextant, nearest(whereOdd(sextant, q, t)), nearest(p)};
            } else {
                const F32 vs = vf * (sf * inv), q = fused(-vs, f, vf), t = fused(vs, f, p);
                return Three{sextant, lowBits<Sample>(nearest(whereOdd(sextant, q, t))), lowBits<Sample>(nearest(p))};
            }
        };
        const auto result = each(core, toS32(hue), toS32(S), toS32(V));
        return bySextant(saturate<Samples>(firstOf(result)), V, saturate<Samples>(secondOf(result)),
                         saturate<Samples>(thirdOf(result)));
    }
};

} // namespace pyxcc::perceptual
