// Conversions of YCbCr and YUV to packed pixels, whatever becomes of the low bits.
#pragma once

#include "reference/packed_pixels.hpp"
#include "reference/subsampled.hpp"

namespace reference
{

/// As invHighD, but nothing rounds it.
Triple<u8> invHighE(Triple<u8> ycbcr);

/// Of Y, U, V.
Triple<u8> yuvInvHighPacked(Triple<u8> yuv);

/// The pixels of a row's whole blocks take the wide form.
struct RowForms {
    int block;
    InverseForm wide, tail;
};

inline constexpr RowForms highE = {1, invHighE, invHighE};

/// A target as it is handed in.
struct PackedArgument {
    u16* first;
    int step;
    PackedModel model;
    Narrowing narrowing;
};

// Each tests its arguments, then converts.
PyxStatus packC3(const u8* src, int srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms);
PyxStatus packP3(const u8* const* src, int srcStep, const PackedArgument& dst, RoiSize roi);
PyxStatus pack422C2(const u8* src, int srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms);
PyxStatus pack422P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi);
PyxStatus pack420P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi, InverseForm form);

/// The pixels after the last whole block take its chroma.
PyxStatus pack411P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms);

} // namespace reference
