#include "layouts/bytes.hpp"

#include <cstring>

namespace pyxcc::layouts
{

namespace
{

/// Copies at least `Size` bytes and at most twice as many, by two copies that overlap in the middle.
template <int Size> void copyOverlapping(u8* to, const u8* from, int count)
{
    u8 head[Size], tail[Size];
    std::memcpy(head, from, Size);
    std::memcpy(tail, from + count - Size, Size);
    std::memcpy(to, head, Size);
    std::memcpy(to + count - Size, tail, Size);
}

} // namespace

void copyBytes(u8* to, const u8* from, int count)
{
    for (; count > 64; count -= 32, to += 32, from += 32) std::memcpy(to, from, 32);
    if (count >= 32) return copyOverlapping<32>(to, from, count);
    if (count >= 16) return copyOverlapping<16>(to, from, count);
    if (count >= 8) return copyOverlapping<8>(to, from, count);
    if (count >= 4) return copyOverlapping<4>(to, from, count);
    if (count >= 2) return copyOverlapping<2>(to, from, count);
    if (count == 1) *to = *from;
}

} // namespace pyxcc::layouts
