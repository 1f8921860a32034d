// Images of any layout, sample by sample.
#pragma once

#include "pyxcc/types.h"

#include <array>
#include <cstddef>
#include <cstring>
#include <type_traits>

namespace reference
{

/// One channel of an image: samples at a constant distance within a row, rows at a step in bytes. Samples are copied
/// bytewise, since a step may put them at any address. T is const for an image that is only read.
template <typename T> class Channel
{
public:
    using Sample = std::remove_const_t<T>;

    Channel() = default;

    /// `distance` is from a sample to the next of its row, counted in samples.
    Channel(T* first, int step, int distance)
        : first_(reinterpret_cast<Byte*>(first)), step_(step), distance_(distance * std::ptrdiff_t{sizeof(T)})
    {
    }

    Sample get(int row, int column) const
    {
        Sample sample;
        std::memcpy(&sample, address(row, column), sizeof sample);
        return sample;
    }

    void set(int row, int column, Sample sample) const { std::memcpy(address(row, column), &sample, sizeof sample); }

private:
    using Byte = std::conditional_t<std::is_const_v<T>, const std::byte, std::byte>;

    Byte* address(int row, int column) const { return first_ + row * step_ + column * distance_; }

    Byte* first_ = nullptr;
    std::ptrdiff_t step_ = 0;
    std::ptrdiff_t distance_ = 0;
};

/// The channels of an image in the order of its layout; those that the layout lacks stay unset.
template <typename T> using Image = std::array<Channel<T>, 4>;

/// An image of `count` interleaved samples a pixel.
template <typename T> Image<T> interleaved(T* first, int step, int count)
{
    Image<T> image;
    for (int k = 0; k < count; ++k) image[k] = Channel<T>(first + k, step, count);
    return image;
}

/// An image of `count` planes that share a step.
template <typename T> Image<T> planar(T* const* planes, int step, int count = 3)
{
    Image<T> image;
    for (int k = 0; k < count; ++k) image[k] = Channel<T>(planes[k], step, 1);
    return image;
}

/// The same image with its first and third channel exchanged.
template <typename T> Image<T> reversed(const Image<T>& image) { return {image[2], image[1], image[0], image[3]}; }

} // namespace reference
