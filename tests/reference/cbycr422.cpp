#include "reference/cbycr422.hpp"

#include "reference/arguments.hpp"
#include "reference/bt601.hpp"
#include "reference/bt601_subsampled.hpp"
#include "reference/gamma_curves.hpp"
#include "reference/primitives.hpp"
#include "reference/repacking.hpp"

namespace reference
{

namespace
{

/// What becomes of a sample before it is converted.
using Curve = u8 (*)(u8);

u8 unchanged(u8 v) { return v; }

Triple<u8> pixelThrough(Curve curve, const Image<const u8>& rgb, int row, int column)
{
    const auto [r, g, b] = pixelOf(rgb, row, column);
    return {curve(r), curve(g), curve(b)};
}

u8 lumaFiltered(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return sat8((8422 * r + 16515 * g + 3212 * b + 0x84000) >> 15);
}

/// Luma of every pixel. Chroma of a pair by the taps 1, 2, 1 at the odd pixel of the pair before and at the two of its
/// own. The first pair of a row has nothing in the place of the pair before, so that its chroma is the paler. A last
/// odd pixel has Cb of its own, unfiltered, and no Cr.
void toFiltered(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, Curve curve)
{
    for (int row = 0; row < roi.height; ++row) {
        s32 carryCb = 0, carryCr = 0;
        for (int pair = 0; pair < roi.width / 2; ++pair) {
            const Triple<u8> even = pixelThrough(curve, rgb, row, 2 * pair);
            const Triple<u8> odd = pixelThrough(curve, rgb, row, 2 * pair + 1);
            const auto [re, ge, be] = even;
            const auto [ro, go, bo] = odd;
            const s32 oddCb = 3596 * bo - 1213 * ro - 2385 * go;
            const s32 oddCr = 3596 * ro - 3015 * go - 582 * bo;
            ycbcr[0].set(row, 2 * pair, lumaFiltered(even));
            ycbcr[0].set(row, 2 * pair + 1, lumaFiltered(odd));
            ycbcr[1].set(row, pair, sat8((7193 * be - 2426 * re - 4769 * ge + oddCb + carryCb + 0x403FFF) >> 15));
            ycbcr[2].set(row, pair, sat8((7193 * re - 6030 * ge - 1164 * be + oddCr + carryCr + 0x403FFF) >> 15));
            carryCb = oddCb;
            carryCr = oddCr;
        }
        if (roi.width % 2 != 0) {
            const int column = roi.width - 1;
            const Triple<u8> lone = fwdExact(pixelThrough(curve, rgb, row, column));
            ycbcr[0].set(row, column, lone[0]);
            ycbcr[1].set(row, column / 2, lone[1]);
        }
    }
}

Chroma highS64(Triple<s32> sums) { return chromaHighS(sums, 64); }

} // namespace

PyxStatus pyxiRGBToCbYCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    toFiltered(interleaved(src, srcStep, 3), packedCbYCr(dst, dstStep), roi, unchanged);
    return pyxOk;
}

PyxStatus pyxiRGBToCbYCr422Gamma_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    toFiltered(interleaved(src, srcStep, 3), packedCbYCr(dst, dstStep), roi, gammaFwd8u);
    return pyxOk;
}

// The bytes of a last odd pixel are taken for R, G, B, although all others are B, G, R.
PyxStatus pyxiBGRToCbYCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = packedCbYCr(dst, dstStep);
    const ForwardForms forms = {lumaHigh7, highS64};
    toSubsampled(reversed(source), target, wholeBlocks(roi, block422), block422, roi.width, forms, forms);
    if (roi.width % 2 == 0) return pyxOk;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<u8> lone = fwdExact(pixelOf(source, row, column));
        target[0].set(row, column, lone[0]);
        target[1].set(row, column / 2, lone[1]);
    }
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 3);
    fromPacked(packedCbYCr(src, srcStep), target, roi, First::cb, roi.width & ~7, invHighC, invExactD);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    fromPacked(packedCbYCr(src, srcStep), target, roi, First::cb, roi.width & ~7, invHighD, invExactD);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCbCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), packedYCbCr(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToCbYCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), packedCbYCr(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), planar(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(planar(src, srcStep), packedCbYCr(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), planar(dst, dstStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), planar(dst, dstStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedCbYCr(src, srcStep), chromaExchanged(planar(dst, dstStep)), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToCbYCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), packedCbYCr(dst, dstStep), roi, rowDouble);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToCbYCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planarYCrCbOfCrossedSteps(src, srcStep), packedCbYCr(dst, dstStep), roi, rowDouble);
    return pyxOk;
}

} // namespace reference
