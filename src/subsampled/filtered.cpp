// Subsampled YCbCr to another subsampling or to RGB, with chroma, and in two of them luma, filtered along the columns.
#include "pyxcc/filter_interlace.h"

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/chroma_means.hpp"
#include "layouts/chroma_pairs.hpp"
#include "matrix/bt601_forms.hpp"
#include "subsampled/bands.hpp"
#include "subsampled/column_filters.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// Two rows of chroma for each of the source; the rows at the ends stand for those beyond.
template <class Source, class Target>
void doubleByFourTaps(const Source& source, const Target& target, int width, int rows)
{
    const auto row = [&](int m) { return source.row(std::clamp(m, 0, rows - 1)); };
    for (int m = 0; m < rows; ++m) {
        convertColumns(together(row(m - 1), row(m), row(m + 1), row(m + 2)),
                       RowPair{target.row(2 * m), target.row(2 * m + 1)}, 0, width, FourTaps{});
    }
}

/// What chroma is doubled by four taps for: whole pairs of columns, and eights of rows.
RoiSize pairsAndEights(RoiSize roi) { return {roi.width & ~1, roi.height & ~7}; }

PyxStatus planesByFourTaps(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3],
                           Two<int> chromaOfTarget, RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 8)))
        return failure;
    const RoiSize size = pairsAndEights(roi);
    copyPlane8u(src[0], srcStep[0], dst[0], dstStep[0], size.width, size.height);
    const auto component = [&](int from, int to) {
        doubleByFourTaps(plane(src[from], srcStep[from]), plane(dst[to], dstStep[to]), size.width / 2, size.height / 2);
    };
    component(1, chromaOfTarget.a);
    component(2, chromaOfTarget.b);
    return pyxOk;
}

/// Calls visit(y, rows, form) for each row of a band: what becomes of these rows of luma by this form is row y. Rows at
/// the top and at the bottom of the image have a form of their own.
template <class Edge, class Visit>
void eachSmoothedRow(const Band& band, const BytePlane<const u8>& luma, const Edge& edge, const Visit& visit)
{
    for (int y = band.first; y < band.end; ++y) {
        if (band.begins(y) || band.ends(y)) {
            visit(y, together(luma.row(y), luma.row(band.begins(y) ? y + 1 : y - 1)), edge);
        } else {
            visit(y, together(luma.row(y - 1), luma.row(y), luma.row(y + 1)), Smoothed{});
        }
    }
}

/// A row of chroma and the one below it.
auto chromaBelow(const Band& band, const BytePlane<const u8>& pairs, int j)
{
    return together(pairs.row(band.chroma(j)), pairs.row(band.chroma(j + 1)));
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    return planesByFourTaps(src, srcStep, dst, dstStep, {1, 2}, roi);
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToYCbCr422_Filter_8u_P3R(const u8* const src[3], const int srcStep[3],
                                                          u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    return planesByFourTaps(src, srcStep, dst, dstStep, {2, 1}, roi);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                            int srcCbCrStep, u8* const dst[3], const int dstStep[3],
                                                            RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(srcY, srcCbCr, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 8)))
        return failure;
    const RoiSize size = pairsAndEights(roi);
    copyPlane8u(srcY, srcYStep, dst[0], dstStep[0], size.width, size.height);
    doubleByFourTaps(plane(srcCbCr, srcCbCrStep), pairsOf(plane(dst[1], dstStep[1]), plane(dst[2], dstStep[2])),
                     size.width, size.height / 2);
    return pyxOk;
}

/// A last odd row has the chroma of the last row of chroma.
PyxStatus PYXCC_CALL pyxiYCbCr420ToYCbCr422_Filter_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr,
                                                            int srcCbCrStep, u8* dst, int dstStep, RoiSize roi,
                                                            s32 layout)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 2, 2))) return failure;
    const auto band = bandOf(layout, roi.height);
    if (!band) return pyxOk;
    const auto pairs = plane(srcCbCr, srcCbCrStep);
    const auto target = packedPairs<true>(dst, dstStep);
    eachSmoothedRow(*band, plane(srcY, srcYStep), RaisedAtEdge{}, [&](int y, const auto& luma, const auto& form) {
        convertColumns(LumaAndPairsRow{luma, chromaBelow(*band, pairs, y >> 1)}, target.row(y), 0, roi.width & ~1,
                       byKind(form, Between{}));
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
    const int width = roi.width & ~1;
    const auto target = plane(dst[0], dstStep[0]);
    eachSmoothedRow(*band, plane(srcY, srcYStep), SmoothedAtEdge{}, [&](int y, const auto& luma, const auto& form) {
        convertColumns(luma, target.row(y), 0, width, form);
    });
    const auto pairs = plane(srcCbCr, srcCbCrStep);
    const auto chroma = pairsOf(plane(dst[1], dstStep[1]), plane(dst[2], dstStep[2]));
    for (int j = band->first / 2; j < band->end / 2; ++j) {
        convertColumns(chromaBelow(*band, pairs, j), chroma.row(j), 0, width, Between{});
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
