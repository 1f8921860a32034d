#include "tone/byte_steps.hpp"

#include <algorithm>

namespace pyxcc::tone
{

/// From one byte of another value to the next all have one number n, and the line between 2^12 n and 2^12 (n + 1): the
/// first and the last of them tell how far it may be moved. Of what fits all the middle is taken.
std::optional<u16> ByteSteps::offsetOf(const ByteFunction& function)
{
    s32 least = -65536, most = 65536;
    int number = -1;
    for (int x = 0; x < 256; ++x) {
        const s32 at = static_cast<s32>((static_cast<u32>(x) * 256 * slope) >> 16);
        if (x == 0 || function[x] != function[x - 1]) {
            ++number;
            if (number == values && number < ByteSteps::most) valueOf[values++] = function[x];
            if (number >= values || valueOf[number] != function[x]) return std::nullopt;
            least = std::max(least, (number << shift) - at);
        }
        most = std::min(most, ((number + 1) << shift) - 1 - at);
    }
    if (least > most) return std::nullopt;
    return static_cast<u16>((least + most) >> 1);
}

} // namespace pyxcc::tone
