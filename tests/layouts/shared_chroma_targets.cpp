// Targets with shared chroma: luma is i + 1 in column i of the first row and i + 65 in the second; chroma sample k is
// k + 129 in the first component and k + 193 in the second.
#include "layouts/shared_chroma.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <vector>

using namespace pyxcc;
using namespace pyxcc::layouts;

namespace
{

using Samples = std::vector<u8>;

constexpr int block = 32;
constexpr int before = 64; ///< columns in front of the block, a multiple of every chroma block
constexpr u8 untouched = 0xee;

/// Samples first, first + 1, ...
Samples upFrom(int first, int count)
{
    Samples samples(count);
    for (int i = 0; i < count; ++i) samples[i] = static_cast<u8>(first + i);
    return samples;
}

/// The column whose sample stands at place i of a register.
template <Order order> constexpr int columnAt(int i)
{
    if (order == Order::ofMemory) return i;
    const int half = i / 16, four = i % 16 / 4; // fours by turns in the lower half and in the upper one
    return 4 * (2 * four + half) + i % 4;
}

template <Order order> wide::U8 lumaOfRow(int row)
{
    std::array<u8, block> samples;
    for (int i = 0; i < block; ++i) samples[i] = static_cast<u8>(64 * row + 1 + columnAt<order>(i));
    return loadSamples(samples.data());
}

/// Words as forms give them, one for every two columns: for fours in the even words, with anything in the odd ones.
template <int Columns, Order order> wide::Byte chromaFrom(int first)
{
    std::array<s16, 16> words;
    for (int i = 0; i < 16; ++i) {
        const int column = columnAt<order>(2 * i);
        words[i] = static_cast<s16>(column % Columns == 0 ? first + column / Columns : 77);
    }
    return {loadSamples<wide::S16>(reinterpret_cast<const u8*>(words.data())).v};
}

template <int Columns, Order order> NarrowedPairs chroma()
{
    return narrowPairs(Two{chromaFrom<Columns, order>(129), chromaFrom<Columns, order>(193)});
}

template <int Columns, Order order> ChromaOfSums<Columns, wide::U8> oneRow()
{
    return {lumaOfRow<order>(0), chroma<Columns, order>()};
}

template <Order order> ChromaOfSums<2, Two<wide::U8>> twoRows()
{
    return {{lumaOfRow<order>(0), lumaOfRow<order>(1)}, chroma<2, order>()};
}

/// A row of `columns` columns with nothing but `samples`, `at` samples from its start.
Samples rowWith(int at, const Samples& samples, int length)
{
    Samples row(length, untouched);
    std::ranges::copy(samples, row.begin() + at);
    return row;
}

/// A plane of rows, and a way to look at one of them.
struct Plane {
    int rowBytes, rows;
    Samples bytes = Samples(static_cast<std::size_t>(rowBytes) * rows, untouched);

