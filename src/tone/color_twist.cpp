// Colour twists of integer samples: a 3 by 4 matrix of the caller's over every pixel.
#include "pyxcc/color_twist.h"

#include "tone/color_twist.hpp"

using namespace pyxcc::tone;

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                              const f32 twist[3][4])
{
    return twistC3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistC3(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return twistAC4(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                              RoiSize roi, const f32 twist[3][4])
{
    return twistP3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistP3<u8>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                              const f32 twist[3][4])
{
    return twistC3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_C3IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistC3(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4R(const s8* src, int srcStep, s8* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return twistAC4(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_AC4IR(s8* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_P3R(const s8* const src[3], int srcStep, s8* const dst[3], int dstStep,
                                              RoiSize roi, const f32 twist[3][4])
{
    return twistP3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_8s_IP3R(s8* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistP3<s8>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return twistC3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistC3(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return twistAC4(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep,
                                               RoiSize roi, const f32 twist[3][4])
{
    return twistP3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return twistP3<u16>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                               const f32 twist[3][4])
{
    return twistC3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_C3IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistC3(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return twistAC4(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_AC4IR(s16* srcDst, int srcDstStep, RoiSize roi, const f32 twist[3][4])
{
    return twistAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_P3R(const s16* const src[3], int srcStep, s16* const dst[3], int dstStep,
                                               RoiSize roi, const f32 twist[3][4])
{
    return twistP3(src, srcStep, dst, dstStep, roi, twist);
}

PyxStatus PYXCC_CALL pyxiColorTwist32f_16s_IP3R(s16* const srcDst[3], int srcDstStep, RoiSize roi,
                                                const f32 twist[3][4])
{
    return twistP3<s16>(srcDst, srcDstStep, srcDst, srcDstStep, roi, twist);
}
