// Exports as rows of a table:
//
//     REPACK(name, source layout and how its planes are taken, rule, target layout and likewise, smallest size)
//
// A layout gives the parameters of a signature and, by overloads, their tests and the image.
#pragma once

#include "subsampled/repack.hpp"

#include <limits>

#define REPACK_SOURCE_P3 const u8 *const src[3], const int srcStep[3]
#define REPACK_SOURCE_P2 const u8 *srcY, int srcYStep, const u8 *srcCbCr, int srcCbCrStep
#define REPACK_SOURCE_C2 const u8 *src, int srcStep
#define REPACK_TARGET_P3 u8 *const dst[3], const int dstStep[3]
#define REPACK_TARGET_P2 u8 *dstY, int dstYStep, u8 *dstCbCr, int dstCbCrStep
#define REPACK_TARGET_C2 u8 *dst, int dstStep

#define REPACK_FROM_P3 src, srcStep
#define REPACK_FROM_P2 srcY, srcYStep, srcCbCr, srcCbCrStep
#define REPACK_FROM_C2 src, srcStep
#define REPACK_TO_P3 dst, dstStep
#define REPACK_TO_P2 dstY, dstYStep, dstCbCr, dstCbCrStep
#define REPACK_TO_C2 dst, dstStep

#define REPACK(name, sourceLayout, sourcePlanes, Rule, targetLayout, targetPlanes, least)                              \
    PyxStatus PYXCC_CALL name(REPACK_SOURCE_##sourceLayout, REPACK_TARGET_##targetLayout, RoiSize roi)                 \
    {                                                                                                                  \
        const PyxStatus failure =                                                                                      \
            firstFailure(given(REPACK_FROM_##sourceLayout), given(REPACK_TO_##targetLayout), (least)(roi));            \
        if (failure) return failure;                                                                                   \
        return repack<Rule>(roi, (sourcePlanes)(REPACK_FROM_##sourceLayout),                                           \
                            (targetPlanes)(REPACK_TO_##targetLayout));                                                 \
    }

namespace pyxcc::subsampled
{

// No pointer is null: P3, P2, C2.

template <class Byte> auto given(Byte* const planes[3], const int*)
{
    return
        [=]() -> PyxStatus { return frame::firstFailure(frame::notNull(planes), frame::elementsNotNull<3>(planes)); };
}
template <class Byte> auto given(Byte* luma, int, Byte* pairs, int) { return frame::notNull(luma, pairs); }
template <class Byte> auto given(Byte* pixels, int) { return frame::notNull(pixels); }

/// The smallest size.
template <int Width, int Height>
inline constexpr auto atLeast = [](RoiSize roi) { return frame::sizeAtLeast(roi, Width, Height); };
inline constexpr int anyHeight = std::numeric_limits<s32>::min();

inline constexpr auto least2x2 = atLeast<2, 2>;
inline constexpr auto least2x1 = atLeast<2, 1>;
inline constexpr auto least2 = atLeast<2, anyHeight>;
inline constexpr auto least4x2 = atLeast<4, 2>;
inline constexpr auto least4x1 = atLeast<4, 1>;
inline constexpr auto least4 = atLeast<4, anyHeight>;

using SameGrid420 = SameGrid<2, 2>;
using SameGrid422 = SameGrid<2, 1>;
using SameGrid411 = SameGrid<4, 1>;

// How the planes are taken.

struct AsTheyAre {
    template <class Byte> auto operator()(Byte* const planes[3], const int steps[3]) const
    {
        return layouts::ThreePlanes<Byte>{{planes[0], planes[1], planes[2]}, {steps[0], steps[1], steps[2]}};
    }
    template <class Byte> auto operator()(Byte* luma, int lumaStep, Byte* pairs, int pairsStep) const
    {
        return layouts::TwoPlanes<Byte>{{luma, pairs}, {lumaStep, pairsStep}};
    }
    template <class Byte> auto operator()(Byte* pixels, int step) const
    {
        return layouts::Packed<layouts::First::luma, Byte>{pixels, step};
    }
};
inline constexpr AsTheyAre asTheyAre;

/// Packed rows that begin with chroma.
inline constexpr auto chromaFirst = []<class Byte>(Byte* pixels, int step) {
    return layouts::Packed<layouts::First::chroma, Byte>{pixels, step};
};

/// The third before the second.
inline constexpr auto exchangedPlanes = []<class Byte>(Byte* const planes[3], const int steps[3]) {
    return layouts::ThreePlanes<Byte>{{planes[0], planes[2], planes[1]}, {steps[0], steps[2], steps[1]}};
};

/// The third before the second, but each walked by the other one's step.
inline constexpr auto exchangedButForSteps = []<class Byte>(Byte* const planes[3], const int steps[3]) {
    return layouts::ThreePlanes<Byte>{{planes[0], planes[2], planes[1]}, {steps[0], steps[1], steps[2]}};
};

} // namespace pyxcc::subsampled
