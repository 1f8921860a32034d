#include "reference/packed_output.hpp"

#include "reference/arguments.hpp"
#include "reference/primitives.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// Every pixel of the region. `chroma` tells how many columns of chroma there are.
void convert(const Image<const u8>& ycbcr, const PackedArgument& dst, RoiSize roi, Block block, int chromaColumns,
             RowForms forms)
{
    const PackedTarget target = {packedRows(dst.first, dst.step), dst.model, dst.narrowing};
    const int wideColumns = roi.width / forms.block * forms.block;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const int chromaRow = row / block.rows, chromaColumn = std::min(column / block.columns, chromaColumns - 1);
            const u8 y = ycbcr[0].get(row, column);
            const u8 cb = ycbcr[1].get(chromaRow, chromaColumn);
            const u8 cr = ycbcr[2].get(chromaRow, chromaColumn);
            const InverseForm form = column < wideColumns ? forms.wide : forms.tail;
            target.set(row, column, form({y, cb, cr}));
        }
    }
}

/// A last odd column or row has a chroma sample of its own.
void convert(const Image<const u8>& ycbcr, const PackedArgument& dst, RoiSize roi, Block block, RowForms forms)
{
    convert(ycbcr, dst, roi, block, (roi.width + block.columns - 1) / block.columns, forms);
}

constexpr Block blockOfOne = {1, 1};

} // namespace

Triple<u8> invHighE(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 9535);
    return {
        sat8((t + mulHighS16(v, 13074)) >> 4),
        sat8((t - mulHighS16(u, 3211) - mulHighS16(v, 6660)) >> 4),
        sat8((t + mulHighS16(u, 16523)) >> 4),
    };
}

Triple<u8> yuvInvHighPacked(Triple<u8> yuv)
{
    const s32 y = 16 * yuv[0], u = (yuv[1] - 128) * 128, v = (yuv[2] - 128) * 128;
    return {
        sat8((y + mulHighS16(v, 9338)) >> 4),
        sat8((y - mulHighS16(v, 4759) - mulHighS16(u, 3227)) >> 4),
        sat8((y + mulHighS16(u, 16646)) >> 4),
    };
}

PyxStatus packC3(const u8* src, int srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), dst, roi, blockOfOne, forms);
    return pyxOk;
}

PyxStatus packP3(const u8* const* src, int srcStep, const PackedArgument& dst, RoiSize roi)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), dst, roi, blockOfOne, highE);
    return pyxOk;
}

// The second chroma sample of a last odd pixel lies past the row's own bytes.
PyxStatus pack422C2(const u8* src, int srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(packedYCbCr(src, srcStep), dst, roi, block422, forms);
    return pyxOk;
}

PyxStatus pack422P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), dst, roi, block422, highE);
    return pyxOk;
}

PyxStatus pack420P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi, InverseForm form)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), dst, roi, block420, {1, form, form});
    return pyxOk;
}

PyxStatus pack411P3(const u8* const* src, const int* srcStep, const PackedArgument& dst, RoiSize roi, RowForms forms)
{
    if (anyNull(src, dst.first)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), dst, roi, block411, roi.width / 4, forms);
    return statusOf(roi, block411);
}

} // namespace reference
