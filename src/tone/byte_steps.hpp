// Functions of bytes that go up by even steps, as those of few levels do: the number of a step is a line in 16 bits,
// rounded down, and a register can look up the value of a step. The line is found from all 256 values of a function,
// so that nothing is left to chance. A function that has none is to be taken another way.
#pragma once

#include "lanes/lanes.hpp"

#include <array>
#include <optional>

namespace pyxcc::tone
{

using ByteFunction = std::array<u8, 256>;

/// Functions whose values are the same ones, but for the bytes at which they go up.
struct ByteSteps {
    static constexpr int most = 16;
    static constexpr int shift = 12;

    u16 slope;      ///< of steps in 4096ths, over 256 bytes
    int values = 0; ///< so many are known, up to `most`
    std::array<u8, most> valueOf = {};

    /// Of so many steps between 0 and 255. The line is steeper than those by a little, for a step that rounding has put
    /// on 255 itself to be met as well as one that should be there and is not.
    explicit ByteSteps(int steps) : slope(static_cast<u16>(((steps << (shift + 9)) / 255 + 1) / 2 + 4)) {}

    /// What is to be added to the line for it to tell a function.
    std::optional<u16> offsetOf(const ByteFunction& function);
};

/// The value of a function.
inline u8 lookUp(const ByteSteps& steps, u8 x, u16 offset)
{
    const u32 line = (u32{x} * 256 * steps.slope) >> 16;
    return steps.valueOf[static_cast<u16>(line + offset) >> ByteSteps::shift];
}

/// The same of a function for each byte. Its offsets come in the order of widening.
PYXCC_INLINE wide::U8 lookUp(const ByteSteps& steps, wide::U8 x, const Two<wide::U16>& offsets)
{
    const auto numbers = [&](const wide::Sample& words, wide::U16 offset) PYXCC_INLINE_LAMBDA {
        return wide::Byte(((mulHighU16(words.in256ths, steps.slope) + offset) >> ByteSteps::shift).v);
    };
    const Two<wide::Sample> words = widen(x);
    return lookUp(steps.valueOf, narrow(numbers(words.a, offsets.a), numbers(words.b, offsets.b)));
}

} // namespace pyxcc::tone
