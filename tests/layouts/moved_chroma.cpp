// Rows of chroma that are moved, by their index rules: with s and t the samples of a component in source and target,
// as plain statements, for every number of samples up to some blocks, between guard pages.
#include "subsampled/index_rules.hpp"
#include "support/memory.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <numeric>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::layouts;
using namespace pyxcc::subsampled;
using support::Memory;
using support::Placement;

using Samples = std::vector<u8>;

constexpr int mostSamples = 140;
constexpr u8 untouched = 0xee;

/// Samples that tell component, row and column.
Samples component(int first, int count)
{
    Samples samples(count);
    for (int i = 0; i < count; ++i) samples[i] = static_cast<u8>(first + 7 * i + i / 37);
    return samples;
}

/// Both components of a row, and luma where it goes with them.
struct Content {
    Samples a, b, luma;
    bool operator==(const Content&) const = default;
};

/// Rows in memory that ends, or begins, where nothing may be touched.
struct InPlanes {
    static constexpr int columns = 0;
    std::array<Memory, 2> memory;

    InPlanes(int samples, Placement placement)
        : memory{Memory(placement, static_cast<std::size_t>(samples), 0),
                 Memory(placement, static_cast<std::size_t>(samples), 0)}
    {
    }
    template <class Byte> PlanesRow<Byte> row() const { return {memory[0].bytes().data(), memory[1].bytes().data()}; }

    void set(const Content& x) const
    {
        std::ranges::copy(x.a, memory[0].bytes().begin());
        std::ranges::copy(x.b, memory[1].bytes().begin());
    }
    Content get() const
    {
        const auto samples = [](const Memory& m) { return Samples(m.bytes().begin(), m.bytes().end()); };
        return {samples(memory[0]), samples(memory[1]), {}};
    }
};

struct InPairs {
    static constexpr int columns = 0;
    Memory memory;

    InPairs(int samples, Placement placement) : memory(placement, 2 * static_cast<std::size_t>(samples), 0) {}
    template <class Byte> PairsRow<Byte> row() const { return {memory.bytes().data()}; }

    void set(const Content& x) const
    {
        for (std::size_t i = 0; i < x.a.size(); ++i) {
            memory.bytes()[2 * i] = x.a[i];
            memory.bytes()[2 * i + 1] = x.b[i];
        }
    }
    Content get() const
    {
        Content x;
        for (std::size_t i = 0; i < memory.bytes().size(); i += 2) {
            x.a.push_back(memory.bytes()[i]);
            x.b.push_back(memory.bytes()[i + 1]);
        }
        return x;
    }
};

/// Beside luma.
template <int Columns, class Chroma> struct WithLumaBeside {
    static constexpr int columns = Columns;
    Memory luma;
    Chroma chroma;

    WithLumaBeside(int samples, Placement placement)
        : luma(placement, Columns * static_cast<std::size_t>(samples), 0), chroma(samples, placement)
    {
    }
    template <class Byte> auto row() const
    {
        return BesideLumaRow<Columns, Byte, decltype(chroma.template row<Byte>())>{luma.bytes().data(),
                                                                                   chroma.template row<Byte>()};
    }
    void set(const Content& x) const
    {
        std::ranges::copy(x.luma, luma.bytes().begin());
        chroma.set(x);
    }
    Content get() const
    {
        Content x = chroma.get();
        x.luma.assign(luma.bytes().begin(), luma.bytes().end());
        return x;
    }
};

