// RGB to CIE L*u*v* and back.
#include "pyxcc/luv.h"

#include "layouts/float_images.hpp"
#include "perceptual/hue_images.hpp"
#include "perceptual/luv_by_power.hpp"
#include "perceptual/luv_inverse_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::perceptual;

namespace
{

auto toLuvOfFloats() { return wideThenTail<8>(RgbToLuvOfFloats(127.998046875f), RgbToLuvOfFloatsTail{}); }
auto toLuvOfFloatsAC4() { return wideThenTail<4>(RgbToLuvOfFloats(128.0f), RgbToLuvOfFloatsTail{}); }
auto toRgbOfFloats() { return wideThenTail<8>(LuvToRgbOfFloats{}, LuvToRgbOfFloatsTail{}); }
auto toRgbOfBytes() { return wideThenTail<8>(LuvToRgbOfBytesC3{}, LuvToRgbTail<255>{}); }

template <class Rounding> auto toLuvOfWords()
{
    return wideThenTail<4>(RgbToLuvOfWords{}, RgbToLuvOfWordsTail<Rounding>{});
}
auto toLuvOfSignedWords()
{
    return wideThenTail<4>(OnRaisedWords<RgbToLuvOfWords>{}, OnRaisedWords<RgbToLuvOfWordsTail<NearestOfLuv>>{});
}
auto toRgbOfWords() { return wideThenTail<4>(LuvToRgbOfWords{}, LuvToRgbTail<65535>{}); }
auto toRgbOfSignedWords()
{
    return wideThenTail<4>(OnRaisedWords<LuvToRgbOfWords>{}, OnRaisedWords<LuvToRgbTail<65535>>{});
}

} // namespace

PyxStatus PYXCC_CALL pyxiRGBToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), c3(dst, dstStep), toLuvOfFloats());
}

PyxStatus PYXCC_CALL pyxiBGRToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, reversed(c3(src, srcStep)), c3(dst, dstStep), toLuvOfFloats());
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, ac4ForFloats(src, srcStep), ac4ForFloats(dst, dstStep), toLuvOfFloatsAC4());
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3Eights(src, srcStep), c3Eights(dst, dstStep), everyPixel(RgbToLuvOfBytes{}));
}

PyxStatus PYXCC_CALL pyxiBGRToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, reversed(c3Eights(src, srcStep)), c3Eights(dst, dstStep),
                   everyPixel(RgbToLuvOfBytes{}));
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, ac4ForFloats(src, srcStep), ac4ForFloats(dst, dstStep),
                   everyPixel(RgbToLuvByPower{}));
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, toLuvOfWords<NearestOfLuv>());
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, toLuvOfWords<TruncOfLuv>());
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, toLuvOfSignedWords());
}

PyxStatus PYXCC_CALL pyxiRGBToLUV_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, toLuvOfSignedWords());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), c3(dst, dstStep), toRgbOfFloats());
}

PyxStatus PYXCC_CALL pyxiLUVToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3(src, srcStep), reversed(c3(dst, dstStep)), toRgbOfFloats());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, everyPixel(LuvToRgbOfFloatsTail{}));
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3Eights(src, srcStep), c3Eights(dst, dstStep), toRgbOfBytes());
}

PyxStatus PYXCC_CALL pyxiLUVToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, c3Eights(src, srcStep), reversed(c3Eights(dst, dstStep)), toRgbOfBytes());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert(src, dst, roi, ac4ForFloats(src, srcStep), ac4ForFloats(dst, dstStep),
                   wideThenTail<4>(LuvToRgbOfBytesAC4{}, LuvToRgbTail<255>{}));
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, toRgbOfWords());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, toRgbOfWords());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, toRgbOfSignedWords());
}

PyxStatus PYXCC_CALL pyxiLUVToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, toRgbOfSignedWords());
}
