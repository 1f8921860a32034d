// A mosaic that goes on beyond its ends, mirrored about its first and last samples.
#pragma once

#include "layouts/bytes.hpp"

#include <algorithm>
#include <cstring>

namespace pyxcc::mosaic
{

template <class T> struct ExtendedMosaic {
    const T* first;
    std::ptrdiff_t step;
    s32 width, height;

    /// Copies the samples of row `y` from column `from` up to `to`. What is reflected to beyond the other end of a
    /// short row is read from there.
    void take(s32 y, s32 from, s32 to, T* target) const
    {
        constexpr int size = sizeof(T);
        const u8* const row = layouts::rowAt(layouts::bytes(first), step, mirrored(y, height - 1));
        const s32 inside = std::clamp(0, from, to), behind = std::clamp(width, inside, to);
        for (s32 x = from; x < to; ++x) {
            if (x == inside) {
                std::memcpy(target + (x - from), row + std::ptrdiff_t{x} * size,
                            static_cast<std::size_t>(behind - x) * size);
                x = behind;
                if (x >= to) break;
            }
            std::memcpy(target + (x - from), row + std::ptrdiff_t{mirrored(x, width - 1)} * size, size);
        }
    }

    /// Hints at samples that are taken soon.
    void expect(s32 y, s32 from, s32 to) const
    {
        constexpr int size = sizeof(T);
        const u8* const row = layouts::rowAt(layouts::bytes(first), step, y);
        for (s32 x = from; x < to; x += 128 / size) layouts::expectFrom<0>(row + std::ptrdiff_t{x} * size);
    }

private:
    static s32 mirrored(s32 place, s32 last)
    {
        if (place < 0) return -place;
        return place > last ? 2 * last - place : place;
    }
};

} // namespace pyxcc::mosaic
