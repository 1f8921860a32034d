// Even and odd columns apart: rows of a mosaic that are taken apart, and pixels that are put together.
#include "layouts/avx2/pairs_of_triples.hpp"
#include "mosaic/halved_rows.hpp"

#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <vector>

namespace
{

using namespace pyxcc;
using pyxcc::layouts::InterleavedRow;
using pyxcc::layouts::PairsOfC3;
using support::Memory;
using support::Placement;

template <class T> using Lanes = std::array<T, wide::RegisterOf<T>::count>;

template <class T> Lanes<T> lanesOf(wide::RegisterOf<T> x)
{
    Lanes<T> lanes;
    layouts::storeSamples(reinterpret_cast<u8*>(lanes.data()), x);
    return lanes;
}

template <class T> T sample(const Memory& memory, int index)
{
    T value;
    std::memcpy(&value, memory.bytes().data() + index * static_cast<int>(sizeof(T)), sizeof(T));
    return value;
}

/// Lane k of what is loaded is the column 2 k + Offset.
template <int Offset, class T>
void expectEveryOther(const mosaic::HalvedRow<T>& halves, const Memory& columns, int count, int pair)
{
    const Lanes<T> lanes = lanesOf<T>(halves.template load<Offset>(pair));
    for (int k = 0; k < static_cast<int>(lanes.size()); ++k) {
        const int column = 2 * (pair + k) + Offset;
        if (column >= count + 2) break;
        ASSERT_EQ(lanes[k], sample<T>(columns, 2 + column)) << count << ", " << column;
    }
}

template <class T> void expectHalves(Placement placement)
{
    support::Random random(support::seedOf("halves", sizeof(T)));
    const auto halves = std::make_unique<mosaic::HalvedRow<T>>();
    for (const int count : {1, 2, 3, 27, 28, 29, 31, 32, 33, 59, 60, 61, 63, 64, 65, 124, 128, 2047, 2048}) {
        const Memory columns(placement, (count + 4) * sizeof(T), 1 * sizeof(T));
        random.fill(columns.bytes());
        halves->take(reinterpret_cast<const T*>(columns.bytes().data()) + 2, count);
        for (int pair = 0; 2 * pair < count; pair += wide::RegisterOf<T>::count) {
            expectEveryOther<-2>(*halves, columns, count, pair);
            expectEveryOther<-1>(*halves, columns, count, pair);
            expectEveryOther<0>(*halves, columns, count, pair);
            expectEveryOther<1>(*halves, columns, count, pair);
            expectEveryOther<2>(*halves, columns, count, pair);
            expectEveryOther<3>(*halves, columns, count, pair);
        }
    }
}

/// Sample c of the pixel of column x.
template <class T> T channelAt(int x, int c) { return static_cast<T>(1 + 3 * x + c); }

template <class T> void expectPixels()
{
    using Samples = wide::RegisterOf<T>;
    constexpr int block = 2 * Samples::count;
    static_assert(layouts::blockOf<PairsOfC3<Samples>> == block);
    Two<Three<Samples>> pixels;
    const auto channel = [](int column, int c) {
        Lanes<T> lanes;
        for (int k = 0; k < Samples::count; ++k) lanes[k] = channelAt<T>(2 * k + column, c);
        return layouts::loadSamples<Samples>(reinterpret_cast<const u8*>(lanes.data()));
    };
    pixels.a = {channel(0, 0), channel(0, 1), channel(0, 2)};
    pixels.b = {channel(1, 0), channel(1, 1), channel(1, 2)};
    std::vector<T> expected;
    for (int x = 0; x < block; ++x) {
        for (int c = 0; c < 3; ++c) expected.push_back(channelAt<T>(x, c));
    }
    const auto expectStored = [&](int count, const auto& store) {
        const Memory target(Placement::endAtGuard, 3 * count * sizeof(T));
        store(InterleavedRow<PairsOfC3<Samples>, u8>{target.bytes().data(), {}});
        EXPECT_EQ(std::memcmp(target.bytes().data(), expected.data(), target.bytes().size()), 0) << count;
    };
    expectStored(block, [&](const auto& row) { row.store(0, pixels); });
    for (int count = 1; count <= block; ++count)
        expectStored(count, [&](const auto& row) { row.store(0, count, pixels); });
}

} // namespace

TEST(HalvedRow, HasTheColumnsOfARowAndTwoOnBothSides)
{
    for (const Placement placement : {Placement::margins, Placement::endAtGuard, Placement::beginAtGuard}) {
        expectHalves<u8>(placement);
        expectHalves<u16>(placement);
    }
}

TEST(PairsOfC3, EvenAndOddColumnsBecomePixels)
{
    expectPixels<u8>();
    expectPixels<u16>();
}
