// BT.601 YCbCr with chroma shared by two columns of two rows to RGB.
#include "pyxcc/subsampled_to_rgb.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "matrix/bt601_forms.hpp"
#include "subsampled/row_pairs.hpp"

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;
using namespace pyxcc::subsampled;

namespace
{

/// Blocks of `Block` columns in the wide form, the rest of the whole pairs in an exact one.
template <int Block, class Source, class Target, class Wide>
PyxStatus wideThenExact(RoiSize roi, const Source& source, const Target& target, Wide wide)
{
    eachRowPair(roi, source, target, spans(upTo<blocksOf<Block>, wholePairs>, wide, invExactB));
    return warnIfOff(roi, 2, 2);
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, p2(srcY, srcYStep, srcCbCr, srcCbCrStep), reversed(c3(dst, dstStep)), inv3A);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, p2(srcY, srcYStep, srcCbCr, srcCbCrStep), reversed(c4(dst, dstStep, aval)), inv3A);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, p2(srcY, srcYStep, srcCbCr, srcCbCrStep), c3(dst, dstStep), inv3A);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, p2(srcY, srcYStep, srcCbCr, srcCbCrStep), c4(dst, dstStep, aval), inv3A);
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, chromaExchanged(p2(srcY, srcYStep, srcCbCr, srcCbCrStep)), reversed(c3(dst, dstStep)),
                       inv3B);
}

/// The size is tested before the pointers.
PyxStatus PYXCC_CALL pyxiYCrCb420ToBGR_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(sizeAtLeast(roi, 1, 1), notNull(srcY, srcCbCr, dst))) return failure;
    return wholeBlocks(roi, chromaExchanged(p2(srcY, srcYStep, srcCbCr, srcCbCrStep)), reversed(c4(dst, dstStep, aval)),
                       inv3B);
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P2C3R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(srcY, srcCbCr, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return wholeBlocks(roi, chromaExchanged(p2(srcY, srcYStep, srcCbCr, srcCbCrStep)), c3(dst, dstStep), inv3B);
}

/// The size is tested before the pointers.
PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P2C4R(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep,
                                                u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(sizeAtLeast(roi, 1, 1), notNull(srcY, srcCbCr, dst))) return failure;
    return wholeBlocks(roi, chromaExchanged(p2(srcY, srcYStep, srcCbCr, srcCbCrStep)), c4(dst, dstStep, aval), inv3B);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wideThenExact<16>(roi, p3<2>(src, srcStep), reversed(c3(dst, dstStep)), inv3D);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToBGR_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wholeBlocks(roi, p3<2>(src, srcStep), reversed(c4(dst, dstStep, aval)), inv3A);
}

PyxStatus PYXCC_CALL pyxiYCbCr420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wideThenExact<8>(roi, p3<2>(src, srcStep), c3(dst, dstStep), invHighC);
}

PyxStatus PYXCC_CALL pyxiYCrCb420ToRGB_8u_P3C4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    return wideThenExact<8>(roi, chromaExchanged(p3<2>(src, srcStep)), c4(dst, dstStep, aval), invHighD);
}
