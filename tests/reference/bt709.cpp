#include "reference/bt709.hpp"

#include "reference/arguments.hpp"
#include "reference/primitives.hpp"
#include "reference/subsampled.hpp"

#include <algorithm>

namespace reference
{

namespace
{

// CSC forward.

u8 luma709High(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 256, g = rgb[1] * 256, b = rgb[2] * 256;
    return sat8((mulHighU16(r, 5997) + mulHighU16(g, 20120) + mulHighU16(b, 2032) + 2112) >> 7);
}

u8 luma709Exact(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return sat8((4063 * b + 40239 * g + 11993 * r + 0x108000) >> 16);
}

// The products are cut before they are subtracted.
Chroma chroma709HighU(Triple<s32> sums)
{
    const s32 r = sums[0] * 32, g = sums[1] * 32, b = sums[2] * 32;
    return {
        sat8((mulHighU16(b, 28770) - (mulHighU16(g, 22151) + mulHighU16(r, 6619)) + 16448) >> 7),
        sat8((mulHighU16(r, 28770) - (mulHighU16(g, 26149) + mulHighU16(b, 2621)) + 16448) >> 7),
    };
}

Chroma chroma709HighS(Triple<s32> sums)
{
    const s32 r = sums[0] * 32, g = sums[1] * 32, b = sums[2] * 32;
    return {
        sat8((mulHighS16(b, 28770) + mulHighS16(g, -22151) + mulHighS16(r, -6619) + 16448) >> 7),
        sat8((mulHighS16(r, 28770) + mulHighS16(g, -26149) + mulHighS16(b, -2621) + 16448) >> 7),
    };
}

// What is subtracted costs 256, which the cut to 8 bits gives back.
Chroma chroma709Exact(Triple<s32> sums)
{
    const auto [r, g, b] = sums;
    return {
        low8((28770 * b - 22151 * g - 6619 * r - 0x1FF8000) >> 18),
        low8((28770 * r - 2621 * b - 26149 * g - 0x1FF8000) >> 18),
    };
}

// HDTV forward, which never gives 0 or 255.

u8 clamp254(s32 x) { return static_cast<u8>(std::clamp(x, 1, 254)); }

u8 lumaHdtvHigh(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 256, g = rgb[1] * 256, b = rgb[2] * 256;
    return clamp254((mulHighU16(r, 6980) + mulHighU16(g, 23429) + mulHighU16(b, 2359) + 64) >> 7);
}

u8 lumaHdtvExact(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return clamp254((4719 * b + 46858 * g + 13959 * r + 32768) >> 16);
}

/// The scale is 32 for the sums over four pixels and 64 for those over two.
Chroma chromaHdtvHigh(Triple<s32> sums, s32 scale)
{
    const s32 r = sums[0] * scale, g = sums[1] * scale, b = sums[2] * scale;
    return {
        clamp254((mulHighS16(b, 16744) + mulHighS16(g, -12911) + mulHighS16(r, -3834) + 8224) >> 6),
        clamp254((mulHighS16(r, 16744) + mulHighS16(g, -15204) + mulHighS16(b, -1540) + 8224) >> 6),
    };
}

Chroma chromaHdtvHigh32(Triple<s32> sums) { return chromaHdtvHigh(sums, 32); }
Chroma chromaHdtvHigh64(Triple<s32> sums) { return chromaHdtvHigh(sums, 64); }

Chroma chromaHdtvExact(Triple<s32> sums)
{
    const auto [r, g, b] = sums;
    return {
        clamp254((33489 * b - 25821 * g - 7668 * r + 33587200) >> 18),
        clamp254((33489 * r - 3080 * b - 30409 * g + 33587200) >> 18),
    };
}

/// Of a pixel that has no other to share its chroma with.
u8 cbHdtvLone(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return clamp254((33489 * b - 25821 * g - 7668 * r + 0x808000) >> 16);
}

// CSC inverse.

Triple<u8> inv709Exact(Triple<u8> ycbcr)
{
    const s32 y = 76284 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 117506 * cr - 1187776) >> 16),
        sat8((y - 13959 * cb - 34996 * cr - 1187776) >> 16),
        sat8((y + 138609 * cb - 1187776) >> 16),
    };
}

/// The saturation of 16-bit lanes does not show, since no sum comes near to their bounds.
Triple<u8> inv709High(Triple<u8> ycbcr, s32 add)
{
    const s32 b = (ycbcr[1] - 128) * 128, r = (ycbcr[2] - 128) * 128;
    const s32 y = mulHighS16((ycbcr[0] - 16) * 128, 9535) + add;
    return {
        sat8((y + mulHighS16(r, 14688)) >> 4),
        sat8((y - mulHighS16(b, 1745) - mulHighS16(r, 4375)) >> 4),
        sat8((y + mulHighS16(b, 17326)) >> 4),
    };
}

Triple<u8> inv709High0(Triple<u8> ycbcr) { return inv709High(ycbcr, 0); }
Triple<u8> inv709High4(Triple<u8> ycbcr) { return inv709High(ycbcr, 4); }

// HDTV inverse.

Triple<u8> invHdtvExact(Triple<u8> ycbcr)
{
    const s32 y = 65536 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 100925 * cr + 32768) >> 16),
        sat8((y - 11993 * cb - 30081 * cr + 32768) >> 16),
        sat8((y + 119013 * cb + 32768) >> 16),
    };
}