    Samples row(int y) const { return {bytes.begin() + y * rowBytes, bytes.begin() + (y + 1) * rowBytes}; }
};

/// Stores a whole block, or a part of one.
template <class Row, class Pixels> void storeColumns(const Row& row, int count, const Pixels& pixels)
{
    if (count == block) {
        row.store(before, pixels);
    } else {
        row.store(before, count, pixels);
    }
}

template <int Columns, Order order, Rest rest = Rest::lumaOnly> void expectInPlanes(int count, bool exchanged)
{
    constexpr int width = before + block + 8;
    Plane y{width, 2}, first{width / Columns, 3}, second{width / Columns + 5, 3};
    u8* const planes[3] = {y.bytes.data(), first.bytes.data(), second.bytes.data()};
    const int steps[3] = {y.rowBytes, first.rowBytes, second.rowBytes};
    const auto image = p3<Columns, order, rest>(planes, steps);
    if constexpr (rest == Rest::withChroma) {
        storeColumns(image.row(1), count, oneRow<Columns, order>());
    } else if (exchanged) {
        storeColumns(chromaExchanged(image).row(1), count, oneRow<Columns, order>());
    } else {
        storeColumns(image.row(1), count, oneRow<Columns, order>());
    }
    const int samples = rest == Rest::withChroma ? (count + Columns - 1) / Columns : count / Columns;
    EXPECT_EQ(y.row(0), Samples(y.rowBytes, untouched));
    EXPECT_EQ(y.row(1), rowWith(before, upFrom(1, count), y.rowBytes));
    const auto& [a, b] = exchanged ? std::pair(second, first) : std::pair(first, second);
    EXPECT_EQ(a.row(1), rowWith(before / Columns, upFrom(129, samples), a.rowBytes));
    EXPECT_EQ(b.row(1), rowWith(before / Columns, upFrom(193, samples), b.rowBytes));
    for (const int other : {0, 2}) {
        EXPECT_EQ(a.row(other), Samples(a.rowBytes, untouched));
        EXPECT_EQ(b.row(other), Samples(b.rowBytes, untouched));
    }
}

/// first[0] second[0] first[1] second[1] ...
Samples inTurn(const Samples& first, const Samples& second)
{
    Samples all;
    for (std::size_t i = 0; i < first.size(); ++i) {
        all.push_back(first[i]);
        all.push_back(second[i]);
    }
    return all;
}

template <Order order> void expectInPairsOfRows(int count)
{
    constexpr int width = before + block;
    Plane y{width, 4}, cb{width / 2, 2}, cr{width / 2, 2};
    u8* const planes[3] = {y.bytes.data(), cb.bytes.data(), cr.bytes.data()};
    const int steps[3] = {y.rowBytes, cb.rowBytes, cr.rowBytes};
    storeColumns(p3<2, order>(planes, steps).rowPair(1), count, twoRows<order>());
    EXPECT_EQ(y.row(2), rowWith(before, upFrom(1, count), width));
    EXPECT_EQ(y.row(3), rowWith(before, upFrom(65, count), width));
    EXPECT_EQ(cb.row(1), rowWith(before / 2, upFrom(129, count / 2), width / 2));
    EXPECT_EQ(cr.row(1), rowWith(before / 2, upFrom(193, count / 2), width / 2));
    for (const int other : {0, 1}) EXPECT_EQ(y.row(other), Samples(width, untouched));
    EXPECT_EQ(cb.row(0), Samples(width / 2, untouched));
    EXPECT_EQ(cr.row(0), Samples(width / 2, untouched));
}

template <Order order> void expectPairsInOnePlane(int count)
{
    constexpr int width = before + block + 8;
    Plane y{width, 2}, pairs{width, 1};
    storeColumns(p2<order>(y.bytes.data(), width, pairs.bytes.data(), width).rowPair(0), count, twoRows<order>());
    EXPECT_EQ(y.row(0), rowWith(before, upFrom(1, count), width));
    EXPECT_EQ(y.row(1), rowWith(before, upFrom(65, count), width));
    EXPECT_EQ(pairs.row(0), rowWith(before, inTurn(upFrom(129, count / 2), upFrom(193, count / 2)), width));
}

/// An odd count ends with luma and the first component.
template <Order order> void expectPacked(int count)
{
    const Samples luma = upFrom(1, block);
    const Samples chromaOfBlock = inTurn(upFrom(129, block / 2), upFrom(193, block / 2));
    const Samples exchangedChroma = inTurn(upFrom(193, block / 2), upFrom(129, block / 2));
    Plane plane{2 * (before + block) + 6, 2};
    u8* const bytes = plane.bytes.data();
    const auto expect = [&](auto image, Samples pixels) {
        std::ranges::fill(plane.bytes, untouched);
        storeColumns(image.row(1), count, oneRow<2, order>());
        pixels.resize(2 * count);
        EXPECT_EQ(plane.row(0), Samples(plane.rowBytes, untouched));
        EXPECT_EQ(plane.row(1), rowWith(2 * before, pixels, plane.rowBytes));
    };
    expect(c2LumaFirst<order>(bytes, plane.rowBytes), inTurn(luma, chromaOfBlock));
    expect(c2ChromaFirst<order>(bytes, plane.rowBytes), inTurn(chromaOfBlock, luma));
    expect(chromaExchanged(c2LumaFirst<order>(bytes, plane.rowBytes)), inTurn(luma, exchangedChroma));
}

/// Every part of a block and the whole of it, in either order.
template <class OfMemory, class Any> void eachCount(const OfMemory& ofMemory, const Any& any)
{
    for (int count = 1; count <= block; ++count) {
        SCOPED_TRACE(count);
        ofMemory(count);
        any(count);
    }
}

} // namespace

TEST(SharedChromaTargets, PlanesWithASampleForTwoColumns)
{
    for (const bool exchanged : {false, true}) {
        eachCount([=](int count) { expectInPlanes<2, Order::ofMemory>(count, exchanged); },
                  [=](int count) { expectInPlanes<2, Order::any>(count, exchanged); });
    }
}

TEST(SharedChromaTargets, PlanesWithASampleForFourColumns)
{
    for (const bool exchanged : {false, true}) {
        eachCount([=](int count) { expectInPlanes<4, Order::ofMemory>(count, exchanged); },
                  [=](int count) { expectInPlanes<4, Order::any>(count, exchanged); });
    }
}

TEST(SharedChromaTargets, PlanesWithASampleForALastOddColumn)
{
    eachCount([](int count) { expectInPlanes<2, Order::ofMemory, Rest::withChroma>(count, false); },
              [](int count) { expectInPlanes<2, Order::any, Rest::withChroma>(count, false); });
}

TEST(SharedChromaTargets, PairsOfRowsShareOneRowOfChroma)
{
    eachCount(expectInPairsOfRows<Order::ofMemory>, expectInPairsOfRows<Order::any>);
}

TEST(SharedChromaTargets, ChromaPairsInOnePlane)
{
    eachCount(expectPairsInOnePlane<Order::ofMemory>, expectPairsInOnePlane<Order::any>);
}

TEST(SharedChromaTargets, PackedRows) { eachCount(expectPacked<Order::ofMemory>, expectPacked<Order::any>); }

TEST(SharedChromaTargets, TheAnyOrderIsThatOfLoadedQuadruples)
{
    std::array<u8, 4 * block> pixels;
    for (int i = 0; i < 4 * block; ++i) pixels[i] = static_cast<u8>(i / 4 + 1);
    std::array<u8, block> loaded, expected;
    storeSamples(loaded.data(), loadQuadruples<wide::U8, Order::any>(pixels.data()).b);
    storeSamples(expected.data(), lumaOfRow<Order::any>(0));
    EXPECT_EQ(loaded, expected);
}
