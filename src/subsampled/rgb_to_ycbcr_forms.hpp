// The forms of RGB to BT.601 YCbCr with shared chroma. The matrix is one; where terms are truncated or rounded, and how
// much is added for it, is each school's own.
#pragma once

#include "matrix/bt601_forms.hpp"
#include "subsampled/shared_chroma.hpp"

namespace pyxcc::subsampled
{

using namespace matrix;

/// The last half step is left out.
using LumaExactOdd = LumaExact<bt601Luma, 0x100000>;

/// In 128ths of a step, with half the weights; 16.5 steps are added.
using LumaHigh7 = LumaHigh<Weights{8422, 16515, 3212}, 2112, 7>;

/// In 256ths of a step; 16 steps are added.
using LumaHigh8 = LumaHigh<bt601Luma, 16 * 256, 8>;

/// 16 steps are added, and nothing for rounding.
using LumaRoundPlain = LumaRound<bt601RoundedLuma, 16 * 64>;

/// 128.5 steps are added.
template <int Scale> using ChromaHighS = ChromaHighSigned<bt601Chroma, Scale, 16448, 7>;

/// 128.125 steps are added.
using ChromaHighU4 = ChromaHighUnsigned<bt601Chroma, 32, 16400, 7>;
using ChromaHighU2 = ChromaHighUnsigned<bt601Chroma, 32, 8200, 6>;

/// 128 steps are added, and 2 / 64 for rounding or nothing.
using ChromaRound4 = ChromaRound<bt601RoundedChroma, 32, 8194>;
using ChromaRoundPlain4 = ChromaRound<bt601RoundedChroma, 32, 128 * 64>;

/// The exact chroma forms of a number of pixels, some of which round to nearest, with half a step, and some of which
/// kept the addend of a single pixel, an eighth, as the shift grew.
template <int Pixels> using ChromaNearest = ChromaExact<bt601Chroma, Pixels, 4>;
template <int Pixels> using ChromaEighth = ChromaExact<bt601Chroma, Pixels, 1>;

inline constexpr LumaExact601 lumaExact;
inline constexpr LumaRound601 lumaRound;
inline constexpr ByColumn<LumaExact601, LumaExactOdd> lumaExactByColumn;
inline constexpr LumaHigh7 lumaHigh7;
inline constexpr LumaHigh8 lumaHigh8;
inline constexpr LumaRoundPlain lumaRoundPlain;
template <int Scale> inline constexpr ChromaHighS<Scale> chromaHighS;
inline constexpr ChromaHighU4 chromaHighU4;
inline constexpr ChromaHighU2 chromaHighU2;
inline constexpr ChromaRound4 chromaRound4;
inline constexpr ChromaRoundPlain4 chromaRoundPlain4;
template <int Pixels> inline constexpr ChromaNearest<Pixels> chromaNearest;
template <int Pixels> inline constexpr ChromaEighth<Pixels> chromaEighth;

} // namespace pyxcc::subsampled
