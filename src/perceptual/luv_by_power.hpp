// RGB to L*u*v* of bytes with true divisions, and L by a power of Y.
#pragma once

#include "perceptual/luv_forward_forms.hpp"

namespace pyxcc::perceptual
{

/// Y^p for the float next to 1/3 as the exponent, p = 1/3 + 2^-25 / 3, with Y up to 1, from where L is no line. It is
/// as good as a power of doubles narrowed to a float: the bytes that come of it are the same for all pixels.
///
/// The cube root s comes from the table to five digits. One step more gets it to twice that, as long as the cube is
/// known to more digits than a float has: its square is a sum of two. What p has over 1/3 shows in the last bit: it
/// makes s (1 + 2^-25 log s) of s, where two digits of the logarithm do.
template <class F32> PYXCC_INLINE F32 powerOfAThird(const RootStart<F32>& start, const F32& Y)
{
    const F32 s = rootByEightTerms(start, luvLastTerms);
    const F32 square = s * s, squareRest = fused(s, s, -square);
    const F32 overCube = fused(-squareRest, s, fused(-square, s, Y));
    const F32 logarithm =
        fused(fused(fused(fused(fused(F32(5.415697f), s, F32(-19.54048f)), s, F32(28.6318f)), s, F32(-22.32311f)), s,
                    F32(10.91411f)),
              s, F32(-3.097004f));
    const F32 step = (overCube * refinedByFused(square)) * 0.33333334f;
    return s + fused(s * logarithm, F32(0x1p-25f), step);
}

/// Each step as in the formula; integers are cut.
struct RgbToLuvByPower : frame::OnFloats {
    static constexpr bool inTwoSteps = true;

    template <class F32> PYXCC_INLINE BegunLuv<F32> begin(const F32& R, const F32& G, const F32& B) const
    {
        const F32 full = 255.0f, zero = 0.0f;
        const F32 X = FusedSums::weighted(xOfRgb, R, G, B) / full;
        const F32 Y = FusedSums::weighted(yOfRgb, R, G, B) / full;
        const F32 Z = FusedSums::weighted(zOfRgb, R, G, B) / full;
        const F32 D = fused(Y, F32(15.0f), fused(Z, F32(3.0f), X));
        const F32 up = whereEqual(Y, zero, zero, (X * 4.0f) / D), vp = whereEqual(Y, zero, zero, (Y * 9.0f) / D);
        return {Y, rootStartWithin(labCubeRootTable, trunc(Y * 127.998046875f), Y), {up - un, vp - vn}};
    }

    template <class F32> PYXCC_INLINE auto end(const BegunLuv<F32>& begun) const
    {
        const auto& [Y, start, chroma] = begun;
        const F32 L = whereLess(F32(luvLimit), Y, fused(powerOfAThird(start, Y), F32(116.0f), F32(-16.0f)), Y * 903.3f);
        const F32 full = 255.0f, scale = L * 13.0f;
        const F32 u = fused(chroma.u, scale, F32(134.0f)), v = fused(chroma.v, scale, F32(140.0f));
        return Three{trunc((full * L) / F32(100.0f)), trunc((full * u) / F32(354.0f) + 0.5f),
                     trunc((v * full) / F32(262.0f) + 0.5f)};
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        return end(begin(R, G, B));
    }
};

} // namespace pyxcc::perceptual
