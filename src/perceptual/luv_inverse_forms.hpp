// CIE L*u*v* to RGB. In blocks the conversions multiply by approximate reciprocals, refined or not; behind them, and in
// pixels of four floats, they divide.
#pragma once

#include "perceptual/hue_scale.hpp"
#include "perceptual/luv_forward_forms.hpp"

namespace pyxcc::perceptual
{

inline constexpr f32 blackLuv = 9e-5f;        ///< what has an L below it is black
inline constexpr f32 luvLineEnd = 7.9996247f; ///< Y is a line in L below it
inline constexpr f32 nearZeroChroma = 1.1920929e-5f;

template <class F32> PYXCC_INLINE F32 cubed(const F32& f) { return f * (f * f); }

template <class F32> PYXCC_INLINE Three<F32> whereVisible(const F32& L, const Three<F32>& rgb)
{
    const F32 black = blackLuv;
    return {zeroWhereLess(L, black, rgb.a), zeroWhereLess(L, black, rgb.b), zeroWhereLess(L, black, rgb.c)};
}

/// v' is kept off zero, which it is divided by.
template <class F32> PYXCC_INLINE F32 offZero(const F32& v)
{
    return v + whereAtMost(magnitude(v), F32(nearZeroChroma), F32(blackLuv), F32(0.0f));
}

/// In blocks, with refined reciprocals. fL is the root of Y by L.
template <class F32> PYXCC_INLINE Three<F32> luvToRgbInBlocks(const F32& L, const F32& fL, const F32& u, const F32& v)
{
    const F32 Y = whereLess(L, F32(luvLineEnd), L * 0.001107052f, cubed(fL));
    const F32 q = L * 13.0f, rq = refinedByFused(q);
    const F32 uu = fused(rq, u, F32(un)), vv = offZero(fused(rq, v, F32(vn)));
    const F32 x = rcp(vv), e = fused(x, vv, F32(-1.0f));
    const F32 d = fused(-x, e, x) * Y;
    const F32 w = fused(x, fused(F32(3.0f), e, F32(-3.0f)), F32(5.0f));
    const F32 X = (d * 2.25f) * uu;
    const F32 Z = fused(-X, F32(0.33333334f), -(w * Y));
    return multiplied<FusedSums>(rgbOfXyz, X, Y, Z);
}

/// A NaN stays one.
template <class F32> PYXCC_INLINE F32 between0And1(const F32& x) { return greater(F32(0.0f), lesser(F32(1.0f), x)); }
template <class F32> PYXCC_INLINE Three<F32> between0And1(const Three<F32>& x)
{
    return {between0And1(x.a), between0And1(x.b), between0And1(x.c)};
}

struct LuvToRgbOfFloats : frame::OnFloats {
    template <class F32> PYXCC_INLINE Three<F32> operator()(const F32& L, const F32& u, const F32& v) const
    {
        return whereVisible(L, between0And1(luvToRgbInBlocks(L, (L + 16.0f) * 0.00862069f, u, v)));
    }
};

/// All divisions are true ones.
struct LuvToRgbOfFloatsTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE Three<F32> operator()(const F32& L, const F32& u, const F32& v) const
    {
        const F32 f = (L + 16.0f) / F32(116.0f);
        const F32 Y = whereLess(L, F32(luvLineEnd), L / F32(903.3f), (f * f) * f);
        const F32 q = L * 13.0f;
        const F32 vv = v / q + vn, uu = u / q + un;
        const F32 d = Y / whereLess(magnitude(vv), F32(1.1920929e-7f), vv + blackLuv, vv);
        const F32 X = (uu * 2.25f) * d;
        const F32 Z = fused(F32(3.0f), d, -fused(Y, F32(5.0f), X / F32(3.0f)));
        const F32 R = fused(-Z, F32(0.498535f), fused(X, F32(3.240479f), -(Y * 1.53715f)));
        const F32 G = fused(Z, F32(0.041556f), fused(Y, F32(1.875991f), X * -0.969256f));
        const F32 B = fused(Z, F32(1.057311f), fused(X, F32(0.055648f), -(Y * 0.204043f)));
        return whereVisible(L, between0And1(Three{R, G, B}));
    }
};

// Integer samples in blocks.

struct RawReciprocal {
    template <class F32> PYXCC_INLINE F32 operator()(const F32& v) const { return rcp(v); }
};
struct RefinedReciprocal {
    template <class F32> PYXCC_INLINE F32 operator()(const F32& v) const { return refinedByFused(v); }
};

