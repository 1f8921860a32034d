// Conversions of images pixel by pixel.
#pragma once

#include "reference/image.hpp"

#include <array>

namespace reference
{

/// Three samples of a pixel, in the order of its colour model.
template <typename T> using Triple = std::array<T, 3>;

/// Converts the first three channels. The whole blocks of a row take the wide form, the pixels that are left take the
/// tail form. A pixel is read before it is written, so that an image may be converted in place.
template <typename S, typename D, typename Wide, typename Tail>
void convert(const Image<const S>& src, const Image<D>& dst, RoiSize roi, int block, Wide wide, Tail tail)
{
    const int blocksEnd = roi.width / block * block;
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) {
            const Triple<S> in = {src[0].get(row, column), src[1].get(row, column), src[2].get(row, column)};
            const Triple<D> out = column < blocksEnd ? wide(in) : tail(in);
            for (int k = 0; k < 3; ++k) dst[k].set(row, column, out[k]);
        }
    }
}

/// Where all pixels take one form.
template <typename S, typename D, typename Form>
void convert(const Image<const S>& src, const Image<D>& dst, RoiSize roi, Form form)
{
    convert(src, dst, roi, 1, form, form);
}

/// Sets every sample of a channel.
template <typename T> void fill(const Channel<T>& dst, RoiSize roi, T value)
{
    for (int row = 0; row < roi.height; ++row) {
        for (int column = 0; column < roi.width; ++column) dst.set(row, column, value);
    }
}

} // namespace reference
