// The inverse forms over their constants: Y, Cb, Cr in, R, G, B out, as templates over 16-bit lanes.
#pragma once

#include "frame/forms.hpp"
#include "lanes/lanes.hpp"

namespace pyxcc::matrix
{

/// What a step of each sample adds to the channels.
struct InverseWeights {
    int y, crToR, cbToG, crToG, cbToB;
};

/// 32-bit sums in 65536ths of a step; what is added to the channels includes that chroma counts from 128.
template <InverseWeights k, Three<int> Addends> struct InvExact : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return Three{sat8(exactSum<16, Addends.a, k.y, k.crToR>(Y, Cr)),
                     sat8(exactSum<16, Addends.b, k.y, k.cbToG, k.crToG>(Y, Cb, Cr)),
                     sat8(exactSum<16, Addends.c, k.y, k.cbToB>(Y, Cb))};
    }
};

/// One addend for all, with chroma counted from 128.
constexpr Three<int> from128(InverseWeights k, int addend)
{
    return {addend - 128 * k.crToR, addend - 128 * (k.cbToG + k.crToG), addend - 128 * k.cbToB};
}

// The high-product forms. One chroma sample's share in the channels serves all the pixels that it covers, so that a
// form is two parts: `shares` of chroma, and `add` of them to a pixel's luma. Of packed pixels chroma is taken where it
// lies: `sharesInPlace` makes the products of both components at once.

/// Luma in the scale of the shares.
template <int Zero, int Weight> struct HighLuma {
    template <class Word> static PYXCC_INLINE auto scaled(const Word& Y) { return highShare<Zero, Weight>(Y); }
};

/// Weights of the high products; those of G are taken as the form below has them, added or taken off.
struct HighWeights {
    int crToR, cbToG, crToG, cbToB;
};

namespace detail
{

/// What chroma adds to R, to G in two parts that are to be added up, and to B: R and B are products of one component
/// each.
template <class Chroma> struct SharesInPlace {
    Chroma bAndR, g;
};

template <class Chroma> SharesInPlace(Chroma, Chroma) -> SharesInPlace<Chroma>;

template <HighWeights k, class Chroma> PYXCC_INLINE auto products(const Chroma& x)
{
    return SharesInPlace{mulHighS16<k.cbToB, k.crToR>(x), mulHighS16<k.cbToG, k.crToG>(x)};
}

} // namespace detail

/// What chroma adds, taken `1 << Bits` times as large into the products.
template <HighWeights k, int Bits = 7> struct ChromaAdded {
    static constexpr bool takesOffG = false;

    template <class Chroma> static PYXCC_INLINE auto sharesInPlace(const Chroma& chroma)
    {
        return detail::products<k>(chromaFrom128<1 << Bits>(chroma));
    }

    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        return Three{highShare<128, k.crToR, Bits>(Cr),
                     highShare<128, k.crToG, Bits>(Cr) + highShare<128, k.cbToG, Bits>(Cb),
                     highShare<128, k.cbToB, Bits>(Cb)};
    }
};

/// The same with the shares of G taken off as magnitudes: a truncated product and the truncated negative product are
/// not opposites.
template <HighWeights k> struct ChromaTakenOff {
    static constexpr bool takesOffG = true;

    template <class Chroma> static PYXCC_INLINE auto sharesInPlace(const Chroma& chroma)
    {
        return detail::products<k>(chromaFrom128<128>(chroma));
    }

    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        return Three{highShare<128, k.crToR>(Cr), highShare<128, k.crToG>(Cr) + highShare<128, k.cbToG>(Cb),
                     highShare<128, k.cbToB>(Cb)};
    }
};

/// Chroma counted from 0, magnitudes taken off in G: what it adds at 128, and 16 steps of luma, are in the offsets.
template <HighWeights k, Three<int> Offsets> struct ChromaOffset {
    static constexpr bool takesOffG = true;

    /// Twice the weights make up for half the chroma, 127 times of which is the most at hand.
    template <class Chroma> static PYXCC_INLINE auto sharesInPlace(const Chroma& chroma)
    {
        constexpr HighWeights twice{2 * k.crToR, 2 * k.cbToG, 2 * k.crToG, 2 * k.cbToB};
        const auto share = detail::products<twice>(chromaFrom0<64>(chroma));
        return detail::SharesInPlace{share.bAndR - Two{Offsets.c, Offsets.a}, share.g - Two{Offsets.b, 0}};
    }

    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        return Three{highShare<0, k.crToR>(Cr) - Offsets.a,
                     highShare<0, k.cbToG>(Cb) + highShare<0, k.crToG>(Cr) - Offsets.b,
                     highShare<0, k.cbToB>(Cb) - Offsets.c};
    }
};

