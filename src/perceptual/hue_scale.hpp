// Constants of hue models over integer samples, and how their forms come back to integers. All arithmetic is in f32.
#pragma once

#include "lanes/lanes.hpp"

#include <bit>
#include <limits>

namespace pyxcc::perceptual
{

/// A float told by its representation.
constexpr f32 ofBits(u32 bits) { return std::bit_cast<f32>(bits); }

inline constexpr f32 c60 = ofBits(0x3c888889); ///< a sixtieth

/// What depends on the sample type. A full circle of hue is as many steps as the greatest sample.
template <class Sample> struct HueScale;

template <> struct HueScale<u8> {
    static constexpr f32 full = 255;
    static constexpr f32 difference = 0x1p-16f;         ///< what scaledDifference() comes by
    static constexpr f32 hueScale = ofBits(0x3f355555); ///< samples a degree
    static constexpr f32 hk = ofBits(0x3fb4b4b5);       ///< degrees a sample
    static constexpr f32 ck = ofBits(0x3cc0c0c2);       ///< hk times a sixtieth: sextants a sample
    static constexpr f32 inv = ofBits(0x3b808081);      ///< of the greatest sample
};

template <> struct HueScale<u16> {
    static constexpr f32 full = 65535;
    static constexpr f32 difference = 1;
    static constexpr f32 hueScale = ofBits(0x43360aab);
    static constexpr f32 hk = ofBits(0x3bb400b4);
    static constexpr f32 ck = ofBits(0x38c000c1);
    static constexpr f32 inv = ofBits(0x37800080);
};

/// Conversions to integers: in the rounding mode in force, or towards zero.
struct Nearest {
    template <class F32> PYXCC_INLINE auto operator()(const F32& x) const { return nearest(x); }
};
struct Truncated {
    template <class F32> PYXCC_INLINE auto operator()(const F32& x) const { return trunc(x); }
};

/// What is left of an integer that is stored as a sample without regard to its range.
template <class Sample, class S32> PYXCC_INLINE S32 lowBits(const S32& x)
{
    return x & S32(int{std::numeric_limits<Sample>::max()});
}
template <class Sample, class S32> PYXCC_INLINE Three<S32> lowBits(const Three<S32>& x)
{
    return {lowBits<Sample>(x.a), lowBits<Sample>(x.b), lowBits<Sample>(x.c)};
}

/// An angle brought back by a full circle from above, or from below.
template <class F32> PYXCC_INLINE F32 notAbove360(const F32& h) { return whereLess(F32(360), h, h - F32(360), h); }
template <class F32> PYXCC_INLINE F32 notBelow0(const F32& h) { return whereLess(h, F32(0), h + F32(360), h); }

/// The members of results that come in groups.
template <class Group, int N> PYXCC_INLINE auto firstOf(const Several<Group, N>& x)
{
    return each([](const Group& of) PYXCC_INLINE_LAMBDA { return of.a; }, x);
}
template <class Group, int N> PYXCC_INLINE auto secondOf(const Several<Group, N>& x)
{
    return each([](const Group& of) PYXCC_INLINE_LAMBDA { return of.b; }, x);
}
template <class Group, int N> PYXCC_INLINE auto thirdOf(const Several<Group, N>& x)
{
    return each([](const Group& of) PYXCC_INLINE_LAMBDA { return of.c; }, x);
}

} // namespace pyxcc::perceptual
