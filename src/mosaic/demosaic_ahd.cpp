// A sensor's mosaic to RGB along rows or along columns, whichever is the smoother.
#include "pyxcc/demosaic_ahd.h"

#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "mosaic/ahd_forms.hpp"
#include "mosaic/extended_mosaic.hpp"
#include "mosaic/sites.hpp"

#include <array>
#include <type_traits>

using namespace pyxcc::frame;
using namespace pyxcc::layouts;
using namespace pyxcc::mosaic;

namespace
{

/// What a call works on. Blocks of the target lie relative to (left, top).
template <class T> struct Work {
    ExtendedMosaic<T> mosaic;
    s32 grid;
    T* target;
    int targetStep;
    s32 left, top;
    T* workspace;
    std::ptrdiff_t workspaceStep;
};

/// Rows of the caller's workspace that take turns.
template <class T, int Rows> struct Ring {
    T* first = nullptr;
    std::ptrdiff_t step = 0;

    T* row(s32 y) const { return reinterpret_cast<T*>(rowAt(bytes(first), step, (y % Rows + Rows) % Rows)); }

    /// Those around row `y`, from a column on.
    ThreeRows<T> around(s32 y, int column) const
    {
        return {{row(y - 1) + column, row(y) + column, row(y + 1) + column}};
    }
};

/// The planes of the two candidates for a block. A row has three columns in front of the block and three behind it.
template <class T> struct Planes {
    struct Candidate {
        Ring<T, 4> red, blue;
        Ring<T, 5> green;
    };
    Candidate alongRow, alongColumn;
    Ring<u8, 4> score;

    Planes(T* workspace, std::ptrdiff_t step)
    {
        int rows = 0;
        const auto take = [&]<class Sample, int Rows>(Ring<Sample, Rows>& ring) {
            ring = {reinterpret_cast<Sample*>(rowAt(bytes(workspace), step, rows)), step};
            rows += Rows;
        };
        for (Candidate* candidate : {&alongRow, &alongColumn}) {
            take(candidate->red);
            take(candidate->blue);
            take(candidate->green);
        }
        take(score);
    }
};

template <class T> class Block
{
public:
    Block(const Work<T>& work, s32 x, s32 y, s32 width, s32 height)
        : work_(work), planes_(work.workspace, work.workspaceStep), x_(x), y_(y), width_(width), height_(height)
    {
    }

    /// Every row of a plane is made once: green first, then what needs the rows of green above and below it, then what
    /// needs those of the other colours, and so on. Scores are made two rows at a time, which have their luma and
    /// chroma in common.
    void convert() const
    {
        const s32 scored = y_ + height_ + 1; // rows of scores end in front of this one
        s32 green = y_ - 3, target = y_;
        for (s32 row = y_ - 1; row < scored; row += 2) {
            const int rows = std::min(2, scored - row);
            for (; green <= row + rows + 1; ++green) {
                fillGreen(green);
                if (green >= y_ - 1) fillColors(green - 1);
            }
            fillScores(row, rows);
            for (; target < row + rows - 1; ++target) emit(target);
        }
    }

private:
    /// Columns that are worked on at a time, so that what a step of the work takes and makes stays near at hand.
    static constexpr int stretch = 256 / static_cast<int>(sizeof(T));

    /// Calls with each stretch of columns [from, to) of the planes.
    template <int Length = stretch, class Step> static void eachStretch(int from, int to, const Step& step)
    {
        int at = from;
        for (; at <= to - Length; at += Length) step(at, std::integral_constant<int, Length>{});
        if (at < to) step(at, to - at);
    }

    /// Column `column` of the planes is this one of the mosaic.
    s32 place(int column) const { return x_ - 3 + column; }

    GreenParity greenParity(s32 y, int column) const { return isGreen(siteAt(work_.grid, place(column), y)) ? 0 : 1; }

    void fillGreen(s32 y) const
    {
        eachStretch(0, width_ + 6, [&](int column, auto count) {
            T buffers[5][stretch + 4];
            const T* rows[5];
            for (int i = 0; i < 5; ++i) {
                rows[i] = work_.mosaic.samples(y + i - 2, place(column) - 2, place(column) + count + 2, buffers[i]) + 2;
            }
            interpolateGreen<stretch>(rows, planes_.alongRow.green.row(y) + column,
                                      planes_.alongColumn.green.row(y) + column, count, greenParity(y, column));
        });
    }

    void fillColors(s32 y) const
    {
        const bool redRow = isOfRedRow(siteAt(work_.grid, x_, y));
        eachStretch(1, width_ + 5, [&](int column, auto count) {
            T buffers[3][stretch + 2];
            ThreeRows<T> mosaic;
            for (int i = 0; i < 3; ++i) {
                mosaic.row[i] =
                    work_.mosaic.samples(y + i - 1, place(column) - 1, place(column) + count + 1, buffers[i]) + 1;
            }
            for (const auto* candidate : {&planes_.alongRow, &planes_.alongColumn}) {
                T* const red = candidate->red.row(y) + column;
                T* const blue = candidate->blue.row(y) + column;
                interpolateColors<stretch>(mosaic, candidate->green.around(y, column), redRow ? red : blue,
                                           redRow ? blue : red, count, greenParity(y, column));
            }
        });
    }

    /// The distances of rows of a candidate from each other and along each of those within.
    struct Measured {
        Distances<T, stretch> between[3], beside[2];

        DistancesAround<T, stretch> around(int row) const { return {&beside[row], &between[row], &between[row + 1]}; }
    };

    void fillScores(s32 y, int rows) const
    {
        eachStretch<stretch - 2>(2, width_ + 4, [&](int column, auto count) {
            const auto withNeighbors = more<2>(count);
            Measured alongRow, alongColumn;
            measureCandidate(planes_.alongRow, y, rows, column - 1, alongRow, withNeighbors);
            measureCandidate(planes_.alongColumn, y, rows, column - 1, alongColumn, withNeighbors);
            for (int i = 0; i < rows; ++i) {
                scoreCandidates(alongRow.around(i), alongColumn.around(i), planes_.score.row(y + i) + column,
                                withNeighbors);
            }
        });
    }

    template <int By, int Count> static constexpr auto more(std::integral_constant<int, Count>)
    {
        return std::integral_constant<int, Count + By>{};
    }
    template <int By> static constexpr int more(int count) { return count + By; }

    template <class Count>
    static void measureCandidate(const typename Planes<T>::Candidate& candidate, s32 y, int rows, int column,
                                 Measured& to, Count count)
    {
        LumaChroma<stretch> converted[4];
        for (int i = 0; i < rows + 2; ++i) {
            const auto from = [y = y + i - 1, column](const auto& ring) { return ring.row(y) + column; };
            toLumaChroma(from(candidate.red), from(candidate.green), from(candidate.blue), converted[i], count);
        }
        for (int i = 0; i < rows + 1; ++i) measure<0>(converted[i], converted[i + 1], to.between[i], count);
        for (int i = 0; i < rows; ++i) measure<1>(converted[i + 1], converted[i + 1], to.beside[i], count);
    }

    void emit(s32 y) const
    {
        std::uint64_t last = 0;
        u8* const target = targetRow(y);
        eachStretch(3, width_ + 3, [&](int column, auto count) {
            Signs<stretch> signs = {}; // whole eights are decided
            addScores(planes_.score.around(y, column), signs, count);
            last = decide(signs, count, last);
            T chosen[3][stretch];
            const auto chooseFrom = [&](const auto& alongRow, const auto& alongColumn, T* to) {
                choose(signs.negative, alongRow.row(y) + column, alongColumn.row(y) + column, to, count);
            };
            chooseFrom(planes_.alongRow.red, planes_.alongColumn.red, chosen[0]);
            chooseFrom(planes_.alongRow.green, planes_.alongColumn.green, chosen[1]);
            chooseFrom(planes_.alongRow.blue, planes_.alongColumn.blue, chosen[2]);
            using Samples = pyxcc::wide::RegisterOf<T>;
            const PlanarRow<Samples, const u8, 3> source{{{{bytes(static_cast<const T*>(chosen[0]))},
                                                           {bytes(static_cast<const T*>(chosen[1]))},
                                                           {bytes(static_cast<const T*>(chosen[2]))}}}};
            const InterleavedRow<C3<Samples>, u8> pixels{target + std::ptrdiff_t{column - 3} * pixelBytes, {}};
            convertColumns(source, pixels, 0, count, Unchanged{});
        });
    }

    /// The first row of a block lies a whole number of samples from the target's first.
    u8* targetRow(s32 y) const
    {
        const std::ptrdiff_t wholeStep = work_.targetStep / sampleSize * sampleSize;
        return rowAt(rowAt(bytes(work_.target), wholeStep, y_ - work_.top), work_.targetStep, y - y_) +
               std::ptrdiff_t{x_ - work_.left} * pixelBytes;
    }

    static constexpr int sampleSize = sizeof(T), pixelBytes = 3 * sampleSize;

    const Work<T>& work_;
    Planes<T> planes_;
    s32 x_, y_, width_, height_;
};

/// The inside, which no mirrored sample reaches, and strips along the four edges. Strips of a small region go beyond
/// it. The inside begins at a red sample and has even sizes; a negative size is rounded down.
template <class T> void convertBlocks(const Work<T>& work, s32 width, s32 height)
{
    const s32 left = work.left, top = work.top, right = left + width, bottom = top + height;
    s32 x = std::max(left, 5), y = std::max(top, 5);
    s32 insideWidth = std::min(work.mosaic.width - 5, right) - x;
    s32 insideHeight = std::min(work.mosaic.height - 5, bottom) - y;
    Site first = siteAt(work.grid, x, y);
    if (first == Site::blue || first == Site::greenOfRedRow) {
        ++x;
        --insideWidth;
        first = siteAt(work.grid, x, y);
    }
    insideWidth &= ~1;
    if (first == Site::greenOfBlueRow) {
        ++y;
        --insideHeight;
    }
    insideHeight &= ~1;

    const s32 below = y + insideHeight, behind = x + insideWidth;
    if (insideWidth >= 1 && insideHeight >= 1) Block<T>(work, x, y, insideWidth, insideHeight).convert();
    if (y > top) Block<T>(work, left, top, width, y - top).convert();
    if (bottom > below) Block<T>(work, left, below, width, bottom - below).convert();
    if (x > left && insideHeight >= 1) Block<T>(work, left, y, x - left, insideHeight).convert();
    if (right > behind && insideHeight >= 1) Block<T>(work, behind, y, right - behind, insideHeight).convert();
}

/// What is left of a length in front of the mosaic's end.
s32 lengthWithin(s32 start, s32 length, s32 limit)
{
    return static_cast<s32>(length + std::min(std::int64_t{limit} - start - length, std::int64_t{0}));
}

template <class T>
PyxStatus convert(const T* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, T* dst, int dstStep, s32 grid, T* tmp,
                  int tmpStep)
{
    const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(srcSize, 5, 5), knownGrid(grid));
    if (failure) return failure;
    const Work<T> work = {.mosaic = {src, srcStep, srcSize.width, srcSize.height},
                          .grid = grid,
                          .target = dst,
                          .targetStep = dstStep,
                          .left = std::max(srcRoi.x, 0),
                          .top = std::max(srcRoi.y, 0),
                          .workspace = tmp,
                          .workspaceStep = tmpStep & -static_cast<int>(sizeof(T))};
    const s32 width = lengthWithin(work.left, srcRoi.width, srcSize.width);
    const s32 height = lengthWithin(work.top, srcRoi.height, srcSize.height);
    if (width >= 1 && height >= 1) convertBlocks(work, width, height);
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiDemosaicAHD_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst,
                                              int dstStep, s32 grid, u8* tmp, int tmpStep)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid, tmp, tmpStep);
}

PyxStatus PYXCC_CALL pyxiDemosaicAHD_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst,
                                               int dstStep, s32 grid, u16* tmp, int tmpStep)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid, tmp, tmpStep);
}
