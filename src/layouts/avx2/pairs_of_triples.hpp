// Pixels of three samples whose even and odd columns are apart.
#pragma once

#include "layouts/rows.hpp"

namespace pyxcc::layouts
{

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
