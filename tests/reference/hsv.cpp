#include "reference/hsv.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/pixels.hpp"
#include "reference/reciprocal.hpp"

#include <algorithm>
#include <cmath>

namespace reference
{

namespace
{

/// The upper bound of the samples, a step of them, and a degree of hue in them.
template <typename T> struct Depth;

template <> struct Depth<u8> {
    static constexpr f32 full = 255.0f;
    static constexpr f32 inv = 0x1.010102p-8f; // 0.003921569
    static constexpr f32 hk = 0x1.69696ap+0f;  // 1.4117647
};

template <> struct Depth<u16> {
    static constexpr f32 full = 65535.0f;
    static constexpr f32 inv = 0x1.0001p-16f; // 1.5259022e-5
    static constexpr f32 hk = 0x1.680168p-8f; // 0.005493248
};

constexpr f32 c60 = 0x1.111112p-6f; // 0.016666668

/// From R, G, B to H, S, V in the body of a row. Of channels that tie, R beats G, G beats B and B beats R.
Triple<u8> hsvBody(Triple<u8> rgb)
{
    const f32 r = rgb[0], g = rgb[1], b = rgb[2];
    const f32 M = std::max(std::max(r, g), b);
    const f32 m = std::min(std::min(r, g), b);
    const f32 d = M - m;
    const bool z = M == 0 || d == 0;
    const f32 u = z ? 255.0f : 0.0f;
    const f32 M1 = M + u;
    const f32 d1 = d + u;
    const f32 sv = z ? 0.0f : (rcp(M1) * d1) * 255.0f;
    const f32 e = rcp(d1);
    const f32 T = e * (M1 - g);
    const f32 cR = std::fma(M1 - b, e, -T);
    const f32 cG = std::fma(-(r - b), e, 2.0f);
    const f32 cB = std::fma(r - g, e, 4.0f);
    const bool eqR = r == M1;
    const bool eqG = g == M1 && !eqR;
    const bool eqB = b == M1 && !eqG;
    f32 w = 0, y = 0;
    if (eqB) {
        y = cB;
    } else if (eqG) {
        y = cG;
    } else if (eqR) {
        w = cR;
    }
    const f32 t = (w + y) * 42.5f;
    f32 h = t < 0 ? std::fma(42.5f, y, std::fma(42.5f, w, 255.0f)) : t;
    if (z) h = 0;
    return {saturated<u8>(nearest(h)), saturated<u8>(nearest(sv)), saturated<u8>(nearest(M))};
}

/// The same in the tail, where B beats G and G beats R.
Triple<u8> hsvTail(Triple<u8> rgb)
{
    const f32 r = rgb[0], g = rgb[1], b = rgb[2];
    const f32 M = std::max(std::max(r, g), b);
    const f32 m = std::min(std::min(r, g), b);
    const f32 d = M - m;
    const u8 V = lowBits<u8>(nearest(M));
    if (M == 0 || d == 0) return {0, 0, V};
    const u8 S = lowBits<u8>(nearest((rcp(M) * d) * 255.0f));
    const f32 e = rcp(d);
    const f32 A = (M - r) * e;
    const f32 B = (M - g) * e;
    const f32 C = (M - b) * e;
    f32 h = 0;
    if (M == r) h = C - B;
    if (M == g) h = (A - C) + 2.0f;
    if (M == b) h = (B - A) + 4.0f;
    f32 t = h * 42.5f;
    if (0 > t) t = t + 255.0f;
    return {lowBits<u8>(nearest(t)), S, V};
}

/// Words divide. Of channels that tie, B beats G and G beats R.
Triple<u16> hsvOfWords(Triple<u16> rgb)
{
    const s32 r = rgb[0], g = rgb[1], b = rgb[2];
    const s32 V = std::max({r, g, b});
    const s32 d = V - std::min({r, g, b});
    if (V == 0 || d == 0) return {0, 0, static_cast<u16>(V)};
    const f32 fd = static_cast<f32>(d);
    const f32 s = fd / static_cast<f32>(V);
    const f32 i = 1.0f / fd;
    const s32 S = truncated(std::fma(65535.0f, s, 0.5f));
    const f32 a1 = static_cast<f32>(V - r) * i;
    const f32 b1 = static_cast<f32>(V - g) * i;
    const f32 c1 = static_cast<f32>(V - b) * i;
    f32 h = 0;
    if (V == r) h = c1 - b1;
    if (V == g) h = (a1 + 2.0f) - c1;
    if (V == b) h = (4.0f - a1) + b1;
    // What lies just below zero stays, and is cut to zero.
    if (0 > h + 0x1p-23f) h = h + 6.0f;
    const s32 H = truncated(0.5f + (65535.0f * h) / 6.0f);
    return {lowBits<u16>(H), lowBits<u16>(S), static_cast<u16>(V)};
}

/// The levels of a colour, placed by the sixth of the circle that its hue is in.
template <typename T> Triple<T> placed(int sixth, T V, T p, T q, T t)
{
    switch (sixth) {
    case 0:
        return {V, t, p};
    case 1:
        return {q, V, p};
    case 2:
        return {p, V, t};
    case 3:
        return {p, q, V};
    case 4:
        return {t, p, V};
    default:
        return {V, p, q};
    }
}

/// The last hue is the first one again.
template <typename T> f32 hueOf(T H) { return H == Depth<T>::full ? 0.0f : static_cast<f32>(H); }

/// From H, S, V to R, G, B in the body of a row.
Triple<u8> rgbBodyOfBytes(Triple<u8> hsv)
{
    using D = Depth<u8>;
    if (hsv[1] == 0) return {hsv[2], hsv[2], hsv[2]};
    constexpr f32 ck = c60 * D::hk;
    const f32 H = hueOf(hsv[0]), S = hsv[1], V = hsv[2];
    const s32 i = truncated((H * c60) * D::hk);
    const f32 f = std::fma(H, ck, -static_cast<f32>(i));
    const f32 p = -(std::fma(D::inv, S, -1.0f) * V);
    const f32 vs = (D::inv * V) * S;
    const f32 q = std::fma(-vs, f, V);
    const f32 w = std::fma(f, D::inv, -D::inv);
    const f32 t = std::fma(w, S, 1.0f) * V;
    const auto sample = [](f32 x) { return saturated<u8>(nearest(x)); };
    return placed(i, sample(V), sample(p), sample(q), sample(t));
}

Triple<u16> rgbBodyOfWords(Triple<u16> hsv)
{
    using D = Depth<u16>;
    if (hsv[1] == 0) return {hsv[2], hsv[2], hsv[2]};
    constexpr f32 ck = c60 * D::hk;
    const f32 H = hueOf(hsv[0]), S = hsv[1], V = hsv[2];
    const s32 i = truncated((H * c60) * D::hk);
    const f32 f = std::fma(H, ck, -static_cast<f32>(i));
    const f32 p = -(std::fma(D::inv, S, -1.0f) * V);
    const f32 vs = V * (S * D::inv);
    const f32 q = std::fma(-vs, f, V);
    const f32 t = std::fma(vs, f, p);
    const auto sample = [](f32 x) { return lowBits<u16>(nearest(x)); };
    return placed(i, sample(V), sample(p), sample(q), sample(t));
}

template <typename T> Triple<T> rgbTail(Triple<T> hsv)
{
    using D = Depth<T>;
    if (hsv[1] == 0) return {hsv[2], hsv[2], hsv[2]};
    const f32 S = hsv[1], V = hsv[2];
    const f32 sec = (hueOf(hsv[0]) * c60) * D::hk;
    const s32 i = truncated(sec);
    const f32 f = sec - static_cast<f32>(i);
    const f32 vs = V * (S * D::inv);
    const f32 p = V - vs;
    const f32 fv = f * vs;
    const f32 q = V - fv;
    const f32 t = p + fv;
    const auto sample = [](f32 x) { return lowBits<T>(nearest(x)); };
    return placed(i, hsv[2], sample(p), sample(q), sample(t));
}

/// Pixels of `count` samples, the fourth of which takes no part. Steps are counted in samples, so that those of words
/// lose an odd byte.
template <typename T, typename Wide, typename Tail>
PyxStatus convertPixels(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, Wide wide, Tail tail)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const int mask = ~static_cast<int>(sizeof(T) - 1);
    const auto source = interleaved(src, srcStep & mask, count);
    const auto target = interleaved(dst, dstStep & mask, count);
    convert(source, target, roi, 4, wide, tail);
    return pyxOk;
}

} // namespace

PyxStatus pyxiHSVToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, rgbBodyOfWords, rgbTail<u16>);
}

PyxStatus pyxiHSVToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, rgbBodyOfWords, rgbTail<u16>);
}

PyxStatus pyxiHSVToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, rgbBodyOfBytes, rgbTail<u8>);
}

PyxStatus pyxiHSVToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, rgbBodyOfBytes, rgbTail<u8>);
}

PyxStatus pyxiRGBToHSV_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, hsvOfWords, hsvOfWords);
}

PyxStatus pyxiRGBToHSV_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, hsvOfWords, hsvOfWords);
}

PyxStatus pyxiRGBToHSV_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(4, src, srcStep, dst, dstStep, roi, hsvBody, hsvTail);
}

PyxStatus pyxiRGBToHSV_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertPixels(3, src, srcStep, dst, dstStep, roi, hsvBody, hsvTail);
}

} // namespace reference
