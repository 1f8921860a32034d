// RGB and BGR to HLS, whole blocks. What can be told of samples is done on samples, of which a register holds 32 or 16,
// where floats come by 8. What a float is computed from, and in which order, is as it would be with all in floats.
#pragma once

#include "frame/channel_forms.hpp"
#include "perceptual/hue_scale.hpp"

namespace pyxcc::perceptual
{

/// The half of the sum of two samples, rounded in the mode in force when this is made. A half between two is first
/// rounded up, and brought down again where the mode does not lead up: always, or where it led to an odd sample, or
/// never.
class HalfSum
{
public:
    HalfSum()
    {
        const bool upToOdd = scalar::nearest(0.5f).v == 1, upToEven = scalar::nearest(1.5f).v == 2;
        downFromOdd = upToEven && !upToOdd;
        alwaysDown = !upToEven;
    }

    template <class Samples> PYXCC_INLINE Samples operator()(const Samples& x, const Samples& y) const
    {
        const Samples up = avgUp(x, y);
        return up - ((x ^ y) & ((up & Samples(downFromOdd)) | Samples(alwaysDown)));
    }

private:
    int downFromOdd, alwaysDown;
};

/// The third of the circle that a hue is in: R before G before B.
template <class Samples> struct ThirdOfSamples {
    Samples plus, minus; ///< the other two channels, as they are subtracted
    Samples offset;      ///< degrees in front of the third's middle

    PYXCC_INLINE ThirdOfSamples(const Samples& M, const Samples& r, const Samples& g, const Samples& b)
    {
        const Samples isR = equal(M, r), isG = equal(M, g);
        plus = where(isR, g, where(isG, b, r));
        minus = where(isR, b, where(isG, r, g));
        offset = exceptWhere(isR, where(isG, Samples(120), Samples(240)));
    }
};

/// Hue and saturation by `hue` and `saturation`, which take floats. A gray has neither.
template <class Samples, class Hue, class Saturation>
PYXCC_INLINE Two<Samples> hueAndSaturation(const Samples& M, const Samples& m, const ThirdOfSamples<Samples>& third,
                                           const Hue& hue, const Saturation& saturation)
{
    const Samples d = M - m, isGray = equal(d, Samples(0));
    // What saturation is measured by: M + m, or how far it is from twice the greatest sample, whichever is less.
    const Samples full(-1), unit = full - distance(M, full - m);
    const auto core = [&](const auto& difference, const auto& offset, const auto& extent, const auto& by)
                          PYXCC_INLINE_LAMBDA {
                              const auto spread = toF32(extent);
                              return Two{hue(toF32(difference), toF32(offset), spread), saturation(spread, toF32(by))};
                          };
    const auto result = each(core, scaledDifference(third.plus, third.minus), toS32(third.offset),
                             toS32(greater(d, Samples(1))), toS32(greater(unit, Samples(1))));
    return {saturate<Samples>(firstOf(result)), exceptWhere(isGray, saturate<Samples>(secondOf(result)))};
}

/// The reciprocal: of bytes as it comes, of words after a step of refinement.
template <class Sample, class F32> PYXCC_INLINE F32 reciprocal(const F32& v)
{
    const F32 x = rcp(v);
    if constexpr (sizeof(Sample) == 1) return x;
    return fused(-x, fused(x, v, F32(-1)), x);
}

/// RGB to HLS, whole blocks.
template <class Sample> struct RgbToHls : frame::OnChannels {
    HalfSum halfSum;

    template <class Samples> PYXCC_INLINE auto operator()(const Samples& r, const Samples& g, const Samples& b) const
    {
        using Scale = HueScale<Sample>;
        const Samples M = greater(greater(r, g), b), m = lesser(lesser(r, g), b);
        const auto hue = []<class F32>(const F32& difference, const F32& offset, const F32& d) PYXCC_INLINE_LAMBDA {
            const F32 h = fused(difference, reciprocal<Sample>(d) * F32(60 * Scale::difference), offset);
            return nearest(whereSigned(h, h + F32(360), h) * F32(Scale::hueScale));
        };
        const auto saturation = []<class F32>(const F32& d, const F32& unit) PYXCC_INLINE_LAMBDA {
            return nearest((d * reciprocal<Sample>(unit)) * F32(Scale::full));
        };
        const auto [H, S] = hueAndSaturation(M, m, ThirdOfSamples<Samples>(M, r, g, b), hue, saturation);
        return Three<Samples>{H, halfSum(M, m), S};
    }
};

/// BGR to HLS, whole blocks.
struct BgrToHls : frame::OnChannels {
    template <class U8> PYXCC_INLINE auto operator()(const U8& b, const U8& g, const U8& r) const
    {
        using Scale = HueScale<u8>;
        const U8 M = greater(greater(r, g), b), m = lesser(lesser(r, g), b);
        const auto hue = []<class F32>(const F32& difference, const F32& offset, const F32& d) PYXCC_INLINE_LAMBDA {
            const F32 h = fused(difference * F32(60 * Scale::difference), rcp(d), offset);
            return trunc(whereSigned(h, h + F32(360), h) * F32(Scale::hueScale));
        };
        const auto saturation = []<class F32>(const F32& d, const F32& unit)
                                    PYXCC_INLINE_LAMBDA { return trunc((d * rcp(unit)) * F32(Scale::full)); };
        const auto [H, S] = hueAndSaturation(M, m, ThirdOfSamples<U8>(M, r, g, b), hue, saturation);
        return Three<U8>{H, avgDown(M, m), S};
    }
};

} // namespace pyxcc::perceptual
