// The 8-bit BT.601 forms, studio range. A form is a template over 16-bit lanes: forward it takes R, G, B and gives Y,
// Cb, Cr, inverse it takes Y, Cb, Cr and gives R, G, B.
//
// They are near to each other and not the same: each export names the ones that it has, and their last bits are part of
// its results.
#pragma once

#include "matrix/forward_forms.hpp"

namespace pyxcc::matrix
{

inline constexpr Weights bt601Luma{16843, 33030, 6423};
inline constexpr ChromaWeights bt601Chroma{{-9699, -19071, 28770}, {28770, -24117, -4653}};
inline constexpr Weights bt601RoundedLuma{4211, 8258, 1606};
inline constexpr ChromaWeights bt601RoundedChroma{{-2425, -4768, 7193}, {7193, -6029, -1163}};

/// 16.5 and 128.5 steps are added.
using LumaExact601 = LumaExact<bt601Luma, 0x108000>;
using FwdExact = FullResolution<LumaExact601, ChromaExact<bt601Chroma, 1, 4>>;

/// Luma in 256ths of a step, chroma in 128ths: 16.5 and 128.5 steps are added.
using FwdHigh = FullResolution<LumaHigh<bt601Luma, 16 * 256 + 128, 8>, ChromaHighSigned<bt601Chroma, 128, 16448, 7>>;

/// 16 steps for luma or 128 for chroma are added, and 2 / 64 for rounding.
using LumaRound601 = LumaRound<bt601RoundedLuma, 1026>;
using FwdRound = FullResolution<LumaRound601, ChromaRound<bt601RoundedChroma, 128, 8194>>;

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
