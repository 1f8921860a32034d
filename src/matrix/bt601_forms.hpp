// The 8-bit BT.601 forms, studio range. A form is a template over 16-bit lanes: forward it takes R, G, B and gives Y,
// Cb, Cr, inverse it takes Y, Cb, Cr and gives R, G, B.
//
// They are near to each other and not the same: each export names the ones that it has, and their last bits are part of
// its results.
#pragma once

#include "matrix/forward_forms.hpp"
#include "matrix/inverse_forms.hpp"

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

inline constexpr InverseWeights bt601Inverse{76284, 104595, -25690, -53281, 132186};
inline constexpr InverseWeights bt601InverseLess{76282, 104593, -25689, -53279, 132184};
inline constexpr InverseWeights bt601InverseMore{76294, 104595, -25625, -53281, 132186};

/// 16 steps of luma are taken off, in those that round half a step less.
using InvExactA = InvExact<bt601Inverse, from128(bt601Inverse, -1220544)>;         // truncates
using InvExactB = InvExact<bt601Inverse, from128(bt601Inverse, -1187776)>;         // rounds
using InvExactC = InvExact<bt601InverseLess, from128(bt601InverseLess, -1220512)>; // truncates
using InvExactD = InvExact<bt601InverseLess, from128(bt601InverseLess, -1187744)>; // rounds
using InvExactE = InvExact<bt601InverseMore, from128(bt601InverseMore, -1187936)>; // rounds
using InvExactF = InvExact<bt601Inverse, Three{-14608761, 8887730, -18140365}>;    // near to A

/// In sixteenths of a step.
using InvHighA = InvHigh<HighLuma<16, 9536>, ChromaAdded<HighWeights{13074, -3203, -6660, 16523}>, 8, 4>;
using InvHighB = InvHigh<HighLuma<16, 9536>, ChromaAdded<HighWeights{13074, -3203, -6660, 16523}>, 0, 4>;
using InvHighC = InvHigh<HighLuma<16, 9535>, ChromaAdded<HighWeights{13074, -3211, -6660, 16523}>, 8, 4>;
using InvHighD = InvHigh<HighLuma<16, 9535>, ChromaTakenOff<HighWeights{13074, 3211, 6660, 16523}>, 8, 4>;

/// In eighths of a step.
inline constexpr HighWeights bt601Eighths{6537, 1606, 3330, 8262};
inline constexpr HighWeights bt601EighthsMore{6537, 1605, 3330, 8263};
using Inv3A = InvHigh<HighLuma<0, 4769>, ChromaOffset<bt601EighthsMore, Three{1779, 1089, 2211}>, 0, 3>;
using Inv3B = InvHigh<HighLuma<0, 4768>, ChromaOffset<bt601Eighths, Three{1779, 1084, 2210}>, 0, 3>;
using Inv3C = InvHigh<HighLuma<0, 4768>, ChromaOffset<bt601Eighths, Three{1783, 1085, 2214}>, 0, 3>;
using Inv3D = InvHigh<HighLuma<16, 4769>, ChromaTakenOff<bt601EighthsMore>, 0, 3>;

inline constexpr FwdExact fwdExact;
inline constexpr FwdHigh fwdHigh;
inline constexpr FwdRound fwdRound;
inline constexpr InvExactA invExactA;
inline constexpr InvExactB invExactB;
inline constexpr InvExactC invExactC;
inline constexpr InvExactD invExactD;
inline constexpr InvExactE invExactE;
inline constexpr InvExactF invExactF;
inline constexpr InvHighA invHighA;
inline constexpr InvHighB invHighB;
inline constexpr InvHighC invHighC;
inline constexpr InvHighD invHighD;
inline constexpr Inv3A inv3A;
inline constexpr Inv3B inv3B;
inline constexpr Inv3C inv3C;
inline constexpr Inv3D inv3D;

} // namespace pyxcc::matrix
