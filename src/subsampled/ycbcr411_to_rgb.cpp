// BT.601 YCbCr with chroma shared by four columns of a row to RGB.
#include "pyxcc/subsampled_to_rgb.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "matrix/bt601_forms.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;
using namespace pyxcc::subsampled;

namespace
{

template <class Target>
PyxStatus toPixels(RoiSize roi, const u8* const src[3], const int srcStep[3], const Target& target)
{
    return eachRow(roi, p3<4>(src, srcStep), target, spans(upTo<wholeFoursOrThree, everyColumn>, invHighA, invExactE));
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 4, 1)))
        return failure;
    return toPixels(roi, src, srcStep, reversed(c3(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiYCbCr411ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 4, 1)))
        return failure;
    return toPixels(roi, src, srcStep, reversed(c4(dst, dstStep, aval)));
}
