// RGB to and from XYZ and YCC: integers for bytes, floats for all other samples.
#pragma once

#include "frame/float_forms.hpp"
#include "frame/forms.hpp"

namespace pyxcc::matrix
{

// Bytes: 32-bit sums, of which what lies below the point is cut off.

/// In 65536ths of a step.
struct RgbToXyzBytes : frame::OnPixels {
    template <class Pixels> PYXCC_INLINE auto operator()(const Pixels& rgb) const
    {
        return Three{upperSum<27030, 23434, 11824>(rgb), upperSum<13937, 46868, 4729>(rgb),
                     upperSum<1267, 7811, 62274>(rgb)};
    }
};

struct XyzToRgbBytes : frame::OnPixels {
    template <class Pixels> PYXCC_INLINE auto operator()(const Pixels& xyz) const
    {
        return Three{upperSum<212368, -100738, -32671>(xyz), upperSum<-63521, 122944, 2723>(xyz),
                     upperSum<3646, -13372, 69291>(xyz)};
    }
};

/// Luma, and what the colours exceed it by, are cut off to sixteenths of a step first, differences downwards, so that
/// what is taken off for them is cut off upwards. The zeros of C1 and C2 are at 156 and 137, which keeps both within a
/// byte.
struct RgbToYccBytes : frame::OnPixels {
    template <class Pixels> PYXCC_INLINE auto operator()(const Pixels& rgb) const
    {
        const auto bluesAndReds = wordsOf<2, 0>(rgb);
        const auto s = sumOfProducts<1867, 4898>(bluesAndReds) + sumOfProducts<9617, 0>(wordsOf<1, none>(rgb));
        const auto excess = (bluesAndReds << 4) - twice((s + 1023) >> 10);
        return pixelWords(upperMulHighS16<2921>(s << 6), mulHighS16<1789, 2178>(excess) + Two{156, 137});
    }
};

/// In 65536ths of a step, to which the factors of 4096ths go with 16 times the samples. G has a and b of the other two
/// as 256ths of those, cut off: 128 times the sample takes twice the factor to be there in the upper half.
struct YccToRgbBytes : frame::OnPixels {
    template <class Pixels> PYXCC_INLINE auto operator()(const Pixels& ycc) const
    {
        constexpr int zero1 = 156, zero2 = 137;
        const auto y1 = (wordsOf<0, 1>(ycc) << 4) - Two{0, 16 * zero1};
        const auto y2 = (wordsOf<0, 2>(ycc) << 4) - Two{0, 16 * zero2};
        const auto chroma = (wordsOf<1, 2>(ycc) << 7) - Two{128 * zero1, 128 * zero2};
        const auto ab = mulHighS16<2 * 9084, 2 * 7460>(chroma);
        return Three{sumOfProducts<5564, 7460>(y2), sumOfProducts<5564, 0>(y1) + sumOfProducts<-794, -2084>(ab),
                     sumOfProducts<5564, 9084>(y1)};
    }
};

// Floats: sums of three terms are fused, those of two are not.

template <class F32> PYXCC_INLINE F32 weightedSum(const Three<f32>& k, const F32& x, const F32& y, const F32& z)
{
    return fused(F32(k.c), z, fused(F32(k.b), y, F32(k.a) * x));
}

template <class F32> PYXCC_INLINE F32 within0To1(const F32& x) { return lesser(greater(x, F32(0.0f)), F32(1.0f)); }

struct RgbToXyz : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        return Three{weightedSum({0.412453f, 0.35758f, 0.180423f}, R, G, B),
                     weightedSum({0.212671f, 0.71516f, 0.072169f}, R, G, B),
                     weightedSum({0.019334f, 0.119193f, 0.950227f}, R, G, B)};
    }
};

struct XyzToRgb : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& X, const F32& Y, const F32& Z) const
    {
        return Three{weightedSum({3.240479f, -1.53715f, -0.498535f}, X, Y, Z),
                     weightedSum({-0.969256f, 1.875991f, 0.041556f}, X, Y, Z),
                     weightedSum({0.055648f, -0.204043f, 1.057311f}, X, Y, Z)};
    }
};

/// Where the zeros of C1 and C2 are.
struct YccZeros {
    f32 c1, c2;
};

inline constexpr YccZeros yccZeros{0.6117647f, 0.5372549f}, yccZerosOfWords{40092, 35209};

template <YccZeros zeros> struct RgbToYcc : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        const F32 s = weightedSum({0.299f, 0.587f, 0.114f}, R, G, B);
        return Three{F32(0.7132668f) * s, F32(0.4368627f) * (B - s) + F32(zeros.c1),
                     F32(0.53192f) * (R - s) + F32(zeros.c2)};
    }
};

template <YccZeros zeros> struct YccToRgb : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& Y, const F32& C1, const F32& C2) const
    {
        const F32 y = F32(1.3584f) * Y;
        const F32 c1 = F32(2.2179f) * (C1 - F32(zeros.c1)), c2 = F32(1.8215f) * (C2 - F32(zeros.c2));
        return Three{y + c2, fused(F32(-0.509f), c2, fused(F32(-0.194f), c1, y)), y + c1};
    }
};

/// All three channels held to 0 to 1.
template <class Form> struct Held : Form {
    template <class F32> PYXCC_INLINE auto operator()(const F32& x, const F32& y, const F32& z) const
    {
        const auto r = Form::operator()(x, y, z);
        return Three{within0To1(r.a), within0To1(r.b), within0To1(r.c)};
    }
};

/// The third channel only.
template <class Form> struct ThirdHeld : Form {
    template <class F32> PYXCC_INLINE auto operator()(const F32& x, const F32& y, const F32& z) const
    {
        const auto r = Form::operator()(x, y, z);
        return Three{r.a, r.b, within0To1(r.c)};
    }
};

/// To integers in the rounding mode in force, which saturate to words.
template <class Form> struct ToWords : Form {
    template <class F32> PYXCC_INLINE auto operator()(const F32& x, const F32& y, const F32& z) const
    {
        const auto r = Form::operator()(x, y, z);
        return Three{nearest(r.a), nearest(r.b), nearest(r.c)};
    }
};

} // namespace pyxcc::matrix
