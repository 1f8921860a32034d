// Images of packed 16-bit pixels. A field holds the leading bits of a byte: a source gives it with zeros behind it, a
// target drops what is behind it.
#pragma once

#include "layouts/avx2/packed_fields.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// Three fields of a 16-bit pixel, the first in the lowest bits.
template <FieldWidths widths> struct PackedPixels {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Three<wide::U8> load(const u8* p) { return loadFields<widths>(p); }

    static PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) { storeFields<widths>(p, pixels); }
};

/// Rows at any distance.
template <FieldWidths widths, class Pixel> auto packedPixels(Pixel* first, std::ptrdiff_t step)
{
    static_assert(sizeof(Pixel) == 2);
    return detail::interleaved(first, step, PackedPixels<widths>{});
}

/// Rows at a distance of whole pixels: an odd step loses its last bit.
template <FieldWidths widths, class Pixel> auto packedPixelsApart(Pixel* first, std::ptrdiff_t step)
{
    return packedPixels<widths>(first, step >> 1 << 1);
}

} // namespace pyxcc::layouts
