// Gray to colour, and the luma of packed 4:2:2.
#include "pyxcc/gray.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/gray_images.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;

namespace
{

template <class Sample> PyxStatus grayToC3(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c1(src, srcStep), c3Gray(dst, dstStep), everyPixel(Unchanged{}));
}

template <class Sample>
PyxStatus grayToC4(const Sample* src, int srcStep, Sample* dst, int dstStep, RoiSize roi, Sample aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c1(src, srcStep), c4Gray(dst, dstStep, aval), everyPixel(Unchanged{}));
}

} // namespace

PyxStatus PYXCC_CALL pyxiGrayToRGB_8u_C1C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return grayToC3(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiGrayToRGB_8u_C1C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    return grayToC4(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus PYXCC_CALL pyxiGrayToRGB_16u_C1C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return grayToC3(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiGrayToRGB_16u_C1C4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi, u16 aval)
{
    return grayToC4(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus PYXCC_CALL pyxiGrayToRGB_32f_C1C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return grayToC3(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiGrayToRGB_32f_C1C4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 aval)
{
    return grayToC4(src, srcStep, dst, dstStep, roi, aval);
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToGray_8u_C2C1R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, lumaOfC2(src, srcStep), c1(dst, dstStep), everyPixel(Unchanged{}));
}
