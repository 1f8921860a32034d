#include "reference/filter_interlace.hpp"

#include "reference/arguments.hpp"
#include "reference/bands.hpp"
#include "reference/bt601_subsampled.hpp"
#include "reference/primitives.hpp"
#include "reference/repacking.hpp"
#include "reference/resampling.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// The fields of a frame: top rows are even, bottom rows odd.
constexpr Block blockOfFields = {2, 4};

/// A chroma channel at twice its height. Every row of the source stays, and between two of them comes one by the taps
/// -1, 9, 9, -1. Rows beyond the ends are those at the ends. The size is that of the source.
void doubleByFourTaps(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size)
{
    const int last = size.height - 1;
    for (int row = 0; row <= last; ++row) {
        for (int column = 0; column < size.width; ++column) {
            const s32 before = src.get(std::max(row - 1, 0), column);
            const s32 here = src.get(row, column);
            const s32 next = src.get(std::min(row + 1, last), column);
            const s32 afterNext = src.get(std::min(row + 2, last), column);
            dst.set(2 * row, column, static_cast<u8>(here));
            dst.set(2 * row + 1, column, sat8((9 * (here + next) - before - afterNext + 8) >> 4));
        }
    }
}

/// 4:2:0 to 4:2:2 in whole eights of rows.
void filterTo422(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi)
{
    const RoiSize worked = wholeBlocks(roi, {2, 8});
    const RoiSize chroma = {worked.width / 2, worked.height / 2};
    copyChannel(src[0], dst[0], worked);
    doubleByFourTaps(src[1], dst[1], chroma);
    doubleByFourTaps(src[2], dst[2], chroma);
}

/// A chroma channel at twice its height, each field by itself. Rows beyond the ends of a field are those at its ends.
/// The size is that of the target.
void doubleFields(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size)
{
    const int last = size.height / 4 - 1;
    for (int field = 0; field < 2; ++field) {
        for (int n = 0; n < size.height / 2; ++n) {
            const int q = n / 2;
            for (int column = 0; column < size.width; ++column) {
                const s32 before = src.get(2 * std::max(q - 1, 0) + field, column);
                const s32 here = src.get(2 * q + field, column);
                const s32 next = src.get(2 * std::min(q + 1, last) + field, column);
                const s32 top = n % 2 == 0 ? before + 7 * here : 5 * here + 3 * next;
                const s32 bottom = n % 2 == 0 ? 3 * before + 5 * here : 7 * here + next;
                const s32 sum = field == 0 ? top : bottom;
                dst.set(2 * n + field, column, static_cast<u8>((sum + 4) >> 3));
            }
        }
    }
}

/// A chroma channel at half its height, each field by itself and no more than four rows together. The size is that of
/// the source.
void halveFields(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size)
{
    for (int group = 0; group < size.height / 4; ++group) {
        for (int column = 0; column < size.width; ++column) {
            const s32 top0 = src.get(4 * group, column), bottom0 = src.get(4 * group + 1, column);
            const s32 top1 = src.get(4 * group + 2, column), bottom1 = src.get(4 * group + 3, column);
            dst.set(2 * group, column, static_cast<u8>((3 * top0 + top1 + 2) >> 2));
            dst.set(2 * group + 1, column, static_cast<u8>((bottom0 + 3 * bottom1 + 2) >> 2));
        }
    }
}

using FieldFilter = void (*)(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size);

PyxStatus interlaced(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, FieldFilter filter)
{
    const RoiSize worked = wholeBlocks(roi, blockOfFields);
    const RoiSize chroma = {worked.width / 2, worked.height};
    copyChannel(src[0], dst[0], worked);
    filter(src[1], dst[1], chroma);
    filter(src[2], dst[2], chroma);
    return statusOf(roi, blockOfFields);
}

} // namespace

PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 8)) return pyxErrSize;
    filterTo422(planar(src, srcStep), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                               const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 8)) return pyxErrSize;
    filterTo422(chromaExchanged(planar(src, srcStep)), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 8)) return pyxErrSize;
    filterTo422(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* dst, int dstStep, RoiSize roi, s32 layout)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    bandTo422(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), packedYCbCr(dst, dstStep), roi, layout);
    return pyxOk;
}

// The size is tested twice. The bytes of a pair keep their order, so that Cb goes to the plane that the name gives to
// Cr.
PyxStatus pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                 u8* const dst[3], const int dstStep[3], RoiSize roi, s32 layout)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    bandTo420(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, layout);
    return pyxOk;
}

// The chroma of a row of blocks is averaged with that of the next one, but in the last.
PyxStatus pyxiYCrCb420ToBGR_Filter_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                            RoiSize roi, u8 aval)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto ycbcr = chromaExchanged(planar(src, srcStep));
    const auto rgb = reversed(interleaved(dst, dstStep, 4));
    const RoiSize worked = wholeBlocks(roi, block420);
    const int last = worked.height / 2 - 1;
    for (int row = 0; row < worked.height; ++row) {
        const int here = row / 2;
        const int next = std::min(here + 1, last);
        for (int column = 0; column < worked.width; ++column) {
            const u8 y = ycbcr[0].get(row, column);
            const u8 cb = avgUp(ycbcr[1].get(here, column / 2), ycbcr[1].get(next, column / 2));
            const u8 cr = avgUp(ycbcr[2].get(here, column / 2), ycbcr[2].get(next, column / 2));
            const Triple<u8> out = inv3D({y, cb, cr});
            for (int k = 0; k < 3; ++k) rgb[k].set(row, column, out[k]);
        }
    }
    fill(rgb[3], worked, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420To422_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                             const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 4)) return pyxErrSize;
    return interlaced(planar(src, srcStep), planar(dst, dstStep), roi, doubleFields);
}

PyxStatus pyxiYCbCr422To420_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                             const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 4)) return pyxErrSize;
    return interlaced(planar(src, srcStep), planar(dst, dstStep), roi, halveFields);
}

PyxStatus pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                    RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 4)) return pyxErrSize;
    return interlaced(planar(src, srcStep), packedCbYCr(dst, dstStep), roi, doubleFields);
}

PyxStatus pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 4)) return pyxErrSize;
    return interlaced(packedCbYCr(src, srcStep), planar(dst, dstStep), roi, halveFields);
}

} // namespace reference
