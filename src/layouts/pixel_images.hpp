// Images of bytes for forms over whole pixels.
#pragma once

#include "layouts/avx2/eights.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// Three interleaved bytes a pixel.
struct C3Pixels {
    using Samples = wide::Pixels<3>;
    static constexpr int pixelBytes = 3;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Samples load(const u8* p) { return loadEight<3>(p); }
    static PYXCC_INLINE void store(u8* p, const wide::PixelWords& pixels) { storeEightTriples(p, pixels); }
};

/// The same with a fourth byte, which a store puts back as it was.
struct AC4Pixels {
    using Samples = wide::Pixels<4>;
    static constexpr int pixelBytes = 4;
    static constexpr bool readsTarget = true;

    static PYXCC_INLINE Samples load(const u8* p) { return loadEight<4>(p); }
    static PYXCC_INLINE void store(u8* p, const wide::PixelWords& pixels) { storeEightQuadruples(p, pixels); }
};

template <class Byte> auto c3Pixels(Byte* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C3Pixels{});
}

template <class Byte> auto ac4Pixels(Byte* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, AC4Pixels{});
}

} // namespace pyxcc::layouts
