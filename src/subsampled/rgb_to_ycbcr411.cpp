// RGB to BT.601 YCbCr with chroma shared by four columns of a row.
#include "pyxcc/rgb_to_subsampled.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "layouts/shared_chroma.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"
#include "subsampled/wide_spans.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

constexpr auto tail = fours(lumaExact, chromaEighth<4>);

} // namespace

PyxStatus PYXCC_CALL pyxiBGRToYCbCr411_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 4, 1)))
        return failure;
    eachRow(roi, reversed(c3(src, srcStep)), p3<4>(dst, dstStep),
            spans(upTo<blocksOf<16>, wholeFours>, fours(lumaRoundPlain, chromaRoundPlain4), tail));
    return warnIfOff(roi, 4, 1);
}

/// Columns behind the last whole four get luma.
PyxStatus PYXCC_CALL pyxiBGRToYCbCr411_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3],
                                                 RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(dst), sizeAtLeast(roi, 4, 1)))
        return failure;
    eachRow(roi, reversed(ac4<Order::any>(src, srcStep)), p3<4, Order::any>(dst, dstStep),
            spans(upTo<blocksOf<32>, everyColumn>, fours(lumaHigh7, chromaHighU4), tail));
    return warnIfOff(roi, 4, 1);
}
