#include "reference/bt601_subsampled.hpp"

#include "reference/bt601.hpp"
#include "reference/primitives.hpp"

namespace reference
{

u8 lumaExact(Triple<u8> rgb) { return fwdExact(rgb)[0]; }

u8 lumaRound(Triple<u8> rgb) { return fwdRound(rgb)[0]; }

// As fwdExact, but without the half that rounds.
u8 lumaExactOdd(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return sat8((16843 * r + 33030 * g + 6423 * b + 0x100000) >> 16);
}

u8 lumaHigh7(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 256, g = rgb[1] * 256, b = rgb[2] * 256;
    return sat8((mulHighU16(r, 8422) + mulHighU16(g, 16515) + mulHighU16(b, 3212) + 2112) >> 7);
}

u8 lumaHigh8(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 256, g = rgb[1] * 256, b = rgb[2] * 256;
    return sat8(((mulHighU16(r, 16843) + mulHighU16(g, 33030) + mulHighU16(b, 6423)) >> 8) + 16);
}

// As fwdRound, but the bias is added after the shift.
u8 lumaRoundPlain(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 128, g = rgb[1] * 128, b = rgb[2] * 128;
    return sat8(((mulRound15(r, 4211) + mulRound15(g, 8258) + mulRound15(b, 1606)) >> 6) + 16);
}

Chroma chromaHighS(Triple<s32> sums, s32 scale)
{
    const s32 r = sums[0] * scale, g = sums[1] * scale, b = sums[2] * scale;
    return {
        sat8((mulHighS16(b, 28770) + mulHighS16(g, -19071) + mulHighS16(r, -9699) + 16448) >> 7),
        sat8((mulHighS16(r, 28770) + mulHighS16(g, -24117) + mulHighS16(b, -4653) + 16448) >> 7),
    };
}

// Unlike in chromaHighS the products are cut before they are subtracted, which rounds them the other way.
Chroma chromaHighU(Triple<s32> sums, s32 add, int shift)
{
    const s32 r = sums[0] * 32, g = sums[1] * 32, b = sums[2] * 32;
    return {
        sat8((mulHighU16(b, 28770) - (mulHighU16(g, 19071) + mulHighU16(r, 9699)) + add) >> shift),
        sat8((mulHighU16(r, 28770) - (mulHighU16(g, 24117) + mulHighU16(b, 4653)) + add) >> shift),
    };
}

Chroma chromaRound(Triple<s32> sums)
{
    const s32 r = sums[0] * 32, g = sums[1] * 32, b = sums[2] * 32;
    return {
        sat8((mulRound15(b, 7193) - mulRound15(r, 2425) - mulRound15(g, 4768) + 8194) >> 6),
        sat8((mulRound15(r, 7193) - mulRound15(b, 1163) - mulRound15(g, 6029) + 8194) >> 6),
    };
}

Chroma chromaRoundPlain(Triple<s32> sums)
{
    const s32 r = sums[0] * 32, g = sums[1] * 32, b = sums[2] * 32;
    return {
        sat8(((mulRound15(b, 7193) - mulRound15(r, 2425) - mulRound15(g, 4768)) >> 6) + 128),
        sat8(((mulRound15(r, 7193) - mulRound15(b, 1163) - mulRound15(g, 6029)) >> 6) + 128),
    };
}

// What is subtracted costs 256, which the cut to 8 bits gives back.
Chroma chromaExact(Triple<s32> sums, int shift, s32 subtract)
{
    const auto [r, g, b] = sums;
    return {
        low8((28770 * b - 19071 * g - 9699 * r - subtract) >> shift),
        low8((28770 * r - 24117 * g - 4653 * b - subtract) >> shift),
    };
}

Chroma chromaMadd(Triple<s32> sums)
{
    const auto [r, g, b] = sums;
    return {
        sat8((28770 * b - 19071 * g - 9699 * r + 0x1010000) >> 17),
        sat8((28770 * r - 24117 * g - 4653 * b + 0x1010000) >> 17),
    };
}

Triple<u8> invExactE(Triple<u8> ycbcr)
{
    const s32 y = 76294 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 104595 * cr - 1187936) >> 16),
        sat8((y - 25625 * cb - 53281 * cr - 1187936) >> 16),
        sat8((y + 132186 * cb - 1187936) >> 16),
    };
}

// The zero of chroma is in the constants, which are not quite 128 times the factors and the bias.
Triple<u8> invExactF(Triple<u8> ycbcr)
{
    const s32 y = 76284 * ycbcr[0], cb = ycbcr[1], cr = ycbcr[2];
    return {
        sat8((y + 104595 * cr - 14608761) >> 16),
        sat8((y - 53281 * cr - 25690 * cb + 8887730) >> 16),
        sat8((y + 132186 * cb - 18140365) >> 16),
    };
}

Triple<u8> inv3A(Triple<u8> ycbcr)
{
    const s32 u = ycbcr[1] * 128, v = ycbcr[2] * 128;
    const s32 t = mulHighS16(ycbcr[0] * 128, 4769);
    return {
        sat8((t + mulHighS16(v, 6537) - 1779) >> 3),
        sat8((t - (mulHighS16(u, 1605) + mulHighS16(v, 3330) - 1089)) >> 3),
        sat8((t + mulHighS16(u, 8263) - 2211) >> 3),
    };
}

Triple<u8> inv3B(Triple<u8> ycbcr)
{
    const s32 u = ycbcr[1] * 128, v = ycbcr[2] * 128;
    const s32 t = mulHighS16(ycbcr[0] * 128, 4768);
    return {
        sat8((t + mulHighS16(v, 6537) - 1779) >> 3),
        sat8((t - (mulHighS16(u, 1606) + mulHighS16(v, 3330) - 1084)) >> 3),
        sat8((t + mulHighS16(u, 8262) - 2210) >> 3),
    };
}

Triple<u8> inv3C(Triple<u8> ycbcr)
{
    const s32 u = ycbcr[1] * 128, v = ycbcr[2] * 128;
    const s32 t = mulHighS16(ycbcr[0] * 128, 4768);
    return {
        sat8((t + mulHighS16(v, 6537) - 1783) >> 3),
        sat8((t - (mulHighS16(u, 1606) + mulHighS16(v, 3330) - 1085)) >> 3),
        sat8((t + mulHighS16(u, 8262) - 2214) >> 3),
    };
}

// The biases are taken off before the products.
Triple<u8> inv3D(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 4769);
    return {
        sat8((t + mulHighS16(v, 6537)) >> 3),
        sat8((t - (mulHighS16(u, 1605) + mulHighS16(v, 3330))) >> 3),
        sat8((t + mulHighS16(u, 8263)) >> 3),
    };
}

} // namespace reference
