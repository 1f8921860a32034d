// A sensor's mosaic to RGB along rows or along columns, whichever is the smoother.
#include "pyxcc/demosaic_ahd.h"

#include "frame/row_driver.hpp"
#include "layouts/images.hpp"
#include "mosaic/ahd_forms.hpp"
#include "mosaic/ahd_homogeneity.hpp"
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
};

/// A part of the image that is converted by itself. Its first row is a whole number of samples from the target's first.
struct Block {
    s32 x, y, width, height;
};

/// Rows that take turns.
template <class Row, int rows> struct Ring {
    static_assert((rows & (rows - 1)) == 0);
    Row row[rows];

    Row& operator[](s32 y) { return row[y & (rows - 1)]; }
};

/// Takes a stretch of a block's columns from its first row to its last. Every row of a plane is made once, and what is
/// made of it follows as soon as the rows below it are there: what is at work stays in the nearest cache, however wide
/// the image is. It is so little that the caller's rows are not needed.
template <class T> class Stretch
{
public:
    /// Three columns in front of those that are converted and three behind them.
    static constexpr int planeColumns = 384 / static_cast<int>(sizeof(T)), columns = planeColumns - 6;

    Stretch(const Work<T>& work, const Block& block, s32 x)
        : work_(work), block_(block), x_(x), width_(std::min(columns, block.x + block.width - x)),
          count_((width_ + 6 + Samples::count - 1) / Samples::count * Samples::count)
    {
    }

    /// Converts the rows [from, to). `last` is kept for each of them.
    void convert(s32 from, s32 to, u32* last)
    {
        for (s32 y = from - 5; y < from - 1; ++y) fillMosaic(y);
        for (s32 y = from - 3; y < to + 3; ++y) {
            fillMosaic(y + 2);
            fillGreen(y);
            if (y < from - 1) continue;
            fillColors(y - 1);
            if (y < from) continue;
            measureCandidate(alongRow_, y - 2);
            measureCandidate(alongColumn_, y - 2);
            if (y < from + 1) continue;
            fillScores(y - 2);
            if (y < from + 3) continue;
            emit(y - 3, last[y - 3 - from]);
        }
    }

private:
    using Samples = pyxcc::wide::RegisterOf<T>;
    static constexpr int sampleSize = sizeof(T), pixelBytes = 3 * sampleSize;

    template <class Number> using PlaneRow = Line<Number, planeColumns>;

    struct Candidate {
        Ring<GreenRow<T, planeColumns>, 4> green;
        Ring<PlaneRow<T>, 4> red, blue;
        Ring<LumaChroma<T, planeColumns>, 2> converted;
        Ring<Distances<T, planeColumns>, 2> below;
    };

    bool isGreenFirst(s32 y) const { return isGreen(siteAt(work_.grid, x_ - 3, y)); }

    void fillMosaic(s32 y)
    {
        work_.mosaic.expect(y + rowsAhead, x_ - 5, x_ + width_ + 5);
        work_.mosaic.take(y, x_ - 5, x_ + width_ + 5, mosaic_[y].at(-2));
    }

    void fillGreen(s32 y)
    {
        const T* const rows[] = {mosaic_[y - 2].at(), mosaic_[y - 1].at(), mosaic_[y].at(), mosaic_[y + 1].at(),
                                 mosaic_[y + 2].at()};
        if (isGreenFirst(y)) {
            interpolateGreen<true>(rows, alongRow_.green[y], alongColumn_.green[y], count_);
        } else {
            interpolateGreen<false>(rows, alongRow_.green[y], alongColumn_.green[y], count_);
        }
    }

    void fillColors(s32 y)
    {
        const bool redRow = isOfRedRow(siteAt(work_.grid, x_, y));
        for (Candidate* candidate : {&alongRow_, &alongColumn_}) {
            T *const red = candidate->red[y].at(), *const blue = candidate->blue[y].at();
            const GreensAround<T, planeColumns> greens = {candidate->green[y - 1], candidate->green[y],
                                                          candidate->green[y + 1]};
            if (isGreenFirst(y)) {
                interpolateColors<true>(mosaic_[y].at(), greens, redRow ? red : blue, redRow ? blue : red, count_);
            } else {
                interpolateColors<false>(mosaic_[y].at(), greens, redRow ? red : blue, redRow ? blue : red, count_);
            }
            toLumaChroma(red, candidate->green[y].green.at(), blue, candidate->converted[y], count_);
        }
    }

    void measureCandidate(Candidate& candidate, s32 y)
    {
        measure(candidate.converted[y], candidate.converted[y + 1], candidate.below[y], count_);
    }

    void fillScores(s32 y)
    {
        Distances<T, planeColumns> besideAlongRow, besideAlongColumn;
        measureBeside(alongRow_.converted[y], besideAlongRow, count_);
        measureBeside(alongColumn_.converted[y], besideAlongColumn, count_);
        scoreCandidates({besideAlongRow, alongRow_.below[y - 1], alongRow_.below[y]},
                        {besideAlongColumn, alongColumn_.below[y - 1], alongColumn_.below[y]}, scores_[y], count_);
    }

    /// A row of what is chosen, which is computed as it is loaded.
    struct ChosenRow {
        static constexpr int block = Samples::count;
        ThreeRows<T> scores;
        pyxcc::Three<const T*> alongRow, alongColumn;
        u32& last;

        PYXCC_INLINE pyxcc::Three<Samples> load(int x) const { return load(x, block); }
        PYXCC_INLINE pyxcc::Three<Samples> load(int x, int count) const
        {
            const Samples mask = choice<T>(scores, x, count, last);
            const auto chosen = [mask, x](const T* h, const T* v)
                                    PYXCC_INLINE_LAMBDA { return where(mask, registerOf(v + x), registerOf(h + x)); };
            return {chosen(alongRow.a, alongColumn.a), chosen(alongRow.b, alongColumn.b),
                    chosen(alongRow.c, alongColumn.c)};
        }
    };

    /// Rows of a stretch are too short for the processor to look ahead of: hints do, at the same columns some rows
    /// below.
    static constexpr int rowsAhead = 6;

    struct TargetRow {
        static constexpr int block = Samples::count;
        InterleavedRow<C3<Samples>, u8> row;
        std::ptrdiff_t ahead;

        PYXCC_INLINE void store(int x, const pyxcc::Three<Samples>& pixels) const
        {
            u8* const at = row.pixel(x);
            expectFrom<0>(at + ahead);
            row.packing.store(at, pixels);
        }
        PYXCC_INLINE void store(int x, int count, const pyxcc::Three<Samples>& pixels) const
        {
            row.store(x, count, pixels);
        }
    };

    void emit(s32 y, u32& last)
    {
        const auto planes = [y](Candidate& from) {
            return pyxcc::Three<const T*>{from.red[y].at(3), from.green[y].green.at(3), from.blue[y].at(3)};
        };
        const ChosenRow source = {{scores_[y - 1].at(3), scores_[y].at(3), scores_[y + 1].at(3)},
                                  planes(alongRow_),
                                  planes(alongColumn_),
                                  last};
        const TargetRow target{{targetRow(y), {}}, std::ptrdiff_t{work_.targetStep} * rowsAhead};
        convertColumns(source, target, 0, width_, Unchanged{});
    }

    /// The first row of a block lies a whole number of samples from the target's first.
    u8* targetRow(s32 y) const
    {
        const std::ptrdiff_t wholeStep = work_.targetStep / sampleSize * sampleSize;
        return rowAt(rowAt(bytes(work_.target), wholeStep, block_.y - work_.top), work_.targetStep, y - block_.y) +
               std::ptrdiff_t{x_ - work_.left} * pixelBytes;
    }

    const Work<T>& work_;
    const Block& block_;
    s32 x_;
    int width_, count_; ///< as many columns as are computed: whole registers
    Ring<PlaneRow<T>, 8> mosaic_ = {};
    Candidate alongRow_ = {}, alongColumn_ = {};
    Ring<PlaneRow<T>, 4> scores_ = {};
};

