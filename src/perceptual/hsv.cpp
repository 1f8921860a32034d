// RGB to HSV and back, interleaved.
#include "pyxcc/hsv.h"

#include "perceptual/hsv_blocks.hpp"
#include "perceptual/hsv_forms.hpp"
#include "perceptual/hue_images.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::perceptual;

PyxStatus PYXCC_CALL pyxiRGBToHSV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(RgbToHsv{}, RgbToHsvTail{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHSV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(RgbToHsv{}, RgbToHsvTail{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHSV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, everyPixel(RgbToHsvOfWords{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHSV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, everyPixel(RgbToHsvOfWords{}));
}

PyxStatus PYXCC_CALL pyxiHSVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HsvToRgb<u8>{}, HsvToRgbTail<u8>{}));
}

PyxStatus PYXCC_CALL pyxiHSVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HsvToRgb<u8>{}, HsvToRgbTail<u8>{}));
}

PyxStatus PYXCC_CALL pyxiHSVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HsvToRgb<u16>{}, HsvToRgbTail<u16>{}));
}

PyxStatus PYXCC_CALL pyxiHSVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HsvToRgb<u16>{}, HsvToRgbTail<u16>{}));
}
