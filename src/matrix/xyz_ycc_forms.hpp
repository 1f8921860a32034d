// RGB to and from XYZ and YCC: integers for bytes, floats for all other samples.
#pragma once

#include "frame/float_forms.hpp"
#include "frame/forms.hpp"

namespace pyxcc::matrix
{

// Bytes: 32-bit sums, of which what lies below the point is cut off.

struct RgbToXyzBytes : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        return Three{sat8(exactSum<16, 0, 27030, 23434, 11824>(R, G, B)),
                     sat8(exactSum<16, 0, 13937, 46868, 4729>(R, G, B)),
                     sat8(exactSum<16, 0, 1267, 7811, 62274>(R, G, B))};
    }
};

struct XyzToRgbBytes : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& X, const Word& Y, const Word& Z) const
    {
        return Three{sat8(exactSum<16, 0, 212368, -100738, -32671>(X, Y, Z)),
                     sat8(exactSum<16, 0, -63521, 122944, 2723>(X, Y, Z)),
                     sat8(exactSum<16, 0, 3646, -13372, 69291>(X, Y, Z))};
    }
};

/// Luma and what the colours exceed it by are cut off to sixteenths of a step first.
struct RgbToYccBytes : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto s = exactSum<10, 0, 4898, 9617, 1867>(R, G, B);
        const auto blueExcess = exactSum<10, 0, -4898, -9617, 16384 - 1867>(R, G, B);
        const auto redExcess = exactSum<10, 0, 16384 - 4898, -9617, -1867>(R, G, B);
        return Three{sat8(mulHighS16(s, 2921)), low8(mulHighS16(blueExcess, 1789) - 100),
                     low8(mulHighS16(redExcess, 2178) - 119)};
    }
};

/// The zeros of C1 and C2 are at 156 and 137.
struct YccToRgbBytes : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& C1, const Word& C2) const
    {
        const auto a = highShare<156, 2 * 9084>(C1), b = highShare<137, 2 * 7460>(C2); // in sixteenths of a step
        return Three{sat8(exactSum<12, -137 * 7460, 5564, 7460>(Y, C2)),
                     sat8(exactSum<16, 0, 16 * 5564, -794, -2084>(Y, a, b)),
                     sat8(exactSum<12, -156 * 9084, 5564, 9084>(Y, C1))};
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
