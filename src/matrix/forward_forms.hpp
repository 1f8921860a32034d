// What the 8-bit forward forms of every matrix are made of. A luma form takes R, G, B of a pixel; a chroma form takes
// sums of R, of G and of B over the pixels that share the chroma, 1, 2 or 4 of them, and gives Cb, Cr.
//
// They are templates over 16-bit lanes. Terms that a form truncates or rounds by itself are written in its notation and
// not rearranged.
#pragma once

#include "frame/forms.hpp"
#include "lanes/avx2/bytes_by_turns.hpp"
#include "lanes/lanes.hpp"

#include <bit>

namespace pyxcc::matrix
{

/// Of R, G and B, in the unit of the form.
struct Weights {
    int r, g, b;
};

struct ChromaWeights {
    Weights cb, cr;
};

/// What a result is clamped to. Most forms cannot leave the range of a byte, and their clamp is that of any byte.
struct Clamp {
    int low = 0, high = 255;
};

namespace detail
{

template <Clamp ends, class S16> PYXCC_INLINE auto clamped(const S16& x)
{
    if constexpr (ends.low == 0 && ends.high == 255) {
        return sat8(x);
    } else {
        return clampTo<ends.low, ends.high>(x);
    }
}

template <int Factor, class Word> PYXCC_INLINE auto times(const Word& x)
{
    static_assert(std::has_single_bit(static_cast<unsigned>(Factor)));
    return x << std::countr_zero(static_cast<unsigned>(Factor));
}

} // namespace detail

/// A 32-bit sum.
template <Weights k, int Addend, Clamp ends = Clamp{}> struct LumaExact : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        return detail::clamped<ends>(exactSum<16, Addend, k.r, k.g, k.b>(R, G, B));
    }

    static PYXCC_INLINE wide::U8 ofBytes(wide::U8 R, wide::U8 G,
                                         wide::U8 B) requires(ends.low == 0 && ends.high == 255 &&
                                                              wide::sumsByBytes<Addend, k.r, k.g, k.b>)
    {
        return wide::exactSumOfBytes<Addend, k.r, k.g, k.b>(R, G, B);
    }
};

/// High halves of 16-bit products, each truncated by itself.
template <Weights k, int Addend, int Shift, Clamp ends = Clamp{}> struct LumaHigh : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto y =
            mulHighU16(asU16(R << 8), k.r) + mulHighU16(asU16(G << 8), k.g) + mulHighU16(asU16(B << 8), k.b) + Addend;
        return detail::clamped<ends>(asS16(y >> Shift));
    }
};

/// Rounded 16-bit products in sixty-fourths of a step.
template <Weights k, int Addend> struct LumaRound : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto y = mulRound15(R << 7, k.r) + mulRound15(G << 7, k.g) + mulRound15(B << 7, k.b) + Addend;
        return sat8(y >> 6);
    }

    /// Twice the weights make up for half the scale, which is at hand.
    static PYXCC_INLINE wide::U8 ofBytes(wide::U8 R, wide::U8 G, wide::U8 B)
    {
        static_assert(k.r > 0 && k.g > 0 && k.b > 0 && k.r + k.g + k.b + Addend < 16384); // so that a byte it is
        const auto r = wide::timesByTurns<64>(R), g = wide::timesByTurns<64>(G), b = wide::timesByTurns<64>(B);
        const auto y = [](const auto& x, const auto& y, const auto& z) PYXCC_INLINE_LAMBDA {
            return mulRound15(x, 2 * k.r) + mulRound15(y, 2 * k.g) + mulRound15(z, 2 * k.b) + Addend;
        };
        return wide::bytesByTurns<6>(y(r.a, g.a, b.a), y(r.b, g.b, b.b));
    }
};

/// A 32-bit sum over `Pixels` pixels, with 128 steps and a number of eighths of a step for rounding.
template <ChromaWeights k, int Pixels, int Eighths, Clamp ends = Clamp{}> struct ChromaExact {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        constexpr int shift = 16 + std::countr_zero(static_cast<unsigned>(Pixels));
        constexpr int addend = (128 * 8 + Eighths) << (shift - 3);
        return Two{detail::clamped<ends>(exactSum<shift, addend, k.cb.r, k.cb.g, k.cb.b>(R, G, B)),
                   detail::clamped<ends>(exactSum<shift, addend, k.cr.r, k.cr.g, k.cr.b>(R, G, B))};
    }
};

/// High halves of 16-bit products of signed weights, the negative ones truncated downwards as well.
template <ChromaWeights k, int Scale, int Addend, int Shift, Clamp ends = Clamp{}> struct ChromaHighSigned {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto r = detail::times<Scale>(R), g = detail::times<Scale>(G), b = detail::times<Scale>(B);
        const auto cb = mulHighS16(b, k.cb.b) + mulHighS16(g, k.cb.g) + mulHighS16(r, k.cb.r) + Addend;
        const auto cr = mulHighS16(r, k.cr.r) + mulHighS16(g, k.cr.g) + mulHighS16(b, k.cr.b) + Addend;
        return Two{detail::clamped<ends>(cb >> Shift), detail::clamped<ends>(cr >> Shift)};
    }
};

/// High halves of 16-bit products of the weights' magnitudes: what is negative is truncated first and taken off then.
template <ChromaWeights k, int Scale, int Addend, int Shift> struct ChromaHighUnsigned {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto r = asU16(detail::times<Scale>(R)), g = asU16(detail::times<Scale>(G)),
                   b = asU16(detail::times<Scale>(B));
        const auto cb = mulHighU16(b, k.cb.b) - (mulHighU16(g, -k.cb.g) + mulHighU16(r, -k.cb.r)) + Addend;
        const auto cr = mulHighU16(r, k.cr.r) - (mulHighU16(g, -k.cr.g) + mulHighU16(b, -k.cr.b)) + Addend;
        return Two{sat8(asS16(cb >> Shift)), sat8(asS16(cr >> Shift))};
    }
};

/// Rounded 16-bit products of the weights' magnitudes in sixty-fourths of a step.
template <ChromaWeights k, int Scale, int Addend> struct ChromaRound {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto r = detail::times<Scale>(R), g = detail::times<Scale>(G), b = detail::times<Scale>(B);
        const auto cb = mulRound15(b, k.cb.b) - mulRound15(r, -k.cb.r) - mulRound15(g, -k.cb.g) + Addend;
        const auto cr = mulRound15(r, k.cr.r) - mulRound15(b, -k.cr.b) - mulRound15(g, -k.cr.g) + Addend;
        return Two{sat8(cb >> 6), sat8(cr >> 6)};
    }
};

/// Luma and chroma of each pixel by itself.
template <class Luma, class Chroma> struct FullResolution : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto chroma = Chroma{}(R, G, B);
        return Three{Luma{}(R, G, B), chroma.a, chroma.b};
    }
};

} // namespace pyxcc::matrix
