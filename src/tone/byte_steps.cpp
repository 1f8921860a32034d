#include "tone/byte_steps.hpp"

#include "layouts/avx2/interleave.hpp"

#include <algorithm>
#include <numeric>

namespace pyxcc::tone
{

/// From one byte of another value to the next all have one number n, and the line between 2^12 n and 2^12 (n + 1): the
/// first and the last of them tell how far it may be moved. Of what fits all the middle is taken.
std::optional<u16> ByteSteps::offsetOf(const ByteFunction& function, int /*place*/)
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

/// The slope is rounded down to as many bits as there is room for; few functions take one that is a little flatter.
/// Each value tells between which 128ths of a step the line may start. Rounding can let the last step have 255 where
/// those before it, which are to be whole as well, fall short of it, and so does the line then.
bool StepValues::findLine(int steps, u32 in256ths, const std::array<u8, most + 2>& values)
{
    const u32 count = static_cast<u32>(steps);
    int bits = 10;
    while ((in256ths << (bits - 7)) / count < 65536) ++bits;
    scale = static_cast<u16>(65536 >> (bits - 9));
    s32 least = 0, greatest = -1;
    for (u32 flatter = 0; flatter < 4 && least > greatest; ++flatter) {
        slope = static_cast<u16>((in256ths << (bits - 8)) / count - flatter);
        const auto startFor = [&](u32 value, int n) { // the least from which on that step has that value
            return static_cast<s32>(((value << (bits + 7)) + slope - 1u) / slope) - 128 * n;
        };
        least = 0;
        greatest = 127;
        for (int n = 0; n <= steps; ++n) {
            if (values[n] < 255) greatest = std::min(greatest, startFor(values[n] + 1u, n) - 1);
            if (n < steps || values[n] < 255) least = std::max(least, startFor(values[n], n));
        }
        nearTop = values[steps] == 255 && startFor(255, steps) > greatest ? 254 : 255;
        if (values[steps] == 255) least = std::max(least, startFor(nearTop, steps));
    }
    start = static_cast<u16>(std::clamp(least, 0, 127));
    for (int n = 0; n <= steps + 1; ++n) {
        if (at(128u * static_cast<u32>(n) + start) != values[n]) return false;
    }
    return true;
}

/// Of bytes that are on a step, by numbers without an error, rounding has made either less or more: the guess is for
/// less.
std::optional<u16> FineSteps::offsetOf(const ByteFunction& function, int place) const
{
    const auto tells = [&](const wide::U16& offset) {
        ByteFunction bytes, results;
        std::iota(bytes.begin(), bytes.end(), u8{0});
        for (int x = 0; x < 256; x += wide::U8::count)
            layouts::storeSamples(&results[x], lookUp(*this, layouts::loadSamples(&bytes[x]), Two{offset, offset}));
        return results == function;
    };
    for (const int difference : {0, 1, -1}) {
        const u16 offset = static_cast<u16>(255 + 254 - place + difference);
        if (tells(wide::U16(offset))) return offset;
    }
    return std::nullopt;
}

bool FineSteps::tryNext()
{
    if (nudge != 0) return false;
    nudge = static_cast<u8>((65535 + factor) / factor);
    return true;
}

} // namespace pyxcc::tone
