// Rows of a mosaic, the even and the odd columns apart: neighbours of a place in one half are those in the other.
#pragma once

#include "layouts/avx2/turns.hpp"
#include "layouts/rows.hpp"
#include "mosaic/cfa_forms.hpp"

#include <array>

namespace pyxcc::mosaic
{

/// Columns that are taken apart at a time: five rows of them stay in the nearest cache.
inline constexpr int stretch = 2048;

/// A stretch of a row: its even columns and its odd ones, counted from its first, from two columns in front of it up to
/// two behind it.
template <class T> class HalvedRow
{
public:
    using Samples = wide::RegisterOf<T>;
    static constexpr int sampleBytes = sizeof(T);

    /// Takes `count` columns and those around them.
    void take(const T* row, int count)
    {
        constexpr int lanes = Samples::count;
        const int end = count + 4;
        const u8* const from = layouts::bytes(row - 2);
        int x = 0;
        for (; x <= end - 2 * lanes; x += 2 * lanes) {
            const u8* const p = from + std::ptrdiff_t{x} * sampleBytes;
            put(x / 2, p);
        }
        // What is computed along with the last columns reaches beyond them: it finds zeros.
        u8 rest[4 * 32] = {};
        layouts::copyBytes(rest, from + std::ptrdiff_t{x} * sampleBytes, (end - x) * sampleBytes);
        put(x / 2, rest);
        put(x / 2 + lanes, rest + 64);
    }

    /// Samples of every other column, from the one that lies `Offset` behind the first of a pair of columns.
    template <int Offset> PYXCC_INLINE Samples load(std::ptrdiff_t pair) const
    {
        constexpr int parity = Offset & 1;
        return layouts::loadSamples<Samples>(layouts::bytes(half_[parity] + pair + (Offset - parity + 2) / 2));
    }

private:
    void put(int at, const u8* columns)
    {
        using layouts::loadSamples, layouts::storeSamples, layouts::bytes;
        const auto [even, odd] = layouts::dealt<sampleBytes>(loadSamples(columns), loadSamples(columns + 32));
        storeSamples(bytes(half_[0] + at), even);
        storeSamples(bytes(half_[1] + at), odd);
    }

    T half_[2][stretch / 2 + 3 * Samples::count];
};

/// Five rows, of which the middle one is converted; a form that does not look two rows away needs only the inner three.
template <class T> struct RowsAround {
    std::array<const HalvedRow<T>*, 5> row;
    const T* next; ///< what is taken next

    /// The sites and their partners from a pair of columns on.
    template <bool siteFirst> PYXCC_INLINE auto pairs(std::ptrdiff_t at) const
    {
        constexpr int site = siteFirst ? 0 : 1, inwards = siteFirst ? 1 : -1;
        constexpr int partner = site + inwards, outer = site - inwards;
        const HalvedRow<T>&upper = *row[1], &middle = *row[2], &lower = *row[3];
        return Pair<wide::RegisterOf<T>>{middle.template load<site>(at),
                                         middle.template load<partner>(at),
                                         middle.template load<partner + inwards>(at),
                                         middle.template load<outer>(at),
                                         upper.template load<site>(at),
                                         lower.template load<site>(at),
                                         upper.template load<partner>(at),
                                         lower.template load<partner>(at),
                                         upper.template load<outer>(at),
                                         lower.template load<outer>(at)};
    }

    template <bool siteFirst> PYXCC_INLINE auto widePairs(std::ptrdiff_t at) const
    {
        constexpr int site = siteFirst ? 0 : 1, outerSite = siteFirst ? -2 : 3;
        return WidePair<wide::RegisterOf<T>>{pairs<siteFirst>(at), row[2]->template load<outerSite>(at),
                                             row[0]->template load<site>(at), row[4]->template load<site>(at)};
    }
};

} // namespace pyxcc::mosaic
