// Ordered dithering: each channel of 8 bits is taken to the bits of its field against a threshold that repeats over 4
// by 4 pixels.
#pragma once

#include "lanes/lanes.hpp"

#include <algorithm>
#include <array>

namespace pyxcc::packed
{

/// The thresholds of 4 by 4 pixels, rows first. Those of 5 bits are near to the others times 0.484, but no formula
/// makes them.
using Thresholds = std::array<std::array<int, 4>, 4>;

inline constexpr Thresholds thresholdsOf4Bits = {
    {{0, 2312, 578, 2890}, {3468, 1156, 4046, 1734}, {867, 3179, 289, 2601}, {4335, 2023, 3757, 1445}}};
inline constexpr Thresholds thresholdsOf5Bits = {
    {{0, 1118, 279, 1398}, {1678, 559, 1957, 839}, {419, 1538, 139, 1258}, {2097, 978, 1817, 699}}};
inline constexpr Thresholds thresholdsOf6Bits = [] {
    Thresholds half = thresholdsOf5Bits;
    for (auto& row : half) {
        for (int& threshold : row) threshold >>= 1;
    }
    return half;
}();

/// A field of some bits: its thresholds, and a step of it in 256ths of a step of 8 bits, about.
template <int Bits> struct Field;
template <> struct Field<4> {
    static constexpr const Thresholds& thresholds = thresholdsOf4Bits;
    static constexpr int step = 4352;
};
template <> struct Field<5> {
    static constexpr const Thresholds& thresholds = thresholdsOf5Bits;
    static constexpr int step = 2105;
};
template <> struct Field<6> {
    static constexpr const Thresholds& thresholds = thresholdsOf6Bits;
    static constexpr int step = 1036;
};

/// The field below the channel, at its greatest 2 ^ Bits - 2.
template <int Bits> constexpr int fieldBelow(int channel) { return channel * ((1 << Bits) - 1) >> 8; }

/// The rule: the field below the channel, or the next one if what is left of the channel is above the threshold.
template <int Bits> constexpr int ditheredField(int channel, int threshold)
{
    const int below = fieldBelow<Bits>(channel);
    return below + (channel * 256 - below * Field<Bits>::step > threshold ? 1 : 0);
}

// With one threshold, a field is so nearly a line of the channel that the leading bits of a product and a sum tell it
// exactly; that is half of the rule's work. Only with some thresholds of 6 bits the line rises past the next field at
// its end, and is held back.

template <class Word> struct Line {
    Word slope, start; ///< 256 channel * slope / 65536 + start
};

template <int Bits> inline constexpr bool heldBack = Bits == 6;

/// The line whose leading bits are the field. All thresholds have one near to the rule's own slope.
template <int Bits> constexpr Line<u16> lineOf(int threshold)
{
    constexpr int unit = 1 << (16 - Bits);
    for (u32 slope = 65536 * unit / Field<Bits>::step;; slope -= 16) {
        int least = 0, most = 65535;
        for (int c = 0; c < 256; ++c) {
            const int field = ditheredField<Bits>(c, threshold), rise = static_cast<int>(256u * c * slope >> 16);
            const bool isHeld = heldBack<Bits> && field > fieldBelow<Bits>(c);
            least = std::max(least, field * unit - rise);
            most = std::min(most, (isHeld ? 65536 : (field + 1) * unit) - 1 - rise);
        }
        if (least <= most) return {static_cast<u16>(slope), static_cast<u16>(least)};
    }
}

/// The channel's field as the leading bits of a word.
template <int Bits> struct Dither {
    template <class Channel, class Word>
    PYXCC_INLINE auto operator()(const Channel& channel, const Line<Word>& line) const
    {
        const auto in256ths = asU16(channel << 8);
        const auto field = mulHighU16(in256ths, line.slope) + line.start;
        if constexpr (heldBack<Bits>) {
            constexpr int unit = 1 << (16 - Bits);
            return lesser(field, mulHighU16(in256ths, 65536 - unit) + unit);
        } else {
            return field;
        }
    }
};

} // namespace pyxcc::packed
