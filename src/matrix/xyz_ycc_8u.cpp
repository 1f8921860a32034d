// RGB to and from XYZ and YCC, 8 bits.
#include "pyxcc/xyz_ycc.h"

#include "matrix/xyz_ycc.hpp"

using namespace pyxcc::matrix;

PyxStatus PYXCC_CALL pyxiRGBToXYZ_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, RgbToXyzBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToXYZ_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, RgbToXyzBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, RgbToYccBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, RgbToYccBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, XyzToRgbBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, XyzToRgbBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, YccToRgbBytes>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, YccToRgbBytes>(src, srcStep, dst, dstStep, roi);
}
