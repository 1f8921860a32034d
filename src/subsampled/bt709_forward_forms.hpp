// The forward forms of BT.709 with shared chroma: studio range, and full range with results kept within 1 to 254.
#pragma once

#include "matrix/forward_forms.hpp"
#include "subsampled/shared_chroma.hpp"

namespace pyxcc::subsampled::bt709
{

using namespace matrix;

inline constexpr ChromaWeights studioChroma{{-6619, -22151, 28770}, {28770, -26149, -2621}};

inline constexpr Clamp hdtvClamp{1, 254};
inline constexpr ChromaWeights hdtvChroma{{-7668, -25821, 33489}, {33489, -30409, -3080}};
inline constexpr ChromaWeights hdtvHalfChroma{{-3834, -12911, 16744}, {16744, -15204, -1540}};

// Studio range: 16.5 steps are added to luma, 128.5 or 128.125 to chroma.
using LumaExactStudio = LumaExact<Weights{11993, 40239, 4063}, 0x108000>;
using LumaHighStudio = LumaHigh<Weights{5997, 20120, 2032}, 2112, 7>;
using ChromaExactStudio = ChromaExact<studioChroma, 4, 1>;
using ChromaHighU = ChromaHighUnsigned<studioChroma, 32, 16448, 7>;
using ChromaHighS = ChromaHighSigned<studioChroma, 32, 16448, 7>;

// Full range: half a step is added to luma, 128.5 or 128.125 to chroma.
using LumaExactHdtv = LumaExact<Weights{13959, 46858, 4719}, 32768, hdtvClamp>;
using LumaHighHdtv = LumaHigh<Weights{6980, 23429, 2359}, 64, 7, hdtvClamp>;
using ChromaExactHdtv = ChromaExact<hdtvChroma, 4, 1, hdtvClamp>;
using ChromaLoneHdtv = ChromaExact<hdtvChroma, 1, 4, hdtvClamp>;
template <int Scale> using ChromaHighHdtv = ChromaHighSigned<hdtvHalfChroma, Scale, 8224, 6, hdtvClamp>;

} // namespace pyxcc::subsampled::bt709
