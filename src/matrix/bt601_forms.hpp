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
    template <class S16> PYXCC_INLINE auto operator()(S16 R, S16 G, S16 B) const
    {
        const auto r = exact(R), g = exact(G), b = exact(B);
        return Three{low8((16843 * r + 33030 * g + 6423 * b + 0x108000) >> 16),
                     low8((-9699 * r - 19071 * g + 28770 * b - 0x7f8000) >> 16),
                     low8((28770 * r - 24117 * g - 4653 * b - 0x7f8000) >> 16)};
    }
};

/// High halves of 16-bit products, each truncated by itself.
struct FwdHigh : frame::OnWords {
    template <class S16> PYXCC_INLINE auto operator()(S16 R, S16 G, S16 B) const
    {
        const auto luma =
            mulHighU16(asU16(R) << 8, 16843) + mulHighU16(asU16(G) << 8, 33030) + mulHighU16(asU16(B) << 8, 6423) + 128;
        const S16 r = R << 7, g = G << 7, b = B << 7;
        const S16 cb = mulHighS16(r, -9699) + mulHighS16(g, -19071) + mulHighS16(b, 28770) + 64;
        const S16 cr = mulHighS16(r, 28770) + mulHighS16(g, -24117) + mulHighS16(b, -4653) + 64;
        return Three{sat8(asS16(luma >> 8) + 16), sat8((cb >> 7) + 128), sat8((cr >> 7) + 128)};
    }
};

/// Rounded 16-bit products in sixty-fourths of a step: 16 steps for luma or 128 for chroma, and 2 / 64 for rounding.
struct FwdRound : frame::OnWords {
    template <class S16> PYXCC_INLINE auto operator()(S16 R, S16 G, S16 B) const
    {
        const S16 r = R << 7, g = G << 7, b = B << 7;
        const S16 y = mulRound15(r, 4211) + mulRound15(g, 8258) + mulRound15(b, 1606) + 1026;
        const S16 cr = mulRound15(r, 7193) - mulRound15(g, 6029) - mulRound15(b, 1163) + 8194;
        const S16 cb = mulRound15(b, 7193) - mulRound15(g, 4768) - mulRound15(r, 2425) + 8194;
        return Three{sat8(y >> 6), sat8(cb >> 6), sat8(cr >> 6)};
    }
};

/// The weights of an exact inverse form and what it adds: 16 steps of luma less, and a half more where it rounds.
struct InvExactWeights {
    int y, crToR, cbToG, crToG, cbToB, addend;
};

template <InvExactWeights k> struct InvExact : frame::OnWords {
    template <class S16> PYXCC_INLINE auto operator()(S16 Y, S16 Cb, S16 Cr) const
    {
        const auto y = exact(Y), cb = exact(Cb - 128), cr = exact(Cr - 128);
        return Three{sat8((k.y * y + k.crToR * cr + k.addend) >> 16),
                     sat8((k.y * y + k.cbToG * cb + k.crToG * cr + k.addend) >> 16),
                     sat8((k.y * y + k.cbToB * cb + k.addend) >> 16)};
    }
};

using InvExactA = InvExact<InvExactWeights{76284, 104595, -25690, -53281, 132186, -1220544}>; // truncates
using InvExactB = InvExact<InvExactWeights{76284, 104595, -25690, -53281, 132186, -1187776}>; // rounds
using InvExactC = InvExact<InvExactWeights{76282, 104593, -25689, -53279, 132184, -1220512}>; // truncates
using InvExactD = InvExact<InvExactWeights{76282, 104593, -25689, -53279, 132184, -1187744}>; // rounds

/// What chroma adds to the three channels, in sixteenths of a step, in the high-product forms: one chroma sample's
/// share serves all the pixels that it covers.
template <int CbToG> struct ChromaAdded {
    template <class S16> static PYXCC_INLINE Three<S16> shares(S16 Cb, S16 Cr)
    {
        const S16 u = (Cb - 128) << 7, v = (Cr - 128) << 7;
        return {mulHighS16(v, 13074), mulHighS16(v, -6660) + mulHighS16(u, CbToG), mulHighS16(u, 16523)};
    }
};

/// The same with the shares of G taken off as magnitudes: a truncated product and the truncated negative product are
/// not opposites.
template <int CbToG> struct ChromaTakenOff {
    template <class S16> static PYXCC_INLINE Three<S16> shares(S16 Cb, S16 Cr)
    {
        const S16 u = (Cb - 128) << 7, v = (Cr - 128) << 7;
        return {mulHighS16(v, 13074), S16(0) - mulHighS16(v, 6660) - mulHighS16(u, CbToG), mulHighS16(u, 16523)};
    }
};

template <int LumaWeight, int Rounding, class Chroma> struct InvHigh : frame::OnWords, Chroma {
    template <class S16> static PYXCC_INLINE auto add(S16 Y, const Three<S16>& chroma)
    {
        const S16 y = mulHighS16((Y - 16) << 7, LumaWeight) + Rounding;
        return Three{sat8((y + chroma.a) >> 4), sat8((y + chroma.b) >> 4), sat8((y + chroma.c) >> 4)};
    }

    template <class S16> PYXCC_INLINE auto operator()(S16 Y, S16 Cb, S16 Cr) const
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
