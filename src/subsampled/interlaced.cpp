// YCbCr 4:2:0 to 4:2:2 and back with the two fields of a frame kept apart.
#include "pyxcc/filter_interlace.h"

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "layouts/chroma_pairs.hpp"
#include "subsampled/column_filters.hpp"

#include <algorithm>

using namespace pyxcc;
using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

/// What is converted: whole pairs of columns, and fours of rows.
RoiSize pairsAndFours(RoiSize roi) { return {roi.width & ~1, roi.height & ~3}; }

/// The rows of one field of a frame.
template <class Image> struct Field {
    Image frame;
    int parity;

    PYXCC_INLINE auto row(int n) const { return frame.row(2 * n + parity); }
};

template <class Image> auto fieldOf(const Image& frame, int parity) { return Field<Image>{frame, parity}; }

/// Rows 2 k and 2 k + 1 of a field.
template <class Image> PYXCC_INLINE auto pairOf(const Field<Image>& field, int k)
{
    return RowPair{field.row(2 * k), field.row(2 * k + 1)};
}

template <class Image> PYXCC_INLINE auto packedPairOf(const Field<Image>& field, int k)
{
    return PackedRowPair{field.row(2 * k), field.row(2 * k + 1)};
}

/// Row k of a field of `rows` rows between those above and below it; the rows at the ends stand for those beyond.
template <class Image> PYXCC_INLINE auto around(const Field<Image>& field, int k, int rows)
{
    return together(field.row(std::max(k - 1, 0)), field.row(k), field.row(std::min(k + 1, rows - 1)));
}

/// Calls convert(k, parity, form) for both fields of each four rows of the frame.
template <class Top, class Bottom, class Convert>
void eachFour(int height, const Top& top, const Bottom& bottom, const Convert& convert)
{
    for (int k = 0; k < height / 4; ++k) {
        convert(k, 0, top);
        convert(k, 1, bottom);
    }
}

void doubleFields(const BytePlane<const u8>& source, const BytePlane<u8>& target, int width, int height)
{
    eachFour(height, TopFieldDoubled{}, BottomFieldDoubled{}, [&](int k, int parity, const auto& form) {
        convertColumns(around(fieldOf(source, parity), k, height / 4), pairOf(fieldOf(target, parity), k), 0, width,
                       form);
    });
}

void halveFields(const BytePlane<const u8>& source, const BytePlane<u8>& target, int width, int height)
{
    eachFour(height, TopFieldHalved{}, BottomFieldHalved{}, [&](int k, int parity, const auto& form) {
        convertColumns(pairOf(fieldOf(source, parity), k), fieldOf(target, parity).row(k), 0, width, form);
    });
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr420To422_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 4)))
        return failure;
    const auto [width, height] = pairsAndFours(roi);
    copyPlane8u(src[0], srcStep[0], dst[0], dstStep[0], width, height);
    for (int i = 1; i < 3; ++i) doubleFields(plane(src[i], srcStep[i]), plane(dst[i], dstStep[i]), width / 2, height);
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiYCbCr422To420_Interlace_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                                        const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure =
            firstFailure(notNull(src, dst), elementsNotNull<3>(src), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 4)))
        return failure;
    const auto [width, height] = pairsAndFours(roi);
    copyPlane8u(src[0], srcStep[0], dst[0], dstStep[0], width, height);
    for (int i = 1; i < 3; ++i) halveFields(plane(src[i], srcStep[i]), plane(dst[i], dstStep[i]), width / 2, height);
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToCbYCr422_Interlace_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst,
                                                               int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 2, 4)))
        return failure;
    const auto [width, height] = pairsAndFours(roi);
    const auto luma = plane(src[0], srcStep[0]);
    const auto pairs = pairsOf(plane(src[1], srcStep[1]), plane(src[2], srcStep[2]));
    const auto target = packedPairs<false>(dst, dstStep);
    eachFour(height, TopFieldDoubled{}, BottomFieldDoubled{},
             [&, width = width, height = height](int k, int parity, const auto& form) {
                 convertColumns(
                     LumaAndPairsRow{pairOf(fieldOf(luma, parity), k), around(fieldOf(pairs, parity), k, height / 4)},
                     packedPairOf(fieldOf(target, parity), k), 0, width, byKind(Unchanged{}, form));
             });
    return warnIfOff(roi, 2, 4);
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr420_Interlace_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3],
                                                               const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 4)))
        return failure;
    const auto [width, height] = pairsAndFours(roi);
    const auto source = packedPairs<false>(src, srcStep);
    const auto luma = plane(dst[0], dstStep[0]);
    const auto pairs = pairsOf(plane(dst[1], dstStep[1]), plane(dst[2], dstStep[2]));
    eachFour(height, TopFieldHalved{}, BottomFieldHalved{}, [&, width = width](int k, int parity, const auto& form) {
        convertColumns(packedPairOf(fieldOf(source, parity), k),
                       LumaAndPairsRow{pairOf(fieldOf(luma, parity), k), fieldOf(pairs, parity).row(k)}, 0, width,
                       byKind(Unchanged{}, form));
    });
    return warnIfOff(roi, 2, 4);
}
