// Rows of bits: eight pixels a byte, the first in the highest bit.
#pragma once

#include "layouts/bytes.hpp"

#include <algorithm>
#include <bit>
#include <cstring>

namespace pyxcc::layouts
{

struct BitRow {
    u8* at;
    int offset; ///< of the first pixel, 0 to 7

    /// Writes 32 bits from pixel `x` on, whose bit begins a byte.
    PYXCC_INLINE void store(int x, u32 bits) const
    {
        static_assert(std::endian::native == std::endian::little);
        const u32 inMemory = __builtin_bswap32(bits);
        std::memcpy(at + (std::ptrdiff_t{x} + offset) / 8, &inMemory, sizeof inMemory);
    }

    /// Writes `count` bits, up to 32, from pixel `x` on: that of the first pixel is the highest of `bits`. All other
    /// bits are kept.
    PYXCC_INLINE void store(int x, int count, u32 bits) const
    {
        std::ptrdiff_t place = std::ptrdiff_t{x} + offset;
        if (count == 32 && place % 8 == 0) return store(x, bits);
        while (count > 0) {
            const int within = static_cast<int>(place % 8), some = std::min(count, 8 - within);
            const u32 mask = (0xffu >> within) & (0xff00u >> (within + some));
            u8& byte = at[place / 8];
            byte = static_cast<u8>((byte & ~mask) | ((bits >> 24 >> within) & mask));
            bits = some < 32 ? bits << some : 0;
            place += some;
            count -= some;
        }
    }

    /// So many pixels in front of the first one whose bit begins a byte.
    int pixelsInFrontOfByte() const { return -offset & 7; }
};

} // namespace pyxcc::layouts
