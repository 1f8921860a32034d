// Subsampled YCbCr to another subsampling or to RGB, with chroma, and in two of them luma, filtered along the columns.
#include "pyxcc/filter_interlace.h"

#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/chroma_means.hpp"
#include "layouts/computed_rows.hpp"
#include "matrix/bt601_forms.hpp"
#include "subsampled/bands.hpp"
#include "subsampled/column_filters.hpp"
#include "subsampled/repack_exports.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// Two rows of chroma for each of the source: the row itself and one between it and the one below. The rows at the ends
/// stand for those beyond.
template <class Source, class Target>
PyxStatus doubleByFourTaps(RoiSize roi, const Source& source, const Target& target)
{
    const int samples = roi.width / 2, rows = roi.height / 8 * 4;
    copyLuma(source, target, 2 * samples, 2 * rows);
    const auto row = [&](int m) { return source.chroma(std::clamp(m, 0, rows - 1)); };
    for (int m = 0; m < rows; ++m) {
        takeRow<AsItIs>(samples, row(m), target.chroma(2 * m));
        takeRow<AsItIs>(samples, computed(FourTaps{}, row(m), row(m + 1), row(m - 1), row(m + 2)),
                        target.chroma(2 * m + 1));
    }
    return pyxOk;
}

/// Calls take(y, row of luma) for each row of a band. Rows at the top and at the bottom of the image have a form of
/// their own.
template <class Edge, class Source, class Take>
void eachSmoothedRow(const Band& band, const Source& source, Edge edge, const Take& take)
{
    const auto luma = [&](int y) { return lumaByTwos(source.luma(y)); };
    for (int y = band.first; y < band.end; ++y) {
        if (band.begins(y) || band.ends(y)) {
            take(y, computed(edge, luma(y), luma(band.begins(y) ? y + 1 : y - 1)));
        } else {
            take(y, computed(Smoothed{}, luma(y - 1), luma(y), luma(y + 1)));
        }
    }
}

/// Row j of chroma moved half way to the one below it.
template <class Source> auto chromaMovedDown(const Band& band, const Source& source, int j)
{
    return computed(HalfWay{}, source.chroma(band.chroma(j)), source.chroma(band.chroma(j + 1)));
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 8)))
        return failure;
    return doubleByFourTaps(roi, asTheyAre(src, srcStep), asTheyAre(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 8)))
        return failure;
    return doubleByFourTaps(roi, exchangedPlanes(src, srcStep), asTheyAre(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                            int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(given(srcY, srcYStep, srcCbCr, srcCbCrStep), given(dst, dstStep), sizeAtLeast(roi, 2, 8)))
        return failure;
    return doubleByFourTaps(roi, asTheyAre(srcY, srcYStep, srcCbCr, srcCbCrStep), asTheyAre(dst, dstStep));
}

/// A last odd row has the chroma of the last row of chroma.
PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                            int srcCbCrStep, u8* dst, int dstStep, RoiSize roi,
                                                            s32 layout)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 2, 2))) return failure;
    const auto band = bandOf(layout, roi.height);
    if (!band) return pyxOk;
    const auto source = asTheyAre(srcY, srcYStep, srcCbCr, srcCbCrStep);
    const auto target = asTheyAre(dst, dstStep);
    eachSmoothedRow(*band, source, RaisedAtEdge{}, [&](int y, const auto& luma) {
        takeRow<AsItIs>(roi.width / 2, BesideRow{luma, chromaMovedDown(*band, source, y >> 1)}, target.row(y));
    });
    return pyxOk;
}

/// The elements are tested between the size's two tests. The first byte of a pair goes to the second plane, although
/// that is Cr by name.
PyxStatus PYXCC_CALL pyxiYCbCr420ToYCrCb420_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                            int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                            RoiSize roi, s32 layout)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1),
                                               elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    const auto band = bandOf(layout, roi.height);
    if (!band) return pyxOk;
    const int samples = roi.width / 2;
    const auto source = asTheyAre(srcY, srcYStep, srcCbCr, srcCbCrStep);
    const auto target = asTheyAre(dst, dstStep);
    eachSmoothedRow(*band, source, SmoothedAtEdge{},
                    [&](int y, const auto& luma) { takeRow<AsItIs>(samples, luma, lumaByTwos(target.luma(y))); });
    for (int j = band->first / 2; j < band->end / 2; ++j) {
        takeRow<AsItIs>(samples, chromaMovedDown(*band, source, j), target.chroma(j));
    }
    return pyxOk;
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_Filter_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                       int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 1, 1)))
        return failure;
    eachRowPair(roi, chromaBetweenRows(chromaExchanged(p3<2>(src, srcStep)), roi.height / 2),
                reversed(c4(dst, dstStep, aval)), spans(upTo<wholePairs>, matrix::inv3D));
    return warnIfOff(roi, 2, 2);
}
