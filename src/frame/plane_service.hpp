// Whole-plane services that the families share.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::frame
{

/// Copies a plane of bytes row by row. Large planes go past the cache where its size is known.
/// Returns pyxErrNullPtr or pyxErrSize (a width or height below 1) with nothing written.
PyxStatus copyPlane8u(const u8* src, int srcStep, u8* dst, int dstStep, int width, int height);

/// Sets every byte of a plane to `value`; the gaps between rows keep theirs. Planes that the largest cache cannot hold
/// go past it.
void fillPlane8u(u8 value, u8* dst, int dstStep, int width, int height);

} // namespace pyxcc::frame
