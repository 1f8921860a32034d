// RGB to CIE L*a*b* and back. Columns in whole blocks go by fused sums, and those behind them by plain ones; which is
// the one and which the other shows in the last bit.
#pragma once

#include "frame/two_steps.hpp"
#include "perceptual/cube_root.hpp"
#include "perceptual/root_lines.hpp"
#include "perceptual/smooth_root.hpp"
#include "perceptual/xyz_of_rgb.hpp"

namespace pyxcc::perceptual
{

inline constexpr f32 labLimit = 0.008856f; ///< below it the cube root and L are lines
inline constexpr f32 labRowsToOne = 127.998046875f;

/// What the models of floats have of the series.
inline constexpr LastTerms labLastTermsOfFloats = {0.019001169f, 0.015834307f};
inline constexpr LastTerms labLastTermsOfWords = {0.0190012f, 0.0158343f};

template <class F32> PYXCC_INLINE auto labRow(const F32& v) { return trunc(v * labRowsToOne); }

// What differs by depth: how samples come to the white point, the cube root, and what is stored of L, a and b in blocks
// (with fused sums) and behind them. `a` and `b` come as the differences that they are multiples of.

struct LabOfFloats {
    static constexpr Weights white = {1.0521265f, 1.0f, 0.91848117f};

    template <class F32> static PYXCC_INLINE auto start(const F32& v)
    {
        return rootStart(labCubeRootTable, labRow(v), v);
    }
    template <class F32> static PYXCC_INLINE F32 root(const RootStart<F32>& start)
    {
        return rootByEightTerms(start, labLastTermsOfFloats);
    }
    template <class Sums, class F32> static PYXCC_INLINE Three<F32> stored(const F32& L, const F32& a, const F32& b)
    {
        return {L, a * 500.0f, b * 200.0f};
    }
};

struct LabOfBytes {
    static constexpr Weights white = {0.0041259914f, 0.003921569f, 0.0036018905f};

    template <class F32> static PYXCC_INLINE auto start(const F32& v)
    {
        return rootStartWithin(labCubeRootTable, labRow(v), v);
    }
    template <class F32> static PYXCC_INLINE F32 root(const RootStart<F32>& start) { return rootByFourTerms(start); }

    template <class Sums, class F32> static PYXCC_INLINE auto stored(const F32& L, const F32& a, const F32& b)
    {
        return Three{nearest(L * 2.55f), nearest(Sums::productAndSum(a, F32(500.0f), F32(128.0f))),
                     nearest(Sums::productAndSum(b, F32(200.0f), F32(128.0f)))};
    }
    static constexpr int lowBits = 0xff;
};

struct LabOfWords {
    static constexpr Weights white = LabOfBytes::white;

    template <class F32> static PYXCC_INLINE auto start(const F32& v)
    {
        return rootStartWithin(labCubeRootTable, labRow(v), v);
    }
    template <class F32> static PYXCC_INLINE F32 root(const RootStart<F32>& start)
    {
        return rootByEightTerms(start, labLastTermsOfWords);
    }
    template <class Sums, class F32> static PYXCC_INLINE auto stored(const F32& L, const F32& a, const F32& b)
    {
        return Three{nearest(L * 655.35f), nearest(Sums::productAndSum(a, F32(500.0f), F32(128.0f)) * 255.0f),
                     nearest(Sums::productAndSum(b, F32(200.0f), F32(128.0f)) * 255.0f)};
    }
    static constexpr int lowBits = 0xffff;
};

template <class Depth, class Sums> struct RgbToLab : frame::OnFloats {
    static constexpr bool inTwoSteps = true;

    template <class F32> struct Begun {
        Three<F32> xyz;
        Three<RootStart<F32>> start;
    };

    template <class F32> PYXCC_INLINE Begun<F32> begin(const F32& R, const F32& G, const F32& B) const
    {
        const auto [x, y, z] = overWhite(R, G, B);
        return {{x, y, z}, {Depth::start(x), Depth::start(y), Depth::start(z)}};
    }

    template <class F32> static PYXCC_INLINE Three<F32> overWhite(const F32& R, const F32& G, const F32& B)
    {
        const auto [X, Y, Z] = multiplied<Sums>(xyzOfRgb, R, G, B);
        return {X * Depth::white.a, Y * Depth::white.b, Z * Depth::white.c};
    }

    template <class F32> PYXCC_INLINE auto end(const Begun<F32>& begun) const
    {
        const auto& [x, y, z] = begun.xyz;
        Three<F32> f = {Depth::root(begun.start.a), Depth::root(begun.start.b), Depth::root(begun.start.c)};
        F32 L = Sums::productAndSum(f.b, F32(116.0f), F32(-16.0f));
        // Most blocks have nothing so dark, and are spared the choices.
        if (anyAtMost(lesser(lesser(x, y), z), F32(labLimit))) {
            L = whereAtMost(y, F32(labLimit), y * 903.3f, L);
            f = {rootOrLine(x, f.a), rootOrLine(y, f.b), rootOrLine(z, f.c)};
        }
        return Depth::template stored<Sums>(L, f.a - f.b, f.b - f.c);
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        return end(begin(R, G, B));
    }

private:
    template <class F32> static PYXCC_INLINE F32 rootOrLine(const F32& v, const F32& root)
    {
        return whereAtMost(v, F32(labLimit), fused(v, F32(7.787f), F32(0.13793103f)), root);
    }
};

/// Blocks of bytes. Smooth roots of x and y, and lines for z, which is dark most often, tell L, a and b to less than a
/// thousandth of a level. A block that has one nearer to the middle of two levels, or a dark x or y, takes the roots
/// that count. To the nearest only: other modes lead elsewhere.
struct RgbToLabOfBytes : frame::OnFloats {
    bool toNearest = scalar::roundsToNearest();

    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        static constexpr Weights white = LabOfBytes::white;
        static constexpr WeightsAndMore kx = scaledWeights(xOfRgb, white.a), ky = scaledWeights(yOfRgb, white.b),
                                        kz = raisedWeights(zOfRgb, white.c);
        const F32 x = weighted(kx, R, G, B), y = weighted(ky, R, G, B), z = weighted(kz, R, G, B);
        const F32 fx = smoothRoot(x), fy = smoothRoot(y), fz = lookUp(labRootLines, z);
        constexpr f32 whiteL = 116 * 2.55f * oneLevel, blackL = -16 * 2.55f * oneLevel + aboveLevel;
        constexpr f32 a500 = 500 * oneLevel, b200 = 200 * oneLevel, gray = 128 * oneLevel + aboveLevel;
        const Three lab = {fineLevel(nearest(fused(fy, F32(whiteL), F32(blackL)))),
                           fineLevel(nearest(fused(fx - fy, F32(a500), F32(gray)))),
                           fineLevel(nearest(fused(fy - fz, F32(b200), F32(gray))))};
        if (toNearest && !isInDoubt(lab) && !anyAtMost(lesser(x, y), F32(smoothRootsFrom))) return lab;
        return fineLevels(RgbToLab<LabOfBytes, FusedSums>{}(R, G, B));
    }
};

