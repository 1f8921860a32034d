// Targets whose blocks go past the cache, which an image that the cache cannot hold would only empty.
#pragma once

#include "layouts/avx2/stream.hpp"
#include "layouts/images.hpp"

#include <cstdint>

namespace pyxcc::layouts
{

/// Whole blocks are to be stored from firstAligned() on; partial blocks anywhere, through the cache.
template <class Row> struct StreamedRow {
    static constexpr int block = Row::block;
    Row row;

    /// The first column at an address that blocks may be streamed to: that of a multiple of 32 bytes, and so is the
    /// size of a block. A row has one if its address is a multiple of the power of two in a pixel's size.
    int firstAligned() const
    {
        int x = 0;
        while (reinterpret_cast<std::uintptr_t>(row.pixel(x)) % 32 != 0) ++x;
        return x;
    }

    template <class Pixels> PYXCC_INLINE void store(int x, const Pixels& pixels) const
    {
        row.packing.stream(row.pixel(x), pixels);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Pixels& pixels) const
    {
        row.store(x, count, pixels);
    }
};

template <class Image> struct StreamedImage {
    Image image;

    PYXCC_INLINE auto row(int y) const { return StreamedRow<decltype(image.row(y))>{image.row(y)}; }
};

template <class Image> auto streamed(const Image& image) { return StreamedImage<Image>{image}; }

/// A row of planes. Its first column at a multiple of 32 bytes is to be the same in all of them.
template <class Samples, int Planes> struct StreamedRow<PlanarRow<Samples, u8, Planes>> {
    static constexpr int block = Samples::count;
    PlanarRow<Samples, u8, Planes> row;

    int firstAligned() const
    {
        constexpr int size = sampleBytes<Samples>;
        return static_cast<int>(-reinterpret_cast<std::uintptr_t>(row.plane[0].at) % 32) / size;
    }

    template <class Pixels> PYXCC_INLINE void store(int x, const Pixels& pixels) const
    {
        const auto put = [&](int plane, Samples samples) PYXCC_INLINE_LAMBDA {
            u8* const at = row.plane[plane].at + static_cast<std::ptrdiff_t>(x) * sampleBytes<Samples>;
            detail::put<Stores::streamed>(at, detail::raw(samples));
        };
        put(0, pixels.a);
        put(1, pixels.b);
        put(2, pixels.c);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Pixels& pixels) const
    {
        row.store(x, count, pixels);
    }
};

} // namespace pyxcc::layouts
