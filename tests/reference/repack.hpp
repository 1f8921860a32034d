// YCbCr moved between chroma grids and layouts, and resampled between grids.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

PyxStatus pyxiYCbCr1620To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                    const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411To420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3],
                                   RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);
PyxStatus pyxiYCbCr411ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);
PyxStatus pyxiYCbCr411ToYCrCb422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* const dst[3],
                                const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep, u8* dstCbCr,
                                int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr420To1620_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                    const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420To411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], const int dstStep[3],
                                   RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr411_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr422_8u_P2C2R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* dst,
                                          int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr422_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                          u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u8* const dst[3],
                                const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep, u8* dstCbCr,
                                int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr411_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr411_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr420_8u_C2P2R(const u8* src, int srcStep, u8* dstY, int dstYStep, u8* dstCbCr,
                                          int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCbCr420_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr422ToYCrCb420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiYCbCr422ToYCrCb422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCbCr422ToYCrCb422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);
PyxStatus pyxiYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToYCbCr411_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToYCbCr420_8u_P3P2R(const u8* const src[3], const int srcStep[3], u8* dstY, int dstYStep,
                                          u8* dstCbCr, int dstCbCrStep, RoiSize roi);
PyxStatus pyxiYCrCb420ToYCbCr422_8u_P3C2R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                          RoiSize roi);
PyxStatus pyxiYCrCb420ToYCbCr422_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3],
                                        const int dstStep[3], RoiSize roi);
PyxStatus pyxiYCrCb422ToYCbCr411_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiYCrCb422ToYCbCr420_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);
PyxStatus pyxiYCrCb422ToYCbCr422_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                          RoiSize roi);

} // namespace reference
