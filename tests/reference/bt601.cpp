#include "reference/bt601.hpp"

#include "reference/primitives.hpp"

namespace reference
{

Triple<u8> fwdExact(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return {
        low8((16843 * r + 33030 * g + 6423 * b + 0x108000) >> 16),
        low8((-9699 * r - 19071 * g + 28770 * b - 0x7f8000) >> 16),
        low8((28770 * r - 24117 * g - 4653 * b - 0x7f8000) >> 16),
    };
}

Triple<u8> fwdHigh(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 128, g = rgb[1] * 128, b = rgb[2] * 128;
    const s32 y = mulHighU16(2 * r, 16843) + mulHighU16(2 * g, 33030) + mulHighU16(2 * b, 6423);
    const s32 cb = mulHighS16(r, -9699) + mulHighS16(g, -19071) + mulHighS16(b, 28770);
    const s32 cr = mulHighS16(r, 28770) + mulHighS16(g, -24117) + mulHighS16(b, -4653);
    return {
        sat8(((y + 128) >> 8) + 16),
        sat8(((cb + 64) >> 7) + 128),
        sat8(((cr + 64) >> 7) + 128),
    };
}

Triple<u8> fwdRound(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 128, g = rgb[1] * 128, b = rgb[2] * 128;
    const s32 y = mulRound15(r, 4211) + mulRound15(g, 8258) + mulRound15(b, 1606);
    const s32 cb = mulRound15(b, 7193) - mulRound15(g, 4768) - mulRound15(r, 2425);
    const s32 cr = mulRound15(r, 7193) - mulRound15(g, 6029) - mulRound15(b, 1163);
    return {
        sat8((y + 1026) >> 6),
        sat8((cb + 8194) >> 6),
        sat8((cr + 8194) >> 6),
    };
}

Triple<u8> invExactA(Triple<u8> ycbcr)
{
    const s32 y = 76284 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 104595 * cr - 1220544) >> 16),
        sat8((y - 25690 * cb - 53281 * cr - 1220544) >> 16),
        sat8((y + 132186 * cb - 1220544) >> 16),
    };
}

Triple<u8> invExactB(Triple<u8> ycbcr)
{
    const s32 y = 76284 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 104595 * cr - 1187776) >> 16),
        sat8((y - 25690 * cb - 53281 * cr - 1187776) >> 16),
        sat8((y + 132186 * cb - 1187776) >> 16),
    };
}

Triple<u8> invExactC(Triple<u8> ycbcr)
{
    const s32 y = 76282 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 104593 * cr - 1220512) >> 16),
        sat8((y - 25689 * cb - 53279 * cr - 1220512) >> 16),
        sat8((y + 132184 * cb - 1220512) >> 16),
    };
}

Triple<u8> invExactD(Triple<u8> ycbcr)
{
    const s32 y = 76282 * ycbcr[0], cb = ycbcr[1] - 128, cr = ycbcr[2] - 128;
    return {
        sat8((y + 104593 * cr - 1187744) >> 16),
        sat8((y - 25689 * cb - 53279 * cr - 1187744) >> 16),
        sat8((y + 132184 * cb - 1187744) >> 16),
    };
}

Triple<u8> invHighA(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 9536);
    return {
        sat8((t + mulHighS16(v, 13074) + 8) >> 4),
        sat8((t + mulHighS16(v, -6660) + mulHighS16(u, -3203) + 8) >> 4),
        sat8((t + mulHighS16(u, 16523) + 8) >> 4),
    };
}

Triple<u8> invHighB(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 9536);
    return {
        sat8((t + mulHighS16(v, 13074)) >> 4),
        sat8((t + mulHighS16(v, -6660) + mulHighS16(u, -3203)) >> 4),
        sat8((t + mulHighS16(u, 16523)) >> 4),
    };
}

Triple<u8> invHighC(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 9535);
    return {
        sat8((t + mulHighS16(v, 13074) + 8) >> 4),
        sat8((t + mulHighS16(v, -6660) + mulHighS16(u, -3211) + 8) >> 4),
        sat8((t + mulHighS16(u, 16523) + 8) >> 4),
    };
}

// Unlike in invHighC the products of green are subtracted, which rounds them the other way.
Triple<u8> invHighD(Triple<u8> ycbcr)
{
    const s32 u = (ycbcr[1] - 128) * 128, v = (ycbcr[2] - 128) * 128;
    const s32 t = mulHighS16((ycbcr[0] - 16) * 128, 9535);
    return {
        sat8((t + mulHighS16(v, 13074) + 8) >> 4),
        sat8((t - mulHighS16(v, 6660) - mulHighS16(u, 3211) + 8) >> 4),
        sat8((t + mulHighS16(u, 16523) + 8) >> 4),
    };
}

} // namespace reference