/// Exact sums; what is added is that to the channels.
template <HighWeights k, Three<int> Addends> struct ChromaExactly {
    static constexpr bool takesOffG = false;

    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        return Three{exactShare<128, k.crToR, Addends.a>(Cr),
                     exactSum<16, Addends.b, k.cbToG, k.crToG>(Cb - 128, Cr - 128),
                     exactShare<128, k.cbToB, Addends.c>(Cb)};
    }
};

namespace detail
{

/// (x + Rounding) >> Shift, in the cheapest way.
template <int Rounding, int Shift, class Sum> PYXCC_INLINE auto inSteps(const Sum& x)
{
    if constexpr (Shift == 0) {
        return x;
    } else if constexpr (Rounding == 0) {
        return x >> Shift;
    } else if constexpr (Rounding == 1 << (Shift - 1)) {
        return roundedShift<Shift>(x);
    } else {
        return (x + Rounding) >> Shift;
    }
}

} // namespace detail

template <class Luma, class Chroma, int Rounding, int Shift> struct InvHigh : frame::OnWords, Chroma {
    template <class Word, class Share> static PYXCC_INLINE auto add(const Word& Y, const Three<Share>& chroma)
    {
        const auto y = Luma::scaled(Y);
        return Three{rounded(y + chroma.a), rounded(Chroma::takesOffG ? y - chroma.b : y + chroma.b),
                     rounded(y + chroma.c)};
    }

    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return add(Y, Chroma::shares(Cb, Cr));
    }

    template <class Packed> static PYXCC_INLINE auto sharesInPlace(const Packed& chroma) requires requires
    {
        Chroma::sharesInPlace(chroma);
    }
    {
        const auto share = Chroma::sharesInPlace(chroma);
        return Three{crOfPixels(share.bAndR), sumOfPixels(share.g), cbOfPixels(share.bAndR)};
    }

private:
    template <class Sum> static PYXCC_INLINE auto rounded(const Sum& sum)
    {
        return sat8(detail::inSteps<Rounding, Shift>(sum));
    }
};

/// Luma of full range is whole steps, which come through the rounding as they are: what is rounded is what chroma adds.
template <class Chroma, int Rounding, int Shift> struct InvFullRange : frame::AddedToLuma {
    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        const auto share = Chroma::shares(Cb, Cr);
        return Three{detail::inSteps<Rounding, Shift>(share.a), ofG(share.b),
                     detail::inSteps<Rounding, Shift>(share.c)};
    }

    template <class Packed> static PYXCC_INLINE auto sharesInPlace(const Packed& chroma) requires requires
    {
        Chroma::sharesInPlace(chroma);
    }
    {
        const auto share = Chroma::sharesInPlace(chroma);
        const auto bAndR = detail::inSteps<Rounding, Shift>(share.bAndR);
        return Three{crOfPixels(bAndR), ofG(sumOfPixels(share.g)), cbOfPixels(bAndR)};
    }

    template <class Word, class Share> static PYXCC_INLINE auto add(const Word& Y, const Three<Share>& chroma)
    {
        return Three{sat8(Y + chroma.a), sat8(Y + chroma.b), sat8(Y + chroma.c)};
    }

    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return add(Y, shares(Cb, Cr));
    }

private:
    template <class Share> static PYXCC_INLINE auto ofG(const Share& share)
    {
        if constexpr (!Chroma::takesOffG) {
            return detail::inSteps<Rounding, Shift>(share);
        } else if constexpr (Shift > 0 && Rounding == (1 << Shift) / 2) {
            return mulRound15(share, -(1 << (15 - Shift))); // which takes off as it rounds
        } else {
            return detail::inSteps<Rounding, Shift>(0 - share);
        }
    }
};

} // namespace pyxcc::matrix
