#include "reference/hls.hpp"

#include "reference/arguments.hpp"
#include "reference/conversions.hpp"
#include "reference/pixels.hpp"
#include "reference/reciprocal.hpp"

#include <cmath>

namespace reference
{

namespace
{

/// What depends on the depth: the range of samples, and a degree of hue in samples and back.
template <typename T> struct Depth;

template <> struct Depth<u8> {
    static constexpr f32 half = 127.5f, twice = 510.0f, full = 255.0f;
    static constexpr f32 hueScale = 0x1.6aaaaap-1f; // 0.7083333
    static constexpr f32 inv = 0x1.010102p-8f;      // 0.003921569
    static constexpr f32 hk = 0x1.69696ap+0f;       // 1.4117647
};

template <> struct Depth<u16> {
    static constexpr f32 half = 32767.5f, twice = 131070.0f, full = 65535.0f;
    static constexpr f32 hueScale = 0x1.6c1556p+7f; // 182.04167
    static constexpr f32 inv = 0x1.0001p-16f;       // 1.5259022e-5
    static constexpr f32 hk = 0x1.680168p-8f;       // 0.005493248
};

constexpr f32 c60 = 0x1.111112p-6f; // 0.016666668

/// The bounds of a pixel's channels.
struct Range {
    f32 M, m, d, s;
};

// Where one of two is no number it is the second that counts, as in the processor's instructions.

f32 maximum(f32 a, f32 b) { return a > b ? a : b; }

f32 minimum(f32 a, f32 b) { return a < b ? a : b; }

Range rangeOf(f32 r, f32 g, f32 b)
{
    const f32 M = maximum(maximum(r, g), b);
    const f32 m = minimum(minimum(r, g), b);
    return {M, m, M - m, M + m};
}

template <typename T> f32 bodyReciprocal(f32 v) { return sizeof(T) == 1 ? rcp(v) : refined(rcp(v), v); }

/// From R, G, B to H, L, S in the body of a row.
template <typename T> Triple<T> hlsBody(Triple<T> rgb)
{
    using D = Depth<T>;
    const f32 r = rgb[0], g = rgb[1], b = rgb[2];
    const auto [M, m, d, s] = rangeOf(r, g, b);
    const f32 l = s * 0.5f;
    const bool z = d == 0;
    const f32 t = z ? 0.5f : s;
    const f32 den = l <= D::half ? t : D::twice - t;
    const f32 sv = z ? 0.0f : d * bodyReciprocal<T>(den);
    const f32 k = (z ? 0.0f : bodyReciprocal<T>(d)) * 60.0f;
    f32 h = 0;
    if (M == r) {
        h = (g - b) * k;
    } else if (M == g) {
        h = std::fma(b - r, k, 120.0f);
    } else {
        h = std::fma(r - g, k, 240.0f);
    }
    if (h < 0) h = h + 360.0f;
    if (z) h = 0;
    return {
        saturated<T>(nearest(h * D::hueScale)),
        saturated<T>(nearest(l)),
        saturated<T>(nearest(sv * D::full)),
    };
}

/// The same in the tail, with the conversion that is given.
template <typename T, s32 (*conv)(f32)> Triple<T> hlsTail(Triple<T> rgb)
{
    using D = Depth<T>;
    const f32 r = rgb[0], g = rgb[1], b = rgb[2];
    const auto [M, m, d, s] = rangeOf(r, g, b);
    const f32 l = s * 0.5f;
    const T L = lowBits<T>(conv(l));
    if (d == 0) return {0, L, 0};
    f32 den = s;
    if (l > D::half) den = D::twice - s;
    const f32 x = rcp(den);
    const f32 w = (x + x) - ((den * x) * x);
    const T S = lowBits<T>(conv((d * w) * D::full));
    const f32 p = rcp(d);
    const f32 e = (p + p) - ((d * p) * p);
    f32 h = 0;
    if (M == r) {
        h = ((g - b) * 60.0f) * e;
    } else if (M == g) {
        h = ((b - r) * 60.0f) * e + 120.0f;
    } else {
        h = ((r - g) * 60.0f) * e + 240.0f;
    }
    if (0 > h) h = h + 360.0f;
    return {lowBits<T>(conv(h * D::hueScale)), L, S};
}

Triple<f32> hlsOfFloats(Triple<f32> rgb)
{
    const auto [r, g, b] = rgb;
    const auto [M, m, d, s] = rangeOf(r, g, b);
    const f32 L = s * 0.5f;
    if (0x1p-23f >= d) return {0, L, 0};
    const f32 S = 0.5f >= L ? d / s : d / (2.0f - s);
    f32 h = 0;
    if (r == M) {
        h = ((g - b) * 60.0f) / d;
    } else if (g == M) {
        h = ((b - r) * 60.0f) / d + 120.0f;
    } else {
        h = ((r - g) * 60.0f) / d + 240.0f;
    }
    if (0 > h) h = h + 360.0f;
    return {h / 360.0f, L, S};
}

/// From R, G, B to H, L, S in the body of the forms whose pixels are in the order B, G, R. They cut where the others
/// round, and divide what the others multiply.
Triple<u8> hlsBodyOfBgr(Triple<u8> rgb)
{
    const f32 r = rgb[0], g = rgb[1], b = rgb[2];
    const auto [M, m, d, s] = rangeOf(r, g, b);
    const f32 l = s * 0.5f;
    const bool z = d == 0;
    const f32 u = z ? 0.5f : 0.0f;
    const f32 s1 = s + u;
    const f32 d1 = d + u;
    const f32 den = l <= 127.5f ? s1 : 510.0f - s1;
    const f32 sv = z ? 0.0f : d1 * rcp(den);
    f32 n = 0, o = 0;
    if (M == r) {
        n = 60.0f * (g - b);
        o = 0;
    } else if (M == g) {
        n = 60.0f * (b - r);
        o = 120.0f;
    } else {
        n = 60.0f * (r - g);
        o = 240.0f;
    }
    f32 h = std::fma(n, rcp(d1), o);
    if (h < 0) h = h + 360.0f;
    if (z) h = 0;
    return {
        saturated<u8>(truncated(h * Depth<u8>::hueScale)),
        saturated<u8>(truncated(l)),
        saturated<u8>(truncated(sv * 255.0f)),
    };
}

/// The hue of a channel's own, and how far it is below 240, which differ in their rounding.
struct Angle {
    f32 h, below240;
};

/// The hues of R, G, B in the bodies, H having `scale` samples a degree.
Triple<Angle> bodyAngles(f32 H, f32 scale)
{
    f32 hR = std::fma(scale, H, 120.0f);
    if (hR > 360.0f) hR = hR - 360.0f;
    const f32 hG = H * scale;
    f32 hB = std::fma(scale, H, -120.0f);
    if (hB < 0) hB = hB + 360.0f;
    return {Angle{hR, 240.0f - hR}, Angle{hG, std::fma(-scale, H, 240.0f)}, Angle{hB, 240.0f - hB}};
}

/// The hues of R, G, B in the tails, of one in degrees.
Triple<f32> tailAngles(f32 hG)
{
    f32 hR = hG + 120.0f;
    if (hR > 360.0f) hR = hR - 360.0f;
    f32 hB = hG - 120.0f;
    if (0 > hB) hB = hB + 360.0f;
    return {hR, hG, hB};
}

/// From H, L, S to R, G, B in the body of a row.
template <typename T> Triple<T> rgbBody(Triple<T> hls)
{
    using D = Depth<T>;
    const f32 H = hls[0], L = hls[1], S = hls[2];
    const f32 Ls = L * D::inv, Ss = S * D::inv, P = Ls * Ss;
    const f32 q = Ls <= 0.5f ? P : std::fma(D::inv, S, -P);
    const f32 m2 = std::fma(D::inv, L, q);
    const f32 m1 = std::fma(Ls, 2.0f, -m2);
    const f32 dd = m2 - m1;
    const auto value = [=](Angle a) {
        if (a.h < 60.0f) return std::fma(c60, dd * a.h, m1);
        if (a.h < 180.0f) return m2;
        if (a.h < 240.0f) return std::fma(c60, dd * a.below240, m1);
        return m1;
    };
    const auto [R, G, B] = bodyAngles(H, D::hk);
    return {
        saturated<T>(nearest(value(R) * D::full)),
        saturated<T>(nearest(value(G) * D::full)),
        saturated<T>(nearest(value(B) * D::full)),
    };
}

/// The value of a channel by its hue in the tails that multiply.
f32 tailValue(f32 h, f32 m1, f32 m2)
{
    const f32 dd = m2 - m1;
    if (60.0f > h) return (h * c60) * dd + m1;
    if (180.0f > h) return m2;
    if (240.0f > h) return ((240.0f - h) * c60) * dd + m1;
    return m1;
}

/// The value of a channel by its hue in the tails that divide.
f32 dividedValue(f32 h, f32 m1, f32 m2)
{
    if (60.0f > h) return m1 + ((m2 - m1) * h) / 60.0f;
    if (180.0f > h) return m2;
    if (240.0f > h) return m1 + ((m2 - m1) * (240.0f - h)) / 60.0f;
    return m1;
}

/// The upper one of the two levels between which the channels lie.
f32 tailUpper(f32 L, f32 S)
{
    const f32 P = L * S;
    return L > 0.5f ? (L + S) - P : L + P;
}

f32 fusedTailUpper(f32 L, f32 S) { return 0.5f >= L ? std::fma(S, L, L) : std::fma(-S, L, L + S); }

Triple<u16> rgbTailOfWords(Triple<u16> hls)
{
    using D = Depth<u16>;
    const f32 H = hls[0] * D::hk, L = hls[1] * D::inv, S = hls[2] * D::inv;
    if (S == 0) return {hls[1], hls[1], hls[1]};
    const f32 m2 = tailUpper(L, S);
    const f32 m1 = (L + L) - m2;
    const auto [R, G, B] = tailAngles(H);
    return {
        lowBits<u16>(nearest(tailValue(R, m1, m2) * 65535.0f)),
        lowBits<u16>(nearest(tailValue(G, m1, m2) * 65535.0f)),
        lowBits<u16>(nearest(tailValue(B, m1, m2) * 65535.0f)),
    };
}

Triple<u8> rgbTailOfBytes(Triple<u8> hls)
{
    const f32 H = (hls[0] * 360.0f) / 255.0f, L = hls[1] / 255.0f, S = hls[2] / 255.0f;
    Triple<f32> rgb = {L, L, L};
    if (S != 0) {
        const f32 m2 = fusedTailUpper(L, S);
        const f32 m1 = std::fma(L, 2.0f, -m2);
        const auto [R, G, B] = tailAngles(H);
        rgb = {dividedValue(R, m1, m2), dividedValue(G, m1, m2), dividedValue(B, m1, m2)};
    }
    return {
        lowBits<u8>(truncated(255.0f * rgb[0])),
        lowBits<u8>(truncated(255.0f * rgb[1])),
        lowBits<u8>(truncated(255.0f * rgb[2])),
    };
}

/// The value of a channel in the bodies that scale the hue before they multiply by the distance of the levels.
f32 bodyValue(Angle a, f32 m1, f32 m2)
{
    const f32 dd = m2 - m1;
    if (a.h < 60.0f) return std::fma(dd, a.h * c60, m1);
    if (a.h < 180.0f) return m2;
    if (a.h < 240.0f) return std::fma(a.below240 * c60, dd, m1);
    return m1;
}

Triple<f32> rgbBodyOfFloats(Triple<f32> hls)
{
    const auto [H, L, S] = hls;
    if (S == 0) return {L, L, L};
    const f32 m2 = L <= 0.5f ? std::fma(L, S, L) : std::fma(-L, S - 1.0f, S);
    const f32 m1 = std::fma(L, 2.0f, -m2);
    const auto [R, G, B] = bodyAngles(H, 360.0f);
    return {bodyValue(R, m1, m2), bodyValue(G, m1, m2), bodyValue(B, m1, m2)};
}

Triple<f32> rgbTailOfFloats(Triple<f32> hls)
{
    const auto [H, L, S] = hls;
    if (S == 0) return {L, L, L};
    const f32 m2 = fusedTailUpper(L, S);
    const f32 m1 = std::fma(L, 2.0f, -m2);
    const auto [R, G, B] = tailAngles(360.0f * H);
    return {dividedValue(R, m1, m2), dividedValue(G, m1, m2), dividedValue(B, m1, m2)};
}

/// From H, L, S to R, G, B in the body of the forms whose pixels are in the order B, G, R.
Triple<u8> rgbBodyOfBgr(Triple<u8> hls)
{
    using D = Depth<u8>;
    const f32 H = hls[0], L = hls[1], S = hls[2];
    const f32 Ld = L * D::inv, Sd = S * D::inv;
    const f32 a = std::fma(Sd, D::inv, -D::inv);
    const f32 b = std::fma(-L, a, Sd);
    const f32 c = std::fma(Sd, Ld, Ld);
    const f32 m2 = Ld <= 0.5f ? c : b;
    const f32 m1 = std::fma(Ld, 2.0f, -m2);
    const auto channel = [=](Angle angle) {
        const f32 value = Sd == 0 ? Ld : bodyValue(angle, m1, m2);
        return saturated<u8>(truncated(value * 255.0f));
    };
    const auto [R, G, B] = bodyAngles(H, D::hk);
    return {channel(R), channel(G), channel(B)};
}

Triple<u8> rgbTailOfBgr(Triple<u8> hls)
{
    using D = Depth<u8>;
    const f32 H = hls[0] * D::hk, L = hls[1] * D::inv, S = hls[2] * D::inv;
    if (S == 0) return {hls[1], hls[1], hls[1]};
    const f32 m2 = tailUpper(L, S);
    const f32 m1 = L * 2.0f - m2;
    const auto [R, G, B] = tailAngles(H);
    return {
        saturated<u8>(truncated(tailValue(R, m1, m2) * 255.0f)),
        saturated<u8>(truncated(tailValue(G, m1, m2) * 255.0f)),
        saturated<u8>(truncated(tailValue(B, m1, m2) * 255.0f)),
    };
}

/// Signed words are unsigned ones moved down, hue and saturation included.
template <Triple<u16> (*form)(Triple<u16>)> Triple<s16> movedDown(Triple<s16> in)
{
    Triple<u16> samples;
    for (int k = 0; k < 3; ++k) samples[k] = static_cast<u16>(in[k] + 32768);
    samples = form(samples);
    Triple<s16> out;
    for (int k = 0; k < 3; ++k) out[k] = static_cast<s16>(samples[k] - 32768);
    return out;
}

/// Pixels of `count` samples in the order R, G, B, the fourth of which takes no part. Steps are counted in samples, so
/// that they lose the bytes beyond.
template <typename T, typename Wide, typename Tail>
PyxStatus convertRgb(int count, const T* src, int srcStep, T* dst, int dstStep, RoiSize roi, int block, Wide wide,
                     Tail tail)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const int mask = ~static_cast<int>(sizeof(T) - 1);
    const auto source = interleaved(src, srcStep & mask, count);
    const auto target = interleaved(dst, dstStep & mask, count);
    convert(source, target, roi, block, wide, tail);
    return pyxOk;
}

/// What is left of the tests where pixels are in the order B, G, R, once the pointers have passed: steps come before
/// the size.
PyxStatus failureOf(int srcStep, int dstStep, RoiSize roi)
{
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    return pyxOk;
}

void fromBgr(const Image<const u8>& bgr, const Image<u8>& hls, RoiSize roi)
{
    convert(reversed(bgr), hls, roi, 4, hlsBodyOfBgr, hlsTail<u8, truncated>);
}

void toBgr(const Image<const u8>& hls, const Image<u8>& bgr, RoiSize roi)
{
    convert(hls, reversed(bgr), roi, 4, rgbBodyOfBgr, rgbTailOfBgr);
}

void copyAlpha(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi)
{
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) dst[3].set(row, column, src[3].get(row, column));
    }
}

} // namespace

