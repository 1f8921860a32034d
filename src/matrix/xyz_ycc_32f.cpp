// RGB to and from XYZ and YCC, floats.
#include "pyxcc/xyz_ycc.h"

#include "matrix/xyz_ycc.hpp"

using namespace pyxcc::matrix;

PyxStatus PYXCC_CALL pyxiRGBToXYZ_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, ThirdHeld<RgbToXyz>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToXYZ_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, ThirdHeld<RgbToXyz>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, RgbToYcc<yccZeros>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, RgbToYcc<yccZeros>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, Held<XyzToRgb>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, Held<XyzToRgb>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, Held<YccToRgb<yccZeros>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, Held<YccToRgb<yccZeros>>>(src, srcStep, dst, dstStep, roi);
}
