// Blocks of pixels against the plain statement of each layout: sample c of pixel x of a row lies at
// (x * samples a pixel + c) * bytes a sample, in the plane of its own or in the one plane.
#include "layouts/images.hpp"
#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <set>
#include <string>
#include <vector>

namespace
{

namespace layouts = pyxcc::layouts;
using pyxcc::Four;
using pyxcc::Three;
using support::Memory;
using support::Placement;

constexpr int firstColumn = 3;

struct InC3 {
    static constexpr int planes = 1, samples = 3, takingPart = 3;
    template <class Sample> static auto image(Sample* const* first) { return layouts::c3(first[0], 0); }
};
struct InAC4 {
    static constexpr int planes = 1, samples = 4, takingPart = 3;
    template <class Sample> static auto image(Sample* const* first) { return layouts::ac4(first[0], 0); }
};
struct InC4 {
    static constexpr int planes = 1, samples = 4, takingPart = 4;
    template <class Sample> static auto image(Sample* const* first) { return layouts::c4(first[0], 0); }
};
struct InAC4OfAnyOrder : InAC4 {
    template <class Sample> static auto image(Sample* const* first)
    {
        return layouts::ac4<layouts::Order::any>(first[0], 0);
    }
};
struct InC4OfAnyOrder : InC4 {
    template <class Sample> static auto image(Sample* const* first)
    {
        return layouts::c4<layouts::Order::any>(first[0], 0);
    }
};
struct InP3 {
    static constexpr int planes = 3, samples = 1, takingPart = 3;
    template <class Sample> static auto image(Sample* const* first) { return layouts::p3(first, 0); }
};
struct InP4 {
    static constexpr int planes = 4, samples = 1, takingPart = 4;
    template <class Sample> static auto image(Sample* const* first) { return layouts::p4(first, 0); }
};

/// Where and how far from a multiple of 64 a row lies: at guard pages, and off every alignment within margins.
struct Place {
    Placement placement;
    std::size_t alignment;
};
constexpr Place places[] = {{Placement::endAtGuard, 0}, {Placement::beginAtGuard, 0}, {Placement::margins, 1}};

/// The planes of one row, each in memory of its own, which end with the row.
template <class Sample, class Layout> struct Row {
    std::vector<Memory> planes;

    Row(const Place& place, int width, support::Random& random)
    {
        for (int i = 0; i < Layout::planes; ++i) {
            planes.emplace_back(place.placement, sizeof(Sample) * Layout::samples * width, place.alignment);
            random.fill(planes.back().all());
        }
    }

    template <class Access> auto row() const
    {
        std::array<Access*, Layout::planes> first;
        for (int i = 0; i < Layout::planes; ++i) first[i] = reinterpret_cast<Access*>(planes[i].bytes().data());
        return Layout::image(first.data()).row(0);
    }

    /// The bytes of the sample of a channel.
    u8* sample(int x, int channel) const
    {
        const int plane = Layout::planes == 1 ? 0 : channel;
        const int place = Layout::planes == 1 ? x * Layout::samples + channel : x;
        return planes[plane].bytes().data() + place * sizeof(Sample);
    }

    std::vector<std::vector<u8>> snapshot() const
    {
        std::vector<std::vector<u8>> bytes;
        for (const Memory& plane : planes) bytes.emplace_back(plane.all().begin(), plane.all().end());
        return bytes;
    }
};

template <class Samples> auto registersOf(const Three<Samples>& x) { return std::array{x.a, x.b, x.c}; }
template <class Samples> auto registersOf(const Four<Samples>& x) { return std::array{x.a, x.b, x.c, x.d}; }

template <class Sample, class Layout> struct BlocksOf {
    static constexpr int block = 32 / sizeof(Sample);
    using Samples = pyxcc::wide::RegisterOf<Sample>;
    using Bytes = std::array<u8, 32>; // of a channel

    static std::vector<Bytes> bytesOf(const auto& pixels)
    {
        std::vector<Bytes> channels;
        for (const Samples& x : registersOf(pixels)) layouts::storeSamples(channels.emplace_back().data(), x);
        return channels;
    }

    static auto random(support::Random& random)
    {
        std::array<Samples, 4> x;
        for (Samples& samples : x) {
            Bytes bytes;
            random.fill(bytes);
            samples = layouts::loadSamples<Samples>(bytes.data());
        }
        if constexpr (Layout::takingPart == 4) {
            return Four{x[0], x[1], x[2], x[3]};
        } else {
            return Three{x[0], x[1], x[2]};
        }
    }

    static void expectLoads()
    {
        support::Random numbers(1);
        for (const Place& place : places) {
            for (int count = 1; count <= block; ++count) {
                const Row<Sample, Layout> memory(place, firstColumn + count, numbers);
                const auto row = memory.template row<const Sample>();
                const auto channels = bytesOf(count == block ? row.load(firstColumn) : row.load(firstColumn, count));
                ASSERT_EQ(channels.size(), std::size_t{Layout::takingPart});
                for (int c = 0; c < Layout::takingPart; ++c) {
                    Bytes told = {};
                    for (int i = 0; i < count; ++i) {
                        std::memcpy(&told[i * sizeof(Sample)], memory.sample(firstColumn + i, c), sizeof(Sample));
                    }
                    ASSERT_EQ(channels[c], told)
                        << "channel " << c << " of " << count << " pixels, " << nameOf(place.placement);
                }
            }
        }
    }

    static void expectStores()
    {
        support::Random numbers(2);
        for (const Place& place : places) {
            for (int count = 1; count <= block; ++count) {
                const Row<Sample, Layout> memory(place, firstColumn + count, numbers);
                const auto pixels = random(numbers);
                const auto before = memory.snapshot();
                const auto row = memory.template row<Sample>();
                if (count == block) {
                    row.store(firstColumn, pixels);
                } else {
                    row.store(firstColumn, count, pixels);
                }
                const auto after = memory.snapshot();

                // What is told is made in the same memory, from its state before.
                for (int i = 0; i < Layout::planes; ++i) std::ranges::copy(before[i], memory.planes[i].all().begin());
                const auto channels = bytesOf(pixels);
                for (int c = 0; c < Layout::takingPart; ++c) {
                    for (int i = 0; i < count; ++i) {
                        std::memcpy(memory.sample(firstColumn + i, c), &channels[c][i * sizeof(Sample)],
                                    sizeof(Sample));
                    }
                }
                ASSERT_EQ(after, memory.snapshot()) << count << " pixels, " << nameOf(place.placement);
            }
        }
    }
};

/// Pixels that come in any order keep their samples together, and are stored where they were loaded from.
template <class Sample, class Layout> void expectPixelsKeptTogether()
{
    using Blocks = BlocksOf<Sample, Layout>;
    support::Random numbers(4);
    for (const Place& place : places) {
        const Row<Sample, Layout> source(place, Blocks::block, numbers), target(place, Blocks::block, numbers);
        const auto pixels = source.template row<const Sample>().load(0);
        const auto channels = Blocks::bytesOf(pixels);
        std::multiset<std::string> told, loaded;
        for (int i = 0; i < Blocks::block; ++i) {
            std::string sourcePixel, pixel;
            for (int c = 0; c < Layout::takingPart; ++c) {
                sourcePixel.append(reinterpret_cast<const char*>(source.sample(i, c)), sizeof(Sample));
                pixel.append(reinterpret_cast<const char*>(&channels[c][i * sizeof(Sample)]), sizeof(Sample));
            }
            told.insert(sourcePixel);
            loaded.insert(pixel);
        }
        EXPECT_EQ(loaded, told) << nameOf(place.placement);

        target.template row<Sample>().store(0, pixels);
        for (int i = 0; i < Blocks::block; ++i) {
            for (int c = 0; c < Layout::takingPart; ++c) {
                EXPECT_EQ(std::memcmp(target.sample(i, c), source.sample(i, c), sizeof(Sample)), 0)
                    << "channel " << c << " of pixel " << i << ", " << nameOf(place.placement);
            }
        }
    }
}

template <class Sample> class Rows : public testing::Test
{
};

struct Names {
    template <class Sample> static std::string GetName(int i)
    {
        return std::array{"u8", "s8", "u16", "s16", "s32", "f32"}[i];
    }
};

using Samples = testing::Types<u8, s8, u16, s16, s32, f32>;
TYPED_TEST_SUITE(Rows, Samples, Names);

TYPED_TEST(Rows, C3Loads) { BlocksOf<TypeParam, InC3>::expectLoads(); }
TYPED_TEST(Rows, C3Stores) { BlocksOf<TypeParam, InC3>::expectStores(); }
TYPED_TEST(Rows, AC4Loads) { BlocksOf<TypeParam, InAC4>::expectLoads(); }
TYPED_TEST(Rows, AC4StoresKeepTheFourth) { BlocksOf<TypeParam, InAC4>::expectStores(); }
TYPED_TEST(Rows, C4Loads) { BlocksOf<TypeParam, InC4>::expectLoads(); }
TYPED_TEST(Rows, C4Stores) { BlocksOf<TypeParam, InC4>::expectStores(); }
TYPED_TEST(Rows, AC4OfAnyOrder) { expectPixelsKeptTogether<TypeParam, InAC4OfAnyOrder>(); }
TYPED_TEST(Rows, C4OfAnyOrder) { expectPixelsKeptTogether<TypeParam, InC4OfAnyOrder>(); }
TYPED_TEST(Rows, P3Loads) { BlocksOf<TypeParam, InP3>::expectLoads(); }
TYPED_TEST(Rows, P3Stores) { BlocksOf<TypeParam, InP3>::expectStores(); }
TYPED_TEST(Rows, P4Loads) { BlocksOf<TypeParam, InP4>::expectLoads(); }
TYPED_TEST(Rows, P4Stores) { BlocksOf<TypeParam, InP4>::expectStores(); }

/// The fourth channel set is the fourth channel stored.
TYPED_TEST(Rows, C4StoresSetTheFourth)
{
    using Blocks = BlocksOf<TypeParam, InC4>;
    support::Random random(3);
    const Four pixels = Blocks::random(random);
    constexpr TypeParam fourth = 77;
    for (int count = 1; count <= Blocks::block; ++count) {
        std::array<TypeParam, 4 *Blocks::block> set = {}, told = {};
        layouts::c4(set.data(), 0, fourth).row(0).store(0, count, Three{pixels.a, pixels.b, pixels.c});
        layouts::c4(told.data(), 0).row(0).store(0, count, Four{pixels.a, pixels.b, pixels.c, {fourth}});
        EXPECT_EQ(std::memcmp(set.data(), told.data(), sizeof set), 0) << count << " pixels";
        EXPECT_EQ(set[3], fourth);
    }
}

} // namespace
