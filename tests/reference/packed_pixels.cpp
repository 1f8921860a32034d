#include "reference/packed_pixels.hpp"

namespace reference
{

namespace
{

constexpr s32 thresholds4[4][4] = {
    {0, 2312, 578, 2890},
    {3468, 1156, 4046, 1734},
    {867, 3179, 289, 2601},
    {4335, 2023, 3757, 1445},
};

constexpr s32 thresholds5[4][4] = {
    {0, 1118, 279, 1398},
    {1678, 559, 1957, 839},
    {419, 1538, 139, 1258},
    {2097, 978, 1817, 699},
};

} // namespace

s32 cut(s32 sample, int bits, int, int) { return sample >> (8 - bits); }

s32 dithered(s32 sample, int bits, int row, int column)
{
    if (bits == 4) {
        const s32 q = (sample * 15) >> 8;
        const bool up = sample * 256 - q * 4352 > thresholds4[row & 3][column & 3];
        return up ? q + 1 : q;
    }
    const s32 threshold = thresholds5[row & 3][column & 3];
    if (bits == 5) {
        const s32 q = (sample * 31) >> 8;
        const bool up = sample * 256 - q * 2105 > threshold;
        return ((up ? q + 1 : q) * 2105) >> 11;
    }
    const s32 q = (sample * 63) >> 8;
    const bool up = sample * 256 - q * 1036 > threshold >> 1;
    return ((up ? q + 1 : q) * 1036) >> 10;
}

void PackedTarget::set(int row, int column, Triple<u8> rgb) const
{
    const s32 r = narrowing(rgb[0], model.outerBits, row, column);
    const s32 g = narrowing(rgb[1], model.middleBits, row, column);
    const s32 b = narrowing(rgb[2], model.outerBits, row, column);
    const s32 low = model.redIsHigh ? b : r, high = model.redIsHigh ? r : b;
    const s32 pixel = low | g << model.outerBits | high << (model.outerBits + model.middleBits);
    pixels.set(row, column, static_cast<u16>(pixel));
}

} // namespace reference
