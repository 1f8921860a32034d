// Mosaics as conversions take them, and what they make of them.
#pragma once

#include <gtest/gtest.h>

#include "pyxcc/types.h"

#include <array>
#include <cstddef>
#include <vector>

namespace edge
{

/// What the samples of a target hold before the call.
inline constexpr int unwritten = 77;

template <typename T> using Pixel = std::array<T, 3>;

/// The colours of the first two rows of each grid: 0 is red, 1 green, 2 blue.
inline constexpr int gridColours[4][2][2] = {{{2, 1}, {1, 0}}, {{0, 1}, {1, 2}}, {{1, 2}, {0, 1}}, {{1, 0}, {2, 1}}};

/// A mosaic of one colour.
template <typename T> std::vector<T> mosaicOf(Pixel<T> colour, int grid, RoiSize size)
{
    std::vector<T> samples;
    for (int y = 0; y < size.height; ++y) {
        for (int x = 0; x < size.width; ++x)
            samples.push_back(colour[static_cast<std::size_t>(gridColours[grid][y & 1][x & 1])]);
    }
    return samples;
}

/// Pixels one after the other.
template <typename T> std::vector<T> pixels(Pixel<T> colour, std::size_t count)
{
    std::vector<T> samples;
    for (std::size_t i = 0; i < count; ++i) samples.insert(samples.end(), colour.begin(), colour.end());
    return samples;
}

/// Samples that have nothing to do with each other.
template <typename T> std::vector<T> noise(std::size_t count)
{
    std::vector<T> samples;
    u32 state = 12345;
    for (std::size_t i = 0; i < count; ++i) {
        state = state * 1664525 + 1013904223;
        samples.push_back(static_cast<T>(state >> 16));
    }
    return samples;
}

} // namespace edge
