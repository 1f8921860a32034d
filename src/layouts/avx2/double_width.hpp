// Two registers of samples that are twice as wide as those on the other side of a conversion, in the order in which a
// register is widened and narrowed: each 128-bit half by itself.
#pragma once

#include "layouts/avx2/interleave.hpp"

namespace pyxcc::layouts
{

/// Reads 64 bytes of samples.
template <class Register> PYXCC_INLINE Two<Register> loadForNarrowing(const u8* p)
{
    const auto halves = [p](int at) PYXCC_INLINE_LAMBDA {
        const __m128i low = _mm_loadu_si128(reinterpret_cast<const __m128i*>(p + at));
        const __m128i high = _mm_loadu_si128(reinterpret_cast<const __m128i*>(p + at + 32));
        return _mm256_inserti128_si256(_mm256_castsi128_si256(low), high, 1);
    };
    return {Register(halves(0)), Register(halves(16))};
}

/// Writes 64 bytes of samples.
template <class Register> PYXCC_INLINE void storeWidened(u8* p, const Two<Register>& samples)
{
    detail::storeWhole(p, _mm256_permute2x128_si256(samples.a.v, samples.b.v, 0x20));
    detail::storeWhole(p + 32, _mm256_permute2x128_si256(samples.a.v, samples.b.v, 0x31));
}

} // namespace pyxcc::layouts
