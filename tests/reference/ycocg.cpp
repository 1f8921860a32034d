#include "reference/ycocg.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/pixels.hpp"

namespace reference
{

namespace
{

// A form takes R, G, B to Y, Co, Cg or back. Sums of s32 wrap.

s32 sum(s32 a, s32 b) { return static_cast<s32>(static_cast<u32>(a) + static_cast<u32>(b)); }

s32 difference(s32 a, s32 b) { return static_cast<s32>(static_cast<u32>(a) - static_cast<u32>(b)); }

Triple<s32> plainForward(Triple<s32> rgb)
{
    const auto [r, g, b] = rgb;
    return {(r + 2 * g + b + 2) >> 2, (r - b + 1) >> 1, (2 * g - r - b + 2) >> 2};
}

Triple<s32> plainInverse(Triple<s32> yCoCg)
{
    const auto [y, co, cg] = yCoCg;
    return {difference(sum(y, co), cg), sum(y, cg), difference(difference(y, co), cg)};
}

// How a step of the reversible forms holds its result.
s32 in32(s32 x) { return x; }
s32 wrapped16(s32 x) { return static_cast<s16>(x); }
s32 saturated16(s32 x) { return saturated<s16>(x); }

template <s32 (*held)(s32)> Triple<s32> reversibleForward(Triple<s32> rgb)
{
    const auto [r, g, b] = rgb;
    const s32 co = held(difference(r, b));
    const s32 t = held(sum(b, co >> 1));
    const s32 cg = held(difference(g, t));
    const s32 y = held(sum(t, cg >> 1));
    return {y, co, cg};
}

template <s32 (*held)(s32)> Triple<s32> reversibleInverse(Triple<s32> yCoCg)
{
    const auto [y, co, cg] = yCoCg;
    const s32 t = held(difference(y, cg >> 1));
    const s32 g = held(sum(cg, t));
    const s32 b = held(difference(t, co >> 1));
    const s32 r = held(sum(b, co));
    return {r, g, b};
}

/// Of results in 16 bits.
u8 clampedByte(s32 x) { return saturated<u8>(static_cast<s16>(x)); }

using Arithmetic = Triple<s32> (*)(Triple<s32>);

/// A form, and how its results are stored.
template <typename S, typename D> auto through(Arithmetic form, D (*stored)(s32))
{
    return [=](Triple<S> in) -> Triple<D> {
        const Triple<s32> out = form({in[0], in[1], in[2]});
        return {stored(out[0]), stored(out[1]), stored(out[2])};
    };
}

// Bytes on both sides have Co and Cg about 128.

Triple<u8> bytesForward(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return {
        saturated<u8>((r + 2 * g + b + 2) >> 2),
        saturated<u8>(((r - b + 1) >> 1) + 128),
        saturated<u8>(((2 * g - b - r + 2) >> 2) + 128),
    };
}

Triple<u8> bytesInverse(Triple<u8> yCoCg)
{
    const auto [y, co, cg] = yCoCg;
    return {saturated<u8>(y + co - cg), saturated<u8>(y + cg - 128), saturated<u8>(y - co - cg + 256)};
}

enum class Size { tested, untested };

/// From pixels of `count` samples, the fourth of which is left out. The whole blocks of a row take the wide form.
template <typename S, typename D, typename Wide, typename Tail>
PyxStatus forward(Size size, int count, const S* src, int srcStep, D* const* dst, int dstStep, RoiSize roi, int block,
                  Wide wide, Tail tail)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (size == Size::tested && isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(reversed(interleaved(src, srcStep, count)), planar(dst, dstStep), roi, block, wide, tail);
    return pyxOk;
}

template <typename S, typename D, typename Form>
PyxStatus forward(Size size, int count, const S* src, int srcStep, D* const* dst, int dstStep, RoiSize roi, Form form)
{
    return forward(size, count, src, srcStep, dst, dstStep, roi, 1, form, form);
}

template <typename S, typename D, typename Wide, typename Tail>
PyxStatus inverse(Size size, const S* const* src, int srcStep, D* dst, int dstStep, RoiSize roi, int block, Wide wide,
                  Tail tail)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (size == Size::tested && isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(planar(src, srcStep), reversed(interleaved(dst, dstStep, 3)), roi, block, wide, tail);
    return pyxOk;
}

template <typename S, typename D, typename Form>
PyxStatus inverse(Size size, const S* const* src, int srcStep, D* dst, int dstStep, RoiSize roi, Form form)
{
    return inverse(size, src, srcStep, dst, dstStep, roi, 1, form, form);
}

/// To pixels with a fourth sample, which is given.
template <typename S, typename D, typename Form>
PyxStatus inverseWithAlpha(Size size, const S* const* src, int srcStep, D* dst, int dstStep, RoiSize roi, Form form,
                           D alphaValue)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (size == Size::tested && isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto target = interleaved(dst, dstStep, 4);
    convert(planar(src, srcStep), reversed(target), roi, form);
    fill(target[3], roi, alphaValue);
    return pyxOk;
}

} // namespace

PyxStatus pyxiBGRToYCoCg_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<u8, s16>(plainForward, lowBits<s16>);
    return forward(Size::tested, 3, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiBGRToYCoCg_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<u8, s16>(plainForward, lowBits<s16>);
    return forward(Size::tested, 4, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiBGRToYCoCg_Rev_8u16s_C3P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<u8, s16>(reversibleForward<wrapped16>, lowBits<s16>);
    return forward(Size::tested, 3, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiBGRToYCoCg_Rev_8u16s_C4P3R(const u8* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<u8, s16>(reversibleForward<wrapped16>, lowBits<s16>);
    return forward(Size::tested, 4, src, srcStep, dst, dstStep, roi, form);
}

// The order of the channels is R, G, B here.
PyxStatus pyxiRGBToYCoCg_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    convert(interleaved(src, srcStep, 3), planar(dst, dstStep), roi, bytesForward);
    return pyxOk;
}

PyxStatus pyxiSBGRToYCoCg_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<s16, s32>(plainForward, lowBits<s32>);
    return forward(Size::tested, 3, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiSBGRToYCoCg_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<s16, s32>(plainForward, lowBits<s32>);
    return forward(Size::untested, 4, src, srcStep, dst, dstStep, roi, form);
}

// Co and Cg of 32768 saturate in whole blocks of 4 pixels, and wrap in what is left.
PyxStatus pyxiSBGRToYCoCg_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto wide = through<s16, s16>(plainForward, saturated<s16>);
    const auto tail = through<s16, s16>(plainForward, lowBits<s16>);
    return forward(Size::tested, 3, src, srcStep, dst, dstStep, roi, 4, wide, tail);
}

// Co and Cg of 32768 saturate in whole blocks of 4 pixels, and wrap in what is left.
PyxStatus pyxiSBGRToYCoCg_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto wide = through<s16, s16>(plainForward, saturated<s16>);
    const auto tail = through<s16, s16>(plainForward, lowBits<s16>);
    return forward(Size::tested, 4, src, srcStep, dst, dstStep, roi, 4, wide, tail);
}

PyxStatus pyxiSBGRToYCoCg_Rev_16s32s_C3P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<s16, s32>(reversibleForward<in32>, lowBits<s32>);
    return forward(Size::tested, 3, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiSBGRToYCoCg_Rev_16s32s_C4P3R(const s16* src, int srcStep, s32* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<s16, s32>(reversibleForward<in32>, lowBits<s32>);
    return forward(Size::untested, 4, src, srcStep, dst, dstStep, roi, form);
}

// Whole blocks of 16 pixels saturate, what is left wraps.
PyxStatus pyxiSBGRToYCoCg_Rev_16s_C3P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto wide = through<s16, s16>(reversibleForward<saturated16>, lowBits<s16>);
    const auto tail = through<s16, s16>(reversibleForward<wrapped16>, lowBits<s16>);
    return forward(Size::untested, 3, src, srcStep, dst, dstStep, roi, 16, wide, tail);
}

PyxStatus pyxiSBGRToYCoCg_Rev_16s_C4P3R(const s16* src, int srcStep, s16* const dst[3], int dstStep, RoiSize roi)
{
    const auto form = through<s16, s16>(reversibleForward<wrapped16>, lowBits<s16>);
    return forward(Size::untested, 4, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToBGR_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const auto form = through<s16, u8>(plainInverse, clampedByte);
    return inverse(Size::untested, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToBGR_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                     u8 alphaValue)
{
    const auto form = through<s16, u8>(plainInverse, clampedByte);
    return inverseWithAlpha(Size::untested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

PyxStatus pyxiYCoCgToBGR_Rev_16s8u_P3C3R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const auto form = through<s16, u8>(reversibleInverse<wrapped16>, clampedByte);
    return inverse(Size::untested, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToBGR_Rev_16s8u_P3C4R(const s16* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi,
                                         u8 alphaValue)
{
    const auto form = through<s16, u8>(reversibleInverse<wrapped16>, clampedByte);
    return inverseWithAlpha(Size::untested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

PyxStatus pyxiYCoCgToRGB_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    convert(planar(src, srcStep), interleaved(dst, dstStep, 3), roi, bytesInverse);
    return pyxOk;
}

PyxStatus pyxiYCoCgToSBGR_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    const auto form = through<s16, s16>(plainInverse, lowBits<s16>);
    return inverse(Size::untested, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToSBGR_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                    s16 alphaValue)
{
    const auto form = through<s16, s16>(plainInverse, lowBits<s16>);
    return inverseWithAlpha(Size::tested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

PyxStatus pyxiYCoCgToSBGR_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    const auto form = through<s32, s16>(plainInverse, lowBits<s16>);
    return inverse(Size::tested, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToSBGR_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                       s16 alphaValue)
{
    const auto form = through<s32, s16>(plainInverse, lowBits<s16>);
    return inverseWithAlpha(Size::tested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

// Whole blocks of 16 pixels saturate, what is left wraps.
PyxStatus pyxiYCoCgToSBGR_Rev_16s_P3C3R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    const auto wide = through<s16, s16>(reversibleInverse<saturated16>, lowBits<s16>);
    const auto tail = through<s16, s16>(reversibleInverse<wrapped16>, lowBits<s16>);
    return inverse(Size::untested, src, srcStep, dst, dstStep, roi, 16, wide, tail);
}

PyxStatus pyxiYCoCgToSBGR_Rev_16s_P3C4R(const s16* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                        s16 alphaValue)
{
    const auto form = through<s16, s16>(reversibleInverse<wrapped16>, lowBits<s16>);
    return inverseWithAlpha(Size::untested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

PyxStatus pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    const auto form = through<s32, s16>(reversibleInverse<in32>, lowBits<s16>);
    return inverse(Size::untested, src, srcStep, dst, dstStep, roi, form);
}

PyxStatus pyxiYCoCgToSBGR_Rev_32s16s_P3C4R(const s32* const src[3], int srcStep, s16* dst, int dstStep, RoiSize roi,
                                           s16 alphaValue)
{
    const auto form = through<s32, s16>(reversibleInverse<in32>, lowBits<s16>);
    return inverseWithAlpha(Size::untested, src, srcStep, dst, dstStep, roi, form, alphaValue);
}

} // namespace reference
