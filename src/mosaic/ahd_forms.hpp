// The two candidates for each pixel of a mosaic, one made along rows and one along columns, and which of them is taken.
//
// Rows are taken in whole registers, in which a colour has every other lane. What is to be computed of one colour is
// computed in lanes of twice the width, which differences and sums of samples need anyhow: those of the even columns
// and those of the odd ones are neighbours of each other.
#pragma once

#include "lanes/avx2/bits.hpp"
#include "lanes/avx2/every_other.hpp"
#include "lanes/lanes.hpp"
#include "layouts/rows.hpp"

#include <cstdint>

namespace pyxcc::mosaic
{

/// A row of numbers of a stretch of columns. A register before its first one and two behind its last one may be looked
/// at, though what is there counts for nothing.
template <class Number, int Columns> class Line
{
public:
    Number* at(int x = 0) { return numbers_ + margin + x; }
    const Number* at(int x = 0) const { return numbers_ + margin + x; }

private:
    static constexpr int margin = 32 / static_cast<int>(sizeof(Number));
    alignas(32) Number numbers_[margin + Columns + 2 * margin];
};

/// A register from a row of numbers, and back.
template <class Number> PYXCC_INLINE auto registerOf(const Number* from)
{
    return layouts::loadSamples<wide::RegisterOf<Number>>(layouts::bytes(from));
}
template <class Number> PYXCC_INLINE void storeRegister(Number* to, wide::RegisterOf<Number> numbers)
{
    layouts::storeSamples(layouts::bytes(to), numbers);
}

/// What sums and differences of a few samples fit.
template <class T> using NumberFor = std::conditional_t<sizeof(T) == 1, s16, s32>;

/// ((before + behind) >> 1) + ((2 at - farBefore - farBehind) >> 2), held between the two neighbours. Half of what a
/// place differs from the mean of the far ones, rounded up, is that quarter rounded down. What saturates would have
/// been held as well.
template <class Samples>
PYXCC_INLINE Samples greenBetween(Samples before, Samples behind, Samples at, Samples farBefore, Samples farBehind)
{
    const Samples bend = avgUp(at, complement(avgUp(farBefore, farBehind)));
    const Samples corrected = raised(addSat(lowered(avgDown(before, behind)), lowered(bend)));
    return lesser(greater(corrected, lesser(before, behind)), greater(before, behind));
}

/// A row of the candidates' green, and of what the row's other colour differs from it: a number a pair of columns.
template <class T, int Columns> struct GreenRow {
    Line<T, Columns> green;
    Line<NumberFor<T>, Columns / 2> differences;
};

/// Samples of a row and those around it; [2] is the row itself.
template <class T> using FiveRows = const T* const[5];

/// Green along the row and along the column. Green sites are in the first column of a pair, or in the second one.
template <bool greenFirst, class T, int Columns>
void interpolateGreen(const FiveRows<T>& rows, GreenRow<T, Columns>& alongRow, GreenRow<T, Columns>& alongColumn,
                      int count)
{
    using Samples = wide::RegisterOf<T>;
    const T *const up2 = rows[0], *const up = rows[1], *const at = rows[2], *const down = rows[3],
                   *const down2 = rows[4];
    for (int x = 0; x < count; x += Samples::count) {
        const Samples own = registerOf(at + x);
        const auto put = [own, x](GreenRow<T, Columns>& to, Samples between) PYXCC_INLINE_LAMBDA {
            const Samples green = greenFirst ? byTurns(own, between) : byTurns(between, own);
            storeRegister(to.green.at(x), green);
            storeRegister(to.differences.at(x / 2),
                          greenFirst ? oddLanes(own) - oddLanes(green) : evenLanes(own) - evenLanes(green));
        };
        put(alongRow, greenBetween(registerOf(at + x - 1), registerOf(at + x + 1), own, registerOf(at + x - 2),
                                   registerOf(at + x + 2)));
        put(alongColumn,
            greenBetween(registerOf(up + x), registerOf(down + x), own, registerOf(up2 + x), registerOf(down2 + x)));
    }
}

/// The rows of green above and below a row, and the row itself.
template <class T, int Columns> struct GreensAround {
    const GreenRow<T, Columns>&above, &at, &below;
};

/// The colour that a row has besides green, and the one that it has not, by what they differ from green around.
template <bool greenFirst, class T, int Columns>
void interpolateColors(const T* mosaic, const GreensAround<T, Columns>& greens, T* __restrict ofRow,
                       T* __restrict ofOthers, int count)
{
    using Samples = wide::RegisterOf<T>;
    using Numbers = wide::RegisterOf<NumberFor<T>>;
    // From a green site the differences of its row lie to the left and to the right in this pair and the next one, or
    // in the one before and this one. Those of the rows around it lie in its own column.
    constexpr int left = greenFirst ? -1 : 0, right = left + 1;
    // From a site of the row's colour those of the rows around it lie in these pairs.
    constexpr int beside = greenFirst ? 1 : -1;
    const auto* const own = greens.at.differences.at();
    const auto* const upper = greens.above.differences.at();
    const auto* const lower = greens.below.differences.at();
    for (int x = 0; x < count; x += Samples::count) {
        const int i = x / 2;
        const Samples samples = registerOf(mosaic + x), green = registerOf(greens.at.green.at(x));
        const Numbers evenGreen = evenLanes(green), oddGreen = oddLanes(green);
        const Numbers greenAtGreen = greenFirst ? evenGreen : oddGreen, greenAtSite = greenFirst ? oddGreen : evenGreen;
        const Numbers across = registerOf(upper + i) + registerOf(lower + i);
        const Numbers acrossBeside = registerOf(upper + i + beside) + registerOf(lower + i + beside);
        const Numbers site = greenFirst ? oddLanes(samples) : evenLanes(samples);
        const Numbers atGreen = greenAtGreen + ((registerOf(own + i + left) + registerOf(own + i + right)) >> 1);
        const Numbers otherAtGreen = greenAtGreen + (across >> 1);
        const Numbers otherAtSite = greenAtSite + ((across + acrossBeside) >> 2);
        const auto byTurns = [](Numbers ofGreen, Numbers ofSite) PYXCC_INLINE_LAMBDA {
            return greenFirst ? saturateByTurns(ofGreen, ofSite) : saturateByTurns(ofSite, ofGreen);
        };
        storeRegister(ofRow + x, byTurns(atGreen, site));
        storeRegister(ofOthers + x, byTurns(otherAtGreen, otherAtSite));
    }
}

/// What is added to scores, so that they have no sign.
inline constexpr int noScore = 4;

/// Three rows of scores; [1] is the row itself.
template <class T> using ThreeRows = const T* const[3];

/// The sum of three by three scores; their middle one is in lane 0.
template <class T> PYXCC_INLINE wide::RegisterOf<T> sumOfScores(const ThreeRows<T>& scores, int x)
{
    const auto column = [&](int at) PYXCC_INLINE_LAMBDA {
        return registerOf(scores[0] + at) + registerOf(scores[1] + at) + registerOf(scores[2] + at);
    };
    return column(x - 1) + column(x) + column(x + 1);
}

/// Takes masks of negative sums and of those that are zero, and gives one of where to take the candidate along the
/// column. A sum of zero follows the one in front of it; `last` is 1 if the one in front of the first is negative,
/// otherwise 0, and becomes the same for the last of the columns that count.
///
/// A mask has one bit or more a column, the first column lowest; `bits` of them count. Where a run of zeros begins
/// behind a negative sum, adding 1 to its first bit carries through all of the run, and no further.
PYXCC_INLINE u32 decided(u32 negative, u32 zero, int bits, u32& last)
{
    const u32 behindNegative = (negative << 1 | last) & zero;
    const u32 result = negative | (zero & ~(zero + behindNegative));
    last = result >> (bits - 1) & 1;
    return result;
}

/// A mask of where to take the candidate along the column: 255 for each of the samples' bytes.
template <class T> PYXCC_INLINE wide::RegisterOf<T> choice(const ThreeRows<T>& scores, int x, int count, u32& last)
{
    using Samples = wide::RegisterOf<T>;
    constexpr int none = 9 * noScore;
    const Samples sum = sumOfScores<T>(scores, x);
    const Samples negative = equal(lesser(sum, Samples(none - 1)), sum), zero = equal(sum, Samples(none));
    using wide::U8, wide::bitsOf, wide::maskOf;
    const int bits = count * static_cast<int>(sizeof(T));
    return Samples(maskOf(decided(bitsOf(U8(negative.v)), bitsOf(U8(zero.v)), bits, last)).v);
}

} // namespace pyxcc::mosaic
