// Targets of packed 16-bit pixels whose fields are dithered. The pattern is tied to the region: a row is told by its
// number, and blocks begin at multiples of 4 columns.
#pragma once

#include "layouts/packed_pixels.hpp"
#include "packed/dither.hpp"
#include "packed/models.hpp"

namespace pyxcc::packed
{

/// The lines of a row's thresholds, as the columns of 16 words have them.
template <int Bits> PYXCC_INLINE Line<wide::U16> linesOfRow(int y)
{
    using Words = std::array<u16, wide::U16::count>;
    static constexpr auto rows = [] {
        std::array<Line<Words>, 4> repeated{};
        for (int row = 0; row < 4; ++row) {
            for (int column = 0; column < 4; ++column) {
                const Line<u16> line = lineOf<Bits>(Field<Bits>::thresholds[row][column]);
                for (int x = column; x < wide::U16::count; x += 4) {
                    repeated[row].slope[x] = line.slope;
                    repeated[row].start[x] = line.start;
                }
            }
        }
        return repeated;
    }();
    const auto load = [](const Words& words)
                          PYXCC_INLINE_LAMBDA { return layouts::loadSamples<wide::U16>(layouts::bytes(words.data())); };
    return {load(rows[y % 4].slope), load(rows[y % 4].start)};
}

/// A packing of the pixels of one row.
template <layouts::FieldWidths widths> struct DitheredPixels {
    static_assert(widths.first == widths.third);
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;
    static constexpr bool readsTarget = false;
    Line<wide::U16> outer, middle;

    static PYXCC_INLINE DitheredPixels ofRow(int y)
    {
        return {linesOfRow<widths.first>(y), linesOfRow<widths.second>(y)};
    }

    PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) const
    {
        layouts::storeFields<widths>(p, {dithered<widths.first>(pixels.a, outer),
                                         dithered<widths.second>(pixels.b, middle),
                                         dithered<widths.third>(pixels.c, outer)});
    }

private:
    template <int Bits> static PYXCC_INLINE Two<wide::U16> dithered(wide::U8 channels, const Line<wide::U16>& lines)
    {
        const Two<wide::Sample> words = widen(channels);
        return {Dither<Bits>{}(words.a, lines), Dither<Bits>{}(words.b, lines)};
    }
};

/// Rows at a distance of whole pixels, as those of plain packed pixels.
template <layouts::FieldWidths widths> auto ditheredPixels(u16* first, std::ptrdiff_t step)
{
    return layouts::InterleavedImage<DitheredPixels<widths>, u8>{layouts::bytes(first), step >> 1 << 1, {}};
}

namespace models
{

inline auto RGB444Dither(u16* dst, int dstStep) { return ditheredPixels<layouts::fields444>(dst, dstStep); }
inline auto RGB555Dither(u16* dst, int dstStep) { return ditheredPixels<layouts::fields555>(dst, dstStep); }
inline auto RGB565Dither(u16* dst, int dstStep) { return ditheredPixels<layouts::fields565>(dst, dstStep); }
inline auto BGR444Dither(u16* dst, int dstStep) { return reversed(RGB444Dither(dst, dstStep)); }
inline auto BGR555Dither(u16* dst, int dstStep) { return reversed(RGB555Dither(dst, dstStep)); }
inline auto BGR565Dither(u16* dst, int dstStep) { return reversed(RGB565Dither(dst, dstStep)); }

} // namespace models

} // namespace pyxcc::packed