/// Y0 a0 Y1 b0, or a0 Y0 b0 Y1.
template <First first> struct InPackedRow {
    static constexpr int columns = 2;
    Memory memory;

    InPackedRow(int samples, Placement placement) : memory(placement, 4 * static_cast<std::size_t>(samples), 0) {}
    template <class Byte> PackedRow<first, Byte> row() const { return {memory.bytes().data()}; }

    void set(const Content& x) const
    {
        for (std::size_t i = 0; i < x.a.size(); ++i) {
            u8* const p = &memory.bytes()[4 * i];
            p[lumaAt] = x.luma[2 * i];
            p[1 - lumaAt] = x.a[i];
            p[2 + lumaAt] = x.luma[2 * i + 1];
            p[3 - lumaAt] = x.b[i];
        }
    }
    Content get() const
    {
        Content x;
        for (std::size_t i = 0; i < memory.bytes().size(); i += 4) {
            const u8* const p = &memory.bytes()[i];
            x.a.push_back(p[1 - lumaAt]);
            x.b.push_back(p[3 - lumaAt]);
            x.luma.insert(x.luma.end(), {p[lumaAt], p[2 + lumaAt]});
        }
        return x;
    }

private:
    static constexpr int lumaAt = first == First::luma ? 0 : 1;
};

Content contentOf(int samples, int columns, int start)
{
    return {component(start, samples), component(start + 100, samples), component(start + 50, columns * samples)};
}

Content blank(int samples, int columns)
{
    return {Samples(samples, untouched), Samples(samples, untouched), Samples(columns * samples, untouched)};
}

/// What `sampleAt` of a row, or of two, is for each sample of `count`.
template <class SampleAt> Content made(int count, const Samples& luma, const SampleAt& sampleAt)
{
    Content x{Samples(count), Samples(count), luma};
    for (int i = 0; i < count; ++i) {
        x.a[i] = sampleAt(&Content::a, i);
        x.b[i] = sampleAt(&Content::b, i);
    }
    return x;
}

/// Takes a row through `Block`, of `samples` samples where they are fewer. Luma is the same at both ends, or is not
/// there.
template <class Block, class From, class To, class SampleAt> void expectRow(const SampleAt& sampleOf)
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int samples = 1; samples <= mostSamples; ++samples) {
            const int fromCount = samples * Block::sourceSamples, toCount = samples * Block::targetSamples;
            const From from(fromCount, placement);
            const To to(toCount, placement);
            const Content source = contentOf(fromCount, From::columns, 3);
            from.set(source);
            to.set(blank(toCount, To::columns));
            takeRow<Block>(samples, from.template row<const u8>(), to.template row<u8>());
            const Content expected = made(toCount, To::columns ? source.luma : Samples(),
                                          [&](auto member, int i) { return (source.*member)[sampleOf(i)]; });
            ASSERT_EQ(to.get(), expected) << samples << " samples";
        }
    }
}

using PackedLumaFirst = InPackedRow<First::luma>;
using PackedChromaFirst = InPackedRow<First::chroma>;

} // namespace

TEST(MovedChroma, AsItIs)
{
    const auto same = [](int i) { return i; };
    expectRow<AsItIs, InPlanes, InPlanes>(same);
    expectRow<AsItIs, InPlanes, InPairs>(same);
    expectRow<AsItIs, InPairs, InPlanes>(same);
    expectRow<AsItIs, WithLumaBeside<2, InPlanes>, PackedLumaFirst>(same);
    expectRow<AsItIs, WithLumaBeside<2, InPairs>, PackedLumaFirst>(same);
    expectRow<AsItIs, WithLumaBeside<2, InPlanes>, PackedChromaFirst>(same);
    expectRow<AsItIs, PackedLumaFirst, WithLumaBeside<2, InPlanes>>(same);
    expectRow<AsItIs, PackedLumaFirst, WithLumaBeside<2, InPairs>>(same);
    expectRow<AsItIs, PackedChromaFirst, WithLumaBeside<2, InPlanes>>(same);
    expectRow<AsItIs, PackedChromaFirst, WithLumaBeside<2, InPairs>>(same);
}

TEST(MovedChroma, EachTwice)
{
    const auto half = [](int i) { return i / 2; };
    expectRow<EachTwice, InPlanes, InPlanes>(half);
    expectRow<EachTwice, InPairs, InPlanes>(half);
    expectRow<EachTwice, WithLumaBeside<4, InPlanes>, PackedLumaFirst>(half);
    expectRow<EachTwice, WithLumaBeside<4, InPairs>, PackedLumaFirst>(half);
}