/// A stretch leaves behind what each row ends with, for a band of rows; the next one goes on from there.
template <class T> void convertBlock(const Work<T>& work, const Block& block)
{
    constexpr int band = 1024;
    const s32 bottom = block.y + block.height;
    for (s32 y = block.y; y < bottom; y += band) {
        u32 last[band] = {};
        for (s32 x = block.x; x < block.x + block.width; x += Stretch<T>::columns) {
            Stretch<T>(work, block, x).convert(y, std::min(y + band, bottom), last);
        }
    }
}

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
    if (insideWidth >= 1 && insideHeight >= 1) convertBlock(work, {x, y, insideWidth, insideHeight});
    if (y > top) convertBlock(work, {left, top, width, y - top});
    if (bottom > below) convertBlock(work, {left, below, width, bottom - below});
    if (x > left && insideHeight >= 1) convertBlock(work, {left, y, x - left, insideHeight});
    if (right > behind && insideHeight >= 1) convertBlock(work, {behind, y, right - behind, insideHeight});
}

/// What is left of a length in front of the mosaic's end.
s32 lengthWithin(s32 start, s32 length, s32 limit)
{
    return static_cast<s32>(length + std::min(std::int64_t{limit} - start - length, std::int64_t{0}));
}

template <class T>
PyxStatus convert(const T* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, T* dst, int dstStep, s32 grid)
{
    const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(srcSize, 5, 5), knownGrid(grid));
    if (failure) return failure;
    const Work<T> work = {.mosaic = {src, srcStep, srcSize.width, srcSize.height},
                          .grid = grid,
                          .target = dst,
                          .targetStep = dstStep,
                          .left = std::max(srcRoi.x, 0),
                          .top = std::max(srcRoi.y, 0)};
    const s32 width = lengthWithin(work.left, srcRoi.width, srcSize.width);
    const s32 height = lengthWithin(work.top, srcRoi.height, srcSize.height);
    if (width >= 1 && height >= 1) convertBlocks(work, width, height);
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiDemosaicAHD_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst,
                                              int dstStep, s32 grid, u8* /*tmp*/, int /*tmpStep*/)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}

PyxStatus PYXCC_CALL pyxiDemosaicAHD_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst,
                                               int dstStep, s32 grid, u16* /*tmp*/, int /*tmpStep*/)
{
    return convert(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}
