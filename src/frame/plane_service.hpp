// Whole-plane services that the families share.
#pragma once

#include "pyxcc/types.h"

#include <cstddef>

namespace pyxcc::frame
{

/// Whether an image of so many bytes fills half of the largest cache: as a target, with a source like it, the whole.
bool fillsHalfTheCache(std::size_t bytes);

/// Copies a plane of bytes row by row; the gaps between the target's rows keep theirs. A plane that would fill half of
/// the largest cache goes past it.
/// Returns pyxErrNullPtr for a null pointer and pyxErrSize for a width or height below 1, with nothing written.
PyxStatus copyPlane8u(const u8* src, int srcStep, u8* dst, int dstStep, int width, int height);

/// Sets every byte of a plane to `value`; the gaps between rows keep theirs. A plane that the largest cache cannot hold
/// goes past it.
void fillPlane8u(u8 value, u8* dst, int dstStep, int width, int height);

} // namespace pyxcc::frame
