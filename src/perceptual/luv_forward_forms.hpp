// RGB to CIE L*u*v*. The conversions are kin, not copies: they differ in the terms of the cube root, in the reciprocal,
// in what is tested for black, and in how results become integers.
#pragma once

#include "frame/two_steps.hpp"
#include "perceptual/cube_root.hpp"
#include "perceptual/reciprocals.hpp"
#include "perceptual/root_lines.hpp"
#include "perceptual/xyz_of_rgb.hpp"

namespace pyxcc::perceptual
{

inline constexpr f32 luvLimit = 0.008856f;           ///< L is a line below it
inline constexpr f32 un = 0.197839f, vn = 0.468342f; ///< chroma of white

/// What floats have of the series.
inline constexpr LastTerms luvLastTerms = {0.01900117f, 0.015834307f};

/// u and v over 13 L.
template <class F32> struct LuvChroma {
    F32 u, v;
};

/// A first step: Y, where its root starts from, and chroma.
template <class F32> struct BegunLuv {
    F32 Y;
    RootStart<F32> start;
    LuvChroma<F32> chroma;
};

template <class F32> PYXCC_INLINE F32 luvDenominator(const F32& X, const F32& Y, const F32& Z)
{
    return fused(Y, F32(15.0f), fused(F32(3.0f), Z, X));
}

inline constexpr Weights luvDenominatorOfRgb = {xOfRgb.a + 15 * yOfRgb.a + 3 * zOfRgb.a,
                                                xOfRgb.b + 15 * yOfRgb.b + 3 * zOfRgb.b,
                                                xOfRgb.c + 15 * yOfRgb.c + 3 * zOfRgb.c};

template <class F32> PYXCC_INLINE LuvChroma<F32> luvChroma(const F32& X, const F32& Y, const F32& denominator)
{
    const F32 e = refinedByFused(denominator);
    return {fused(e, X * 4.0f, F32(-un)), fused(Y * 9.0f, e, F32(-vn))};
}

/// In blocks: black has a denominator of 3.
template <class F32> PYXCC_INLINE LuvChroma<F32> luvChromaInBlocks(const F32& X, const F32& Y, const F32& Z)
{
    const F32 D = luvDenominator(X, Y, Z);
    return luvChroma(X, Y, whereEqual(D, F32(0.0f), D + 3.0f, D));
}

/// In blocks of integer samples: of black the denominator may be anything but 0, as X and Y are 0, and of nothing else
/// is it below a hundredth.
template <class F32> PYXCC_INLINE LuvChroma<F32> luvChromaOfSamples(const F32& X, const F32& Y, const F32& Z)
{
    return luvChroma(X, Y, greater(luvDenominator(X, Y, Z), F32(0.001f)));
}

/// Behind them: black is where Z is 0.
template <class F32>
PYXCC_INLINE LuvChroma<F32> luvChromaBehindBlocks(const F32& X, const F32& Y, const F32& Z, const F32& D)
{
    const F32 w = refined(D), zero = 0.0f;
    const F32 up = whereEqual(Z, zero, zero, (X * 4.0f) * w), vp = whereEqual(Z, zero, zero, (Y * 9.0f) * w);
    return {up - un, vp - vn};
}

/// L in blocks, where it is a line up to a limit of Y: most blocks have nothing so dark, and are spared the choice.
template <class F32>
PYXCC_INLINE F32 lightnessInBlocks(const F32& Y, const F32& limit, const F32& onLine, const F32& onCurve)
{
    return anyAtMost(Y, limit) ? whereAtMost(Y, limit, onLine, onCurve) : onCurve;
}

/// Floats. The rows of the table up to 1 are counted as 128, or as a little less.
struct RgbToLuvOfFloats : frame::OnFloats {
    static constexpr bool inTwoSteps = true;
    f32 rowsToOne;

    constexpr explicit RgbToLuvOfFloats(f32 rows) : rowsToOne(rows) {}

