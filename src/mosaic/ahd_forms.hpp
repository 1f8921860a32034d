// The two candidates for each pixel of a mosaic, one made along rows and one along columns, and which is the smoother.
//
// Each form goes along a row, and the compiler makes vector code of it: there is no branch, choices are made by masks
// of all bits or none, and the rows that are written lie apart from all others. A count is a constant where it can be,
// so that no column is left over for the compiler to make code of that takes one at a time.
#pragma once

#include "lanes/lanes.hpp"
#include "layouts/rows.hpp"

#include <algorithm>
#include <array>
#include <bit>
#include <cstdint>
#include <cstring>
#include <limits>
#include <type_traits>

namespace pyxcc::mosaic
{

/// Which columns of a row are green: those whose lowest bit is this.
using GreenParity = int;

/// Samples of a row and those around it; [1] is the row itself.
template <class T> struct ThreeRows {
    const T* row[3];
};

/// What sums and differences of a few samples fit, and so do luma and chroma: the narrower, the more at once.
template <class T> using NumberFor = std::conditional_t<sizeof(T) == 1, s16, s32>;

namespace detail
{

/// The mean of two neighbours, corrected by how the colour of the place itself bends, and held between them.
template <class Number> Number greenBetween(Number before, Number behind, Number at, Number farBefore, Number farBehind)
{
    const auto mean = static_cast<Number>((before + behind) >> 1);
    const auto bend = static_cast<Number>(2 * at - farBefore - farBehind);
    const auto corrected = static_cast<Number>(mean + (bend >> 2));
    const Number least = before < behind ? before : behind, most = before < behind ? behind : before;
    const Number atMost = corrected < most ? corrected : most;
    return atMost > least ? atMost : least;
}

/// A mask for every other column, from the second one on.
template <class Number, int Columns>
constexpr std::array<Number, Columns> everyOtherColumn = [] {
    std::array<Number, Columns> masks{};
    for (int x = 1; x < Columns; x += 2) masks[x] = -1;
    return masks;
}();

/// All bits where the column is green: a load for each register, where parities take several steps.
template <class Number, int Columns> const Number* greenMasks(GreenParity green)
{
    return everyOtherColumn<Number, Columns + 1>.data() + (1 - green);
}

template <class Number> Number where(Number mask, Number yes, Number no)
{
    return static_cast<Number>(no ^ ((yes ^ no) & mask));
}

template <class T> T saturated(NumberFor<T> value)
{
    constexpr NumberFor<T> least = 0, most = std::numeric_limits<T>::max();
    return static_cast<T>(std::min(std::max(value, least), most));
}

} // namespace detail

/// Green along the row and along the column. `rows` are five, [2] is the row itself. `count` is no more than `Columns`.
template <int Columns, class T, class Count>
void interpolateGreen(const T* const rows[5], T* __restrict alongRow, T* __restrict alongColumn, Count count,
                      GreenParity green)
{
    const T *const up2 = rows[0], *const up = rows[1], *const at = rows[2], *const down = rows[3],
                   *const down2 = rows[4];
    using Number = NumberFor<T>;
    const Number* const masks = detail::greenMasks<Number, Columns>(green);
    for (int x = 0; x < count; ++x) {
        const Number own = at[x];
        const Number h = detail::greenBetween<Number>(at[x - 1], at[x + 1], own, at[x - 2], at[x + 2]);
        const Number v = detail::greenBetween<Number>(up[x], down[x], own, up2[x], down2[x]);
        alongRow[x] = static_cast<T>(detail::where(masks[x], own, h));
        alongColumn[x] = static_cast<T>(detail::where(masks[x], own, v));
    }
}

/// The colour that a row has besides green, and the one that it has not, by what they differ from green around. `count`
/// is no more than `Columns`.
template <int Columns, class T, class Count>
void interpolateColors(const ThreeRows<T>& mosaic, const ThreeRows<T>& greens, T* __restrict ofRow,
                       T* __restrict ofOthers, Count count, GreenParity green)
{
    using Number = NumberFor<T>;
    const Number* const masks = detail::greenMasks<Number, Columns>(green);
    alignas(32) Number beside[Columns + 2], across[Columns + 2]; // from one column in front of the first
    const T *const e0 = mosaic.row[0] - 1, *const e1 = mosaic.row[1] - 1, *const e2 = mosaic.row[2] - 1;
    const T *const g0 = greens.row[0] - 1, *const g1 = greens.row[1] - 1, *const g2 = greens.row[2] - 1;
    for (int x = 0; x < count + 2; ++x) {
        beside[x] = static_cast<Number>(e1[x] - g1[x]);
        across[x] = static_cast<Number>((e0[x] - g0[x]) + (e2[x] - g2[x]));
    }
    for (int x = 0; x < count; ++x) {
        const auto h = static_cast<Number>(beside[x] + beside[x + 2]), v = across[x + 1];
        const auto d = static_cast<Number>(across[x] + across[x + 2]);
        const Number at = e1[x + 1], greenAt = g1[x + 1];
        const auto ofGreen = static_cast<Number>(greenAt + (h >> 1));
        const auto acrossGreen = static_cast<Number>(v >> 1), diagonal = static_cast<Number>(d >> 2);
        ofRow[x] = detail::saturated<T>(detail::where(masks[x], ofGreen, at));
        ofOthers[x] =
            detail::saturated<T>(static_cast<Number>(greenAt + detail::where(masks[x], acrossGreen, diagonal)));
    }
}

/// Luma and chroma of a stretch of a row, and of some columns more, which may be looked at but do not count.
template <int Columns> struct LumaChroma {
    static constexpr int spare = 16;
    alignas(32) s16 y[Columns + spare], cb[Columns + spare], cr[Columns + spare];
};

/// (66 R + 129 G + 25 B + 128) >> 8 and so on, by what red and blue have more than green: that takes fewer products.
/// The weights of chroma add up to nothing. 16 bits hold the sums for bytes: that for luma without a sign, those for
/// chroma with one.
template <int Columns, class Count>
void toLumaChroma(const u8* red, const u8* green, const u8* blue, LumaChroma<Columns>& to, Count count)
{
    s16* __restrict const toY = to.y;
    s16* __restrict const toCb = to.cb;
    s16* __restrict const toCr = to.cr;
    for (int x = 0; x < count; ++x) {
        const s16 g = green[x];
        const auto r = static_cast<s16>(red[x] - g), b = static_cast<s16>(blue[x] - g);
        toY[x] = static_cast<s16>(static_cast<u16>(220 * g + 66 * r + 25 * b + 128) >> 8);
        toCb[x] = static_cast<s16>(static_cast<s16>(112 * b - 38 * r + 128) >> 8);
        toCr[x] = static_cast<s16>(static_cast<s16>(112 * r - 18 * b + 128) >> 8);
    }
    toY[count] = toCb[count] = toCr[count] = 0;
}

/// What samples of 16 bits are above 32768 fits multiply-adds. It is nothing to chroma, and takes 28160 from luma,
/// which leaves distances as they are.
template <class Word> PYXCC_INLINE auto lumaAndChroma(Word r, Word g, Word b)
{
    const auto R = lowered(r), G = lowered(g), B = lowered(b);
    return Three{exactSum<8, 128, 66, 129, 25>(R, G, B), exactSum<8, 128, -38, -74, 112>(R, G, B),
                 exactSum<8, 128, 112, -94, -18>(R, G, B)};
}

template <int Columns, class Count>
void toLumaChroma(const u16* red, const u16* green, const u16* blue, LumaChroma<Columns>& to, Count count)
{
    using layouts::bytes, layouts::loadSamples, layouts::storeSamples;
    constexpr int block = wide::U16::count;
    const auto convert = [&to](int x, const u16* r, const u16* g, const u16* b) PYXCC_INLINE_LAMBDA {
        const auto sample = [](const u16* from) PYXCC_INLINE_LAMBDA { return loadSamples<wide::U16>(bytes(from)); };
        const auto converted = lumaAndChroma(sample(r), sample(g), sample(b));
        storeSamples(bytes(to.y + x), converted.a);
        storeSamples(bytes(to.cb + x), converted.b);
        storeSamples(bytes(to.cr + x), converted.c);
    };
    int x = 0;
    for (; x <= count - block; x += block) convert(x, red + x, green + x, blue + x);
    // One column more than there are.
    u16 rest[3][block] = {};
    std::copy_n(red + x, count - x, rest[0]);
    std::copy_n(green + x, count - x, rest[1]);
    std::copy_n(blue + x, count - x, rest[2]);
    convert(x, rest[0], rest[1], rest[2]);
}

/// Distances of luma are as wide as those of chroma, so that they are compared alike.
template <class T> using DistanceFor = std::conditional_t<sizeof(T) == 1, s16, s32>;

/// A sum of two squares of chroma. Those of bytes are below 65536: the largest is that of green and magenta. Those of
/// 16-bit samples may leave 32 bits, and wrap.
template <class T> using SquaresFor = std::conditional_t<sizeof(T) == 1, u16, s32>;

/// How far samples are from their neighbours; one more than count here, too.
template <class T, int Columns> struct Distances {
    alignas(32) DistanceFor<T> luma[Columns + 1];
    alignas(32) SquaresFor<T> chroma[Columns + 1];
};

/// Between the samples of one row and those of another, from its column `from` on.
template <int from, class T, int Columns, class Count>
void measure(const LumaChroma<Columns>& a, const LumaChroma<Columns>& b, Distances<T, Columns>& to, Count count)
{
    using Distance = DistanceFor<T>;
    const s16 *const ay = a.y, *const acb = a.cb, *const acr = a.cr;
    const s16 *const by = b.y + from, *const bcb = b.cb + from, *const bcr = b.cr + from;
    Distance* __restrict const luma = to.luma;
    SquaresFor<T>* __restrict const chroma = to.chroma;
    for (int x = 0; x < count; ++x) {
        const auto y = static_cast<Distance>(ay[x] - by[x]);
        luma[x] = static_cast<Distance>(y < 0 ? -y : y);
        const auto cb = static_cast<u32>(static_cast<Distance>(acb[x] - bcb[x]));
        const auto cr = static_cast<u32>(static_cast<Distance>(acr[x] - bcr[x]));
        chroma[x] = static_cast<SquaresFor<T>>(cb * cb + cr * cr);
    }
    luma[count] = 0;
    chroma[count] = 0;
}

/// Those of a row of a candidate: beside[x] is between the columns x and x + 1; then those to the rows above and below.
template <class T, int Columns> struct DistancesAround {
    const Distances<T, Columns>*beside, *above, *below;
};

/// What is added to scores, so that they have no sign.
inline constexpr int noScore = 4;

/// How many more of its neighbours the candidate along the row resembles than the one along the column, for all of
/// `count` columns but the first and the last.
template <class T, int Columns, class Count>
void scoreCandidates(const DistancesAround<T, Columns>& h, const DistancesAround<T, Columns>& v, u8* __restrict scores,
                     Count count)
{
    using Luma = DistanceFor<T>;
    using Chroma = SquaresFor<T>;
    const Luma *const hBeside = h.beside->luma, *const hAbove = h.above->luma + 1, *const hBelow = h.below->luma + 1;
    const Luma *const vBeside = v.beside->luma, *const vAbove = v.above->luma + 1, *const vBelow = v.below->luma + 1;
    const Chroma *const hBesideC = h.beside->chroma, *const vBesideC = v.beside->chroma;
    const Chroma *const hAboveC = h.above->chroma + 1, *const hBelowC = h.below->chroma + 1;
    const Chroma *const vAboveC = v.above->chroma + 1, *const vBelowC = v.below->chroma + 1;
    alignas(32) Luma more[Columns]; // in a row of its own, or else the compiler narrows each comparison
    for (int x = 0; x < count; ++x) {
        const Luma limit = std::min(std::max(hBeside[x], hBeside[x + 1]), std::max(vAbove[x], vBelow[x]));
        const Chroma limitC = std::min(std::max(hBesideC[x], hBesideC[x + 1]), std::max(vAboveC[x], vBelowC[x]));
        // -1 for what is too far: comparisons are masks.
        const auto isBeyond = [&](Luma luma, Chroma chroma) {
            const Luma far = luma > limit ? -1 : 0, farC = chroma > limitC ? -1 : 0;
            return static_cast<Luma>(far | farC);
        };
        const auto alongRow =
            static_cast<Luma>(isBeyond(hBeside[x], hBesideC[x]) + isBeyond(hBeside[x + 1], hBesideC[x + 1]) +
                              isBeyond(hAbove[x], hAboveC[x]) + isBeyond(hBelow[x], hBelowC[x]));
        const auto alongColumn =
            static_cast<Luma>(isBeyond(vBeside[x], vBesideC[x]) + isBeyond(vBeside[x + 1], vBesideC[x + 1]) +
                              isBeyond(vAbove[x], vAboveC[x]) + isBeyond(vBelow[x], vBelowC[x]));
        more[x] = static_cast<Luma>(alongRow - alongColumn);
    }
    for (int x = 0; x < count - 2; ++x) scores[x] = static_cast<u8>(more[x] + noScore);
}

/// Masks of places where the sum of three by three scores is below zero, and of those where it is zero.
template <int Columns> struct Signs {
    alignas(32) u8 negative[Columns], zero[Columns];
};

template <int Columns, class Count> void addScores(const ThreeRows<u8>& scores, Signs<Columns>& signs, Count count)
{
    static_assert(9 * 2 * noScore < 256);
    constexpr int none = 9 * noScore;
    alignas(32) u8 columns[Columns + 2];
    const u8 *const s0 = scores.row[0] - 1, *const s1 = scores.row[1] - 1, *const s2 = scores.row[2] - 1;
    for (int x = 0; x < count + 2; ++x) columns[x] = static_cast<u8>(s0[x] + s1[x] + s2[x]);
    for (int x = 0; x < count; ++x) {
        const auto sum = static_cast<u8>(columns[x] + columns[x + 1] + columns[x + 2]);
        signs.negative[x] = sum < none ? 0xff : 0;
        signs.zero[x] = sum == none ? 0xff : 0;
    }
}

/// Turns the masks of negative sums into those of where to take the candidate along the column, for whole eights of
/// columns. A sum of zero follows the one in front of it; `last` is 255 if the one in front of the first is negative,
/// otherwise 0. Returns the same for the last column.
///
/// Eight masks make a number, the first column its lowest byte. Where a run of zeros begins behind a negative sum,
/// adding 1 to its first byte carries through all of the run, and no further.
template <int Columns> std::uint64_t decide(Signs<Columns>& signs, int count, std::uint64_t last)
{
    static_assert(std::endian::native == std::endian::little);
    constexpr std::uint64_t ones = 0x0101010101010101;
    for (int x = 0; x < count; x += 8) {
        std::uint64_t negative = 0, zero = 0;
        std::memcpy(&negative, signs.negative + x, 8);
        std::memcpy(&zero, signs.zero + x, 8);
        const std::uint64_t behindNegative = (negative << 8 | last) & zero & ones;
        negative |= zero & ~(zero + behindNegative);
        std::memcpy(signs.negative + x, &negative, 8);
        last = negative >> 56;
    }
    return last;
}

template <class T, class Count>
void choose(const u8* __restrict masks, const T* alongRow, const T* alongColumn, T* __restrict chosen, Count count)
{
    for (int x = 0; x < count; ++x) {
        // A mask grows by its sign.
        const auto mask = static_cast<T>(static_cast<s8>(masks[x])); // NOLINT(bugprone-signed-char-misuse)
        chosen[x] = detail::where<T>(mask, alongColumn[x], alongRow[x]);
    }
}

} // namespace pyxcc::mosaic
