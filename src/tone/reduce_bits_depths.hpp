// Levels of a depth: how far they lie apart, the value that a sample counts as, and what a value is stored as.
#pragma once

#include "lanes/lanes.hpp"

#include <type_traits>

namespace pyxcc::tone
{

/// What the samples of a source count as: floats of 0 to `top`. Those of signed words count from their lowest, as if
/// they were unsigned. `unit` brings them to 0 to 1.
template <class Source> struct Working {
    static constexpr f32 top = 65535.0f, low = 0, unit = 1.5259022e-5f;
};

template <> struct Working<u8> {
    static constexpr f32 top = 255.0f, low = 0, unit = 0.003921569f;
};

template <> struct Working<f32> {
    static constexpr f32 top = 1.0f, low = 1.1920929e-7f;
};

inline f32 workingValue(u8 x) { return static_cast<f32>(x); }
inline f32 workingValue(u16 x) { return static_cast<f32>(x); }
inline f32 workingValue(s16 x) { return static_cast<f32>(x + 32768); }
inline f32 workingValue(f32 x) { return x; }

/// Between which samples an image is reduced.
template <class SourceSample, class TargetSample> struct Depth {
    using Source = SourceSample;
    using Target = TargetSample;
    static constexpr f32 targetTop = sizeof(Target) == 1 ? 255.0f : 65535.0f;
    static constexpr int maxLevels = sizeof(Target) == 1 ? 256 : 65536;

    /// Whether values are rounded when they are stored, in the smallest of the diffusions alone, and its sums fused.
    static constexpr bool rounds =
        std::is_same_v<Source, f32> || (std::is_same_v<Source, s16> && std::is_same_v<Target, u8>);
};

/// The distance of two levels, and its inverse.
struct Levels {
    f32 step, inv;
};

template <class Source> Levels levelsOf(s32 levels)
{
    const f32 s = static_cast<f32>(levels - 1);
    if constexpr (std::is_same_v<Source, u8>) {
        return {(65280.0f / s) * 0.00390625f, s / 255.0f};
    } else if constexpr (std::is_same_v<Source, f32>) {
        return {1.0f / s, s};
    } else {
        return {65535.0f / s, s / 65535.0f};
    }
}

/// What a value is stored as, signed words still as unsigned ones.
template <class Depth, bool Rounded, class F32> PYXCC_INLINE auto stored(const F32& v)
{
    if constexpr (std::is_same_v<typename Depth::Source, f32>) {
        if constexpr (Rounded) {
            return trunc(fused(v, F32(Depth::targetTop), F32(0.5f)));
        } else {
            return trunc(v * F32(Depth::targetTop));
        }
    } else if constexpr (sizeof(typename Depth::Source) == sizeof(typename Depth::Target)) {
        return trunc(v);
    } else if constexpr (Rounded) {
        return trunc(v + F32(0.5f)) >> 8;
    } else {
        return trunc(v) >> 8;
    }
}

/// The ends of the range in place of a value that is not within; `within` for one that is, or is no number.
template <class Source, class F32> PYXCC_INLINE F32 whereWithin(const F32& v, const F32& within, f32 above, f32 below)
{
    const F32 top = Working<Source>::top, low = Working<Source>::low;
    return whereAtMost(top, v, F32(above), whereLess(v, low, F32(below), within));
}

} // namespace pyxcc::tone
