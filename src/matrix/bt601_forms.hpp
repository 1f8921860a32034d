// The 8-bit BT.601 forms, studio range. A form is a template over 16-bit lanes: forward it takes R, G, B and gives Y,
// Cb, Cr, inverse it takes Y, Cb, Cr and gives R, G, B.
//
// They are near to each other and not the same: each export names the ones that it has, and their last bits are part of
// its results.
#pragma once

#include "frame/forms.hpp"
#include "lanes/lanes.hpp"

namespace pyxcc::matrix
{

/// 32-bit sums. The chroma addends are 128 less 256 steps: keeping the low 8 bits takes the 256 away.
struct FwdExact : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        return Three{low8(exactSum<16, 0x108000, 16843, 33030, 6423>(R, G, B)),
                     low8(exactSum<16, -0x7f8000, -9699, -19071, 28770>(R, G, B)),
                     low8(exactSum<16, -0x7f8000, 28770, -24117, -4653>(R, G, B))};
    }
};

/// High halves of 16-bit products, each truncated by itself: luma in 256ths of a step, chroma in 128ths, to which 16.5
/// and 128.5 steps are added.
struct FwdHigh : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto y = mulHighU16(asU16(R << 8), 16843) + mulHighU16(asU16(G << 8), 33030) +
                       mulHighU16(asU16(B << 8), 6423) + (16 * 256 + 128);
        const auto r = R << 7, g = G << 7, b = B << 7;
        const auto cb = mulHighS16(r, -9699) + mulHighS16(g, -19071) + mulHighS16(b, 28770) + (128 * 128 + 64);
        const auto cr = mulHighS16(r, 28770) + mulHighS16(g, -24117) + mulHighS16(b, -4653) + (128 * 128 + 64);
        return Three{sat8(asS16(y >> 8)), sat8(cb >> 7), sat8(cr >> 7)};
    }
};

/// Rounded 16-bit products in sixty-fourths of a step: 16 steps for luma or 128 for chroma, and 2 / 64 for rounding.
struct FwdRound : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& R, const Word& G, const Word& B) const
    {
        const auto r = R << 7, g = G << 7, b = B << 7;
        const auto y = mulRound15(r, 4211) + mulRound15(g, 8258) + mulRound15(b, 1606) + 1026;
        const auto cr = mulRound15(r, 7193) - mulRound15(g, 6029) - mulRound15(b, 1163) + 8194;
        const auto cb = mulRound15(b, 7193) - mulRound15(g, 4768) - mulRound15(r, 2425) + 8194;
        return Three{sat8(y >> 6), sat8(cb >> 6), sat8(cr >> 6)};
    }
};

/// The weights of an exact inverse form and what it adds: 16 steps of luma less, and a half more where it rounds.
struct InvExactWeights {
    int y, crToR, cbToG, crToG, cbToB, addend;
};

template <InvExactWeights k> struct InvExact : frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        const auto cb = Cb - 128, cr = Cr - 128;
        return Three{sat8(exactSum<16, k.addend, k.y, k.crToR>(Y, cr)),
                     sat8(exactSum<16, k.addend, k.y, k.cbToG, k.crToG>(Y, cb, cr)),
                     sat8(exactSum<16, k.addend, k.y, k.cbToB>(Y, cb))};
    }
};

using InvExactA = InvExact<InvExactWeights{76284, 104595, -25690, -53281, 132186, -1220544}>; // truncates
using InvExactB = InvExact<InvExactWeights{76284, 104595, -25690, -53281, 132186, -1187776}>; // rounds
using InvExactC = InvExact<InvExactWeights{76282, 104593, -25689, -53279, 132184, -1220512}>; // truncates
using InvExactD = InvExact<InvExactWeights{76282, 104593, -25689, -53279, 132184, -1187744}>; // rounds

/// What chroma adds to the three channels, in sixteenths of a step, in the high-product forms: one chroma sample's
/// share serves all the pixels that it covers.
template <int CbToG> struct ChromaAdded {
    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        const auto u = (Cb - 128) << 7, v = (Cr - 128) << 7;
        return Three{mulHighS16(v, 13074), mulHighS16(v, -6660) + mulHighS16(u, CbToG), mulHighS16(u, 16523)};
    }
};

/// The same with the shares of G taken off as magnitudes: a truncated product and the truncated negative product are
/// not opposites.
template <int CbToG> struct ChromaTakenOff {
    template <class Word> static PYXCC_INLINE auto shares(const Word& Cb, const Word& Cr)
    {
        const auto u = (Cb - 128) << 7, v = (Cr - 128) << 7;
        return Three{mulHighS16(v, 13074), 0 - mulHighS16(v, 6660) - mulHighS16(u, CbToG), mulHighS16(u, 16523)};
    }
};

template <int LumaWeight, int Rounding, class Chroma> struct InvHigh : frame::OnWords, Chroma {
    template <class Word, class S16> static PYXCC_INLINE auto add(const Word& Y, const Three<S16>& chroma)
    {
        const auto y = mulHighS16((Y - 16) << 7, LumaWeight) + Rounding;
        return Three{sat8((y + chroma.a) >> 4), sat8((y + chroma.b) >> 4), sat8((y + chroma.c) >> 4)};
    }

    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return add(Y, Chroma::shares(Cb, Cr));
    }
};

using InvHighA = InvHigh<9536, 8, ChromaAdded<-3203>>;
using InvHighB = InvHigh<9536, 0, ChromaAdded<-3203>>;
using InvHighC = InvHigh<9535, 8, ChromaAdded<-3211>>;
using InvHighD = InvHigh<9535, 8, ChromaTakenOff<3211>>;

inline constexpr FwdExact fwdExact;
inline constexpr FwdHigh fwdHigh;
inline constexpr FwdRound fwdRound;
inline constexpr InvExactA invExactA;
inline constexpr InvExactB invExactB;
inline constexpr InvExactC invExactC;
inline constexpr InvExactD invExactD;
inline constexpr InvHighA invHighA;
inline constexpr InvHighB invHighB;
inline constexpr InvHighC invHighC;
inline constexpr InvHighD invHighD;

} // namespace pyxcc::matrix
