// BT.601 YCbCr with chroma shared by two columns of a row to RGB.
#include "pyxcc/subsampled_to_rgb.h"

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "matrix/bt601_forms.hpp"
#include "subsampled/wide_spans.hpp"

#include <cstdint>

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::matrix;
using namespace pyxcc::subsampled;

namespace
{

template <Order order = Order::ofMemory> auto ycbcr(const u8* src, int srcStep)
{
    return c2LumaFirst<order>(src, srcStep);
}
template <Order order = Order::ofMemory> auto ycrcb(const u8* src, int srcStep)
{
    return chromaExchanged(c2LumaFirst<order>(src, srcStep));
}

// The schools of the packed rows. Every column is converted, blocks of columns in the wide form.

template <class Source, class Target> PyxStatus highD(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, wideThenTail<8>(invHighD, invExactD));
}

template <class Source, class Target> PyxStatus highB(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, wideThenTail<4>(invHighB, invExactF));
}

template <class Source, class Target> PyxStatus eighthsC(RoiSize roi, const Source& source, const Target& target)
{
    return eachRow(roi, source, target, wideThenTail<8>(inv3C, invExactB));
}

/// Whether every plane and every row of an image lies at a multiple of 16.
bool liesAt16(const u8* const src[3], const int srcStep[3], const u8* dst, int dstStep)
{
    std::uintptr_t bits = reinterpret_cast<std::uintptr_t>(dst) | static_cast<unsigned>(dstStep);
    for (int i = 0; i < 3; ++i) bits |= reinterpret_cast<std::uintptr_t>(src[i]) | static_cast<unsigned>(srcStep[i]);
    return bits % 16 == 0;
}

} // namespace

PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return highD(roi, ycbcr(src, srcStep), reversed(c3(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return highD(roi, ycbcr<Order::ofWords>(src, srcStep), reversed(c4<Order::ofWords>(dst, dstStep, aval)));
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return highB(roi, ycbcr(src, srcStep), c3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return highB(roi, ycbcr(src, srcStep), p3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(dst)))
        return failure;
    return highB(roi, ycrcb(src, srcStep), p3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eighthsC(roi, ycbcr<Order::ofWords>(src, srcStep), c4<Order::ofWords>(dst, dstStep, aval));
}

PyxStatus PYXCC_CALL pyxiYCrCb422ToBGR_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eighthsC(roi, ycrcb(src, srcStep), reversed(c3(dst, dstStep)));
}

PyxStatus PYXCC_CALL pyxiYCrCb422ToBGR_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eighthsC(roi, ycrcb<Order::ofWords>(src, srcStep), reversed(c4<Order::ofWords>(dst, dstStep, aval)));
}

PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eighthsC(roi, ycrcb(src, srcStep), c3(dst, dstStep));
}

PyxStatus PYXCC_CALL pyxiYCrCb422ToRGB_8u_C2C4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi, u8 aval)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
    return eighthsC(roi, ycrcb<Order::ofWords>(src, srcStep), c4<Order::ofWords>(dst, dstStep, aval));
}

/// A last odd column is left alone.
PyxStatus PYXCC_CALL pyxiYCbCr422ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), elementsNotNull<3>(src), sizeAtLeast(roi, 2, 1)))
        return failure;
    return eachRow(roi, p3<2>(src, srcStep), reversed(c3(dst, dstStep)),
                   spans(upTo<blocksOf<8>, wholePairs>, invHighC, invExactF));
}

/// The one conversion whose results depend on where the images lie.
PyxStatus PYXCC_CALL pyxiYCbCr422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep,
                                                RoiSize roi)
{
    if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1), elementsNotNull<3>(src)))
        return failure;
    const auto source = p3<2>(src, srcStep);
    const auto target = c3(dst, dstStep);
    if (liesAt16(src, srcStep, dst, dstStep)) return eachRow(roi, source, target, wideThenTail<8>(inv3D, invExactC));
    return eachRow(roi, source, target, wideThenTail<8>(invHighC, invExactC));
}
