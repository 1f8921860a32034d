// Pixels of three samples whose even and odd columns are apart.
#pragma once

#include "layouts/rows.hpp"

namespace pyxcc::layouts
{

namespace detail
{

/// Pixels of three units in their lanes: the first lanes of a, b and c make three, and so do the second ones.
template <int Bytes> PYXCC_INLINE Three<wide::U8> triplesInLanes(__m256i a, __m256i b, __m256i c)
{
    using Thirds = detail::Thirds<Bytes>;
    a = Thirds::template spread<0>(a);
    b = Thirds::template spread<1>(b);
    c = Thirds::template spread<2>(c);
    constexpr bool afterFirst = Thirds::samples % 3 == 1;
    const wide::U8 y(Thirds::blend(b, c, a)), z(Thirds::blend(c, a, b));
    return {wide::U8(Thirds::blend(a, b, c)), afterFirst ? y : z, afterFirst ? z : y};
}

} // namespace detail

/// Three interleaved samples a pixel, the even columns of a block in one register a channel and the odd ones in
/// another.
template <class Register> struct PairsOfC3 {
    using Samples = Register;
    static constexpr int pixelBytes = 3 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;

    /// Two neighbours are three units of two samples, which are interleaved as three samples are.
    static PYXCC_INLINE void store(u8* p, const Two<Three<Samples>>& pixels)
    {
        constexpr int bytes = sampleBytes<Samples>;
        using detail::unpackLow, detail::unpackHigh, detail::triplesInLanes;
        const Three<Samples>&even = pixels.a, &odd = pixels.b;
        const auto [x, y, z] =
            triplesInLanes<2 * bytes>(unpackLow<bytes>(even.a.v, even.b.v), unpackLow<bytes>(even.c.v, odd.a.v),
                                      unpackLow<bytes>(odd.b.v, odd.c.v));
        const auto [u, v, w] =
            triplesInLanes<2 * bytes>(unpackHigh<bytes>(even.a.v, even.b.v), unpackHigh<bytes>(even.c.v, odd.a.v),
                                      unpackHigh<bytes>(odd.b.v, odd.c.v));
        detail::storeWhole(p, _mm256_permute2x128_si256(x.v, y.v, 0x20));
        detail::storeWhole(p + 32, _mm256_permute2x128_si256(z.v, u.v, 0x20));
        detail::storeWhole(p + 64, _mm256_permute2x128_si256(v.v, w.v, 0x20));
        detail::storeWhole(p + 96, _mm256_permute2x128_si256(x.v, y.v, 0x31));
        detail::storeWhole(p + 128, _mm256_permute2x128_si256(z.v, u.v, 0x31));
        detail::storeWhole(p + 160, _mm256_permute2x128_si256(v.v, w.v, 0x31));
    }
};

template <class Register> inline constexpr int blockOf<PairsOfC3<Register>> = 2 * Register::count;

} // namespace pyxcc::layouts