/// Three channels take the reciprocals as they come and round to nearest, four refine them and are cut. Of black, L is
/// 0, and so is Y with all that comes of it: its u and v, which may be divided by anything else, do not show. 13 L of
/// other bytes is above 5. The reciprocals are what there is to wait for.
template <class Reciprocal, class Conversion> struct LuvToRgbOfBytes : frame::OnFloats {
    static constexpr bool inTwoSteps = true;

    /// uu, Y, and 1 over vv.
    template <class F32> struct Begun {
        F32 uu, Y, x;
    };

    template <class F32> PYXCC_INLINE Begun<F32> begin(const F32& L, const F32& U, const F32& V) const
    {
        constexpr Reciprocal reciprocal;
        const F32 Lp = L * 0.39215687f, f = fused(F32(0.39215687f), L, F32(16.0f)) * 0.00862069f;
        const F32 us = fused(F32(1.3882353f), U, F32(-134.0f)), vs = fused(V, F32(1.027451f), F32(-140.0f));
        const F32 rq = reciprocal(greater(Lp * 13.0f, F32(1.0f)));
        const F32 uu = fused(rq, us, F32(un)), x = reciprocal(offZero(fused(vs, rq, F32(vn))));
        return {uu, whereLess(Lp, F32(luvLineEnd), Lp * 0.001107052f, cubed(f)), x};
    }

    template <class F32> PYXCC_INLINE auto end(const Begun<F32>& begun) const
    {
        constexpr Conversion conversion;
        const auto& [uu, Y, x] = begun;
        const F32 w = fused(F32(3.0f), x, F32(-5.0f));
        const F32 X = uu * ((x * Y) * 2.25f);
        const F32 Z = fused(-X, F32(0.33333334f), w * Y);
        const auto [R, G, B] = multiplied<FusedSums>(rgbOfXyz, X, Y, Z);
        return Three{conversion(R * 255.0f), conversion(G * 255.0f), conversion(B * 255.0f)};
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& L, const F32& U, const F32& V) const
    {
        return end(begin(L, U, V));
    }
};

using LuvToRgbOfBytesC3 = LuvToRgbOfBytes<RawReciprocal, Nearest>;
using LuvToRgbOfBytesAC4 = LuvToRgbOfBytes<RefinedReciprocal, Truncated>;

struct LuvToRgbOfWords : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& L, const F32& U, const F32& V) const
    {
        const F32 Ls = L * 0.0015259022f, f = fused(L, F32(0.0015259022f), F32(16.0f)) * 0.00862069f;
        const F32 us = U * 0.0054016938f - 134.0f, vs = V * 0.0039978637f - 140.0f;
        const auto [R, G, B] = luvToRgbInBlocks(Ls, f, us, vs);
        const auto [r, g, b] = whereVisible(Ls, Three<F32>{R * 65535.0f, G * 65535.0f, B * 65535.0f});
        return Three{trunc(r), trunc(g), trunc(b)};
    }
};

/// Integer samples behind blocks: Y, and with it the colours, are in steps of a sample, and half a step is added.
template <int Full> struct LuvToRgbTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& l, const F32& U, const F32& V) const
    {
        const F32 full = static_cast<f32>(Full);
        const F32 L = (l * 100.0f) / full, u = (U * 354.0f) / full - 134.0f, v = (V * 262.0f) / full - 140.0f;
        const F32 f = (L + 16.0f) / F32(116.0f);
        const F32 Y = whereLess(L, F32(luvLineEnd), L / F32(903.3f), (f * f) * f) * full;
        const F32 q = L * 13.0f;
        const F32 vv = v / q + 0.4683422f, uu = u / q + 0.19783941f;
        const F32 d = Y / whereLess(magnitude(vv), F32(nearZeroChroma), vv + blackLuv, vv);
        const F32 X = (uu * 2.25f) * d;
        const F32 Z = fused(F32(3.0f), d, -fused(Y, F32(5.0f), X / F32(3.0f)));
        const F32 half = 0.5f;
        const F32 R = fused(-Z, F32(0.498535f), fused(X, F32(3.240479f), half - Y * 1.53715f));
        const F32 G = fused(Z, F32(0.041556f), fused(Y, F32(1.875991f), half + X * -0.969256f));
        const F32 b = fused(X, F32(0.055648f), -(Y * 0.204043f));
        const auto [r, g, ofXY] = whereVisible(L, Three<F32>{R, G, b});
        const F32 ofZ = zeroWhereLess(L, F32(blackLuv), Z);
        const auto B = fused(toF64(ofZ), doublesBeside(Z, 1.057311), toF64(ofXY)) + doublesBeside(Z, 0.5);
        return Three{trunc(r), trunc(g), trunc(B)};
    }
};

} // namespace pyxcc::perceptual
