// YCbCr from one layout or chroma form to another: samples are moved, doubled or dropped, never computed.
#include "pyxcc/repack.h"

#include "subsampled/repack_exports.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::subsampled;

// clang-format off

//     name                                  source                      rule                    target               size
REPACK(pyxiYCbCr420_8u_P2P3R,                P2, asTheyAre,              SameGrid420,            P3, asTheyAre,       least2x2)
REPACK(pyxiYCbCr420_8u_P3P2R,                P3, asTheyAre,              SameGrid420,            P2, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422_8u_C2P3R,                C2, asTheyAre,              SameGrid422,            P3, asTheyAre,       least2x1)
REPACK(pyxiYCbCr422_8u_P3C2R,                P3, asTheyAre,              SameGrid422,            C2, asTheyAre,       least2x1)
REPACK(pyxiYCbCr411_8u_P2P3R,                P2, asTheyAre,              SameGrid411,            P3, asTheyAre,       least4)
REPACK(pyxiYCbCr411_8u_P3P2R,                P3, asTheyAre,              SameGrid411,            P2, asTheyAre,       least4)
REPACK(pyxiYCrCb420ToYCbCr420_8u_P3P2R,      P3, exchangedButForSteps,   SameGrid420,            P2, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422ToYCrCb422_8u_P3C2R,      P3, exchangedPlanes,        SameGrid422,            C2, asTheyAre,       least2)
REPACK(pyxiYCrCb422ToYCbCr422_8u_C2P3R,      C2, asTheyAre,              SameGrid422,            P3, exchangedPlanes, least2x1)

REPACK(pyxiYCbCr420ToYCbCr422_8u_P2C2R,      P2, asTheyAre,              RowDouble,              C2, asTheyAre,       least2x2)
REPACK(pyxiYCrCb420ToYCbCr422_8u_P3C2R,      P3, exchangedButForSteps,   RowDouble,              C2, asTheyAre,       least2x2)
REPACK(pyxiYCbCr420ToYCbCr422_8u_P2P3R,      P2, asTheyAre,              RowDoubleMisplaced<32>, P3, asTheyAre,       least2x2)
REPACK(pyxiYCbCr420ToYCbCr422_8u_P3R,        P3, asTheyAre,              RowDoubleMisplaced<64>, P3, asTheyAre,       least2x2)
REPACK(pyxiYCrCb420ToYCbCr422_8u_P3R,        P3, exchangedPlanes,        RowDoubleMisplaced<64>, P3, asTheyAre,       least2x2)

REPACK(pyxiYCbCr422ToYCbCr420_8u_C2P2R,      C2, asTheyAre,              RowSkip,                P2, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422ToYCbCr420_8u_C2P3R,      C2, asTheyAre,              RowSkip,                P3, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422ToYCbCr420_8u_P3P2R,      P3, asTheyAre,              RowSkip,                P2, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422ToYCbCr420_8u_P3R,        P3, asTheyAre,              RowSkip,                P3, asTheyAre,       least2x2)
REPACK(pyxiYCbCr422ToYCrCb420_8u_C2P3R,      C2, asTheyAre,              RowSkip,                P3, exchangedPlanes, least2x2)
REPACK(pyxiYCrCb422ToYCbCr420_8u_C2P3R,      C2, asTheyAre,              RowSkip,                P3, exchangedPlanes, least2x2)

REPACK(pyxiYCbCr411ToYCbCr422_8u_P2C2R,      P2, asTheyAre,              ColDouble,              C2, asTheyAre,       least4)
REPACK(pyxiYCbCr411ToYCbCr422_8u_P2P3R,      P2, asTheyAre,              ColDouble,              P3, asTheyAre,       least4)
REPACK(pyxiYCbCr411ToYCbCr422_8u_P3C2R,      P3, asTheyAre,              ColDouble,              C2, asTheyAre,       least4)
REPACK(pyxiYCbCr411ToYCbCr422_8u_P3R,        P3, asTheyAre,              ColDouble,              P3, asTheyAre,       least4)
REPACK(pyxiYCbCr411ToYCrCb422_8u_P3C2R,      P3, exchangedPlanes,        ColDouble,              C2, asTheyAre,       least4)
REPACK(pyxiYCbCr411ToYCrCb422_8u_P3R,        P3, exchangedPlanes,        ColDouble,              P3, asTheyAre,       least4)

REPACK(pyxiYCbCr422ToYCbCr411_8u_C2P2R,      C2, asTheyAre,              ColSkip,                P2, asTheyAre,       least4)
REPACK(pyxiYCbCr422ToYCbCr411_8u_C2P3R,      C2, asTheyAre,              ColSkip,                P3, asTheyAre,       least4x1)
REPACK(pyxiYCbCr422ToYCbCr411_8u_P3P2R,      P3, asTheyAre,              ColSkip,                P2, asTheyAre,       least4)
REPACK(pyxiYCbCr422ToYCbCr411_8u_P3R,        P3, asTheyAre,              ColSkip,                P3, asTheyAre,       least4)
REPACK(pyxiYCrCb422ToYCbCr411_8u_C2P3R,      C2, asTheyAre,              ColSkip,                P3, exchangedPlanes, least4)

REPACK(pyxiYCbCr411ToYCbCr420_8u_P2P3R,      P2, asTheyAre,              RowFold,                P3, asTheyAre,       least4x2)
REPACK(pyxiYCbCr411ToYCbCr420_8u_P3P2R,      P3, asTheyAre,              RowFold,                P2, asTheyAre,       least4x2)
REPACK(pyxiYCbCr411ToYCbCr420_8u_P3R,        P3, asTheyAre,              RowFold,                P3, asTheyAre,       least4x2)
REPACK(pyxiYCbCr411ToYCrCb420_8u_P2P3R,      P2, asTheyAre,              RowFold,                P3, exchangedPlanes, least4x2)

REPACK(pyxiYCbCr420ToYCbCr411_8u_P2P3R,      P2, asTheyAre,              RowUnfold,              P3, asTheyAre,       least4x2)
REPACK(pyxiYCbCr420ToYCbCr411_8u_P3P2R,      P3, asTheyAre,              RowUnfold,              P2, asTheyAre,       least4x2)
REPACK(pyxiYCrCb420ToYCbCr411_8u_P3P2R,      P3, exchangedPlanes,        RowUnfold,              P2, asTheyAre,       least4x2)

// clang-format on

/// The first of each pair goes to the second plane and the second to the third, whatever they are called. Sizes below 1
/// come before the planes, those below 2 behind them.
PyxStatus PYXCC_CALL pyxiYCbCr420ToYCrCb420_8u_P2P3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                     u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1),
                                               elementsNotNull<3>(dst), sizeAtLeast(roi, 2, 2)))
        return failure;
    return repack<SameGrid420>(roi, asTheyAre(srcY, srcYStep, srcCbCr, srcCbCrStep), asTheyAre(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToYCrCb422_8u_C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), least2(roi))) return failure;
    return rearrangeFours<0, 3, 2, 1>(roi, src, srcStep, dst, dstStep);
}
