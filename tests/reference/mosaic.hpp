// Mosaics of a sensor, which has one colour a sample.
#pragma once

#include "reference/image.hpp"

namespace reference
{

/// What a sample stands for. Green ones tell what lies to their left and right.
enum class Site { red = 0, greenInBlueRow = 1, blue = 2, greenInRedRow = 3 };

constexpr bool isGridKnown(s32 grid) { return grid >= 0 && grid <= 3; }

/// The grids 0 to 3 begin with the rows B G over G R, R G over G B, G B over R G and G R over B G.
constexpr Site siteAt(s32 grid, int x, int y)
{
    constexpr int origin[4] = {2, 0, 1, 3};
    int code = origin[grid];
    if (x & 1) code ^= 3;
    if (y & 1) code ^= 1;
    return static_cast<Site>(code);
}

template <typename T> class Mosaic
{
public:
    Mosaic(const T* src, int srcStep, RoiSize size, s32 grid) : samples_(src, srcStep, 1), size_(size), grid_(grid) {}

    /// Mirrored once about its first and last row and column: what is further away than that is read where it comes to
    /// lie.
    s32 at(int x, int y) const { return samples_.get(mirrored(y, size_.height - 1), mirrored(x, size_.width - 1)); }

    Site site(int x, int y) const { return siteAt(grid_, x, y); }

private:
    static int mirrored(int i, int last)
    {
        if (i < 0) return -i;
        return i > last ? 2 * last - i : i;
    }

    Channel<const T> samples_;
    RoiSize size_;
    s32 grid_;
};

} // namespace reference
