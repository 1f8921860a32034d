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

wide::U8 lumaOfRow(int row) { return loadSamples(upFrom(64 * row + 1, block).data()); }

/// Words as forms give them: for fours in the even words, with anything in the odd ones.
template <int Columns> wide::Byte chromaFrom(int first)
{
    std::array<s16, 16> words;
    words.fill(77);
    for (int k = 0; k < block / Columns; ++k) words[k * Columns / 2] = static_cast<s16>(first + k);
    return {loadSamples<wide::S16>(reinterpret_cast<const u8*>(words.data())).v};
}

template <int Columns> Two<wide::Byte> chroma() { return {chromaFrom<Columns>(129), chromaFrom<Columns>(193)}; }

template <int Columns> ChromaOfSums<Columns, wide::U8> oneRow() { return {lumaOfRow(0), chroma<Columns>()}; }
template <int Columns> ChromaOfSums<Columns, Two<wide::U8>> twoRows()
{
    return {{lumaOfRow(0), lumaOfRow(1)}, chroma<Columns>()};
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

template <int Columns> void expectInPlanes(int count, bool exchanged)
{
    constexpr int width = before + block + 8;
    Plane y{width, 2}, first{width / Columns, 3}, second{width / Columns + 5, 3};
    u8* const planes[3] = {y.bytes.data(), first.bytes.data(), second.bytes.data()};
    const int steps[3] = {y.rowBytes, first.rowBytes, second.rowBytes};
    const auto image = p3<Columns>(planes, steps);
    if (exchanged) {
        storeColumns(chromaExchanged(image).row(1), count, oneRow<Columns>());
    } else {
        storeColumns(image.row(1), count, oneRow<Columns>());
    }
    const int samples = count / Columns;
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

} // namespace

TEST(SharedChromaTargets, PlanesWithASampleForTwoColumns)
{
    for (int count = 1; count <= block; ++count) {
        SCOPED_TRACE(count);
        expectInPlanes<2>(count, false);
        expectInPlanes<2>(count, true);
    }
}

TEST(SharedChromaTargets, PlanesWithASampleForFourColumns)
{
    for (int count = 1; count <= block; ++count) {
        SCOPED_TRACE(count);
        expectInPlanes<4>(count, false);
        expectInPlanes<4>(count, true);
    }
}

TEST(SharedChromaTargets, PairsOfRowsShareOneRowOfChroma)
{
    for (const int count : {2, 30, 31, 32}) {
        SCOPED_TRACE(count);
        constexpr int width = before + block;
        Plane y{width, 4}, cb{width / 2, 2}, cr{width / 2, 2};
        u8* const planes[3] = {y.bytes.data(), cb.bytes.data(), cr.bytes.data()};
        const int steps[3] = {y.rowBytes, cb.rowBytes, cr.rowBytes};
        storeColumns(p3<2>(planes, steps).rowPair(1), count, twoRows<2>());
        EXPECT_EQ(y.row(2), rowWith(before, upFrom(1, count), width));
        EXPECT_EQ(y.row(3), rowWith(before, upFrom(65, count), width));
        EXPECT_EQ(cb.row(1), rowWith(before / 2, upFrom(129, count / 2), width / 2));
        EXPECT_EQ(cr.row(1), rowWith(before / 2, upFrom(193, count / 2), width / 2));
        for (const int other : {0, 1}) EXPECT_EQ(y.row(other), Samples(width, untouched));
        EXPECT_EQ(cb.row(0), Samples(width / 2, untouched));
        EXPECT_EQ(cr.row(0), Samples(width / 2, untouched));
    }
}

TEST(SharedChromaTargets, ChromaPairsInOnePlane)
{
    for (int count = 1; count <= block; ++count) {
        SCOPED_TRACE(count);
        constexpr int width = before + block + 8;
        Plane y{width, 2}, pairs{width, 1};
        storeColumns(p2(y.bytes.data(), width, pairs.bytes.data(), width).rowPair(0), count, twoRows<2>());
        EXPECT_EQ(y.row(0), rowWith(before, upFrom(1, count), width));
        EXPECT_EQ(y.row(1), rowWith(before, upFrom(65, count), width));
        EXPECT_EQ(pairs.row(0), rowWith(before, inTurn(upFrom(129, count / 2), upFrom(193, count / 2)), width));
    }
}

TEST(SharedChromaTargets, PackedRows)
{
    const Samples luma = upFrom(1, block);
    const Samples chromaOfBlock = inTurn(upFrom(129, block / 2), upFrom(193, block / 2));
    const Samples exchangedChroma = inTurn(upFrom(193, block / 2), upFrom(129, block / 2));
    const auto expectPacked = [](auto image, Plane& plane, Samples pixels, int count) {
        std::ranges::fill(plane.bytes, untouched);
        storeColumns(image.row(1), count, oneRow<2>());
        pixels.resize(2 * count);
        EXPECT_EQ(plane.row(0), Samples(plane.rowBytes, untouched));
        EXPECT_EQ(plane.row(1), rowWith(2 * before, pixels, plane.rowBytes));
    };
    Plane plane{2 * (before + block) + 6, 2};
    u8* const bytes = plane.bytes.data();
    for (int count = 1; count <= block; ++count) { // an odd count ends with luma and the first component
        SCOPED_TRACE(count);
        expectPacked(c2LumaFirst(bytes, plane.rowBytes), plane, inTurn(luma, chromaOfBlock), count);
        expectPacked(c2ChromaFirst(bytes, plane.rowBytes), plane, inTurn(chromaOfBlock, luma), count);
        expectPacked(chromaExchanged(c2LumaFirst(bytes, plane.rowBytes)), plane, inTurn(luma, exchangedChroma), count);
    }
}
