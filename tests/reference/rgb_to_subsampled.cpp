#include "reference/rgb_to_subsampled.hpp"

#include "reference/arguments.hpp"
#include "reference/bt601_subsampled.hpp"

namespace reference
{

namespace
{

Chroma highS32(Triple<s32> sums) { return chromaHighS(sums, 32); }
Chroma highS64(Triple<s32> sums) { return chromaHighS(sums, 64); }
Chroma highUFour(Triple<s32> sums) { return chromaHighU(sums, 16400, 7); }
Chroma highUTwo(Triple<s32> sums) { return chromaHighU(sums, 8200, 6); }

// An eighth is added to the sum of four pixels before the cut, and to that of two pixels in planes; a half to that of
// two packed pixels.
Chroma exactFour(Triple<s32> sums) { return chromaExact(sums, 18, 0x1FF8000); }
Chroma exactTwo(Triple<s32> sums) { return chromaExact(sums, 17, 0xFFC000); }
Chroma exactTwoPacked(Triple<s32> sums) { return chromaExact(sums, 17, 0xFF0000); }

// A lone pixel gets a half, but in one conversion an eighth.
Chroma exactOne(Triple<s32> sample) { return chromaExact(sample, 16, 0x7F8000); }
Chroma exactOneEighth(Triple<s32> sample) { return chromaExact(sample, 16, 0x7FE000); }

constexpr ForwardForms tailFour = {lumaExact, exactFour};
constexpr ForwardForms tailTwo = {lumaExact, exactTwo};

// How many columns of a row take the wide forms.

int wideOfBgr420C3(int width) { return width & ~15; }

int wideOf420AC4(int width) { return (width & ~15) + ((width & 7) >= 4 ? 4 : 0); }

int wideOfRgb420(int width)
{
    const int chromaColumns = width >> 1;
    return 2 * ((chromaColumns & ~7) + (chromaColumns & 4));
}

int wideOf411C3(int width) { return width & ~15; }

int wideOf411AC4(int width) { return width & ~31; }

int wideOf422Planar(int width) { return (width & ~31) + ((width & 15) >= 8 ? 8 : 0); }

int wideOfBgr422Packed(int width) { return width & ~1; }

int wideOfRgb422Packed(int width) { return width & ~7; }

// A last odd column or row is left out.

void bgr420C3(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {lumaHigh7, highS32};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block420), block420, wideOfBgr420C3(roi.width), wide, tailFour);
}

void any420AC4(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {lumaHigh7, highUFour};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block420), block420, wideOf420AC4(roi.width), wide, tailFour);
}

void rgb420(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {lumaRound, chromaRound};
    toSubsampled(rgb, ycbcr, wholeBlocks(roi, block420), block420, wideOfRgb420(roi.width), wide, tailFour);
}

/// Of the region as it is; a last odd column gets luma only.
void planar422(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi)
{
    const ForwardForms wide = {lumaHigh7, highUTwo};
    toSubsampled(rgb, ycbcr, roi, block422, wideOf422Planar(roi.width), wide, tailTwo);
}

/// Where the last pair of each row has one pixel only, which gives the first chroma sample alone.
void loneChroma(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, First first, ChromaForm form)
{
    if (roi.width % 2 == 0) return;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<u8> pixel = pixelOf(rgb, row, column);
        const Chroma chroma = form({pixel[0], pixel[1], pixel[2]});
        if (first == First::cb) ycbcr[1].set(row, column / 2, chroma.cb);
        if (first == First::cr) ycbcr[2].set(row, column / 2, chroma.cr);
    }
}

/// The tail takes the lone pixel's luma only.
void bgr422Packed(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, ChromaForm lone)
{
    const ForwardForms wide = {lumaHigh7, highS64};
    toSubsampled(rgb, ycbcr, roi, block422, wideOfBgr422Packed(roi.width), wide, tailTwo);
    loneChroma(rgb, ycbcr, roi, First::cb, lone);
}

