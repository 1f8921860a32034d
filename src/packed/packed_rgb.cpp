// Packed 16-bit pixels to 8-bit RGB and back, and to BT.601 YCbCr and full-range YUV with shared chroma. A field is
// taken as the leading bits of a byte, the rest of which is 0; from there the forms are those of bytes.
#include "pyxcc/packed_rgb.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/shared_chroma.hpp"
#include "packed/chroma_of_fours.hpp"
#include "packed/models.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"
#include "subsampled/wide_spans.hpp"
#include "subsampled/yuv_forms.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::packed;
using namespace pyxcc::subsampled;

namespace
{

// Both channel orders are one conversion: the first channel is the low field.

PyxStatus unpacked(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, packedPixelsApart<fields565>(src, srcStep), c3(dst, dstStep), everyPixel(Unchanged{}));
}

PyxStatus packedAs565(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c3(src, srcStep), packedPixels<fields565>(dst, dstStep), everyPixel(Unchanged{}));
}

/// Chroma of the sums over so many pixels.
template <int Pixels> constexpr auto exactly = pairs(lumaExact, chromaEighth<Pixels>);

/// Planes in which what is left of a block has chroma of its own.
auto everyPart(u8* const dst[3], const int dstStep[3])
{
    return p3<2, Order::ofMemory, Rest::withChroma>(dst, dstStep);
}

/// A lone last pixel has chroma of its own, as far as the target has a place for it.
template <class Source, class Target> PyxStatus to422(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, spans(upTo<wholePairs, everyColumn>, exactly<2>, exactly<1>));
}

/// Chroma is that of the pixels that there are, four, two or one.
template <class Source, class Target> PyxStatus to420(RoiSize roi, const Source& source, const Target& target)
{
    return eachRowByPairs(roi, source, target, spans(upTo<wholePairs, everyColumn>, exactly<4>, exactly<2>),
                          spans(upTo<wholePairs, everyColumn>, exactly<2>, exactly<1>));
}

template <class Source> PyxStatus to411(RoiSize roi, const Source& source, u8* const dst[3], const int dstStep[3])
{
    eachRow(roi, source, p3<4>(dst, dstStep), spans(upTo<wholeFours>, fours(lumaExact, ChromaOfFours{})));
    return warnIfOff(roi, 4, 1);
}

template <class Source, class Form>
PyxStatus toYuv420(RoiSize roi, const Source& source, u8* const dst[3], const int dstStep[3], Form form)
{
    eachRowPair(roi, source, p3<2>(dst, dstStep), spans(upTo<wholePairs>, form));
    return warnIfOff(roi, 2, 2);
}

/// Luma rounds, unlike that of the form for bytes.
constexpr auto yuv420Nearest16 = pairs(YuvLumaNearest{}, YuvChroma16{});

PyxStatus failureOf(const u16* src, u8* const dst[3], RoiSize roi, int width, int height)
{
    return firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, width, height));
}

} // namespace

PyxStatus PYXCC_CALL pyxiBGR565ToBGR_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return unpacked(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGB565ToRGB_16u8u_C3R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return unpacked(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiBGRToBGR565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packedAs565(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToRGB565_8u16u_C3R(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return packedAs565(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 2, 1))) return failure;
    return to422(roi, models::BGR555(src, srcStep), c2LumaFirst(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr422_16u8u_C3C2R(const u16* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 2, 1))) return failure;
    return to422(roi, models::BGR565(src, srcStep), c2LumaFirst(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 1)) return failure;
    return to422(roi, models::BGR555(src, srcStep), everyPart(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 1)) return failure;
    return to422(roi, models::BGR565(src, srcStep), everyPart(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return to420(roi, models::BGR555(src, srcStep), everyPart(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return to420(roi, models::BGR565(src, srcStep), everyPart(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiBGR555ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return to420(roi, models::BGR555(src, srcStep), chromaExchanged(everyPart(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiBGR565ToYCrCb420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return to420(roi, models::BGR565(src, srcStep), chromaExchanged(everyPart(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiBGR555ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 4, 1)) return failure;
    return to411(roi, models::BGR555(src, srcStep), dst, dstStep);
}

PyxStatus PYXCC_CALL pyxiBGR565ToYCbCr411_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3],
                                                      const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 4, 1)) return failure;
    return to411(roi, models::BGR565(src, srcStep), dst, dstStep);
}

PyxStatus PYXCC_CALL pyxiBGR555ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return toYuv420(roi, models::BGR555(src, srcStep), dst, dstStep, yuv420Nearest16);
}

PyxStatus PYXCC_CALL pyxiBGR565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 2, 2)) return failure;
    return toYuv420(roi, models::BGR565(src, srcStep), dst, dstStep, yuv420Nearest16);
}

PyxStatus PYXCC_CALL pyxiRGB565ToYUV420_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 1, 1)) return failure;
    return toYuv420(roi, models::RGB565(src, srcStep), dst, dstStep, yuv420Exact16);
}

PyxStatus PYXCC_CALL pyxiRGB565ToYUV422_16u8u_C3P3R(const u16* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                    RoiSize roi)
{
    if (const PyxStatus failure = failureOf(src, dst, roi, 1, 1)) return failure;
    eachRow(roi, models::RGB565(src, srcStep), p3<2>(dst, dstStep), spans(upTo<wholePairs>, yuv422Exact65535));
    return warnIfOff(roi, 2, 1);
}
