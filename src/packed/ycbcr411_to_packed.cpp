// YCbCr with chroma shared by four columns of a row to packed 16-bit pixels, their fields cut. Up to three columns at
// the end take the last whole chroma sample.
#include "pyxcc/ycbcr_to_packed.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "packed/inverse_forms.hpp"
#include "packed/models.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::packed;

#define FROM_P3_OF_FOURS(Target)                                                                                       \
    PyxStatus PYXCC_CALL pyxiYCbCr411To##Target##_8u16u_P3C3R(const u8* const src[3], const int srcStep[3], u16* dst,  \
                                                              int dstStep, RoiSize roi)                                \
    {                                                                                                                  \
        if (const PyxStatus failure =                                                                                  \
                firstFailure(notNull(src, dst), sizeAtLeast(roi, 4, 1), elementsNotNull<3>(src)))                      \
            return failure;                                                                                            \
        eachRow(roi, p3<4>(src, srcStep), models::Target(dst, dstStep), wideThenTail<4>(invHighE, invExactB));         \
        return warnIfOff(roi, 4, 1);                                                                                   \
    }
FROM_P3_OF_FOURS(BGR555)
FROM_P3_OF_FOURS(BGR565)
