// Sources of filters along a row: each block comes with the pixel in front of it.
#pragma once

#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// `before` points to the samples of the pixel in front; a row begins as if that were black.
template <class Pixels> struct AfterPixel {
    Pixels pixels;
    const u8* before;
};

template <class Row> struct RowAfterPixel {
    static constexpr int block = Row::block;
    Row row;

    PYXCC_INLINE auto load(int x) const { return AfterPixel<decltype(row.load(x))>{row.load(x), before(x)}; }
    PYXCC_INLINE auto load(int x, int count) const
    {
        return AfterPixel<decltype(row.load(x, count))>{row.load(x, count), before(x)};
    }

private:
    PYXCC_INLINE const u8* before(int x) const
    {
        static constexpr u8 black[Row::pixelBytes] = {};
        return x == 0 ? black : row.pixel(x - 1);
    }
};

template <class Image> struct ImageAfterPixels {
    Image image;

    PYXCC_INLINE auto row(int y) const { return RowAfterPixel<decltype(image.row(y))>{image.row(y)}; }
};

template <class Image> auto withPixelBefore(const Image& image) { return ImageAfterPixels<Image>{image}; }

} // namespace pyxcc::layouts
