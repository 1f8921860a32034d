#include "reference/repack.hpp"

#include "reference/arguments.hpp"
#include "reference/repacking.hpp"
#include "reference/resampling.hpp"

namespace reference
{

namespace
{

/// As rowDouble towards planes. Each row of chroma is written to the upper row of a pair and then to the lower one. In
/// the third plane, the samples from `misplacedBegin` to the last whole eight go as far below the upper row as the step
/// of the second plane.
void rowDoubleMisplaced(const Image<const u8>& src, u8* const* dst, const int* dstStep, RoiSize roi, int misplacedBegin)
{
    const RoiSize worked = wholeBlocks(roi, block420);
    const int columns = worked.width / 2;
    const int misplacedEnd = columns & ~7;
    const auto target = planar(dst, dstStep);
    // The rows that lie one step below the rows of the third plane, by either step.
    const Channel<u8> lower(dst[2] + dstStep[2], dstStep[2], 1);
    const Channel<u8> misplaced(dst[2] + dstStep[1], dstStep[2], 1);
    copyChannel(src[0], target[0], worked);
    for (int row = 0; row < worked.height / 2; ++row) {
        for (int column = 0; column < columns; ++column) {
            target[1].set(2 * row, column, src[1].get(row, column));
            target[2].set(2 * row, column, src[2].get(row, column));
        }
        for (int column = 0; column < columns; ++column) {
            const bool isMisplaced = misplacedBegin <= column && column < misplacedEnd;
            target[1].set(2 * row + 1, column, src[1].get(row, column));
            (isMisplaced ? misplaced : lower).set(2 * row, column, src[2].get(row, column));
        }
    }
}

using Resampler = void (*)(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize roi);

/// A size that is off the multiple is an error here.
PyxStatus resample(const u8* const* src, const int* srcStep, u8* const* dst, const int* dstStep, RoiSize roi,
                   Block multiple, Resampler resampler)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, multiple.columns, multiple.rows)) return pyxErrSize;
    if (roi.width % multiple.columns != 0 || roi.height % multiple.rows != 0) return pyxErrSize;
    const auto source = planar(src, srcStep);
    const auto target = planar(dst, dstStep);
    copyChannel(source[0], target[0], roi);
    resampler(source[1], target[1], roi);
    resampler(source[2], target[2], roi);
    return pyxOk;
}

} // namespace

PyxStatus pyxiYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* const dst[3],
                                const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, sameGrid420);
    return pyxOk;
}

PyxStatus pyxiYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep, u8* dstCbCr,
                                int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, sameGrid420);
    return pyxOk;
}

PyxStatus pyxiYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), planar(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(planar(src, srcStep), packedYCbCr(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* const dst[3],
                                const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, sameGrid411);
    return pyxOk;
}

PyxStatus pyxiYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep, u8* dstCbCr,
                                int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, sameGrid411);
    return pyxOk;
}

// The size is tested twice. The bytes of a pair keep their order, so that Cb goes to the plane that the name gives to
// Cr.
PyxStatus pyxiYCbCr420ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, sameGrid420);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planarYCrCbOfCrossedSteps(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, sameGrid420);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCrCb422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (roi.width < 2) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), chromaExchanged(packedYCbCr(dst, dstStep)), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (roi.width < 2) return pyxErrSize;
    repack(planar(src, srcStep), chromaExchanged(packedYCbCr(dst, dstStep)), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 1)) return pyxErrSize;
    repack(chromaExchanged(packedYCbCr(src, srcStep)), planar(dst, dstStep), roi, sameGrid422);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), packedYCbCr(dst, dstStep), roi, rowDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    rowDoubleMisplaced(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), dst, dstStep, roi, (roi.width / 2) & ~31);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    rowDoubleMisplaced(planar(src, srcStep), dst, dstStep, roi, (roi.width / 2) & ~63);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planarYCrCbOfCrossedSteps(src, srcStep), packedYCbCr(dst, dstStep), roi, rowDouble);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    rowDoubleMisplaced(chromaExchanged(planar(src, srcStep)), dst, dstStep, roi, (roi.width / 2) & ~63);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), planar(dst, dstStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(planar(src, srcStep), planar(dst, dstStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), chromaExchanged(planar(dst, dstStep)), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    repack(chromaExchanged(packedYCbCr(src, srcStep)), planar(dst, dstStep), roi, rowSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), packedYCbCr(dst, dstStep), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), packedYCbCr(dst, dstStep), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), planar(dst, dstStep), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), chromaExchanged(packedYCbCr(dst, dstStep)), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCrCb422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), chromaExchanged(planar(dst, dstStep)), roi, colDouble);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr411_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 1)) return pyxErrSize;
    repack(packedYCbCr(src, srcStep), planar(dst, dstStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr422ToYCbCr411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(planar(src, srcStep), planar(dst, dstStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiYCrCb422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (roi.width < 4) return pyxErrSize;
    repack(chromaExchanged(packedYCbCr(src, srcStep)), planar(dst, dstStep), roi, colSkip);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, rowFold);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowFold);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(planar(src, srcStep), planar(dst, dstStep), roi, rowFold);
    return pyxOk;
}

PyxStatus pyxiYCbCr411ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), chromaExchanged(planar(dst, dstStep)), roi, rowFold);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(srcY, srcCbCr, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(semiPlanar(srcY, srcYStep, srcCbCr, srcCbCrStep), planar(dst, dstStep), roi, rowUnfold);
    return pyxOk;
}

PyxStatus pyxiYCbCr420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(planar(src, srcStep), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowUnfold);
    return pyxOk;
}

PyxStatus pyxiYCrCb420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi)
{
    if (anyNull(src, dstY, dstCbCr) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (isSmaller(roi, 4, 2)) return pyxErrSize;
    repack(chromaExchanged(planar(src, srcStep)), semiPlanar(dstY, dstYStep, dstCbCr, dstCbCrStep), roi, rowUnfold);
    return pyxOk;
}

PyxStatus pyxiYCbCr411To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3],
                                   RoiSize roi)
{
    return resample(src, srcStep, dst, dstStep, roi, {4, 4}, chroma411To420);
}

PyxStatus pyxiYCbCr1620To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                    const int dstStep[3], RoiSize roi)
{
    return resample(src, srcStep, dst, dstStep, roi, {4, 4}, chroma1620To420);
}

PyxStatus pyxiYCbCr420To411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3],
                                   RoiSize roi)
{
    return resample(src, srcStep, dst, dstStep, roi, {4, 2}, chroma420To411);
}

PyxStatus pyxiYCbCr420To1620_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                    const int dstStep[3], RoiSize roi)
{
    return resample(src, srcStep, dst, dstStep, roi, {4, 4}, chroma420To1620);
}

} // namespace reference
