// RGB to HLS and back, interleaved.
#include "pyxcc/hls.h"

#include "perceptual/hls_float_forms.hpp"
#include "perceptual/hls_to_rgb_blocks.hpp"
#include "perceptual/hue_images.hpp"
#include "perceptual/rgb_to_hls_blocks.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::perceptual;

PyxStatus PYXCC_CALL pyxiRGBToHLS_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<8>(RgbToHls<u8>{}, RgbToHlsTail<u8, Truncated>{}));
}

/// The only tail here that rounds to nearest.
PyxStatus PYXCC_CALL pyxiRGBToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(RgbToHls<u8>{}, RgbToHlsTail<u8, Nearest>{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(RgbToHls<u16>{}, RgbToHlsTail<u16, Truncated>{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(RgbToHls<u16>{}, RgbToHlsTail<u16, Truncated>{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi,
                    wideThenTail<4>(OnRaisedWords<RgbToHls<u16>>{}, OnRaisedWords<RgbToHlsTail<u16, Truncated>>{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi,
                     wideThenTail<4>(OnRaisedWords<RgbToHls<u16>>{}, OnRaisedWords<RgbToHlsTail<u16, Truncated>>{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, everyPixel(RgbToHlsOfFloats{}));
}

PyxStatus PYXCC_CALL pyxiRGBToHLS_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, everyPixel(RgbToHlsOfFloats{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<8>(HlsToRgb<u8>{}, HlsToRgbTailOfBytes{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<8>(HlsToRgb<u8>{}, HlsToRgbTailOfBytes{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HlsToRgb<u16>{}, HlsToRgbTailOfWords{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HlsToRgb<u16>{}, HlsToRgbTailOfWords{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi,
                    wideThenTail<4>(OnRaisedWords<HlsToRgb<u16>>{}, OnRaisedWords<HlsToRgbTailOfWords>{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi,
                     wideThenTail<4>(OnRaisedWords<HlsToRgb<u16>>{}, OnRaisedWords<HlsToRgbTailOfWords>{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return eachOfC3(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HlsToRgbOfFloats{}, HlsToRgbTailOfFloats{}));
}

PyxStatus PYXCC_CALL pyxiHLSToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return eachOfAC4(src, srcStep, dst, dstStep, roi, wideThenTail<4>(HlsToRgbOfFloats{}, HlsToRgbTailOfFloats{}));
}
