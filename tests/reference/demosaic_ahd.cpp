#include "reference/demosaic_ahd.hpp"

#include "reference/arguments.hpp"
#include "reference/image.hpp"
#include "reference/mosaic.hpp"
#include "reference/pixels.hpp"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <vector>

namespace reference
{

namespace
{

/// A rectangle of values, by the coordinates of the mosaic.
template <typename V> class Plane
{
public:
    explicit Plane(RoiRect at) : at_(at), values_(static_cast<std::size_t>(at.width) * at.height) {}

    V& operator()(int x, int y) { return values_[index(x, y)]; }
    const V& operator()(int x, int y) const { return values_[index(x, y)]; }

    template <typename Rule> void fill(Rule rule)
    {
        for (int y = at_.y; y < at_.y + at_.height; ++y) {
            for (int x = at_.x; x < at_.x + at_.width; ++x) (*this)(x, y) = rule(x, y);
        }
    }

private:
    std::size_t index(int x, int y) const
    {
        return static_cast<std::size_t>(y - at_.y) * at_.width + static_cast<std::size_t>(x - at_.x);
    }

    RoiRect at_;
    std::vector<V> values_;
};

RoiRect grown(RoiRect rect, int by) { return {rect.x - by, rect.y - by, rect.width + 2 * by, rect.height + 2 * by}; }

enum class Direction { horizontal, vertical };

template <typename T> s32 greenAt(const Mosaic<T>& mosaic, int x, int y, Direction direction)
{
    const s32 c = mosaic.at(x, y);
    const Site site = mosaic.site(x, y);
    if (site != Site::red && site != Site::blue) return c;
    const int dx = direction == Direction::horizontal ? 1 : 0, dy = 1 - dx;
    const s32 a = mosaic.at(x - dx, y - dy), b = mosaic.at(x + dx, y + dy);
    const s32 f = mosaic.at(x - 2 * dx, y - 2 * dy), g = mosaic.at(x + 2 * dx, y + 2 * dy);
    const s32 t = ((a + b) >> 1) + (((c - f) - (g - c)) >> 2);
    return std::clamp(t, std::min(a, b), std::max(a, b));
}

/// A pixel as one of the directions would have it, and its luma and chroma.
struct Candidate {
    Triple<s32> rgb;
    s32 y, cb, cr;
};

template <typename T> Candidate candidateAt(const Mosaic<T>& mosaic, const Plane<s32>& green, int x, int y)
{
    const auto excess = [&](int i, int j) { return mosaic.at(i, j) - green(i, j); };
    const auto bounded = [](s32 v) { return std::clamp<s32>(v, 0, std::numeric_limits<T>::max()); };
    const s32 g = green(x, y);
    const s32 horizontal = bounded(g + ((excess(x - 1, y) + excess(x + 1, y)) >> 1));
    const s32 vertical = bounded(g + ((excess(x, y - 1) + excess(x, y + 1)) >> 1));
    const s32 diagonal =
        bounded(g + ((excess(x - 1, y - 1) + excess(x + 1, y - 1) + excess(x - 1, y + 1) + excess(x + 1, y + 1)) >> 2));
    const s32 own = mosaic.at(x, y);
    s32 r = 0, b = 0;
    switch (mosaic.site(x, y)) {
    case Site::red:
        r = own, b = diagonal;
        break;
    case Site::blue:
        r = diagonal, b = own;
        break;
    case Site::greenInRedRow:
        r = horizontal, b = vertical;
        break;
    case Site::greenInBlueRow:
        r = vertical, b = horizontal;
        break;
    }
    return {
        {r, g, b},
        (66 * r + 129 * g + 25 * b + 128) >> 8,
        (-38 * r - 74 * g + 112 * b + 128) >> 8,
        (112 * r - 94 * g - 18 * b + 128) >> 8,
    };
}

s32 lumaDistance(const Candidate& p, const Candidate& q) { return std::abs(p.y - q.y); }

// In 32 bits, beyond which it wraps, so that far colours may come out as near ones.
s32 chromaDistance(const Candidate& p, const Candidate& q)
{
    const u32 cb = static_cast<u32>(p.cb - q.cb), cr = static_cast<u32>(p.cr - q.cr);
    return static_cast<s32>(cb * cb + cr * cr);
}

/// By how many more neighbours a pixel is like in the horizontal candidates than in the vertical ones.
s32 scoreAt(const Plane<Candidate>& horizontal, const Plane<Candidate>& vertical, int x, int y)
{
    constexpr int offsets[4][2] = {{-1, 0}, {1, 0}, {0, -1}, {0, 1}};
    s32 lumaH[4], lumaV[4], chromaH[4], chromaV[4];
    for (int k = 0; k < 4; ++k) {
        const int i = x + offsets[k][0], j = y + offsets[k][1];
        lumaH[k] = lumaDistance(horizontal(i, j), horizontal(x, y));
        lumaV[k] = lumaDistance(vertical(i, j), vertical(x, y));
        chromaH[k] = chromaDistance(horizontal(i, j), horizontal(x, y));
        chromaV[k] = chromaDistance(vertical(i, j), vertical(x, y));
    }
    const s32 lumaLimit = std::min(std::max(lumaH[0], lumaH[1]), std::max(lumaV[2], lumaV[3]));
    const s32 chromaLimit = std::min(std::max(chromaH[0], chromaH[1]), std::max(chromaV[2], chromaV[3]));
    s32 score = 0;
    for (int k = 0; k < 4; ++k) {
        if (lumaH[k] <= lumaLimit && chromaH[k] <= chromaLimit) ++score;
        if (lumaV[k] <= lumaLimit && chromaV[k] <= chromaLimit) --score;
    }
    return score;
}

/// One rectangle, whose first pixel is that of `dst`.
template <typename T> void convertBlock(const Mosaic<T>& mosaic, RoiRect block, const Image<T>& dst)
{
    Plane<s32> greenH(grown(block, 3)), greenV(grown(block, 3));
    greenH.fill([&](int x, int y) { return greenAt(mosaic, x, y, Direction::horizontal); });
    greenV.fill([&](int x, int y) { return greenAt(mosaic, x, y, Direction::vertical); });
    Plane<Candidate> horizontal(grown(block, 2)), vertical(grown(block, 2));
    horizontal.fill([&](int x, int y) { return candidateAt(mosaic, greenH, x, y); });
    vertical.fill([&](int x, int y) { return candidateAt(mosaic, greenV, x, y); });
    Plane<s32> score(grown(block, 1));
    score.fill([&](int x, int y) { return scoreAt(horizontal, vertical, x, y); });

    for (int row = 0; row < block.height; ++row) {
        s32 last = 1;
        for (int column = 0; column < block.width; ++column) {
            const int x = block.x + column, y = block.y + row;
            s32 sum = 0;
            for (int j = y - 1; j <= y + 1; ++j) {
                for (int i = x - 1; i <= x + 1; ++i) sum += score(i, j);
            }
            if (sum != 0) last = sum;
            const Candidate& chosen = last < 0 ? vertical(x, y) : horizontal(x, y);
            for (int k = 0; k < 3; ++k) dst[k].set(row, column, static_cast<T>(chosen.rgb[k]));
        }
    }
}

template <typename T>
PyxStatus demosaic(const T* src, RoiRect roi, RoiSize size, int srcStep, T* dst, int dstStep, s32 grid)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(size, 5, 5)) return pyxErrSize;
    if (!isGridKnown(grid)) return pyxErrBadArg;

