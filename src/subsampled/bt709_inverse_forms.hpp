// The inverse forms of BT.709.
#pragma once

#include "matrix/inverse_forms.hpp"

namespace pyxcc::subsampled::bt709
{

using namespace matrix;

inline constexpr InverseWeights studioInverse{76284, 117506, -13959, -34996, 138609};
inline constexpr InverseWeights hdtvInverse{65536, 100925, -11993, -30081, 119013};

// Studio range: 16 steps of luma are taken off, less half a step or a quarter of one, or the whole of them.
using InvExactStudio = InvExact<studioInverse, from128(studioInverse, -1187776)>;
template <int Rounding>
using InvHighStudio = InvHigh<HighLuma<16, 9535>, ChromaTakenOff<HighWeights{14688, 1745, 4375, 17326}>, Rounding, 4>;

// Full range, rounding.
using InvExactHdtv = InvExact<hdtvInverse, from128(hdtvInverse, 32768)>;
using InvHighHdtv = InvFullRange<ChromaTakenOff<HighWeights{12616, 1499, 3760, 14877}>, 8, 4>;

} // namespace pyxcc::subsampled::bt709