PyxStatus pyxiHLSToRGB_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, movedDown<rgbBody<u16>>, movedDown<rgbTailOfWords>);
}

PyxStatus pyxiHLSToRGB_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 4, movedDown<rgbBody<u16>>, movedDown<rgbTailOfWords>);
}

PyxStatus pyxiHLSToRGB_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, rgbBody<u16>, rgbTailOfWords);
}

PyxStatus pyxiHLSToRGB_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 4, rgbBody<u16>, rgbTailOfWords);
}

PyxStatus pyxiHLSToRGB_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, rgbBodyOfFloats, rgbTailOfFloats);
}

PyxStatus pyxiHLSToRGB_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 4, rgbBodyOfFloats, rgbTailOfFloats);
}

PyxStatus pyxiHLSToRGB_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 8, rgbBody<u8>, rgbTailOfBytes);
}

PyxStatus pyxiHLSToRGB_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 8, rgbBody<u8>, rgbTailOfBytes);
}

PyxStatus pyxiRGBToHLS_16s_AC4R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, movedDown<hlsBody<u16>>,
                      movedDown<hlsTail<u16, truncated>>);
}

PyxStatus pyxiRGBToHLS_16s_C3R(const s16* src, int srcStep, s16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 4, movedDown<hlsBody<u16>>,
                      movedDown<hlsTail<u16, truncated>>);
}

