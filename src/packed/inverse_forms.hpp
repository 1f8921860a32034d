// The inverse forms of packed targets: the high-product ones without rounding, since a field drops the last bits
// anyway.
#pragma once

#include "matrix/bt601_forms.hpp"
#include "matrix/yuv_forms.hpp"

namespace pyxcc::packed
{

using namespace matrix;

using InvHighE = InvHigh<HighLuma<16, 9535>, ChromaTakenOff<HighWeights{13074, 3211, 6660, 16523}>, 0, 4>;
using YuvInvHighPacked = InvFullRange<ChromaTakenOff<HighWeights{9338, 3227, 4759, 16646}>, 0, 4>;

inline constexpr InvHighE invHighE;
inline constexpr YuvInvHighPacked yuvInvHighPacked;

} // namespace pyxcc::packed
