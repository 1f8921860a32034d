// Gamma of floats between two bounds. The bounds are tested before anything else.
#include "pyxcc/gamma.h"

#include "tone/gamma_forms.hpp"
#include "tone/gamma_images.hpp"

using namespace pyxcc::tone;

namespace
{

/// A NaN among the bounds passes.
bool isEmpty(f32 vMin, f32 vMax) { return 0 >= vMax - vMin; }

template <class Curve, class Images> PyxStatus gamma(const Images& images, f32 vMin, f32 vMax)
{
    if (isEmpty(vMin, vMax)) return pyxErrRange;
    if (const PyxStatus failure = images.failure()) return failure;
    images.through(EachSample<GammaBetween<Curve>>{{vMin, vMax}});
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin,
                                          f32 vMax)
{
    return gamma<ForwardCurve>(onC3(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<ForwardCurve>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin,
                                           f32 vMax)
{
    return gamma<ForwardCurve>(onAC4(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<ForwardCurve>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep,
                                          RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<ForwardCurve>(onP3(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaFwd_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<ForwardCurve>(onP3<f32>(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin,
                                          f32 vMax)
{
    return gamma<InverseCurve>(onC3(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_C3IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<InverseCurve>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi, f32 vMin,
                                           f32 vMax)
{
    return gamma<InverseCurve>(onAC4(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_AC4IR(f32* srcDst, int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<InverseCurve>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_P3R(const f32* const src[3], int srcStep, f32* const dst[3], int dstStep,
                                          RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<InverseCurve>(onP3(src, srcStep, dst, dstStep, roi), vMin, vMax);
}

PyxStatus PYXCC_CALL pyxiGammaInv_32f_IP3R(f32* const srcDst[3], int srcDstStep, RoiSize roi, f32 vMin, f32 vMax)
{
    return gamma<InverseCurve>(onP3<f32>(srcDst, srcDstStep, srcDst, srcDstStep, roi), vMin, vMax);
}
