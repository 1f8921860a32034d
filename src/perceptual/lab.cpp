// RGB to CIE L*a*b* and back.
#include "pyxcc/lab.h"

#include "layouts/float_images.hpp"
#include "perceptual/hue_images.hpp"
#include "perceptual/lab_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::perceptual;

namespace
{

auto toLabOfFloats() { return wideThenTail<8>(RgbToLab<LabOfFloats, FusedSums>{}, RgbToLab<LabOfFloats, PlainSums>{}); }

auto toLabOfBytes() { return wideThenTail<8>(RgbToLabOfBytes{}, RgbToLabCut<LabOfBytes>{}); }

template <class Depth, int Block> auto toLab()
{
    return wideThenTail<Block>(RgbToLab<Depth, FusedSums>{}, RgbToLabCut<Depth>{});
}

template <class Depth, int Block> auto toRgb()
{
    return wideThenTail<Block>(LabToRgb<Depth, FusedSums>{}, LabToRgb<Depth, PlainSums>{});
}

template <class Depth, int Block> auto toBgr()
{
    return wideThenTail<Block>(LabToBgr<Depth, FusedSums>{}, LabToBgr<Depth, PlainSums>{});
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, reversed(c3(src, srcStep)), c3(dst, dstStep), toLabOfFloats());
}

PyxStatus PYXCC_CALL pyxiBGRToLab_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, reversed(c3Eights(src, srcStep)), c3Eights(dst, dstStep), toLab<LabOfWords, 4>());
}

PyxStatus PYXCC_CALL pyxiBGRToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, reversed(c3Eights(src, srcStep)), c3Eights(dst, dstStep), toLabOfBytes());
}

PyxStatus PYXCC_CALL pyxiLabToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3Eights(src, srcStep), reversed(c3Eights(dst, dstStep)), toRgb<OfLabWords, 4>());
}

PyxStatus PYXCC_CALL pyxiLabToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), reversed(c3(dst, dstStep)), toRgb<OfLabFloats, 8>());
}

PyxStatus PYXCC_CALL pyxiLabToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3ForFactors(src, srcStep), c3ForFactors(dst, dstStep), toBgr<OfLabBytes, 8>());
}

PyxStatus PYXCC_CALL pyxiLabToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), c3(dst, dstStep), toRgb<OfLabFloats, 8>());
}

PyxStatus PYXCC_CALL pyxiLabToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3ForFactors(src, srcStep), c3ForFactors(dst, dstStep), toRgb<OfLabBytes, 8>());
}

PyxStatus PYXCC_CALL pyxiRGBToLab_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), c3(dst, dstStep), toLabOfFloats());
}

PyxStatus PYXCC_CALL pyxiRGBToLab_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3Eights(src, srcStep), c3Eights(dst, dstStep), toLabOfBytes());
}
