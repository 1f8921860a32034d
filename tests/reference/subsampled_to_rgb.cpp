#include "reference/subsampled_to_rgb.hpp"

#include "reference/arguments.hpp"
#include "reference/bt601.hpp"
#include "reference/bt601_subsampled.hpp"

#include <algorithm>
#include <cstdint>

namespace reference
{

namespace
{

/// A last odd column or row is left out.
void from420(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, int wideColumns, InverseForm wide,
             InverseForm tail)
{
    fromSubsampled(ycbcr, rgb, wholeBlocks(roi, block420), block420, wideColumns, wide, tail);
}

/// Where all pixels take one form.
void from420(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi, InverseForm form)
{
    from420(ycbcr, rgb, roi, roi.width, form, form);
}

/// Alpha of the pixels that are converted.
void fillAlpha420(const Image<u8>& rgba, RoiSize roi, u8 aval) { fill(rgba[3], wholeBlocks(roi, block420), aval); }

/// The pixels after the last whole block take its chroma. They are in the wide form if there are three of them.
void from411(const Image<const u8>& ycbcr, const Image<u8>& rgb, RoiSize roi)
{
    const int wholeColumns = roi.width & ~3;
    const int wideColumns = (roi.width & 3) == 3 ? roi.width : wholeColumns;
    const int lastChroma = (roi.width >> 2) - 1;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const int chromaColumn = std::min(column / 4, lastChroma);
            const InverseForm form = column < wideColumns ? invHighA : invExactE;
            convertPixel(ycbcr, rgb, row, column, {row, chromaColumn, chromaColumn}, form);
        }
    }
}

bool isAligned(const u8* pointer) { return reinterpret_cast<std::uintptr_t>(pointer) % 16 == 0; }

bool isAligned(int step) { return step % 16 == 0; }

} // namespace

PyxStatus pyxiYCbCr420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    from420(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), target, roi, inv3A);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    from420(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), target, roi, inv3A);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 3);
    from420(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), target, roi, inv3A);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 4);
    from420(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), target, roi, inv3A);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCrCb420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep));
    from420(source, reversed(interleaved(dst, dstStep, 3)), roi, inv3B);
    return statusOf(roi, block420);
}

// The size is tested first.
PyxStatus pyxiYCrCb420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval)
{
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    const auto source = chromaExchanged(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep));
    const auto target = reversed(interleaved(dst, dstStep, 4));
    from420(source, target, roi, inv3B);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCrCb420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep));
    from420(source, interleaved(dst, dstStep, 3), roi, inv3B);
    return statusOf(roi, block420);
}

// The size is tested first.
PyxStatus pyxiYCrCb420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                     int dstStep, RoiSize roi, u8 aval)
{
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    const auto source = chromaExchanged(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep));
    const auto target = interleaved(dst, dstStep, 4);
    from420(source, target, roi, inv3B);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    const int chromaColumns = roi.width >> 1;
    const int wideColumns = 2 * ((chromaColumns & ~15) + (chromaColumns & 8));
    from420(planar(src, srcStep), target, roi, wideColumns, inv3D, invExactB);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    from420(planar(src, srcStep), target, roi, inv3A);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = interleaved(dst, dstStep, 3);
    const int wideColumns = 2 * ((roi.width >> 1) & ~3);
    from420(planar(src, srcStep), target, roi, wideColumns, invHighC, invExactB);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCrCb420ToRGB_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto source = chromaExchanged(planar(src, srcStep));
    const auto target = interleaved(dst, dstStep, 4);
    const int wideColumns = 2 * ((roi.width >> 1) & ~3);
    from420(source, target, roi, wideColumns, invHighD, invExactB);
    fillAlpha420(target, roi, aval);
    return statusOf(roi, block420);
}

PyxStatus pyxiYCbCr422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    fromPacked(packedYCbCr(src, srcStep), target, roi, First::cb, roi.width & ~7, invHighD, invExactD);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    fromPacked(packedYCbCr(src, srcStep), target, roi, First::cb, roi.width & ~7, invHighD, invExactD);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 3);
    fromPacked(packedYCbCr(src, srcStep), target, roi, First::cb, roi.width & ~3, invHighB, invExactF);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 4);
    fromPacked(packedYCbCr(src, srcStep), target, roi, First::cb, roi.width & ~7, inv3C, invExactB);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    const auto target = planar(dst, dstStep);
    fromPacked(packedYCbCr(src, srcStep), target, roi, First::cb, roi.width & ~3, invHighB, invExactF);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(packedYCbCr(src, srcStep));
    const auto target = reversed(interleaved(dst, dstStep, 3));
    fromPacked(source, target, roi, First::cr, roi.width & ~7, inv3C, invExactB);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(packedYCbCr(src, srcStep));
    const auto target = reversed(interleaved(dst, dstStep, 4));
    fromPacked(source, target, roi, First::cr, roi.width & ~7, inv3C, invExactB);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(packedYCbCr(src, srcStep));
    const auto target = interleaved(dst, dstStep, 3);
    fromPacked(source, target, roi, First::cr, roi.width & ~7, inv3C, invExactB);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = chromaExchanged(packedYCbCr(src, srcStep));
    const auto target = interleaved(dst, dstStep, 4);
    fromPacked(source, target, roi, First::cr, roi.width & ~7, inv3C, invExactB);
    fill(target[3], roi, aval);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    const auto source = chromaExchanged(packedYCbCr(src, srcStep));
    fromPacked(source, planar(dst, dstStep), roi, First::cr, roi.width & ~3, invHighB, invExactF);
    return pyxOk;
}

// The first element of the array is read ahead of any test of the array, so a caller must not rely on the status of a
// null array; here it is that of a null pointer. A last odd column is left out, without a warning.
PyxStatus pyxiYCbCr422ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 3));
    fromSubsampled(planar(src, srcStep), target, wholeBlocks(roi, block422), block422, roi.width & ~7, invHighC,
                   invExactF);
    return pyxOk;
}

// The wide form goes by the alignment of the whole image. A last odd column has a chroma sample of its own.
PyxStatus pyxiYCbCr422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const bool aligned = isAligned(src[0]) && isAligned(src[1]) && isAligned(src[2]) && isAligned(dst) &&
                         isAligned(srcStep[0]) && isAligned(srcStep[1]) && isAligned(srcStep[2]) && isAligned(dstStep);
    fromSubsampled(planar(src, srcStep), interleaved(dst, dstStep, 3), roi, block422, roi.width & ~7,
                   aligned ? inv3D : invHighC, invExactC);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    from411(planar(src, srcStep), reversed(interleaved(dst, dstStep, 3)), roi);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi,
                                     u8 aval)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    const auto target = reversed(interleaved(dst, dstStep, 4));
    from411(planar(src, srcStep), target, roi);
    fill(target[3], roi, aval);
    return pyxOk;
}

} // namespace reference
