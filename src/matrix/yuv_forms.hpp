// The 8-bit forms of RGB and YUV, full range: forward R, G, B give Y, U, V, inverse Y, U, V give R, G, B. U and V are
// differences to luma, U = 0.492 (B - Y) + 128 and V = 0.877 (R - Y) + 128.
//
// As everywhere, forms that are near to each other are not the same.
#pragma once

#include "matrix/forward_forms.hpp"
#include "matrix/inverse_forms.hpp"

namespace pyxcc::matrix
{

inline constexpr Weights yuvLuma{19595, 38470, 7471};
inline constexpr Weights yuvLumaLess{19595, 38469, 7471};
inline constexpr ChromaWeights yuvChroma{{-4816, -9469, 14286}, {20152, -16875, -3276}};

/// Of B - Y in U and of R - Y in V.
struct DifferenceWeights {
    int u, v;
};

inline constexpr DifferenceWeights yuvDifferences{32244, 57475};

/// Chroma of the differences B - Y and R - Y, in sums over the pixels that share it: a difference is truncated to a
/// whole number before it is scaled. Luma's weights are in 1 << Unit parts; `Addends` go to the differences, and
/// `Shift` takes the pixels of a sum into account.
template <Weights luma, int Unit, Two<int> Addends, DifferenceWeights k, int Shift> struct ChromaOfDifferences {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        constexpr int whole = 1 << Unit;
        const auto u = exactSum<Unit, Addends.a, -luma.r, -luma.g, whole - luma.b>(R, G, B);
        const auto v = exactSum<Unit, Addends.b, whole - luma.r, -luma.g, -luma.b>(R, G, B);
        // U keeps within 16 to 240; V is beyond a byte for reds and their opposites.
        return Two{sat8(scaledDown<Shift, k.u>(u) + 128), sat8(scaledDown<Shift, k.v>(v) + 128)};
    }
};

using YuvLumaNearest = LumaExact<yuvLuma, 32768>;
using YuvLumaFloor = LumaExact<yuvLuma, 0>;

/// Luma rounds, and the differences do as well; or luma is truncated, and the differences to it round almost so.
using YuvFwdExactA =
    FullResolution<YuvLumaNearest, ChromaOfDifferences<yuvLuma, 16, Two{32768, 32768}, yuvDifferences, 16>>;
using YuvFwdExactB =
    FullResolution<YuvLumaFloor, ChromaOfDifferences<yuvLuma, 16, Two{32767, 32767}, yuvDifferences, 16>>;

/// Sums of R, G and B, truncated. The weight of green is one less than luma's.
struct YuvChromaFloor {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        constexpr Weights u = yuvChroma.cb, v = yuvChroma.cr;
        return Two{sat8(exactSum<15, 128 << 15, u.r, u.g, u.b>(R, G, B)),
                   sat8(exactSum<15, 128 << 15, v.r, v.g, v.b>(R, G, B))};
    }
};
using YuvFwdExactC = FullResolution<LumaExact<yuvLumaLess, 0>, YuvChromaFloor>;

/// Luma in 256ths of a step and chroma in 64ths, nothing for rounding.
using YuvFwdHigh = FullResolution<LumaHigh<yuvLumaLess, 0, 8>, ChromaHighSigned<yuvChroma, 128, 128 << 6, 6>>;

/// Luma in halves of a step, with one of them for rounding, which the differences take along.
struct YuvFwdPlanar : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto y = mulHighS16(R << 2, 9798) + mulHighS16(B << 2, 3736) + mulHighS16(G << 2, 19235) + 1;
        return Three{sat8(y >> 1), sat8(mulHighS16((B << 1) - y, 16121) + 128),
                     sat8(mulHighS16((R << 1) - y, 28737) + 128)};
    }
};

inline constexpr HighWeights yuvInverse{74711, -25821, -38076, 133169};
inline constexpr HighWeights yuvInverseLess{74710, -25820, -38075, 133168};
template <HighWeights k, int ToR, int ToG, int ToB>
using YuvInvExact = InvFullRange<ChromaExactly<k, Three{ToR, ToG, ToB}>, 0, 0>;

using YuvInvExactA = YuvInvExact<yuvInverse, 32768, 0, 32768>; // rounds but in G
using YuvInvExactB = YuvInvExact<yuvInverseLess, 0, 0, 0>;     // truncates
using YuvInvExactC = YuvInvExact<yuvInverse, 32768, 32768, 32768>;
using YuvInvExactD = YuvInvExact<yuvInverse, 0, 0, 0>;

/// In whole steps, halves, eighths and sixteenths.
using YuvInvHigh3 = InvFullRange<ChromaAdded<HighWeights{9339, -3228, -4760, 16646}, 3>, 0, 0>;
using YuvInvHigh4 = InvFullRange<ChromaAdded<HighWeights{9338, -3227, -4759, 16645}, 4>, 0, 1>;
using YuvInvHigh4x = InvFullRange<ChromaAdded<HighWeights{9339, -3228, -4760, 16646}, 4>, 0, 1>;
using YuvInvHigh7 = InvFullRange<ChromaTakenOff<HighWeights{4669, 1614, 2380, 8323}>, 4, 3>;
using YuvInvHigh8 = InvFullRange<ChromaTakenOff<HighWeights{9338, 3227, 4759, 16646}>, 8, 4>;

inline constexpr YuvFwdExactA yuvFwdExactA;
inline constexpr YuvFwdExactB yuvFwdExactB;
inline constexpr YuvFwdExactC yuvFwdExactC;
inline constexpr YuvFwdHigh yuvFwdHigh;
inline constexpr YuvFwdPlanar yuvFwdPlanar;
inline constexpr YuvInvExactA yuvInvExactA;
inline constexpr YuvInvExactB yuvInvExactB;
inline constexpr YuvInvExactC yuvInvExactC;
inline constexpr YuvInvExactD yuvInvExactD;
inline constexpr YuvInvHigh3 yuvInvHigh3;
inline constexpr YuvInvHigh4 yuvInvHigh4;
inline constexpr YuvInvHigh4x yuvInvHigh4x;
inline constexpr YuvInvHigh7 yuvInvHigh7;
inline constexpr YuvInvHigh8 yuvInvHigh8;

} // namespace pyxcc::matrix
