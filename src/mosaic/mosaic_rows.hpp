// Rows of a mosaic with those around them, as sources of neighbourhoods.
#pragma once

#include "layouts/rows.hpp"
#include "mosaic/cfa_forms.hpp"

#include <array>

namespace pyxcc::mosaic
{

/// Three rows, of which the middle one is converted. There is a column on both sides of those that are.
template <class T> struct NearRows {
    using Samples = wide::RegisterOf<T>;
    static constexpr int block = Samples::count;
    const T *upper, *middle, *lower;

    PYXCC_INLINE Near<Samples> load(int x) const
    {
        const auto at = [x](const T* row, int dx)
                            PYXCC_INLINE_LAMBDA { return layouts::loadSamples<Samples>(layouts::bytes(row + x + dx)); };
        return {at(middle, 0), at(middle, -1), at(middle, 1), at(upper, 0), at(lower, 0),
                at(upper, -1), at(upper, 1),   at(lower, -1), at(lower, 1)};
    }

    PYXCC_INLINE Near<Samples> load(int x, int count) const
    {
        std::array<std::array<T, block + 2>, 3> rows = {};
        const auto copy = [x, count](std::array<T, block + 2>& to, const T* row)
                              PYXCC_INLINE_LAMBDA { std::copy_n(row + x - 1, count + 2, to.begin()); };
        copy(rows[0], upper);
        copy(rows[1], middle);
        copy(rows[2], lower);
        return NearRows{rows[0].data() + 1, rows[1].data() + 1, rows[2].data() + 1}.load(0);
    }
};

/// Five rows. There are two columns on both sides.
template <class T> struct FarRows {
    using Samples = wide::RegisterOf<T>;
    static constexpr int block = Samples::count;
    std::array<const T*, 5> row;

    PYXCC_INLINE Far<Samples> load(int x) const
    {
        const auto at = [x](const T* row, int dx)
                            PYXCC_INLINE_LAMBDA { return layouts::loadSamples<Samples>(layouts::bytes(row + x + dx)); };
        return {NearRows<T>{row[1], row[2], row[3]}.load(x), at(row[2], -2), at(row[2], 2), at(row[0], 0),
                at(row[4], 0)};
    }

    PYXCC_INLINE Far<Samples> load(int x, int count) const
    {
        std::array<std::array<T, block + 4>, 5> rows = {};
        FarRows copies;
        for (int i = 0; i < 5; ++i) {
            std::copy_n(row[i] + x - 2, count + 4, rows[i].begin());
            copies.row[i] = rows[i].data() + 2;
        }
        return copies.load(0);
    }
};

} // namespace pyxcc::mosaic
