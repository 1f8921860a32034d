// RGB to L*u*v* of bytes with true divisions, and L by a power of Y.
#pragma once

#include "perceptual/luv_forward_forms.hpp"

namespace pyxcc::perceptual
{

/// Y^p for the float next to 1/3 as the exponent, p = 1/3 + 2^-25 / 3, with Y up to 1, from where L is no line. It is
/// as good as a power of doubles narrowed to a float: the bytes that come of it are the same for all pixels.
///
/// The cube root comes from the table to five digits, and one more step in doubles gets it to twice that and more. What
/// p has over 1/3 shows in the last bit of a float: it is its share of log Y, of which four digits do.
template <class F32> PYXCC_INLINE F32 powerOfAThird(const F32& Y)
{
    const auto root = rootByEightTerms(rootStart(labCubeRootTable, trunc(Y * 127.998046875f), Y), luvLastTerms);
    const auto s = toF64(root), y = toF64(Y);

    const auto bits = upperWords(y) - (1023 << 20);
    const F32 m = toF32(bits & 0xfffff) * 0x1p-20f;
    const F32 ofMantissa =
        fused(fused(fused(fused(F32(0.05866494f), m, F32(-0.22510303f)), m, F32(0.44059903f)), m, F32(-0.71671466f)), m,
              F32(1.4426039f));
    const F32 log2 = fused(m, ofMantissa, toF32(bits >> 20));
    const auto excess = toF64(log2 * 6.8857986e-9f); // log 2 times 2^-25 / 3

    // With Y = s^3 (1 + 3 e), the root is about s (1 + e - e^2).
    const auto e = (y - s * s * s) * toF64(F32(0.33333334f) / Y);
    return toF32(fused(s, fused(-e, e, e) + excess, s));
}

/// Each step as in the formula; integers are cut.
struct RgbToLuvByPower : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        const F32 full = 255.0f, zero = 0.0f;
        const F32 X = FusedSums::weighted(xOfRgb, R, G, B) / full;
        const F32 Y = FusedSums::weighted(yOfRgb, R, G, B) / full;
        const F32 Z = FusedSums::weighted(zOfRgb, R, G, B) / full;
        const F32 L = whereLess(F32(luvLimit), Y, fused(powerOfAThird(Y), F32(116.0f), F32(-16.0f)), Y * 903.3f);
        const F32 D = fused(Y, F32(15.0f), fused(Z, F32(3.0f), X));
        const F32 up = whereEqual(Y, zero, zero, (X * 4.0f) / D), vp = whereEqual(Y, zero, zero, (Y * 9.0f) / D);
        const F32 scale = L * 13.0f;
        const F32 u = fused(up - un, scale, F32(134.0f)), v = fused(vp - vn, scale, F32(140.0f));
        return Three{trunc((full * L) / F32(100.0f)), trunc((full * u) / F32(354.0f) + 0.5f),
                     trunc((v * full) / F32(262.0f) + 0.5f)};
    }
};

} // namespace pyxcc::perceptual
