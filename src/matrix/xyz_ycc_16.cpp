// RGB to and from XYZ and YCC, 16 bits with and without a sign.
#include "pyxcc/xyz_ycc.h"

#include "matrix/xyz_ycc.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::matrix;

PyxStatus PYXCC_CALL pyxiRGBToXYZ_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, ToWords<RgbToXyz>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToXYZ_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, ToWords<RgbToXyz>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, ToWords<RgbToYcc<yccZerosOfWords>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, ToWords<RgbToYcc<yccZerosOfWords>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, ToWords<XyzToRgb>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, ToWords<XyzToRgb>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, ToWords<YccToRgb<yccZerosOfWords>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, ToWords<YccToRgb<yccZerosOfWords>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToXYZ_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, OnRaisedWords<ToWords<RgbToXyz>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToXYZ_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, OnRaisedWords<ToWords<RgbToXyz>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, OnRaisedWords<ToWords<RgbToYcc<yccZerosOfWords>>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToYCC_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, OnRaisedWords<ToWords<RgbToYcc<yccZerosOfWords>>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, OnRaisedWords<ToWords<XyzToRgb>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiXYZToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, OnRaisedWords<ToWords<XyzToRgb>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InC3, OnRaisedWords<ToWords<YccToRgb<yccZerosOfWords>>>>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiYCCToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convert<InAC4, OnRaisedWords<ToWords<YccToRgb<yccZerosOfWords>>>>(src, srcStep, dst, dstStep, roi);
}