void rgb422Packed(const Image<const u8>& rgb, const Image<u8>& ycbcr, RoiSize roi, First first)
{
    const ForwardForms wide = {lumaHigh8, chromaMadd};
    const ForwardForms tail = {lumaExact, exactTwoPacked, lumaExactOdd};
    toSubsampled(rgb, ycbcr, roi, block422, wideOfRgb422Packed(roi.width), wide, tail);
    loneChroma(rgb, ycbcr, roi, first, exactOne);
}

} // namespace

PyxStatus pyxiBGRToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    bgr420C3(reversed(interleaved(src, srcStep, 3)), planar(dst, dstStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCrCb420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    bgr420C3(reversed(interleaved(src, srcStep, 3)), chromaExchanged(planar(dst, dstStep)), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCbCr420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    any420AC4(reversed(interleaved(src, srcStep, 4)), planar(dst, dstStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiBGRToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    any420AC4(reversed(interleaved(src, srcStep, 4)), chromaExchanged(planar(dst, dstStep)), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiRGBToYCrCb420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    any420AC4(interleaved(src, srcStep, 4), chromaExchanged(planar(dst, dstStep)), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiRGBToYCbCr420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    rgb420(interleaved(src, srcStep, 3), planar(dst, dstStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiRGBToYCbCr420_8u_C3P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr, int dstCbCrStep,
                                     RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    rgb420(interleaved(src, srcStep, 3), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi);
    return statusOf(roi, block420);
}

PyxStatus pyxiRGBToYCbCr420_8u_C4P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr, int dstCbCrStep,
                                     RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    rgb420(interleaved(src, srcStep, 4), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi);
    return statusOf(roi, block420);
}

// The last columns that make no whole block are left out.
PyxStatus pyxiBGRToYCbCr411_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    const ForwardForms wide = {lumaRoundPlain, chromaRoundPlain};
    toSubsampled(reversed(interleaved(src, srcStep, 3)), planar(dst, dstStep), wholeBlocks(roi, block411), block411,
                 wideOf411C3(roi.width), wide, tailFour);
    return statusOf(roi, block411);
}

// The last columns that make no whole block get luma.
PyxStatus pyxiBGRToYCbCr411_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    const ForwardForms wide = {lumaHigh7, highUFour};
    toSubsampled(reversed(interleaved(src, srcStep, 4)), planar(dst, dstStep), roi, block411, wideOf411AC4(roi.width),
                 wide, tailFour);
    return statusOf(roi, block411);
}

PyxStatus pyxiBGRToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    planar422(reversed(interleaved(src, srcStep, 3)), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiBGRToYCbCr422_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    planar422(reversed(interleaved(src, srcStep, 4)), planar(dst, dstStep), roi);
    return pyxOk;
}

// Unlike its BGR siblings this one leaves a last odd column out, and warns.
PyxStatus pyxiRGBToYCbCr422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    planar422(interleaved(src, srcStep, 3), planar(dst, dstStep), wholeBlocks(roi, block422));
    return statusOf(roi, block422);
}

PyxStatus pyxiBGRToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    bgr422Packed(reversed(interleaved(src, srcStep, 3)), packedYCbCr(dst, dstStep), roi, exactOneEighth);
    return pyxOk;
}

PyxStatus pyxiBGRToYCbCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    bgr422Packed(reversed(interleaved(src, srcStep, 4)), packedYCbCr(dst, dstStep), roi, exactOne);
    return pyxOk;
}

PyxStatus pyxiRGBToYCbCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    rgb422Packed(interleaved(src, srcStep, 3), packedYCbCr(dst, dstStep), roi, First::cb);
    return pyxOk;
}

PyxStatus pyxiRGBToYCrCb422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    rgb422Packed(interleaved(src, srcStep, 3), chromaExchanged(packedYCbCr(dst, dstStep)), roi, First::cr);
    return pyxOk;
}

PyxStatus pyxiRGBToYCbCr422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    rgb422Packed(planar(src, srcStep), packedYCbCr(dst, dstStep), roi, First::cb);
    return pyxOk;
}

PyxStatus pyxiRGBToYCrCb422_8u_P3C2R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    rgb422Packed(planar(src, srcStep), chromaExchanged(packedYCbCr(dst, dstStep)), roi, First::cr);
    return pyxOk;
}

} // namespace reference
