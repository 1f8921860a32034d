// What tells the level of an image: its largest sample, or the sum of its samples.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::tone
{

/// The largest sample. Of two that do not compare the later counts, row after row: behind a NaN the search starts anew.
f32 largestSample(const f32* src, int srcStep, RoiSize roi);

/// In doubles, by partial sums.
f64 sumOfSamples(const f32* src, int srcStep, RoiSize roi);

} // namespace pyxcc::tone