    // A negative origin is moved to 0 and the region keeps its size.
    const int x = std::max(roi.x, 0), y = std::max(roi.y, 0);
    const int w = roi.width + static_cast<int>(std::min<std::int64_t>(std::int64_t{size.width} - x - roi.width, 0));
    const int h = roi.height + static_cast<int>(std::min<std::int64_t>(std::int64_t{size.height} - y - roi.height, 0));
    if (w < 1 || h < 1) return pyxOk;

    // What is within begins with a red sample and has an even size; negative ones are rounded down.
    int x0 = std::max(x, 5), y0 = std::max(y, 5);
    int innerWidth = std::min(size.width - 5, x + w) - x0;
    int innerHeight = std::min(size.height - 5, y + h) - y0;
    Site first = siteAt(grid, x0, y0);
    if (first == Site::blue || first == Site::greenInRedRow) {
        x0 += 1;
        innerWidth -= 1;
        first = siteAt(grid, x0, y0);
    }
    innerWidth &= ~1;
    if (first == Site::greenInBlueRow) {
        y0 += 1;
        innerHeight -= 1;
    }
    innerHeight &= ~1;

    const Mosaic<T> mosaic(src, srcStep, size, grid);
    const auto run = [&](RoiRect block) {
        // The way to the first row goes in whole samples, from there on each row is at the step itself.
        const int size16 = sizeof(T);
        const std::ptrdiff_t rowOffset = std::ptrdiff_t{block.y - y} * (dstStep / size16);
        convertBlock(mosaic, block, interleaved(dst + rowOffset + 3 * std::ptrdiff_t{block.x - x}, dstStep, 3));
    };
    const int yBottom = y0 + innerHeight, xRight = x0 + innerWidth;
    if (innerWidth >= 1 && innerHeight >= 1) run({x0, y0, innerWidth, innerHeight});
    if (y0 - y >= 1) run({x, y, w, y0 - y});
    if (y + h - yBottom >= 1) run({x, yBottom, w, y + h - yBottom});
    if (x0 - x >= 1 && innerHeight >= 1) run({x, y0, x0 - x, innerHeight});
    if (x + w - xRight >= 1 && innerHeight >= 1) run({xRight, y0, x + w - xRight, innerHeight});
    return pyxOk;
}

} // namespace

PyxStatus pyxiDemosaicAHD_8u_C1C3R(const u8* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u8* dst, int dstStep,
                                   s32 grid, u8*, int)
{
    return demosaic(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}

PyxStatus pyxiDemosaicAHD_16u_C1C3R(const u16* src, RoiRect srcRoi, RoiSize srcSize, int srcStep, u16* dst, int dstStep,
                                    s32 grid, u16*, int)
{
    return demosaic(src, srcRoi, srcSize, srcStep, dst, dstStep, grid);
}

} // namespace reference
