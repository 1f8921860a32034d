// The arithmetic of RGB and CIE L*u*v*, by depth and layout. Pixels in the blocks of a row and after them go by their
// own steps, where those differ.
#pragma once

#include "reference/perceptual.hpp"

namespace reference
{

/// From R, G, B.
Triple<f32> toLuv32fC3(Triple<f32> rgb, Span span);
Triple<f32> toLuv32fAC4(Triple<f32> rgb, Span span);
Triple<u8> toLuv8uC3(Triple<u8> rgb, Span span);
Triple<u8> toLuv8uAC4(Triple<u8> rgb, Span span);
Triple<u16> toLuv16uC3(Triple<u16> rgb, Span span);
Triple<u16> toLuv16uAC4(Triple<u16> rgb, Span span);
Triple<s16> toLuv16sC3(Triple<s16> rgb, Span span);
Triple<s16> toLuv16sAC4(Triple<s16> rgb, Span span);

/// To R, G, B.
Triple<f32> fromLuv32fC3(Triple<f32> luv, Span span);
Triple<f32> fromLuv32fAC4(Triple<f32> luv, Span span);
Triple<u8> fromLuv8uC3(Triple<u8> luv, Span span);
Triple<u8> fromLuv8uAC4(Triple<u8> luv, Span span);
Triple<u16> fromLuv16u(Triple<u16> luv, Span span);
Triple<s16> fromLuv16s(Triple<s16> luv, Span span);

} // namespace reference
