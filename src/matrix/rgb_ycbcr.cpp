#include "pyxcc/rgb_ycbcr.h"
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4P3R(const u8*, int, u8* const*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_AC4R(const u8*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3P3R(const u8*, int, u8* const*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_C3R(const u8*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiRGBToYCbCr_8u_P3R(const u8* const*, int, u8* const*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C3R(const u8* const*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToBGR_8u_P3C4R(const u8* const*, int, u8*, int, RoiSize, u8) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_AC4R(const u8*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_C3R(const u8*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C3R(const u8* const*, int, u8*, int, RoiSize) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3C4R(const u8* const*, int, u8*, int, RoiSize, u8) { return pyxOk; }
PyxStatus PYXCC_CALL pyxiYCbCrToRGB_8u_P3R(const u8* const*, int, u8* const*, int, RoiSize) { return pyxOk; }
