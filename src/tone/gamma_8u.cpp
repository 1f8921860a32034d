// Gamma of 8-bit samples: a table of 256.
#include "pyxcc/gamma.h"

#include "tone/gamma_forms.hpp"
#include "tone/gamma_images.hpp"
#include "tone/gamma_tables.hpp"

using namespace pyxcc::tone;

namespace
{

template <const pyxcc::ByteCurve& curve, class Images> PyxStatus gamma(const Images& images)
{
    if (const PyxStatus failure = images.failure()) return failure;
    images.through(EachSample<GammaOfBytes<curve>>{});
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gamma<gammaForward>(onC3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<gammaForward>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gamma<gammaForward>(onAC4(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<gammaForward>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    return gamma<gammaForward>(onP3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return gamma<gammaForward>(onP3<u8>(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gamma<gammaInverse>(onC3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_C3IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<gammaInverse>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return gamma<gammaInverse>(onAC4(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_AC4IR(u8* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<gammaInverse>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep,
                                         RoiSize roi)
{
    return gamma<gammaInverse>(onP3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_8u_IP3R(u8* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return gamma<gammaInverse>(onP3<u8>(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}
