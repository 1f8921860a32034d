#include "reference/yuv.hpp"

#include "reference/primitives.hpp"

namespace reference
{

Triple<u8> yuvFwdExactA(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    const s32 s = 19595 * r + 38470 * g + 7471 * b;
    return {
        low8((s + 32768) >> 16),
        low8((((b * 65536 - s + 32768) >> 16) * 32244 >> 16) - 128),
        sat8((((r * 65536 - s + 32768) >> 16) * 57475 >> 16) + 128),
    };
}

Triple<u8> yuvFwdExactB(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    const s32 s = 19595 * r + 38470 * g + 7471 * b;
    return {
        low8(s >> 16),
        low8((((b * 65536 - s + 32767) >> 16) * 32244 >> 16) - 128),
        sat8((((r * 65536 - s + 32767) >> 16) * 57475 >> 16) + 128),
    };
}

// The weights of luma add up to one less than 1.
Triple<u8> yuvFwdExactC(Triple<u8> rgb)
{
    const auto [r, g, b] = rgb;
    return {
        low8((19595 * r + 38469 * g + 7471 * b) >> 16),
        low8(((-4816 * r - 9469 * g + 14286 * b) >> 15) - 128),
        sat8(((20152 * r - 16875 * g - 3276 * b) >> 15) + 128),
    };
}

Triple<u8> yuvFwdHigh(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 128, g = rgb[1] * 128, b = rgb[2] * 128;
    const s32 y = mulHighU16(2 * r, 19595) + mulHighU16(2 * g, 38469) + mulHighU16(2 * b, 7471);
    const s32 u = mulHighS16(r, -4816) + mulHighS16(g, -9469) + mulHighS16(b, 14286);
    const s32 v = mulHighS16(r, 20152) + mulHighS16(g, -16875) + mulHighS16(b, -3276);
    return {
        sat8(y >> 8),
        sat8((u >> 6) + 128),
        sat8((v >> 6) + 128),
    };
}

// The 1 that rounds luma stays in what is subtracted from blue and red.
Triple<u8> yuvFwdPlanar(Triple<u8> rgb)
{
    const s32 r = rgb[0] * 4, g = rgb[1] * 4, b = rgb[2] * 4;
    const s32 t = mulHighS16(r, 9798) + mulHighS16(b, 3736) + mulHighS16(g, 19235) + 1;
    return {
        sat8(t >> 1),
        sat8(mulHighS16(((b + 1) >> 1) - t, 16121) + 128),
        sat8(mulHighS16(((r + 1) >> 1) - t, 28737) + 128),
    };
}

// Green alone is cut, not rounded.
Triple<u8> yuvInvExactA(Triple<u8> yuv)
{
    const s32 y = yuv[0] * 65536, u = yuv[1] - 128, v = yuv[2] - 128;
    return {
        sat8((y + 74711 * v + 32768) >> 16),
        sat8((y - 25821 * u - 38076 * v) >> 16),
        sat8((y + 133169 * u + 32768) >> 16),
    };
}

Triple<u8> yuvInvExactB(Triple<u8> yuv)
{
    const s32 y = yuv[0] * 65536, u = yuv[1] - 128, v = yuv[2] - 128;
    return {
        sat8((y + 74710 * v) >> 16),
        sat8((y - 25820 * u - 38075 * v) >> 16),
        sat8((y + 133168 * u) >> 16),
    };
}

Triple<u8> yuvInvExactC(Triple<u8> yuv)
{
    const s32 y = yuv[0] * 65536, u = yuv[1] - 128, v = yuv[2] - 128;
    return {
        sat8((y + 74711 * v + 32768) >> 16),
        sat8((y - 25821 * u - 38076 * v + 32768) >> 16),
        sat8((y + 133169 * u + 32768) >> 16),
    };
}

Triple<u8> yuvInvExactD(Triple<u8> yuv)
{
    const s32 y = yuv[0] * 65536, u = yuv[1] - 128, v = yuv[2] - 128;
    return {
        sat8((y + 74711 * v) >> 16),
        sat8((y - 25821 * u - 38076 * v) >> 16),
        sat8((y + 133169 * u) >> 16),
    };
}

Triple<u8> yuvInvHigh3(Triple<u8> yuv)
{
    const s32 y = yuv[0], u = (yuv[1] - 128) * 8, v = (yuv[2] - 128) * 8;
    return {
        sat8(y + mulHighS16(v, 9339)),
        sat8(y + mulHighS16(u, -3228) + mulHighS16(v, -4760)),
        sat8(y + mulHighS16(u, 16646)),
    };
}

Triple<u8> yuvInvHigh4(Triple<u8> yuv)
{
    const s32 y = 2 * yuv[0], u = (yuv[1] - 128) * 16, v = (yuv[2] - 128) * 16;
    return {
        sat8((y + mulHighS16(v, 9338)) >> 1),
        sat8((y + mulHighS16(u, -3227) + mulHighS16(v, -4759)) >> 1),
        sat8((y + mulHighS16(u, 16645)) >> 1),
    };
}

// yuvInvHigh4 with weights one apart.
Triple<u8> yuvInvHigh4x(Triple<u8> yuv)
{
    const s32 y = 2 * yuv[0], u = (yuv[1] - 128) * 16, v = (yuv[2] - 128) * 16;
    return {
        sat8((y + mulHighS16(v, 9339)) >> 1),
        sat8((y + mulHighS16(u, -3228) + mulHighS16(v, -4760)) >> 1),
        sat8((y + mulHighS16(u, 16646)) >> 1),
    };
}

Triple<u8> yuvInvHigh7(Triple<u8> yuv)
{
    const s32 y = 8 * yuv[0], u = (yuv[1] - 128) * 128, v = (yuv[2] - 128) * 128;
    return {
        sat8((y + mulHighS16(v, 4669) + 4) >> 3),
        sat8((y - mulHighS16(v, 2380) - mulHighS16(u, 1614) + 4) >> 3),
        sat8((y + mulHighS16(u, 8323) + 4) >> 3),
    };
}

// The products of green are subtracted as one sum.
Triple<u8> yuvInvHigh8(Triple<u8> yuv)
{
    const s32 y = 16 * yuv[0], u = (yuv[1] - 128) * 128, v = (yuv[2] - 128) * 128;
    return {
        sat8((y + mulHighS16(v, 9338) + 8) >> 4),
        sat8((y - (mulHighS16(u, 3227) + mulHighS16(v, 4759)) + 8) >> 4),
        sat8((y + mulHighS16(u, 16646) + 8) >> 4),
    };
}

Triple<u8> yuv422OddInv13(Triple<u8> yuv)
{
    const s32 y = yuv[0] * 8192, u = yuv[1] - 128, v = yuv[2] - 128;
    return {
        sat8((y + 9338 * v) >> 13),
        sat8((y - 3227 * u - 4759 * v) >> 13),
        sat8((y + 16645 * u) >> 13),
    };
}

} // namespace reference
