// The arithmetic vocabulary over one value. src/lanes/avx2/ has the same names over a register.
//
// A lane wraps like a register's lane does: sums and products keep the low bits. Shifts of signed lanes are arithmetic,
// shifts of unsigned ones logical.
#pragma once

#include "lanes/groups.hpp"
#include "lanes/inline.hpp"
#include "lanes/several.hpp"
#include "pyxcc/types.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cmath>
#include <concepts>
#include <cstdint>
#include <limits>

namespace pyxcc::scalar
{

template <std::integral T> struct Lane {
    T v;

    constexpr Lane() = default;
    constexpr Lane(int value) : v(static_cast<T>(value)) {}

    friend Lane operator+(Lane x, Lane y) { return wrap(bits(x) + bits(y)); }
    friend Lane operator-(Lane x, Lane y) { return wrap(bits(x) - bits(y)); }
    friend Lane operator*(Lane x, Lane y) { return wrap(bits(x) * bits(y)); }
    friend Lane operator&(Lane x, Lane y) { return wrap(bits(x) & bits(y)); }
    friend Lane operator<<(Lane x, int n) { return wrap(bits(x) << n); }
    friend Lane operator>>(Lane x, int n) { return Lane(static_cast<int>(x.v >> n)); }

private:
    static constexpr u32 bits(Lane x) { return static_cast<u32>(x.v); }
    static constexpr Lane wrap(u32 value) { return Lane(static_cast<int>(value)); }
};

using U8 = Lane<u8>;
using S16 = Lane<s16>;
using U16 = Lane<u16>;
using S32 = Lane<s32>;

template <std::floating_point T> struct Float {
    T v;

    constexpr Float() = default;
    constexpr Float(T value) : v(value) {}

    friend Float operator+(Float x, Float y) { return x.v + y.v; }
    friend Float operator-(Float x, Float y) { return x.v - y.v; }
    friend Float operator-(Float x) { return -x.v; }
    friend Float operator*(Float x, Float y) { return x.v * y.v; }
    friend Float operator/(Float x, Float y) { return x.v / y.v; }
};

using F32 = Float<f32>;
using F64 = Float<f64>;

/// A sample that is ready to be stored as a byte.
struct Byte {
    u8 v;
};

inline U16 asU16(S16 x) { return x.v; }
inline S16 asS16(U16 x) { return x.v; }

/// 32768 more, and 32768 less.
inline U16 raised(S16 x) { return x.v + 32768; }
inline S16 lowered(U16 x) { return x.v - 32768; }

inline Byte sat8(S16 x) { return {static_cast<u8>(std::clamp<int>(x.v, 0, 255))}; }
inline Byte sat8(U16 x) { return {static_cast<u8>(std::min<int>(x.v, 255))}; }
template <int Low, int High> Byte clampTo(S16 x) { return {static_cast<u8>(std::clamp<int>(x.v, Low, High))}; }
inline Byte low8(S16 x) { return {static_cast<u8>(x.v)}; }

inline S16 mulRound15(S16 x, int k) { return (x.v * k + 16384) >> 15; }
inline S16 mulHighS16(S16 x, int k) { return (x.v * k) >> 16; }
inline U16 lesser(U16 x, U16 y) { return std::min<int>(x.v, y.v); }
inline U16 mulHighU16(U16 x, U16 y) { return static_cast<int>((u32{x.v} * u32{y.v}) >> 16); }
inline U16 mulHighU16(U16 x, int k) { return static_cast<int>((static_cast<u32>(x.v) * static_cast<u32>(k)) >> 16); }

/// mulHighS16((x - Zero) << Bits, Weight): what a sample adds in the high-product forms.
template <int Zero, int Weight, int Bits = 7> S16 highShare(S16 x) { return mulHighS16((x - Zero) << Bits, Weight); }

/// (Weight (x - Zero) + Addend) >> 16 with an exact product: what a sample adds in the exact forms.
template <int Zero, int Weight, int Addend> S16 exactShare(S16 x) { return (Weight * (x.v - Zero) + Addend) >> 16; }

/// (x + half) >> Shift, half being half a step of the result.
template <int Shift> S16 roundedShift(S16 x) { return (x.v + (1 << (Shift - 1))) >> Shift; }

inline S16 addSatS16(S16 x, S16 y) { return std::clamp(x.v + y.v, -32768, 32767); }
inline S16 subSatS16(S16 x, S16 y) { return std::clamp(x.v - y.v, -32768, 32767); }
inline U16 addSatU16(U16 x, U16 y) { return std::min(x.v + y.v, 65535); }

inline U8 avgUp(U8 x, U8 y) { return (x.v + y.v + 1) >> 1; }
inline U8 avgDown(U8 x, U8 y) { return (x.v + y.v) >> 1; }

/// (Weights * lanes + ... + Addend) >> Shift, clamped to a byte.
template <int Shift, int Addend, int... Weights, class... Lanes> U8 exactMean(const Lanes&... lanes)
{
    return std::clamp((Addend + ... + (Weights * lanes.v)) >> Shift, 0, 255);
}

/// (Weights * lanes + ... + Addend) >> Shift in 32 bits, of which the low 16 are kept.
template <int Shift, int Addend, int... Weights, class... Lanes> S16 exactSum(const Lanes&... lanes)
{
    return (Addend + ... + (Weights * lanes.v)) >> Shift;
}

/// (Weight x) >> Shift with an exact product.
template <int Shift, int Weight> S16 scaledDown(S16 x) { return (Weight * x.v) >> Shift; }

/// An exact sum with weights of the caller's, for lanes of bytes.
template <int Shift, int Addend> S16 exactSumBy(const Three<int>& weights, S16 x, S16 y, S16 z)
{
    const S32 sum = S32(Addend) + S32(weights.a) * x.v + S32(weights.b) * y.v + S32(weights.c) * z.v;
    return (sum >> Shift).v;
}

inline F32 fused(F32 x, F32 y, F32 z) { return std::fma(x.v, y.v, z.v); }
inline F64 fused(F64 x, F64 y, F64 z) { return std::fma(x.v, y.v, z.v); }

/// A NaN on either side gives y.
inline F32 lesser(F32 x, F32 y) { return x.v < y.v ? x : y; }
inline F32 greater(F32 x, F32 y) { return x.v > y.v ? x : y; }

/// A NaN on either side gives y, or `no`.
inline F64 greater(F64 x, F64 y) { return x.v > y.v ? x : y; }
inline F64 whereLess(F64 x, F64 y, F64 yes, F64 no) { return x.v < y.v ? yes : no; }
inline F32 whereLess(F32 x, F32 y, F32 yes, F32 no) { return x.v < y.v ? yes : no; }
inline F32 whereAtMost(F32 x, F32 y, F32 yes, F32 no) { return x.v <= y.v ? yes : no; }
inline F32 whereEqual(F32 x, F32 y, F32 yes, F32 no) { return x.v == y.v ? yes : no; }
inline F32 zeroWhereLess(F32 x, F32 y, F32 z) { return x.v < y.v ? F32(0.0f) : z; }
inline S32 oneMoreWhereLess(F32 x, F32 y, S32 n) { return x.v < y.v ? n.v + 1 : n.v; }
inline F32 whereSigned(F32 x, F32 yes, F32 no) { return std::signbit(x.v) ? yes : no; }
inline bool anyAtMost(F32 x, F32 y) { return x.v <= y.v; }
inline F32 magnitude(F32 x) { return std::fabs(x.v); }
inline S32 whereEqual(F32 x, F32 y, S32 yes, S32 no) { return x.v == y.v ? yes : no; }

inline F64 sqrt(F64 x) { return std::sqrt(x.v); }

inline F32 toF32(S32 x) { return static_cast<f32>(x.v); }
inline F32 toF32(F64 x) { return static_cast<f32>(x.v); }
inline F64 toF64(F32 x) { return x.v; }

/// Sign, exponent, and the first bit of the mantissa.
inline S32 halfOctave(F32 x) { return std::bit_cast<s32>(x.v) >> 22; }

/// Sign, exponent, and 20 bits of the mantissa.
inline S32 upperWords(F64 x) { return static_cast<s32>(std::bit_cast<std::uint64_t>(x.v) >> 32); }

/// To an integer, ties to even, whatever the rounding mode.
inline F32 roundedToEven(F32 x) { return x.v - std::remainder(x.v, 1.0f); }

/// x times 2 to the n, which is an integer; neither x nor the result may leave the range of normal numbers.
inline F32 timesPowerOf2(F32 x, F32 n) { return std::ldexp(x.v, static_cast<int>(n.v)); }

/// Clears the last bits of the mantissa.
inline F32 withoutLowBits(F32 x, int count) { return std::bit_cast<f32>(std::bit_cast<u32>(x.v) & ~0u << count); }

/// Out of range and NaN give the lowest integer.
inline S32 trunc(F32 x) { return x.v >= -0x1p31f && x.v < 0x1p31f ? static_cast<s32>(x.v) : INT32_MIN; }
inline S32 trunc(F64 x) { return x.v > -0x1p31 - 1 && x.v < 0x1p31 ? static_cast<s32>(x.v) : INT32_MIN; }
inline F64 doublesBeside(F32, f64 k) { return k; }
inline S32 nearest(F32 x) { return trunc(F32(std::nearbyint(x.v))); }

/// Whether the mode in force is to round to the nearest.
inline bool roundsToNearest() { return nearest(0.5f).v == 0 && nearest(1.5f).v == 2; }

/// Clamps an integer at both ends of a sample's range.
template <std::integral Sample> Sample saturate(S32 x)
{
    using Limits = std::numeric_limits<Sample>;
    return static_cast<Sample>(std::clamp<s32>(x.v, Limits::min(), Limits::max()));
}

/// Three channels of bytes.
struct Pixel {
    u8 channels[3];
};

/// Two words of a pixel.
struct WordPair {
    S16 lower, upper;