TEST(MovedChroma, EveryOther)
{
    const auto twice = [](int i) { return 2 * i; };
    expectRow<EveryOther, InPlanes, InPlanes>(twice);
    expectRow<EveryOther, InPlanes, InPairs>(twice);
    expectRow<EveryOther, PackedLumaFirst, WithLumaBeside<4, InPlanes>>(twice);
    expectRow<EveryOther, PackedLumaFirst, WithLumaBeside<4, InPairs>>(twice);
    expectRow<EveryOther, PackedChromaFirst, WithLumaBeside<4, InPlanes>>(twice);
}

namespace
{

template <class From, class To> void expectFold()
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int samples = 1; samples <= mostSamples; ++samples) {
            const std::array<From, 2> from = {From(samples, placement), From(samples, placement)};
            const To to(2 * samples, placement);
            const std::array<Content, 2> rows = {contentOf(samples, 0, 3), contentOf(samples, 0, 31)};
            for (int y = 0; y < 2; ++y) from[y].set(rows[y]);
            takeRow<TwoRowsByTurns>(samples,
                                    TwoRows{from[0].template row<const u8>(), from[1].template row<const u8>()},
                                    to.template row<u8>());
            const Content expected =
                made(2 * samples, {}, [&](auto member, int i) { return (rows[i % 2].*member)[i / 2]; });
            ASSERT_EQ(to.get(), expected) << samples << " samples";
        }
    }
}

template <class From, class To> void expectUnfold()
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int samples = 1; samples <= mostSamples; ++samples) {
            const From from(2 * samples, placement);
            const std::array<To, 2> to = {To(samples, placement), To(samples, placement)};
            const Content row = contentOf(2 * samples, 0, 3);
            from.set(row);
            takeRow<ByTurnsToTwoRows>(samples, from.template row<const u8>(),
                                      TwoRows{to[0].template row<u8>(), to[1].template row<u8>()});
            for (int y = 0; y < 2; ++y) {
                const Content expected =
                    made(samples, {}, [&](auto member, int i) { return (row.*member)[2 * i + y]; });
                ASSERT_EQ(to[y].get(), expected) << samples << " samples, row " << y;
            }
        }
    }
}

} // namespace

TEST(MovedChroma, TwoRowsByTurns)
{
    expectFold<InPairs, InPlanes>();
    expectFold<InPlanes, InPairs>();
    expectFold<InPlanes, InPlanes>();
}

TEST(MovedChroma, ByTurnsToTwoRows)
{
    expectUnfold<InPairs, InPlanes>();
    expectUnfold<InPlanes, InPairs>();
}

// Only luma of a packed row is taken to a row of luma.
TEST(MovedChroma, LumaAlone)
{
    for (int samples = 1; samples <= mostSamples; ++samples) {
        const PackedLumaFirst from(samples, Placement::endAtGuard);
        const Memory luma(Placement::endAtGuard, 2 * static_cast<std::size_t>(samples), 0);
        const Content source = contentOf(samples, 2, 3);
        from.set(source);
        takeRow<AsItIs>(samples, from.row<const u8>(), LumaRow<u8>{luma.bytes().data()});
        ASSERT_EQ(Samples(luma.bytes().begin(), luma.bytes().end()), source.luma) << samples << " samples";
    }
}

TEST(MovedChroma, FoursRearranged)
{
    std::array<u8, 32> bytes, result;
    std::iota(bytes.begin(), bytes.end(), u8{0});
    constexpr int places[] = {0, 3, 2, 1};
    storeSamples(result.data(), foursRearranged<0, 3, 2, 1>(loadSamples(bytes.data())));
    for (int i = 0; i < 32; ++i) EXPECT_EQ(result[i], i / 4 * 4 + places[i % 4]) << "byte " << i;
    storeSamples(result.data(), foursRearranged<1, 0, 3, 2>(loadSamples(bytes.data())));
    for (int i = 0; i < 32; ++i) EXPECT_EQ(result[i], i ^ 1) << "byte " << i;
}
