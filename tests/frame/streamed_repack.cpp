// Repacking to packed rows past the cache, of images that allow it and of those that do not, against plain statements.
#include "pyxcc/repack.h"

#include "cache_size.hpp"
#include "support/image.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <utility>

using namespace support;

namespace
{

/// Tells of a tiny cache as long as it lives.
class TinyCache
{
public:
    TinyCache() : before_(std::exchange(cacheSize, tinyCache)) {}
    ~TinyCache() { cacheSize = before_; }
    TinyCache(const TinyCache&) = delete;
    TinyCache& operator=(const TinyCache&) = delete;

private:
    s32 before_;
};

Plane planeOf(int rowBytes, int rows, int gap, Placement placement, int alignment, Random& random)
{
    const int step = rowBytes + gap;
    Plane plane(geometryOf({rowBytes, rows}, catalog::Element::u8, step), placement, alignment);
    random.fill(plane.all());
    return plane;
}

/// Where a target lies: its first byte, as far as the placement leaves that open, and the bytes between its rows.
struct Lie {
    Placement placement;
    int alignment, gap;
};

constexpr Lie lies[] = {{Placement::margins, 0, 0},  {Placement::margins, 32, 64}, {Placement::margins, 0, 32},
                        {Placement::margins, 16, 0}, {Placement::margins, 0, 4},   {Placement::endAtGuard, 0, 0}};

/// Sizes with and without a part of a block; luma of 4:1:1 comes by 128 columns.
constexpr RoiSize sizes[] = {{64, 1}, {128, 3}, {256, 4}, {192, 2}, {130, 2}, {62, 2}, {140, 3}};

/// Converts luma and the second plane to packed rows. The statement tells the chroma byte of pixel x of row y.
void expectPacked(const Lie& lie, RoiSize roi, int chromaBytes, int chromaRows,
                  const std::function<PyxStatus(const Plane&, const Plane&, const Plane&)>& convert,
                  const std::function<u8(const Plane&, int, int)>& chromaAt)
{
    Random random(static_cast<std::uint64_t>(roi.width * 100 + roi.height));
    const Plane luma = planeOf(roi.width, roi.height, 3, Placement::margins, 5, random);
    const Plane chroma = planeOf(chromaBytes, chromaRows, 1, Placement::margins, 9, random);
    const Plane target = planeOf(2 * roi.width, roi.height, lie.gap, lie.placement, lie.alignment, random);
    const Plane expected = target;
    for (int y = 0; y < roi.height; ++y) {
        for (int x = 0; x < roi.width; ++x) {
            expected.row(y)[2 * x] = luma.row(y)[x];
            expected.row(y)[2 * x + 1] = chromaAt(chroma, x, y);
        }
    }
    const TinyCache tiny;
    ASSERT_EQ(convert(luma, chroma, target), pyxOk);
    for (std::size_t i = 0; i < target.all().size(); ++i) {
        ASSERT_EQ(target.all()[i], expected.all()[i]) << roi.width << " x " << roi.height << ", " << lie.alignment
                                                      << " mod 64, gap " << lie.gap << ", byte " << i;
    }
}

int stepOf(const Plane& plane) { return plane.geometry().step; }

} // namespace

TEST(StreamedRepack, PairsBesideLuma)
{
    const auto convert = [](RoiSize roi) {
        return [roi](const Plane& luma, const Plane& pairs, const Plane& target) {
            return pyxiYCbCr411ToYCbCr422_8u_P2C2R(luma.base(), stepOf(luma), pairs.base(), stepOf(pairs),
                                                   target.base(), stepOf(target), roi);
        };
    };
    for (const Lie& lie : lies) {
        for (RoiSize roi : sizes) {
            roi.width &= ~3;
            expectPacked(lie, roi, roi.width / 2, roi.height, convert(roi),
                         [](const Plane& pairs, int x, int y) { return pairs.row(y)[x / 4 * 2 + x % 2]; });
        }
    }
}

TEST(StreamedRepack, EachRowOfPairsTwice)
{
    const auto convert = [](RoiSize roi) {
        return [roi](const Plane& luma, const Plane& pairs, const Plane& target) {
            return pyxiYCbCr420ToYCbCr422_8u_P2C2R(luma.base(), stepOf(luma), pairs.base(), stepOf(pairs),
                                                   target.base(), stepOf(target), roi);
        };
    };
    for (const Lie& lie : lies) {
        for (RoiSize roi : sizes) {
            roi.height = 2 * roi.height;
            expectPacked(lie, roi, roi.width, roi.height / 2, convert(roi),
                         [](const Plane& pairs, int x, int y) { return pairs.row(y / 2)[x]; });
        }
    }
}

// The rows of both planes lie in one plane, each row of the second behind that of the first.
TEST(StreamedRepack, PlanesBesideLuma)
{
    const auto convert = [](RoiSize roi) {
        return [roi](const Plane& luma, const Plane& both, const Plane& target) {
            const u8* const src[3] = {luma.base(), both.base(), both.base() + roi.width / 2};
            const int srcStep[3] = {stepOf(luma), stepOf(both), stepOf(both)};
            return pyxiYCbCr422_8u_P3C2R(src, srcStep, target.base(), stepOf(target), roi);
        };
    };
    for (const Lie& lie : lies) {
        for (const RoiSize roi : sizes) {
            expectPacked(lie, roi, roi.width, roi.height, convert(roi), [roi](const Plane& both, int x, int y) {
                return both.row(y)[x / 2 + x % 2 * (roi.width / 2)];
            });
        }
    }
}