PyxStatus pyxiRGBToHLS_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, hlsBody<u16>, hlsTail<u16, truncated>);
}

PyxStatus pyxiRGBToHLS_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 4, hlsBody<u16>, hlsTail<u16, truncated>);
}

PyxStatus pyxiRGBToHLS_32f_AC4R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 1, hlsOfFloats, hlsOfFloats);
}

PyxStatus pyxiRGBToHLS_32f_C3R(const f32* src, int srcStep, f32* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 1, hlsOfFloats, hlsOfFloats);
}

// Its tail rounds, unlike that of three channels.
PyxStatus pyxiRGBToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertRgb(4, src, srcStep, dst, dstStep, roi, 4, hlsBody<u8>, hlsTail<u8, nearest>);
}

PyxStatus pyxiRGBToHLS_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    return convertRgb(3, src, srcStep, dst, dstStep, roi, 8, hlsBody<u8>, hlsTail<u8, truncated>);
}

PyxStatus pyxiBGRToHLS_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = planar(dst, dstStep, 4);
    fromBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

// Here alone the size is tested before the steps.
PyxStatus pyxiBGRToHLS_8u_AC4R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyStepBelowOne(srcStep, dstStep)) return pyxErrStep;
    fromBgr(interleaved(src, srcStep, 4), interleaved(dst, dstStep, 4), roi);
    return pyxOk;
}

