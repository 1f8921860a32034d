// Rows that are made of several rows as they are loaded, chroma between two rows, and blocks with the pixel in front.
#include "layouts/computed_rows.hpp"
#include "layouts/chroma_means.hpp"
#include "layouts/pixel_before.hpp"
#include "subsampled/index_rules.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

using namespace pyxcc;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;

namespace
{

using Samples = std::vector<u8>;

constexpr u8 untouched = 0xee;

/// Tells its rows apart, whatever the column.
struct FirstLessSecond {
    wide::U8 operator()(wide::U8 x, wide::U8 y) const { return wide::U8(_mm256_sub_epi8(x.v, y.v)); }
};

Samples upFrom(int first, int count, int step = 1)
{
    Samples samples(count);
    for (int i = 0; i < count; ++i) samples[i] = static_cast<u8>(first + step * i);
    return samples;
}

Samples difference(const Samples& x, const Samples& y)
{
    Samples samples(x.size());
    std::ranges::transform(x, y, samples.begin(), [](u8 a, u8 b) { return static_cast<u8>(a - b); });
    return samples;
}

/// `samples` and a few untouched ones.
Samples withRest(Samples samples)
{
    samples.insert(samples.end(), 5, untouched);
    return samples;
}

Samples inTurn(const Samples& first, const Samples& second)
{
    Samples all;
    for (std::size_t i = 0; i < first.size(); ++i) {
        all.push_back(first[i]);
        all.push_back(second[i]);
    }
    return all;
}

constexpr int counts[] = {1, 2, 7, 31, 32, 33, 63, 64, 65, 100};

} // namespace

TEST(ComputedRows, PlanesOfChroma)
{
    for (const int n : counts) {
        const Samples a = upFrom(3, n, 5), b = upFrom(90, n, 3), c = upFrom(7, n), d = upFrom(200, n, 9);
        Samples first(n + 5, untouched), second(n + 5, untouched);
        using Row = PlanesRow<const u8>;
        takeRow<AsItIs>(n, computed(FirstLessSecond{}, Row{a.data(), b.data()}, Row{c.data(), d.data()}),
                        PlanesRow<u8>{first.data(), second.data()});
        EXPECT_EQ(first, withRest(difference(a, c))) << n;
        EXPECT_EQ(second, withRest(difference(b, d))) << n;
    }
}

TEST(ComputedRows, PairsOfChroma)
{
    for (const int n : counts) {
        const Samples a = upFrom(3, 2 * n, 5), b = upFrom(90, 2 * n, 3);
        Samples pairs(2 * n + 5, untouched);
        using Row = PairsRow<const u8>;
        takeRow<AsItIs>(n, computed(FirstLessSecond{}, Row{a.data()}, Row{b.data()}), PairsRow<u8>{pairs.data()});
        EXPECT_EQ(pairs, withRest(difference(a, b))) << n;
    }
}

TEST(ComputedRows, LumaAndChromaBesideEachOther)
{
    for (const int n : counts) {
        const Samples a = upFrom(3, 2 * n, 5), b = upFrom(90, 2 * n, 3), c = upFrom(7, 2 * n), d = upFrom(9, 2 * n, 2);
        const auto luma = computed(FirstLessSecond{}, lumaByTwos(a.data()), lumaByTwos(b.data()));
        const auto chroma = computed(FirstLessSecond{}, PairsRow<const u8>{c.data()}, PairsRow<const u8>{d.data()});
        Samples pixels(4 * n + 5, untouched), alone(2 * n + 5, untouched);
        takeRow<AsItIs>(n, BesideRow{luma, chroma}, PackedRow<First::luma, u8>{pixels.data()});
        EXPECT_EQ(pixels, withRest(inTurn(difference(a, b), difference(c, d)))) << n;
        takeRow<AsItIs>(n, luma, lumaByTwos(alone.data()));
        EXPECT_EQ(alone, withRest(difference(a, b))) << n;
    }
}

TEST(ComputedRows, PackedRowsKeepTheFirstOnesLuma)
{
    for (const int n : counts) {
        const Samples luma = upFrom(3, 2 * n), chroma = upFrom(90, 2 * n, 3), other = upFrom(40, 2 * n, 7);
        const Samples upper = inTurn(chroma, luma), lower = inTurn(other, Samples(2 * n, 1));
        using Row = PackedRow<First::chroma, const u8>;
        Samples pixels(4 * n + 5, untouched);
        takeRow<AsItIs>(n, computed(FirstLessSecond{}, Row{upper.data()}, Row{lower.data()}),
                        PackedRow<First::chroma, u8>{pixels.data()});
        EXPECT_EQ(pixels, withRest(inTurn(difference(chroma, other), luma))) << n;
    }
}

// (a + b + 1) / 2 of a row and the one below it, and the last row as it is.
TEST(ChromaMeans, AreOfTwoRowsButInTheLast)
{
    constexpr int width = 64, rows = 2;
    const Samples y(width * 2 * rows, 9);
    Samples cb = upFrom(1, 32, 3), cr = upFrom(250, 32, -5);
    const Samples lowerCb = upFrom(100, 32), lowerCr = upFrom(8, 32, 2);
    cb.insert(cb.end(), lowerCb.begin(), lowerCb.end());
    cr.insert(cr.end(), lowerCr.begin(), lowerCr.end());
    const u8* const planes[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {width, 32, 32};
    const auto image = chromaBetweenRows(p3<2>(planes, steps), rows);

    const auto expect = [&](const Two<wide::Sample>& chroma, int row, int first, int count) {
        alignas(32) s16 a[16], b[16];
        storeSamples(reinterpret_cast<u8*>(a), static_cast<const wide::S16&>(chroma.a));
        storeSamples(reinterpret_cast<u8*>(b), static_cast<const wide::S16&>(chroma.b));
        for (int i = 0; i < count; ++i) {
            const int at = first + i, below = 32 + at;
            EXPECT_EQ(a[i], row == 0 ? (cb[at] + cb[below] + 1) / 2 : cb[below]) << at;
            EXPECT_EQ(b[i], row == 0 ? (cr[at] + cr[below] + 1) / 2 : cr[below]) << at;
        }
    };
    for (int row = 0; row < rows; ++row) {
        expect(image.rowPair(row).load(32).chroma, row, 16, 16);
        for (int count = 2; count < 32; count += 2)
            expect(image.rowPair(row).load(32, count).chroma, row, 16, count / 2);
    }
}

TEST(PixelBefore, IsBlackAtTheStartOfARow)
{
    const Samples pixels = upFrom(1, 3 * 40);
    const auto row = withPixelBefore(c3(pixels.data(), 0)).row(0);
    const auto before = [](const auto& block) { return Samples(block.before, block.before + 3); };
    EXPECT_EQ(before(row.load(0)), Samples(3, 0));
    EXPECT_EQ(before(row.load(0, 5)), Samples(3, 0));
    EXPECT_EQ(before(row.load(8)), upFrom(1 + 3 * 7, 3));
    EXPECT_EQ(before(row.load(32, 4)), upFrom(1 + 3 * 31, 3));
}
