#include "reference/luv.hpp"

#include "reference/arguments.hpp"
#include "reference/luv_forms.hpp"

namespace reference
{

namespace
{

enum class Order { rgb, bgr };

template <typename T> Image<T> colourImage(T* first, int step, int channels, Order order)
{
    const auto image = interleaved(first, step, channels);
    return order == Order::rgb ? image : reversed(image);
}

/// The fourth sample of a pixel is left alone.
template <typename T, typename Form>
PyxStatus toLuv(Form form, int block, int channels, const T* src, int srcStep, Order order, T* dst, int dstStep,
                RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(
        colourImage(src, srcStep, channels, order), interleaved(dst, dstStep, channels), roi, block,
        [&](Triple<T> in) { return form(in, Span::body); }, [&](Triple<T> in) { return form(in, Span::tail); });
    return pyxOk;
}

template <typename T, typename Form>
PyxStatus fromLuv(Form form, int block, int channels, const T* src, int srcStep, T* dst, int dstStep, Order order,
                  RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(
        interleaved(src, srcStep, channels), colourImage(dst, dstStep, channels, order), roi, block,
        [&](Triple<T> in) { return form(in, Span::body); }, [&](Triple<T> in) { return form(in, Span::tail); });
    return pyxOk;
}

/// A step that is counted in whole samples loses its low bits.
int wholeSamples(int step, int size) { return step & ~(size - 1); }

} // namespace

PyxStatus pyxiBGRToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv32fC3, 8, 3, src, srcStep, Order::bgr, dst, dstStep, roi);
}

PyxStatus pyxiBGRToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv8uC3, 8, 3, src, srcStep, Order::bgr, dst, dstStep, roi);
}

PyxStatus pyxiLUVToBGR_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv32fC3, 8, 3, src, srcStep, dst, dstStep, Order::bgr, roi);
}

PyxStatus pyxiLUVToBGR_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv8uC3, 8, 3, src, srcStep, dst, dstStep, Order::bgr, roi);
}

PyxStatus pyxiLUVToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv16s, 4, 4, src, wholeSamples(srcStep, 2), dst, wholeSamples(dstStep, 2), Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv16s, 4, 3, src, wholeSamples(srcStep, 2), dst, wholeSamples(dstStep, 2), Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv16u, 4, 4, src, wholeSamples(srcStep, 2), dst, wholeSamples(dstStep, 2), Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv16u, 4, 3, src, wholeSamples(srcStep, 2), dst, wholeSamples(dstStep, 2), Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv32fAC4, 1, 4, src, wholeSamples(srcStep, 4), dst, wholeSamples(dstStep, 4), Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv32fC3, 8, 3, src, srcStep, dst, dstStep, Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv8uAC4, 4, 4, src, srcStep, dst, dstStep, Order::rgb, roi);
}

PyxStatus pyxiLUVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return fromLuv(fromLuv8uC3, 8, 3, src, srcStep, dst, dstStep, Order::rgb, roi);
}

PyxStatus pyxiRGBToLUV_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv16sAC4, 4, 4, src, wholeSamples(srcStep, 2), Order::rgb, dst, wholeSamples(dstStep, 2), roi);
}

PyxStatus pyxiRGBToLUV_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv16sC3, 4, 3, src, wholeSamples(srcStep, 2), Order::rgb, dst, wholeSamples(dstStep, 2), roi);
}

PyxStatus pyxiRGBToLUV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv16uAC4, 4, 4, src, wholeSamples(srcStep, 2), Order::rgb, dst, wholeSamples(dstStep, 2), roi);
}

PyxStatus pyxiRGBToLUV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv16uC3, 4, 3, src, wholeSamples(srcStep, 2), Order::rgb, dst, wholeSamples(dstStep, 2), roi);
}

PyxStatus pyxiRGBToLUV_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv32fAC4, 4, 4, src, srcStep, Order::rgb, dst, dstStep, roi);
}

PyxStatus pyxiRGBToLUV_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv32fC3, 8, 3, src, srcStep, Order::rgb, dst, dstStep, roi);
}

PyxStatus pyxiRGBToLUV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv8uAC4, 1, 4, src, srcStep, Order::rgb, dst, dstStep, roi);
}

PyxStatus pyxiRGBToLUV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return toLuv(toLuv8uC3, 8, 3, src, srcStep, Order::rgb, dst, dstStep, roi);
}

} // namespace reference
