// A mosaic that goes on beyond its ends, mirrored about its first and last samples.
#pragma once

#include "layouts/bytes.hpp"

#include <cstdint>
#include <cstring>

namespace pyxcc::mosaic
{

template <class T> struct ExtendedMosaic {
    const T* first;
    std::ptrdiff_t step;
    s32 width, height;

    /// The samples of row `y` from column `from` up to `to`: where they lie, if they are all within the mosaic, or a
    /// copy in `buffer`. What is reflected to beyond the other end of a short row is read from there.
    const T* samples(s32 y, s32 from, s32 to, T* buffer) const
    {
        const u8* const row = layouts::rowAt(layouts::bytes(first), step, mirrored(y, height - 1));
        const u8* const at = row + std::ptrdiff_t{from} * static_cast<int>(sizeof(T));
        const bool whole = from >= 0 && to <= width;
        if (whole && reinterpret_cast<std::uintptr_t>(at) % sizeof(T) == 0) return reinterpret_cast<const T*>(at);
        if (whole) {
            std::memcpy(buffer, at, static_cast<std::size_t>(to - from) * sizeof(T));
            return buffer;
        }
        for (s32 x = from; x < to; ++x) {
            const std::ptrdiff_t column = mirrored(x, width - 1);
            std::memcpy(buffer + (x - from), row + column * static_cast<int>(sizeof(T)), sizeof(T));
        }
        return buffer;
    }

private:
    static s32 mirrored(s32 place, s32 last)
    {
        if (place < 0) return -place;
        return place > last ? 2 * last - place : place;
    }
};

} // namespace pyxcc::mosaic
