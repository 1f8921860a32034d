// RGB and BGR of bytes to HLS, whole blocks. What can be told of bytes is done on bytes, 32 pixels at a time, where
// floats come by 8. What a float is computed from, and in which order, is as it would be with all in floats.
#pragma once

#include "frame/channel_forms.hpp"
#include "perceptual/hue_scale.hpp"

namespace pyxcc::perceptual
{

/// The half of the sum of two bytes, rounded in the mode in force when this is made. A half between two bytes is first
/// rounded up, and brought down again where the mode does not lead up: always, or where it led to an odd byte, or
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

    template <class U8> PYXCC_INLINE U8 operator()(const U8& x, const U8& y) const
    {
        const U8 up = avgUp(x, y);
        return up - ((x ^ y) & ((up & U8(downFromOdd)) | U8(alwaysDown)));
    }

private:
    int downFromOdd, alwaysDown;
};

/// The third of the circle that a hue of bytes is in: R before G before B.
template <class U8> struct ThirdOfBytes {
    U8 plus, minus; ///< the other two channels, as they are subtracted
    U8 offset;      ///< degrees in front of the third's middle

    PYXCC_INLINE ThirdOfBytes(const U8& M, const U8& r, const U8& g, const U8& b)
    {
        const U8 isR = equal(M, r), isG = equal(M, g);
        plus = where(isR, g, where(isG, b, r));
        minus = where(isR, b, where(isG, r, g));
        offset = exceptWhere(isR, where(isG, U8(120), U8(240)));
    }
};

/// What saturation is measured by: M + m, or how far it is from 510, whichever is less, and at least 1.
template <class U8> PYXCC_INLINE U8 saturationUnit(const U8& M, const U8& m)
{
    const U8 full(255);
    return greater(full - distance(M, full - m), U8(1));
}

/// Hue and saturation of bytes by `hue` and `saturation`, which take floats. A gray has neither.
template <class U8, class Hue, class Saturation>
PYXCC_INLINE Two<U8> hueAndSaturation(const U8& M, const U8& m, const ThirdOfBytes<U8>& third, const Hue& hue,
                                      const Saturation& saturation)
{
    const U8 d = M - m, isGray = equal(d, U8(0));
    const auto core = [&](const auto& difference, const auto& offset, const auto& extent,
                          const auto& unit) PYXCC_INLINE_LAMBDA {
        const auto spread = toF32(extent);
        return Two{hue(toF32(difference), toF32(offset), spread), saturation(spread, toF32(unit))};
    };
    const auto result = each(core, differenceIn65536ths(third.plus, third.minus), toS32(third.offset),
                             toS32(greater(d, U8(1))), toS32(saturationUnit(M, m)));
    return {saturate<U8>(firstOf(result)), exceptWhere(isGray, saturate<U8>(secondOf(result)))};
}

/// RGB to HLS, whole blocks.
struct RgbToHlsOfBytes : frame::OnChannels {
    HalfSum halfSum;

    template <class U8> PYXCC_INLINE auto operator()(const U8& r, const U8& g, const U8& b) const
    {
        const U8 M = greater(greater(r, g), b), m = lesser(lesser(r, g), b);
        const auto hue = []<class F32>(const F32& difference, const F32& offset, const F32& d) PYXCC_INLINE_LAMBDA {
            const F32 h = fused(difference, rcp(d) * F32(60 * 0x1p-16f), offset);
            return nearest(whereSigned(h, h + F32(360), h) * F32(HueScale<u8>::hueScale));
        };
        const auto saturation = []<class F32>(const F32& d, const F32& unit)
                                    PYXCC_INLINE_LAMBDA { return nearest((d * rcp(unit)) * F32(255)); };
        const auto [H, S] = hueAndSaturation(M, m, ThirdOfBytes<U8>(M, r, g, b), hue, saturation);
        return Three<U8>{H, halfSum(M, m), S};
    }
};

/// BGR to HLS, whole blocks.
struct BgrToHlsOfBytes : frame::OnChannels {
    template <class U8> PYXCC_INLINE auto operator()(const U8& b, const U8& g, const U8& r) const
    {
        const U8 M = greater(greater(r, g), b), m = lesser(lesser(r, g), b);
        const auto hue = []<class F32>(const F32& difference, const F32& offset, const F32& d) PYXCC_INLINE_LAMBDA {
            const F32 h = fused(difference * F32(60 * 0x1p-16f), rcp(d), offset);
            return trunc(whereSigned(h, h + F32(360), h) * F32(HueScale<u8>::hueScale));
        };
        const auto saturation = []<class F32>(const F32& d, const F32& unit)
                                    PYXCC_INLINE_LAMBDA { return trunc((d * rcp(unit)) * F32(255)); };
        const auto [H, S] = hueAndSaturation(M, m, ThirdOfBytes<U8>(M, r, g, b), hue, saturation);
        return Three<U8>{H, avgDown(M, m), S};
    }
};

} // namespace pyxcc::perceptual