PyxStatus pyxiBGRToHLS_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = planar(src, srcStep, 4);
    const auto target = interleaved(dst, dstStep, 4);
    fromBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiBGRToHLS_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src, 4) || anyPlaneNull(dst, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = planar(src, srcStep, 4);
    const auto target = planar(dst, dstStep, 4);
    fromBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiBGRToHLS_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    fromBgr(interleaved(src, srcStep, 3), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiBGRToHLS_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    fromBgr(planar(src, srcStep), interleaved(dst, dstStep, 3), roi);
    return pyxOk;
}

PyxStatus pyxiBGRToHLS_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    fromBgr(planar(src, srcStep), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_AC4P4R(const u8* src, int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = interleaved(src, srcStep, 4);
    const auto target = planar(dst, dstStep, 4);
    toBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_AP4C4R(const u8* const src[4], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = planar(src, srcStep, 4);
    const auto target = interleaved(dst, dstStep, 4);
    toBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_AP4R(const u8* const src[4], int srcStep, u8* const dst[4], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src, 4) || anyPlaneNull(dst, 4)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    const auto source = planar(src, srcStep, 4);
    const auto target = planar(dst, dstStep, 4);
    toBgr(source, target, roi);
    copyAlpha(source, target, roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    toBgr(interleaved(src, srcStep, 3), planar(dst, dstStep), roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_P3C3R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    toBgr(planar(src, srcStep), interleaved(dst, dstStep, 3), roi);
    return pyxOk;
}

PyxStatus pyxiHLSToBGR_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, RoiSize roi)
{
    if (anyNull(src, dst) || anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    if (const PyxStatus failure = failureOf(srcStep, dstStep, roi)) return failure;
    toBgr(planar(src, srcStep), planar(dst, dstStep), roi);
    return pyxOk;
}

} // namespace reference