/// The same with what does not fit the sample cut off instead of clamped.
template <class Depth> struct RgbToLabCut : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& R, const F32& G, const F32& B) const
    {
        const auto [L, a, b] = RgbToLab<Depth, PlainSums>{}(R, G, B);
        return Three{L & Depth::lowBits, a & Depth::lowBits, b & Depth::lowBits};
    }
};

// The other way round: fy and the chroma of samples, the white point, and what is stored.

struct OfLabFloats {
    static constexpr Weights white = {0.950456f, 1.0f, 1.0887539f};

    template <class Sums, class F32> static PYXCC_INLINE Three<F32> taken(const F32& L, const F32& a, const F32& b)
    {
        return {(L + 16.0f) * 0.00862069f, a, b};
    }
    template <class F32> static PYXCC_INLINE F32 stored(const F32& x) { return x; }
};

struct OfLabBytes {
    static constexpr Weights white = {242.366f, 255.0f, 277.632f};

    template <class Sums, class F32> static PYXCC_INLINE Three<F32> taken(const F32& L, const F32& a, const F32& b)
    {
        return {(L * 0.39215687f + 16.0f) * 0.00862069f, a - 128.0f, b - 128.0f};
    }
    template <class F32> static PYXCC_INLINE auto stored(const F32& x) { return nearest(x); }
};

struct OfLabWords {
    static constexpr Weights white = OfLabBytes::white;

    template <class Sums, class F32> static PYXCC_INLINE Three<F32> taken(const F32& L, const F32& a, const F32& b)
    {
        return {Sums::productAndSum(L, F32(0.0015259022f), F32(16.0f)) * 0.00862069f,
                Sums::productAndSum(a, F32(0.003921569f), F32(-128.0f)),
                Sums::productAndSum(b, F32(0.003921569f), F32(-128.0f))};
    }
    template <class F32> static PYXCC_INLINE auto stored(const F32& x) { return nearest(x); }
};

/// The cube holds for dark samples too, where the way to Lab has a line.
template <class Depth, class Sums> struct LabToRgb : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& L, const F32& a, const F32& b) const
    {
        const auto [fy, A, Bb] = Depth::template taken<Sums>(L, a, b);
        const F32 fx = Sums::productAndSum(A, F32(0.002f), fy), fz = Sums::productAndSum(-Bb, F32(0.005f), fy);
        const auto [R, G, B] =
            multiplied<Sums>(rgbOfXyz, cube(fx) * Depth::white.a, cube(fy) * Depth::white.b, cube(fz) * Depth::white.c);
        return Three{Depth::stored(R), Depth::stored(G), Depth::stored(B)};
    }

private:
    template <class F32> static PYXCC_INLINE F32 cube(const F32& x) { return (x * x) * x; }
};

/// Blue first, for layouts that have no order of their own.
template <class Depth, class Sums> struct LabToBgr : frame::OnFloats {
    template <class F32> PYXCC_INLINE auto operator()(const F32& L, const F32& a, const F32& b) const
    {
        const auto [R, G, B] = LabToRgb<Depth, Sums>{}(L, a, b);
        return Three{B, G, R};
    }
};

/// Blocks of sixteen pixels, two registers a channel.
template <std::derived_from<frame::OnFloats> Form>
PYXCC_INLINE auto apply(const Form& form, const Two<Three<wide::F32>>& pixels)
{
    const auto& [x, y] = pixels;
    return Two{form(x.a, x.b, x.c), form(y.a, y.b, y.c)};
}

} // namespace pyxcc::perceptual
