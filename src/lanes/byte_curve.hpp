// A smooth curve from bytes to bytes, as a register can look it up.
//
// A shuffle looks up tables of 16 entries, so 16 of them would make a table of 256, and choosing among them as many
// operations again. A smooth curve needs only a few: over 16 neighbours it is a line or one more, so that a slope and
// a base for each sixteen and one bit an entry tell it exactly. At the start of a steep curve, up to 30, a term for two
// neighbours each takes up what is left.
#pragma once

#include "pyxcc/types.h"

#include <array>

namespace pyxcc
{

using ByteTable = std::array<u8, 256>;

struct ByteCurve {
    using Sixteen = std::array<u8, 16>;

    Sixteen slope = {}, base = {}; ///< of the sixteen h, the entries from 16 h on
    Sixteen bits[2] = {};          ///< bit h % 8 of [h / 8][l]: whether entry 16 h + l is one above its line
    Sixteen start = {};            ///< [j]: on top of entries 2 j - 1 and 2 j
    bool steep = false;            ///< whether there is a start
};

/// The line with a slope of as many 64ths.
constexpr int onLine(int slope, int v) { return (slope * 4 * (v % 32)) >> 8; }

constexpr u8 lookUp(const ByteCurve& curve, u8 v)
{
    const int h = v / 16, l = v % 16;
    const int bit = curve.bits[h / 8][l] >> (h % 8) & 1;
    const int start = v <= 30 ? curve.start[(v + 1) / 2] : 0;
    return static_cast<u8>(onLine(curve.slope[h], v) + curve.base[h] + bit + start);
}

namespace detail
{

/// The slope near to which that of a sixteen must be.
constexpr int meanSlope(const ByteTable& table, int h)
{
    const int first = 16 * h, last = first + 15;
    return (table[last] - table[first]) * 64 / 15;
}

constexpr void setBit(ByteCurve& curve, int v) { curve.bits[v / 128][v % 16] |= static_cast<u8>(1 << (v / 16 % 8)); }

/// Tells a sixteen by itself.
constexpr bool fitLine(ByteCurve& curve, const ByteTable& table, int h)
{
    const int mean = meanSlope(table, h);
    for (int slope = mean < 4 ? 0 : mean - 4; slope <= mean + 4 && slope < 256; ++slope) {
        int low = 255, high = -255;
        for (int v = 16 * h; v < 16 * h + 16; ++v) {
            const int rest = table[v] - onLine(slope, v);
            if (rest < low) low = rest;
            if (rest > high) high = rest;
        }
        if (high > low + 1) continue;
        curve.slope[h] = static_cast<u8>(slope);
        curve.base[h] = static_cast<u8>(low);
        for (int v = 16 * h; v < 16 * h + 16; ++v) {
            if (table[v] - onLine(slope, v) > low) setBit(curve, v);
        }
        return true;
    }
    return false;
}

/// Tells the first two sixteens together.
constexpr bool fitStart(ByteCurve& curve, const ByteTable& table)
{
    const int mean0 = meanSlope(table, 0) < 224 ? meanSlope(table, 0) : 224, mean1 = meanSlope(table, 1);
    for (int trial = 0; trial < 64 * 64; ++trial) {
        const int slope0 = mean0 - 32 + trial / 64, slope1 = mean1 - 32 + trial % 64;
        const int base1 = table[31] - onLine(slope1, 31); // entry 31 is outside of the start
        const auto rest = [&](int v) {
            return v < 16 ? table[v] - onLine(slope0, v) : table[v] - onLine(slope1, v) - base1;
        };
        bool fits = true;
        for (int j = 1; j < 16 && fits; ++j) {
            const int difference = rest(2 * j) - rest(2 * j - 1);
            fits = difference >= -1 && difference <= 1;
        }
        if (!fits) continue;
        curve.slope[0] = static_cast<u8>(slope0);
        curve.slope[1] = static_cast<u8>(slope1);
        curve.base[1] = static_cast<u8>(base1);
        for (int j = 0; j < 16; ++j) {
            const int odd = j > 0 ? 2 * j - 1 : 0, even = 2 * j;
            const int low = rest(odd) < rest(even) ? rest(odd) : rest(even);
            curve.start[j] = static_cast<u8>(low);
            if (rest(odd) > low) setBit(curve, odd);
            if (rest(even) > low) setBit(curve, even);
        }
        return curve.steep = true;
    }
    return false;
}

} // namespace detail

/// Tells a table as a curve, if it is smooth enough: tells() says whether it was.
constexpr ByteCurve asCurve(const ByteTable& table)
{
    ByteCurve curve;
    for (int h = 2; h < 16; ++h) detail::fitLine(curve, table, h);
    ByteCurve even = curve;
    if (detail::fitLine(even, table, 0) && detail::fitLine(even, table, 1)) return even;
    detail::fitStart(curve, table);
    return curve;
}

constexpr bool tells(const ByteCurve& curve, const ByteTable& table)
{
    for (int v = 0; v < 256; ++v) {
        if (lookUp(curve, static_cast<u8>(v)) != table[v]) return false;
    }
    return true;
}

} // namespace pyxcc