    template <class F32> PYXCC_INLINE BegunLuv<F32> begin(const F32& R, const F32& G, const F32& B) const
    {
        const auto [X, Y, Z] = multiplied<FusedSums>(xyzOfRgb, R, G, B);
        return {Y, rootStart(luvCubeRootTable, trunc(Y * rowsToOne), Y), luvChromaInBlocks(X, Y, Z)};
    }

    template <class F32> PYXCC_INLINE Three<F32> end(const BegunLuv<F32>& begun) const
    {
        const auto& [Y, start, chroma] = begun;
        const F32 root = rootByEightTerms(start, luvLastTerms);
        const F32 L = lightnessInBlocks(Y, F32(luvLimit), Y * 903.3f, fused(F32(116.0f), root, F32(-16.0f)));
        const F32 scale = L * 13.0f;
        return {L, chroma.u * scale, scale * chroma.v};
    }

    template <class F32> PYXCC_INLINE Three<F32> operator()(const F32& R, const F32& G, const F32& B) const
    {
        return end(begin(R, G, B));
    }
};

struct RgbToLuvOfFloatsTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE Three<F32> operator()(const F32& R, const F32& G, const F32& B) const
    {
        const auto [X, Y, Z] = multiplied<PlainSums>(xyzOfRgb, R, G, B);
        const F32 root = rootByPlainTerms<8>(plainRootStart(luvCubeRootTable, trunc(Y * 128.0f), Y), luvLastTerms);
        const F32 L = whereAtMost(Y, F32(luvLimit), Y * 903.3f, root * 116.0f - 16.0f);
        const F32 D = fused(Z, F32(3.0f), fused(Y, F32(15.0f), X));
        const LuvChroma<F32> chroma = luvChromaBehindBlocks(X, Y, Z, D);
        const F32 scale = L * 13.0f;
        return {L, chroma.u * scale, chroma.v * scale};
    }
};

struct RgbToLuvOfBytesByRoots : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        const f32 unit = 0.003921569f;
        const auto [X, Y, Z] = multiplied<FusedSums>(xyzOfRgb, R * unit, G * unit, B * unit);
        const F32 root = rootByFourTerms(rootStartWithin(labCubeRootTable, trunc(Y * 127.998046875f), Y));
        const F32 L = lightnessInBlocks(Y, F32(luvLimit), Y * 903.3f, fused(F32(116.0f), root, F32(-16.0f)));
        const LuvChroma<F32> chroma = luvChromaOfSamples(X, Y, Z);
        const F32 scale = L * 13.0f;
        return Three{nearest(L * 2.55f), nearest(fused(chroma.u, scale, F32(134.0f)) * 0.720339f),
                     nearest(fused(scale, chroma.v, F32(140.0f)) * 0.9732825f)};
    }
};

/// Blocks of bytes. A line for L, and a reciprocal in levels of v, tell L, u and v to less than a thousandth of a
/// level; a block that has one nearer to the middle of two levels goes by roots. To the nearest only: other modes lead
/// elsewhere.
struct RgbToLuvOfBytes : frame::OnFloats {
    bool toNearest = scalar::roundsToNearest();

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        constexpr f64 unit = 0.003921569f, L1 = 2.55f * oneLevel, u1 = 0.720339f * oneLevel, v1 = 0.9732825f * oneLevel;
        // y is raised, the denominator D such that (y - black) / D is 9 Y over it in levels of v, and x to match. Black
        // is divided by something else than 0.
        constexpr f64 ofD = unit * raisedScale / (9 * 13 * v1), ofX = 4 * 13 * u1 * ofD;
        static constexpr WeightsAndMore kx = scaledWeights(xOfRgb, ofX), ky = raisedWeights(yOfRgb, unit),
                                        kd = scaledWeights(luvDenominatorOfRgb, ofD, 1e-30f);
        const F32 x = weighted(kx, R, G, B), y = weighted(ky, R, G, B), e = refinedByFused(weighted(kd, R, G, B));
        constexpr auto whiteU = static_cast<f32>(-un * 13 * u1), whiteV = static_cast<f32>(-vn * 13 * v1);
        const F32 L = lookUp(lightnessLines, y);
        const F32 u = fused(x, e, F32(whiteU)), v = fused(y - ky.more, e, F32(whiteV));
        constexpr f32 levelsOfL = L1, grayU = 134 * u1 + aboveLevel, grayV = 140 * v1 + aboveLevel;
        const Three luv = {fineLevel(nearest(fused(L, F32(levelsOfL), F32(aboveLevel)))),
                           fineLevel(nearest(fused(u, L, F32(grayU)))), fineLevel(nearest(fused(v, L, F32(grayV))))};
        if (toNearest && !isInDoubt(luv)) return luv;
        return fineLevels(RgbToLuvOfBytesByRoots{}(R, G, B));
    }
};

