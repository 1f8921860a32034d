// Pixels of bytes that are loaded as floats and stored from integers, against the plain statement: the float is the
// sample, and the stored sample the nearest one to the integer.
#include "layouts/float_images.hpp"
#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace
{

namespace layouts = pyxcc::layouts;
namespace wide = pyxcc::wide;
using pyxcc::Three;
using support::Memory;
using support::Placement;

constexpr int firstColumn = 2, block = 8;
constexpr Placement placements[] = {Placement::endAtGuard, Placement::beginAtGuard, Placement::margins};

struct InC3 {
    static constexpr int samples = 3;
    template <class Access> static auto row(Access* first) { return layouts::c3ForFloats(first, 0).row(0); }
};
struct InAC4 {
    static constexpr int samples = 4;
    template <class Access> static auto row(Access* first) { return layouts::ac4ForFloats(first, 0).row(0); }
};

template <class T, class Register> std::array<T, block> valuesOf(Register x)
{
    std::array<T, block> values;
    layouts::storeSamples(reinterpret_cast<u8*>(values.data()), x);
    return values;
}

template <class Sample, class Layout> void expectLoads()
{
    support::Random random(1);
    for (const Placement placement : placements) {
        for (int count = 1; count <= block; ++count) {
            const Memory memory(placement, (firstColumn + count) * Layout::samples);
            random.fill(memory.bytes());
            const auto* first = reinterpret_cast<const Sample*>(memory.bytes().data());
            const auto row = Layout::row(first);
            const Three<wide::F32> pixels = count == block ? row.load(firstColumn) : row.load(firstColumn, count);
            const std::array channels{valuesOf<f32>(pixels.a), valuesOf<f32>(pixels.b), valuesOf<f32>(pixels.c)};
            for (int c = 0; c < 3; ++c) {
                for (int i = 0; i < block; ++i) {
                    const f32 told = i < count ? first[(firstColumn + i) * Layout::samples + c] : 0;
                    EXPECT_EQ(channels[c][i], told) << "channel " << c << " of pixel " << i << " of " << count;
                }
            }
        }
    }
}

template <class Sample, class Layout> void expectStores()
{
    using Limits = std::numeric_limits<Sample>;
    support::Random random(2);
    for (const Placement placement : placements) {
        for (int count = 1; count <= block; ++count) {
            const Memory memory(placement, (firstColumn + count) * Layout::samples);
            random.fill(memory.all());
            std::array<std::array<s32, block>, 3> channels;
            for (auto& channel : channels) {
                for (s32& x : channel) x = random.between(-400, 400);
                channel[random.between(0, block - 1)] = INT32_MIN;
                channel[random.between(0, block - 1)] = INT32_MAX;
            }
            std::vector<u8> told(memory.all().begin(), memory.all().end());
            const auto front = memory.bytes().data() - memory.all().data();
            for (int c = 0; c < 3; ++c) {
                for (int i = 0; i < count; ++i) {
                    const s32 x = std::clamp<s32>(channels[c][i], Limits::min(), Limits::max());
                    told[front + (firstColumn + i) * Layout::samples + c] = static_cast<u8>(x);
                }
            }

            const auto load = [&](int c) {
                return layouts::loadSamples<wide::S32>(reinterpret_cast<const u8*>(channels[c].data()));
            };
            const Three pixels{load(0), load(1), load(2)};
            const auto row = Layout::row(reinterpret_cast<Sample*>(memory.bytes().data()));
            if (count == block) {
                row.store(firstColumn, pixels);
            } else {
                row.store(firstColumn, count, pixels);
            }
            EXPECT_EQ(std::vector<u8>(memory.all().begin(), memory.all().end()), told) << count << " pixels";
        }
    }
}

template <class Sample> class FloatImages : public testing::Test
{
};

struct Names {
    template <class Sample> static std::string GetName(int i) { return std::array{"u8", "s8"}[i]; }
};
using Samples = testing::Types<u8, s8>;
TYPED_TEST_SUITE(FloatImages, Samples, Names);

TYPED_TEST(FloatImages, C3Loads) { expectLoads<TypeParam, InC3>(); }
TYPED_TEST(FloatImages, C3Stores) { expectStores<TypeParam, InC3>(); }
// Of 0 to 255 with 16 bits behind the point, which are cut off.
TEST(FloatImagesOfLevels, C3StoresWholesOfFineLevels)
{
    support::Random random(3);
    for (const Placement placement : placements) {
        for (int count = 1; count <= block; ++count) {
            const Memory memory(placement, (firstColumn + count) * InC3::samples);
            random.fill(memory.all());
            std::array<std::array<s32, block>, 3> channels;
            for (auto& channel : channels) {
                for (s32& x : channel) x = random.between(0, 255) * 65536 + random.between(0, 65535);
            }
            std::vector<u8> told(memory.all().begin(), memory.all().end());
            const auto front = memory.bytes().data() - memory.all().data();
            for (int c = 0; c < 3; ++c) {
                for (int i = 0; i < count; ++i)
                    told[front + (firstColumn + i) * 3 + c] = static_cast<u8>(channels[c][i] / 65536);
            }

            const auto load = [&](int c) {
                const auto* const channel = reinterpret_cast<const u8*>(channels[c].data());
                return pyxcc::fineLevel(layouts::loadSamples<wide::S32>(channel));
            };
            const auto row = InC3::row(memory.bytes().data());
            if (count == block) {
                row.store(firstColumn, Three{load(0), load(1), load(2)});
            } else {
                row.store(firstColumn, count, Three{load(0), load(1), load(2)});
            }
            EXPECT_EQ(std::vector<u8>(memory.all().begin(), memory.all().end()), told) << count << " pixels";
        }
    }
}

TYPED_TEST(FloatImages, AC4Loads) { expectLoads<TypeParam, InAC4>(); }
TYPED_TEST(FloatImages, AC4StoresKeepTheFourth) { expectStores<TypeParam, InAC4>(); }

} // namespace
