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

    /// How much less than black luma is to be counted from for its product to be more by `Addend`; 0 if there is none.
    template <int Addend>
    static constexpr int lessBlack = [] {
        for (int less = 1; less < 128; ++less) {
            bool same = true;
            for (int y = 0; y < 256 && same; ++y) {
                const int fromZero = 128 * (y - Zero);
                same = (fromZero + less) * Weight >> 16 == (fromZero * Weight >> 16) + Addend;
            }
            if (same) return less;
        }
        return 0;
    }();

    /// The share and `Addend`, at no more cost where black is counted off by itself.
    template <int Addend, class Word> static PYXCC_INLINE auto scaledPlus(const Word& Y)
    {
        return mulHighS16(Y.belowBlack - lessBlack<Addend>, -Weight);
    }
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

/// A product of chroma that is rounded as it is made: how many times as large chroma is to be, and the weight.
struct RoundedProduct {
    int times, weight;
};

/// The one that gives a share in steps of 1 << Shift, rounded, at once; a weight for G makes up for `times` being less
/// than 128. Zero if there is none.
template <int Weight, int WeightOfG, int Shift>
constexpr RoundedProduct roundedProduct = [] {
    for (int times = 64; times >= 4; times /= 2) {
        const int weight = (Weight * 64 + (times << Shift) / 2) / (times << Shift);
        bool same = WeightOfG * (128 / times) <= 32767;
        for (int x = -128; x < 128 && same; ++x) {
            const int share = x * 128 * Weight >> 16;
            same = (share + (1 << Shift) / 2) >> Shift == (x * times * weight + 16384) >> 15;
        }
        if (same) return RoundedProduct{times, weight};
    }
    return RoundedProduct{0, 0};
}();

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

    template <int Shift>
    static constexpr Two<detail::RoundedProduct> roundedBAndR = {detail::roundedProduct<k.cbToB, k.cbToG, Shift>,
                                                                 detail::roundedProduct<k.crToR, k.crToG, Shift>};
    template <int Shift>
    static constexpr bool roundsBAndR = roundedBAndR<Shift>.a.times > 0 && roundedBAndR<Shift>.b.times > 0;

    /// The same with R and B in steps of 1 << Shift, rounded.
    template <int Shift, class Chroma> static PYXCC_INLINE auto roundedInPlace(const Chroma& chroma)
    {
        constexpr auto cb = roundedBAndR<Shift>.a, cr = roundedBAndR<Shift>.b;
        const auto scaled = chromaFrom128<cb.times, cr.times>(chroma);
        return detail::SharesInPlace{mulRound15<cb.weight, cr.weight>(scaled),
                                     mulHighS16<k.cbToG*(128 / cb.times), k.crToG*(128 / cr.times)>(scaled)};
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

    /// Packed pixels: what is added for rounding comes with luma where it can.
    template <class Word, class Share> static PYXCC_INLINE auto addInPlace(const Word& Y, const Three<Share>& chroma)
    {
        if constexpr (Rounding > 0 && Luma::template lessBlack < Rounding >> 0) {
            const auto y = Luma::template scaledPlus<Rounding>(Y);
            const auto inSteps = [](const auto& sum) PYXCC_INLINE_LAMBDA { return sat8(sum >> Shift); };
            return Three{inSteps(y + chroma.a), inSteps(Chroma::takesOffG ? y - chroma.b : y + chroma.b),
                         inSteps(y + chroma.c)};
        } else {
            return add(Y, chroma);
        }
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
        const auto share = inSteps(chroma);
        return Three{crOfPixels(share.bAndR), ofG(sumOfPixels(share.g)), cbOfPixels(share.bAndR)};
    }

    template <class Word, class Share> static PYXCC_INLINE auto add(const Word& Y, const Three<Share>& chroma)
    {
        return Three{sat8(Y + chroma.a), sat8(Y + chroma.b), sat8(Y + chroma.c)};
    }

    template <class Word, class Share> static PYXCC_INLINE auto addInPlace(const Word& Y, const Three<Share>& chroma)
    {
        return add(Y, chroma);
    }

    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return add(Y, shares(Cb, Cr));
    }

private:
    static constexpr bool roundsToNearest = Shift > 0 && Rounding == (1 << Shift) / 2;

    /// R and B.
    template <class Packed> static PYXCC_INLINE auto inSteps(const Packed& chroma)
    {
        if constexpr (roundsToNearest && requires { requires Chroma::template roundsBAndR<Shift>; }) {
            return Chroma::template roundedInPlace<Shift>(chroma);
        } else {
            const auto share = Chroma::sharesInPlace(chroma);
            return detail::SharesInPlace{detail::inSteps<Rounding, Shift>(share.bAndR), share.g};
        }
    }

    template <class Share> static PYXCC_INLINE auto ofG(const Share& share)
    {
        if constexpr (!Chroma::takesOffG) {
            return detail::inSteps<Rounding, Shift>(share);
        } else if constexpr (roundsToNearest) {
            return mulRound15(share, -(1 << (15 - Shift))); // which takes off as it rounds
        } else {
            return detail::inSteps<Rounding, Shift>(0 - share);
        }
    }
};

} // namespace pyxcc::matrix