// Words stay at their scale up to the cube root, which only L needs.

inline constexpr f32 wordUnit = 1.5259022e-5f, luvLimitOfWords = 580.378f;

template <class F32> PYXCC_INLINE Three<F32> scaledToWords(const F32& L, const F32& u, const F32& v)
{
    return {L * 655.35f, (u + 134.0f) * 185.12712f, (v + 140.0f) * 250.13359f};
}

struct RgbToLuvOfWords : frame::OnFloats {
    static constexpr bool inTwoSteps = true;

    template <class F32> PYXCC_INLINE BegunLuv<F32> begin(const F32& R, const F32& G, const F32& B) const
    {
        const auto [X, Y, Z] = multiplied<FusedSums>(xyzOfRgb, R, G, B);
        return {Y, rootStartWithin(luvCubeRootTable, trunc(Y) >> 9, Y * wordUnit), luvChromaOfSamples(X, Y, Z)};
    }

    template <class F32> PYXCC_INLINE auto end(const BegunLuv<F32>& begun) const
    {
        const auto& [Y, start, chroma] = begun;
        const F32 y = Y * wordUnit, root = rootBySixTerms(start);
        const F32 L = lightnessInBlocks(Y, F32(luvLimitOfWords), y * 903.3f, root * 116.0f - 16.0f);
        const F32 scale = L * 13.0f;
        const auto [l, u, v] = scaledToWords(L, chroma.u * scale, scale * chroma.v);
        return Three{nearest(l), nearest(u), nearest(v)};
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        return end(begin(R, G, B));
    }
};

struct NearestOfLuv {
    template <class F32> static PYXCC_INLINE auto stored(const Three<F32>& x)
    {
        return Three{nearest(x.a), nearest(x.b), nearest(x.c)};
    }
};

/// Chroma to the nearest, halves up; L down.
struct TruncOfLuv {
    template <class F32> static PYXCC_INLINE auto stored(const Three<F32>& x)
    {
        return Three{trunc(x.a), trunc(x.b + 0.5f), trunc(x.c + 0.5f)};
    }
};

template <class Rounding> struct RgbToLuvOfWordsTail : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        const auto [X, Y, Z] = multiplied<PlainSums>(xyzOfRgb, R, G, B);
        const F32 y = Y * wordUnit;
        const F32 root = rootByPlainTerms<6>(plainRootStart(luvCubeRootTable, trunc(Y) >> 9, y), {});
        const F32 L = whereAtMost(Y, F32(luvLimitOfWords), y * 903.3f, root * 116.0f - 16.0f);
        const F32 D = (X + Y * 15.0f) + Z * 3.0f;
        const LuvChroma<F32> chroma = luvChromaBehindBlocks(X, Y, Z, D);
        const F32 scale = L * 13.0f;
        return Rounding::stored(scaledToWords(L, chroma.u * scale, chroma.v * scale));
    }
};

} // namespace pyxcc::perceptual
