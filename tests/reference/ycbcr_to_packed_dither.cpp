#include "reference/ycbcr_to_packed_dither.hpp"

#include "reference/packed_output.hpp"

namespace reference
{

PyxStatus pyxiYCbCr420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr444, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr555, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr565, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb444, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb555, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb565, dithered}, roi, invHighE);
}

PyxStatus pyxiYCbCr422ToBGR444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr444, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr444, dithered}, roi);
}

PyxStatus pyxiYCbCr422ToBGR555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr555, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr555, dithered}, roi);
}

PyxStatus pyxiYCbCr422ToBGR565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr565, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr565, dithered}, roi);
}

PyxStatus pyxiYCbCr422ToRGB444Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb444, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb444, dithered}, roi);
}

PyxStatus pyxiYCbCr422ToRGB555Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb555, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb555, dithered}, roi);
}

PyxStatus pyxiYCbCr422ToRGB565Dither_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb565, dithered}, roi, highE);
}

PyxStatus pyxiYCbCr422ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                                 RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb565, dithered}, roi);
}

PyxStatus pyxiYCbCrToBGR444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr444, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToBGR444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr444, dithered}, roi);
}

PyxStatus pyxiYCbCrToBGR555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr555, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToBGR555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr555, dithered}, roi);
}

PyxStatus pyxiYCbCrToBGR565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr565, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToBGR565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr565, dithered}, roi);
}

PyxStatus pyxiYCbCrToRGB444Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb444, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToRGB444Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb444, dithered}, roi);
}

PyxStatus pyxiYCbCrToRGB555Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb555, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToRGB555Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb555, dithered}, roi);
}

PyxStatus pyxiYCbCrToRGB565Dither_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb565, dithered}, roi, highE);
}

PyxStatus pyxiYCbCrToRGB565Dither_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb565, dithered}, roi);
}

PyxStatus pyxiYUV420ToBGR444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr444, dithered}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToBGR555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr555, dithered}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToBGR565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr565, dithered}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB444Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb444, dithered}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB555Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb555, dithered}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB565Dither_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                               RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb565, dithered}, roi, yuvInvHighPacked);
}

} // namespace reference
