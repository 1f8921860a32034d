// YCbCr 4:2:0 to 4:2:2 and back with the two fields of a frame kept apart.
#include "pyxcc/filter_interlace.h"

#include "layouts/computed_rows.hpp"
#include "subsampled/column_filters.hpp"
#include "subsampled/repack_exports.hpp"

#include <algorithm>

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// Calls take(y, row of chroma) for the rows of the frame that is twice as high, four for two of the source. Each field
/// is doubled by itself; its rows at the ends stand for those beyond. Chroma lies a quarter of a row of the frame above
/// the middle of its rows in one field and below it in the other, so that one is the mirror image of the other.
template <class Source, class Take> void eachDoubledRow(const Source& source, int fours, const Take& take)
{
    for (int k = 0; k < fours; ++k) {
        const auto field = [&, above = std::max(k - 1, 0), below = std::min(k + 1, fours - 1)](int parity) {
            return pyxcc::Three{source.chroma(2 * above + parity), source.chroma(2 * k + parity),
                                source.chroma(2 * below + parity)};
        };
        const auto top = field(0), bottom = field(1);
        take(4 * k, computed(Between<3, 1, 7>{}, top.a, top.b));
        take(4 * k + 1, computed(Between<3, 3, 5>{}, bottom.a, bottom.b));
        take(4 * k + 2, computed(Between<3, 5, 3>{}, top.b, top.c));
        take(4 * k + 3, computed(Between<3, 7, 1>{}, bottom.b, bottom.c));
    }
}

/// Calls take(j, row) for the rows of chroma of the frame that is half as high, two for four of `rowOf`, which are
/// those of one field each. A row with luma has that of the field's first.
template <class RowOf, class Take> void eachHalvedRow(const RowOf& rowOf, int fours, const Take& take)
{
    for (int k = 0; k < fours; ++k) {
        take(2 * k, computed(Between<2, 3, 1>{}, rowOf(4 * k), rowOf(4 * k + 2)));
        take(2 * k + 1, computed(Between<2, 1, 3>{}, rowOf(4 * k + 1), rowOf(4 * k + 3)));
    }
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr420To422_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 4)))
        return failure;
    const int samples = roi.width / 2, fours = roi.height / 4;
    const auto source = asTheyAre(src, srcStep);
    const auto target = asTheyAre(dst, dstStep);
    copyLuma(source, target, 2 * samples, 4 * fours);
    eachDoubledRow(source, fours,
                   [&](int y, const auto& chroma) { takeRow<AsItIs>(samples, chroma, target.chroma(y)); });
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 4)))
        return failure;
    const auto source = asTheyAre(src, srcStep);
    const auto target = chromaFirst(dst, dstStep);
    eachDoubledRow(source, roi.height / 4, [&](int y, const auto& chroma) {
        takeRow<AsItIs>(roi.width / 2, BesideRow{lumaByTwos(source.luma(y)), chroma}, target.row(y));
    });
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiYCbCr422To420_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 4)))
        return failure;
    const int samples = roi.width / 2, fours = roi.height / 4;
    const auto source = asTheyAre(src, srcStep);
    const auto target = asTheyAre(dst, dstStep);
    copyLuma(source, target, 2 * samples, 4 * fours);
    eachHalvedRow([&](int y) { return source.chroma(y); }, fours,
                  [&](int j, const auto& chroma) { takeRow<AsItIs>(samples, chroma, target.chroma(j)); });
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(given(src, srcStep), given(dst, dstStep), sizeAtLeast(roi, 2, 4)))
        return failure;
    const int samples = roi.width / 2;
    const auto source = chromaFirst(src, srcStep);
    const auto target = whole<2>(asTheyAre(dst, dstStep));
    eachHalvedRow([&](int y) { return source.row(y); }, roi.height / 4,
                  [&](int j, const auto& pixels) {
                      const int first = 2 * j - j % 2; // of the two rows of luma, 4 k or 4 k + 1
                      takeRow<AsItIs>(samples, pixels, target.row(first, j));
                      takeRow<AsItIs>(samples, source.row(first + 2), target.luma(first + 2));
                  });
    return warnIfOff(roi, 2, 4);
}
