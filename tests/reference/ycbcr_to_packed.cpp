#include "reference/ycbcr_to_packed.hpp"

#include "reference/bt601.hpp"
#include "reference/packed_output.hpp"

namespace reference
{

namespace
{

constexpr RowForms highEThenExactA = {8, invHighE, invExactA};
constexpr RowForms highDThenExactD = {8, invHighD, invExactD};
constexpr RowForms highEThenExactB = {4, invHighE, invExactB};

} // namespace

PyxStatus pyxiYCbCr411ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack411P3(src, srcStep, {dst, dstStep, bgr555, cut}, roi, highEThenExactB);
}

PyxStatus pyxiYCbCr411ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack411P3(src, srcStep, {dst, dstStep, bgr565, cut}, roi, highEThenExactB);
}

PyxStatus pyxiYCbCr420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr444, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr555, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr565, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb444, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb555, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb565, cut}, roi, invHighE);
}

PyxStatus pyxiYCbCr422ToBGR444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr444, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCr422ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr444, cut}, roi);
}

PyxStatus pyxiYCbCr422ToBGR555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr555, cut}, roi, highDThenExactD);
}

PyxStatus pyxiYCbCr422ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr555, cut}, roi);
}

PyxStatus pyxiYCbCr422ToBGR565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, bgr565, cut}, roi, highDThenExactD);
}

PyxStatus pyxiYCbCr422ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, bgr565, cut}, roi);
}

PyxStatus pyxiYCbCr422ToRGB444_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb444, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCr422ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb444, cut}, roi);
}

PyxStatus pyxiYCbCr422ToRGB555_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb555, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCr422ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb555, cut}, roi);
}

PyxStatus pyxiYCbCr422ToRGB565_8u16u_C2C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return pack422C2(src, srcStep, {dst, dstStep, rgb565, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCr422ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                           RoiSize roi)
{
    return pack422P3(src, srcStep, {dst, dstStep, rgb565, cut}, roi);
}

PyxStatus pyxiYCbCrToBGR444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr444, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToBGR444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr444, cut}, roi);
}

PyxStatus pyxiYCbCrToBGR555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr555, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToBGR555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr555, cut}, roi);
}

PyxStatus pyxiYCbCrToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, bgr565, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToBGR565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, bgr565, cut}, roi);
}

PyxStatus pyxiYCbCrToRGB444_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb444, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToRGB444_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb444, cut}, roi);
}

PyxStatus pyxiYCbCrToRGB555_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb555, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToRGB555_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb555, cut}, roi);
}

PyxStatus pyxiYCbCrToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packC3(src, srcStep, {dst, dstStep, rgb565, cut}, roi, highEThenExactA);
}

PyxStatus pyxiYCbCrToRGB565_8u16u_P3C3R(const u8* const src[3], int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packP3(src, srcStep, {dst, dstStep, rgb565, cut}, roi);
}

PyxStatus pyxiYUV420ToBGR444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr444, cut}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToBGR555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr555, cut}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToBGR565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, bgr565, cut}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB444_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb444, cut}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB555_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb555, cut}, roi, yuvInvHighPacked);
}

PyxStatus pyxiYUV420ToRGB565_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst, int dstStep,
                                         RoiSize roi)
{
    return pack420P3(src, srcStep, {dst, dstStep, rgb565, cut}, roi, yuvInvHighPacked);
}

} // namespace reference
