// Packed CbYCr 4:2:2 from other forms of YCbCr and to them: samples are moved, doubled or dropped, never computed.
#include "pyxcc/cbycr422.h"

#include "subsampled/repack_exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::subsampled;

// clang-format off

//     name                              source                    rule         target               size
REPACK(pyxiCbYCr422ToYCbCr422_8u_C2P3R,  C2, chromaFirst,          SameGrid422, P3, asTheyAre,       least2x1)
REPACK(pyxiYCbCr422ToCbYCr422_8u_P3C2R,  P3, asTheyAre,            SameGrid422, C2, chromaFirst,     least2x1)
REPACK(pyxiCbYCr422ToYCbCr411_8u_C2P3R,  C2, chromaFirst,          ColSkip,     P3, asTheyAre,       least4)
REPACK(pyxiCbYCr422ToYCbCr420_8u_C2P2R,  C2, chromaFirst,          RowSkip,     P2, asTheyAre,       least2x2)
REPACK(pyxiCbYCr422ToYCbCr420_8u_C2P3R,  C2, chromaFirst,          RowSkip,     P3, asTheyAre,       least2x2)
REPACK(pyxiCbYCr422ToYCrCb420_8u_C2P3R,  C2, chromaFirst,          RowSkip,     P3, exchangedPlanes, least2x2)
REPACK(pyxiYCbCr420ToCbYCr422_8u_P2C2R,  P2, asTheyAre,            RowDouble,   C2, chromaFirst,     least2x2)
REPACK(pyxiYCrCb420ToCbYCr422_8u_P3C2R,  P3, exchangedButForSteps, RowDouble,   C2, chromaFirst,     least2x2)

// clang-format on

// Between the two packed forms the bytes of each pixel change places.

PyxStatus PYXCC_CALL pyxiCbYCr422ToYCbCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), least2x1(roi))) return failure;
    return rearrangeFours<1, 0, 3, 2>(roi, src, srcStep, dst, dstStep);
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToCbYCr422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), least2x1(roi))) return failure;
    return rearrangeFours<1, 0, 3, 2>(roi, src, srcStep, dst, dstStep);
}