Triple<u8> invHdtvHigh(Triple<u8> ycbcr)
{
    const s32 b = (ycbcr[1] - 128) * 128, r = (ycbcr[2] - 128) * 128;
    const s32 y = 16 * ycbcr[0] + 8;
    return {
        sat8((y + mulHighS16(r, 12616)) >> 4),
        sat8((y - mulHighS16(b, 1499) - mulHighS16(r, 3760)) >> 4),
        sat8((y + mulHighS16(b, 14877)) >> 4),
    };
}

constexpr ForwardForms cscExact = {luma709Exact, chroma709Exact};
constexpr ForwardForms hdtvExact = {lumaHdtvExact, chromaHdtvExact};

// A last odd column or row is left out of 4:2:0 images.

void cscFrom3(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {luma709High, chroma709HighU};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block420), block420, roi.width & ~15, wide, cscExact);
}

void cscFrom4(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {luma709High, chroma709HighS};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block420), block420, roi.width & ~7, wide, cscExact);
}

int wideOf420ToBgr(int width) { return 2 * ((width >> 1) & ~7); }

/// The whole pairs of each row.
void hdtvPairs(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms forms = {lumaHdtvHigh, chromaHdtvHigh64};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block422), block422, roi.width, forms, forms);
}

/// The last pixel of each row of odd width, which gives Cb and luma.
void hdtvLonePixel(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    if (roi.width % 2 == 0) return;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<u8> pixel = pixelOf(rgb, row, column);
        ycbcr[0].set(row, column, lumaHdtvExact(pixel));
        ycbcr[1].set(row, column / 2, cbHdtvLone(pixel));
    }
}

/// The last pixel of an odd width has Cb of its own and Cr of the pair before; where there is no pair before, its Cb
/// serves as Cr.
void hdtvFromPacked(const u8* src, int srcStep, const Image<u8>& rgb, RoiSize roi)
{
    const auto ycbcr = packedCbYCr(src, srcStep);
    fromSubsampled(ycbcr, rgb, wholeBlocks(roi, block422), block422, roi.width & ~7, invHdtvHigh, invHdtvExact);
    if (roi.width % 2 == 0) return;
    const int column = roi.width - 1;
    const int own = column / 2, before = own - 1;
    for (int row = 0; row < roi.height; ++row) {
        if (column == 0) {
            const Image<const u8> cbTwice = {ycbcr[0], ycbcr[1], ycbcr[1]};
            convertPixel(cbTwice, rgb, row, column, {row, own, own}, invHdtvExact);
        } else {
            convertPixel(ycbcr, rgb, row, column, {row, own, before}, invHdtvExact);
        }
    }
}

} // namespace

PyxStatus pyxiBGRToYCbCr420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    cscFrom3(reversed(interleaved(src, srcStep, 3)), planar(dst, dstStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCbCr420_709CSC_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                            int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    cscFrom3(reversed(interleaved(src, srcStep, 3)), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCrCb420_709CSC_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                            RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    cscFrom3(reversed(interleaved(src, srcStep, 3)), chromaExchanged(planar(dst, dstStep)), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                             RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    cscFrom4(reversed(interleaved(src, srcStep, 4)), planar(dst, dstStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCrCb420_709CSC_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                             RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    cscFrom4(reversed(interleaved(src, srcStep, 4)), chromaExchanged(planar(dst, dstStep)), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                              RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    const auto source = reversed(interleaved(src, srcStep, 4));
    const ForwardForms wide = {lumaHdtvHigh, chromaHdtvHigh32};
    toSubsampled(source, planar(dst, dstStep), wholeBlocks(roi, block420), block420, roi.width & ~7, wide, hdtvExact);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToCbYCr422_709HDTV_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = reversed(interleaved(src, srcStep, 3));
    const auto target = packedCbYCr(dst, dstStep);
    hdtvPairs(source, target, roi);
    hdtvLonePixel(source, target, roi);
    return pyxOk;
}

// The bytes of a lone pixel are taken for R, G, B, although all others are B, G, R.
PyxStatus pyxiBGRToCbYCr422_709HDTV_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = packedCbYCr(dst, dstStep);
    hdtvPairs(reversed(source), target, roi);
    hdtvLonePixel(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiYCbCrToBGR_709CSC_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    convert(planar(src, srcStep), target, roi, 16, inv709High4, inv709Exact);
    return pyxOk;
}

PyxStatus pyxiYCbCrToBGR_709CSC_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                         u8 aval)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    convert(planar(src, srcStep), target, roi, 16, inv709High4, inv709Exact);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToBGR_709CSC_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                            RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    fromSubsampled(planar(src, srcStep), target, wholeBlocks(roi, block420), block420, wideOf420ToBgr(roi.width),
                   inv709High0, inv709Exact);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToBGR_709HDTV_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                             RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    const RoiSize whole = wholeBlocks(roi, block420);
    fromSubsampled(planar(src, srcStep), target, whole, block420, wideOf420ToBgr(roi.width), invHdtvHigh, invHdtvExact);
    fill(target[3], whole, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiCbYCr422ToBGR_709HDTV_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    hdtvFromPacked(src, srcStep, reversed(interleaved(dst, dstStep, 3)), roi);
    return pyxOk;
}

PyxStatus pyxiCbYCr422ToBGR_709HDTV_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    hdtvFromPacked(src, srcStep, target, roi);
    fill(target[3], roi, aval);
    return pyxOk;
}

} // namespace reference
