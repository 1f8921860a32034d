// Functions of bytes that go up by even steps, as those of fewer levels do: the number of a step is a line in 16 bits,
// rounded down, and a register can look up the value of a step, or where there are more than it holds, the value is a
// line once more. The lines are found from all 256 values of a function, so that nothing is left to chance. A function
// that has none is to be taken another way.
#pragma once

#include "lanes/avx2/byte_lines.hpp"
#include "lanes/lanes.hpp"

#include <algorithm>
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

    /// What is to be added to the line for it to tell a function, wherever that goes up.
    std::optional<u16> offsetOf(const ByteFunction& function, int place = 0);

    /// Whether there is another line to try.
    static bool tryNext() { return false; }
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

/// What steps are stored as, as a line: 16 steps or more, up to 255, and one more.
struct StepValues {
    static constexpr int most = 255;

    u16 slope;  ///< over 128ths of a step
    u16 scale;  ///< of what the slope gives to a value
    u16 start;  ///< 128ths of a step to start from
    u8 nearTop; ///< the line's value that stands for 255

    /// Whether there is one. `valueOf` gives the value of a step, and the last one has about so many 256ths.
    template <class ValueOf> bool find(int steps, u32 in256ths, const ValueOf& valueOf)
    {
        std::array<u8, most + 2> values;
        for (int n = 0; n <= steps + 1; ++n) values[n] = valueOf(n);
        return findLine(steps, in256ths, values);
    }

    u8 at(u32 in128ths) const
    {
        const u32 value = std::min(((in128ths * slope) >> 16) * scale >> 16, 255u);
        return static_cast<u8>(value == nearTop ? 255 : value);
    }

    PYXCC_INLINE wide::U8 at(wide::U16 in128ths, wide::U16 andIn128ths) const
    {
        const auto valuesOf = [&](wide::U16 x)
                                  PYXCC_INLINE_LAMBDA { return wide::Byte(mulHighU16(mulHighU16(x, slope), scale).v); };
        const wide::U8 values = narrow(valuesOf(in128ths), valuesOf(andIn128ths));
        return greater(values, equal(values, nearTop));
    }

private:
    bool findLine(int steps, u32 in256ths, const std::array<u8, most + 2>& values);
};

/// Functions of up to 255 steps. A byte times the steps is its number in 255ths, exactly; what is added to it is one
/// step more, for nothing to be below zero.
struct FineSteps {
    static constexpr u16 in128ths = 32897; ///< 2^23 / 255: of a product with 255ths the upper word is 128ths

    StepValues values;
    u16 factor;   ///< 256 times the steps
    u8 nudge = 0; ///< in 256ths of a byte, to all but the lowest: what is on a step counts as above it

    template <class ValueOf> FineSteps(int steps, const ValueOf& valueOf) : factor(static_cast<u16>(256 * steps))
    {
        values.find(steps, 65280, valueOf);
    }

    /// What is to be added to the line for it to tell a function, which goes up where a byte is more than about so many
    /// 255ths above a step.
    std::optional<u16> offsetOf(const ByteFunction& function, int place) const;

    /// Whether there is another line to try.
    bool tryNext();
};

inline u8 lookUp(const FineSteps& steps, u8 x, u16 offset)
{
    const u32 in255ths = ((256u * x + std::min(x, steps.nudge)) * steps.factor >> 16) + offset;
    const u32 in128ths = (static_cast<u16>(in255ths) * u32{FineSteps::in128ths} >> 16) & 0xff80;
    const u32 excess = 128u - steps.values.start;
    return steps.values.at(in128ths > excess ? in128ths - excess : 0);
}

PYXCC_INLINE wide::U8 lookUp(const FineSteps& steps, wide::U8 x, const Two<wide::U16>& offsets)
{
    const auto numbers = [&](wide::U16 nudged, wide::U16 offset) PYXCC_INLINE_LAMBDA {
        const wide::U16 in255ths = mulHighU16(nudged, steps.factor) + offset;
        const wide::U16 in128ths = mulHighU16(in255ths, FineSteps::in128ths) & wide::U16(0xff80);
        return subSatU16(in128ths, 128 - steps.values.start);
    };
    const Two<wide::U16> words = joined(lesser(x, steps.nudge), x);
    return steps.values.at(numbers(words.a, offsets.a), numbers(words.b, offsets.b));
}

} // namespace pyxcc::tone
