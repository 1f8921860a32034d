// Two registers of samples that are twice as wide as those on the other side of a conversion, in the order in which a
// register is widened and narrowed: each 128-bit half by itself.
#pragma once

#include "layouts/avx2/interleave.hpp"

namespace pyxcc::layouts
{

/// Reads 64 bytes of samples.
template <class Register> PYXCC_INLINE Two<Register> loadForNarrowing(const u8* p)
{
    return {Register(detail::lanesFrom(p, p + 32)), Register(detail::lanesFrom(p + 16, p + 48))};
}

/// Writes 64 bytes of samples.
template <class Register> PYXCC_INLINE void storeWidened(u8* p, const Two<Register>& samples)
{
    detail::storeWhole(p, _mm256_permute2x128_si256(samples.a.v, samples.b.v, 0x20));
    detail::storeWhole(p + 32, _mm256_permute2x128_si256(samples.a.v, samples.b.v, 0x31));
}

} // namespace pyxcc::layouts
