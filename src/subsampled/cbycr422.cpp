// RGB to packed CbYCr 4:2:2 and back, BT.601.
#include "pyxcc/cbycr422.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/pixel_before.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"
#include "subsampled/row_filter.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

constexpr auto lone = pairs(lumaExact, chromaNearest<1>);

template <class Samples> PyxStatus filtered(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, withPixelBefore(c3(src, srcStep)), c2ChromaFirst(dst, dstStep),
                   spans(upTo<wholePairs, everyColumn>, FilteredPairs<Samples>{}, lonePixel<Samples>(lone)));
}

} // namespace

PyxStatus PYXCC_CALL pyxiRGBToCbYCr422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return filtered<AsStored>(src, srcStep, dst, dstStep, roi);
}

PyxStatus PYXCC_CALL pyxiRGBToCbYCr422Gamma_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return filtered<GammaCorrected>(src, srcStep, dst, dstStep, roi);
}

/// The lone last pixel is taken for R, G, B.
PyxStatus PYXCC_CALL pyxiBGRToCbYCr422_8u_AC4C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, reversed(ac4<Order::any>(src, srcStep)), c2ChromaFirst<Order::any>(dst, dstStep),
                   spans(upTo<wholePairs, everyColumn>, pairs(lumaHigh7, chromaHighS<64>), redAndBlueExchanged(lone)));
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c2ChromaFirstFromBefore(src, srcStep), c3(dst, dstStep), wideThenTail<8>(invHighC, invExactD));
}

PyxStatus PYXCC_CALL pyxiCbYCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eachRow(roi, c2ChromaFirstFromBefore<Order::ofWords>(src, srcStep),
                   reversed(c4<Order::ofWords>(dst, dstStep, aval)), wideThenTail<8>(invHighD, invExactD));
}