    friend WordPair operator-(WordPair x, WordPair y) { return {x.lower - y.lower, x.upper - y.upper}; }
    friend WordPair operator+(WordPair x, const Two<int>& k) { return {x.lower + k.a, x.upper + k.b}; }
    friend WordPair operator-(WordPair x, const Two<int>& k) { return {x.lower - k.a, x.upper - k.b}; }
    friend WordPair operator<<(WordPair x, int n) { return {x.lower << n, x.upper << n}; }
};

/// Two channels as words.
template <int Lower, int Upper> WordPair wordsOf(const Pixel& pixel)
{
    const auto channel = [&](int c) { return c == none ? 0 : int{pixel.channels[c]}; };
    return {channel(Lower), channel(Upper)};
}

/// High halves of the products of both words.
template <int Lower, int Upper> WordPair mulHighS16(WordPair x)
{
    return {mulHighS16(x.lower, Lower), mulHighS16(x.upper, Upper)};
}

/// The products of both words, added up.
template <int Lower, int Upper> S32 sumOfProducts(WordPair x) { return x.lower.v * Lower + x.upper.v * Upper; }

/// The lower half in both places.
inline WordPair twice(S32 x) { return {x.v, x.v}; }

/// The high half of the product of the upper half, as an upper half.
template <int Weight> S32 upperMulHighS16(S32 x) { return S32(mulHighS16(S16((x >> 16).v), Weight).v) << 16; }

/// The weighted sum of the channels, of which the upper half counts.
template <int A, int B, int C> S32 upperSum(const Pixel& pixel)
{
    return A * pixel.channels[0] + B * pixel.channels[1] + C * pixel.channels[2];
}

/// The samples of a pixel, which saturate on their way to bytes: the first one as an upper half, the others as words.
struct PixelWords {
    S32 upperFirst;
    WordPair others;
};

inline PixelWords pixelWords(S32 upperFirst, WordPair others) { return {upperFirst, others}; }

inline PixelWords asPixelWords(const PixelWords& x) { return x; }
inline PixelWords asPixelWords(const Three<S32>& upper) { return {upper.a, {(upper.b >> 16).v, (upper.c >> 16).v}}; }

// Samples compared, chosen and looked up. Masks have all bits set, or none.

template <class T> Lane<T> operator|(Lane<T> x, Lane<T> y) { return x.v | y.v; }
template <class T> Lane<T> operator^(Lane<T> x, Lane<T> y) { return x.v ^ y.v; }
inline U8 lesser(U8 x, U8 y) { return std::min(x.v, y.v); }
template <class T> Lane<T> greater(Lane<T> x, Lane<T> y) { return std::max(x.v, y.v); }
template <class T> Lane<T> distance(Lane<T> x, Lane<T> y) { return x.v > y.v ? x - y : y - x; }
inline U16 avgUp(U16 x, U16 y) { return (x.v + y.v + 1) >> 1; }
inline U8 mulHighU16(U8 x, int k) { return (x.v * k) >> 16; }

template <class T> Lane<T> equal(Lane<T> x, Lane<T> y) { return x.v == y.v ? -1 : 0; }
template <class T> Lane<T> where(Lane<T> mask, Lane<T> yes, Lane<T> no) { return mask.v ? yes : no; }
template <class T> Lane<T> exceptWhere(Lane<T> mask, Lane<T> x) { return mask.v ? 0 : x; }

inline U8 lookUp(const std::array<u8, 16>& table, U8 index) { return table[index.v]; }
inline U16 lookUp(const std::array<u8, 16>& masks, U16 index) { return masks[index.v] * 0x0101; }
inline F32 lookUp(const std::array<f32, 8>& table, S32 index) { return table[static_cast<u32>(index.v) % 8]; }

inline F32 whereOdd(S32 x, F32 yes, F32 no) { return x.v % 2 != 0 ? yes : no; }

// In lanes of 32 bits, of which a register of samples makes several, and one sample makes one.

template <class T> Several<S32, 1> toS32(Lane<T> x) { return several(S32(x.v)); }
inline Several<S32, 1> scaledDifference(U8 x, U8 y) { return several(S32((x.v - y.v) * 65536)); }
inline Several<S32, 1> scaledDifference(U16 x, U16 y) { return several(S32(x.v - y.v)); }
template <class Samples> Samples saturate(const Several<S32, 1>& x)
{
    return saturate<decltype(Samples::v)>(x.part[0]);
}

} // namespace pyxcc::scalar
