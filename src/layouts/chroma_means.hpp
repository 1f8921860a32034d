// A source whose chroma lies half a row lower than it is stored.
#pragma once

#include "layouts/shared_chroma.hpp"

#include <algorithm>

namespace pyxcc::layouts
{

/// Rows of two planes of chroma, each the mean of two.
template <class Byte> struct ChromaMeansRow {
    ChromaPlanesRow<2, Byte> upper, lower;

    PYXCC_INLINE Two<wide::Sample> load(int x) const
    {
        const auto component = [x](const u8* p, const u8* q) PYXCC_INLINE_LAMBDA {
            return widen(avgUp(loadHalf(p + x / 2), loadHalf(q + x / 2)));
        };
        return {component(upper.a, lower.a), component(upper.b, lower.b)};
    }

    PYXCC_INLINE Two<wide::Sample> load(int x, int count) const
    {
        u8 samples[4][HalfBlock::count] = {};
        const u8* const rows[] = {upper.a, upper.b, lower.a, lower.b};
        for (int i = 0; i < 4; ++i) copyBytes(samples[i], rows[i] + x / 2, (count + 1) / 2);
        return ChromaMeansRow<const u8>{{samples[0], samples[1]}, {samples[2], samples[3]}}.load(0);
    }
};

/// Two planes of `rows` rows of chroma; the last row is taken as it is.
template <class Byte> struct ChromaMeans {
    ChromaPlanes<2, Byte> planes;
    int rows;

    PYXCC_INLINE auto row(int y) const
    {
        return ChromaMeansRow<Byte>{planes.row(y), planes.row(std::min(y + 1, rows - 1))};
    }
};

/// The same image with the mean of each row of chroma and the one below in place of the row.
template <class Byte>
auto chromaBetweenRows(const SharedChromaImage<ChromaPlanes<2, Byte, Order::ofMemory>, Byte>& image, int rows)
{
    return SharedChromaImage<ChromaMeans<Byte>, Byte>{image.first, image.step, {image.chroma, rows}};
}

} // namespace pyxcc::layouts
