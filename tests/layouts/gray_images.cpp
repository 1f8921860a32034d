// Images of one sample a pixel and what is made of them, against the plain statement of each layout; pixels of doubles.
#include "layouts/gray_images.hpp"
#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <vector>

namespace
{

namespace layouts = pyxcc::layouts;
using pyxcc::Three;
using support::Memory;
using support::Placement;

constexpr int firstColumn = 3;
constexpr Placement placements[] = {Placement::endAtGuard, Placement::beginAtGuard, Placement::margins};

template <class Sample> using RegisterOf = pyxcc::wide::RegisterOf<Sample>;
template <class Sample> inline constexpr int blockOf = RegisterOf<Sample>::count;
template <class Sample> using Block = std::array<Sample, blockOf<Sample>>;

template <class Sample> Block<Sample> samplesOf(RegisterOf<Sample> x)
{
    Block<Sample> samples;
    layouts::storeSamples(reinterpret_cast<u8*>(samples.data()), x);
    return samples;
}

template <class Sample> Block<Sample> numbered()
{
    Block<Sample> samples;
    for (int i = 0; i < blockOf<Sample>; ++i) samples[i] = static_cast<Sample>(i + 1);
    return samples;
}

template <class Sample> RegisterOf<Sample> registerOf(const Block<Sample>& samples)
{
    return layouts::loadSamples<RegisterOf<Sample>>(reinterpret_cast<const u8*>(samples.data()));
}

/// A row of random bytes that ends with `count` pixels behind the first column.
template <class Sample> Memory rowOf(Placement placement, int count, int pixelSamples, support::Random& random)
{
    Memory memory(placement, static_cast<std::size_t>(firstColumn + count) * pixelSamples * sizeof(Sample));
    random.fill(memory.all());
    return memory;
}

template <class Sample> Sample sampleAt(const Memory& memory, int index)
{
    Sample sample;
    std::memcpy(&sample, memory.bytes().data() + index * sizeof(Sample), sizeof sample);
    return sample;
}

template <class Row> auto loadPixels(const Row& row, int count)
{
    return count == Row::block ? row.load(firstColumn) : row.load(firstColumn, count);
}

/// Stores samples into pixels of `PixelSamples`, and expects what is told of each of a pixel's samples, and nothing
/// else, to have changed.
template <class Sample, int PixelSamples, class ImageAt, class Told>
void expectStores(const ImageAt& imageAt, RegisterOf<Sample> samples, const Told& told)
{
    support::Random random(2);
    for (const Placement placement : placements) {
        for (int count = 1; count <= blockOf<Sample>; ++count) {
            const Memory memory = rowOf<Sample>(placement, count, PixelSamples, random);
            std::vector<u8> expected(memory.all().begin(), memory.all().end());
            const auto front = memory.bytes().data() - memory.all().data();
            for (int i = 0; i < count * PixelSamples; ++i) {
                const Sample sample = told(i / PixelSamples, i % PixelSamples);
                const auto at = front + (firstColumn * PixelSamples + i) * static_cast<int>(sizeof sample);
                std::memcpy(expected.data() + at, &sample, sizeof sample);
            }
            const auto row = imageAt(reinterpret_cast<Sample*>(memory.bytes().data())).row(0);
            if (count == row.block) {
                row.store(firstColumn, samples);
            } else {
                row.store(firstColumn, count, samples);
            }
            ASSERT_EQ(std::vector<u8>(memory.all().begin(), memory.all().end()), expected)
                << count << " pixels, " << nameOf(placement);
        }
    }
}

template <class Sample> class GrayImages : public testing::Test
{
};
struct Names {
    template <class Sample> static std::string GetName(int i)
    {
        return std::array{"u8", "u16", "s16", "f32", "f64"}[i];
    }
};
using Samples = testing::Types<u8, u16, s16, f32, f64>;
TYPED_TEST_SUITE(GrayImages, Samples, Names);

template <class Sample> class RepeatedGray : public testing::Test
{
};
using SmallSamples = testing::Types<u8, u16, s16, f32>;
TYPED_TEST_SUITE(RepeatedGray, SmallSamples, Names);

TYPED_TEST(GrayImages, C1Loads)
{
    support::Random random(1);
    for (const Placement placement : placements) {
        for (int count = 1; count <= blockOf<TypeParam>; ++count) {
            const Memory samples = rowOf<TypeParam>(placement, count, 1, random);
            const auto row = layouts::c1(reinterpret_cast<const TypeParam*>(samples.bytes().data()), 0).row(0);
            const auto loaded = samplesOf<TypeParam>(loadPixels(row, count));
            for (int i = 0; i < blockOf<TypeParam>; ++i) {
                const TypeParam told = i < count ? sampleAt<TypeParam>(samples, firstColumn + i) : TypeParam{};
                ASSERT_EQ(std::memcmp(&loaded[i], &told, sizeof told), 0) << i << " of " << count;
            }
        }
    }
}

TYPED_TEST(GrayImages, C1Stores)
{
    const auto samples = numbered<TypeParam>();
    expectStores<TypeParam, 1>([](TypeParam* first) { return layouts::c1(first, 0); }, registerOf<TypeParam>(samples),
                               [&](int pixel, int) { return samples[pixel]; });
}

/// What comes in the order that pixels of four samples are loaded in is stored in that of memory.
TYPED_TEST(GrayImages, C1StoresAnyOrder)
{
    using layouts::Order;
    std::array<TypeParam, 4 * blockOf<TypeParam>> pixels;
    for (std::size_t i = 0; i < pixels.size(); ++i) pixels[i] = static_cast<TypeParam>(i / 4 + i % 4 * 60);
    const auto loaded =
        layouts::loadQuadruples<RegisterOf<TypeParam>, Order::any>(reinterpret_cast<const u8*>(pixels.data()));
    const auto any = [](TypeParam* first) { return layouts::c1<Order::any>(first, 0); };
    expectStores<TypeParam, 1>(any, loaded.a, [&](int pixel, int) { return pixels[4 * pixel]; });
    expectStores<TypeParam, 1>(any, loaded.b, [&](int pixel, int) { return pixels[4 * pixel + 1]; });
    expectStores<TypeParam, 1>(any, loaded.c, [&](int pixel, int) { return pixels[4 * pixel + 2]; });
}

TYPED_TEST(RepeatedGray, C3Stores)
{
    const auto samples = numbered<TypeParam>();
    expectStores<TypeParam, 3>([](TypeParam* first) { return layouts::c3Gray(first, 0); },
                               registerOf<TypeParam>(samples), [&](int pixel, int) { return samples[pixel]; });
}

TYPED_TEST(RepeatedGray, C4StoresSetTheFourth)
{
    const auto samples = numbered<TypeParam>();
    constexpr TypeParam fourth = 77;
    expectStores<TypeParam, 4>([](TypeParam* first) { return layouts::c4Gray(first, 0, fourth); },
                               registerOf<TypeParam>(samples),
                               [&](int pixel, int channel) { return channel == 3 ? fourth : samples[pixel]; });
}

/// The even bytes, up to the last pixel's, whose odd byte is the last of the row.
TEST(PackedLuma, Loads)
{
    support::Random random(4);
    for (const Placement placement : placements) {
        for (int count = 1; count <= 32; ++count) {
            const Memory memory = rowOf<u8>(placement, count, 2, random);
            const auto row = layouts::lumaOfC2(memory.bytes().data(), 0).row(0);
            const auto loaded = samplesOf<u8>(loadPixels(row, count));
            for (int i = 0; i < 32; ++i) {
                const u8 told = i < count ? memory.bytes()[2 * (firstColumn + i)] : u8{};
                ASSERT_EQ(loaded[i], told) << i << " of " << count;
            }
        }
    }
}

template <int PixelSamples, class ImageAt> void expectDoublesLoad(const ImageAt& imageAt)
{
    support::Random random(5);
    for (const Placement placement : placements) {
        for (int count = 1; count <= 4; ++count) {
            const Memory memory = rowOf<f64>(placement, count, PixelSamples, random);
            const auto row = imageAt(reinterpret_cast<const f64*>(memory.bytes().data())).row(0);
            const Three<pyxcc::wide::F64> pixels = loadPixels(row, count);
            const std::array channels{samplesOf<f64>(pixels.a), samplesOf<f64>(pixels.b), samplesOf<f64>(pixels.c)};
            for (int i = 0; i < 4; ++i) {
                for (int c = 0; c < 3; ++c) {
                    const f64 told = i < count ? sampleAt<f64>(memory, (firstColumn + i) * PixelSamples + c) : 0;
                    ASSERT_EQ(std::memcmp(&channels[c][i], &told, sizeof told), 0)
                        << "channel " << c << " of pixel " << i << " of " << count;
                }
            }
        }
    }
}

TEST(Doubles, C3Loads)
{
    expectDoublesLoad<3>([](const f64* first) { return layouts::c3(first, 0); });
}

TEST(Doubles, AC4Loads)
{
    expectDoublesLoad<4>([](const f64* first) { return layouts::ac4(first, 0); });
}

/// The words of a channel, and 256 times as large, are its bytes once they are narrowed and brought to the order of
/// memory.
template <int PixelBytes, class ImageAt> void expectWordsLoad(const ImageAt& imageAt)
{
    namespace wide = pyxcc::wide;
    support::Random random(6);
    for (const Placement placement : placements) {
        for (int count = 1; count <= 32; ++count) {
            const Memory memory = rowOf<u8>(placement, count, PixelBytes, random);
            const auto pixels = loadPixels(imageAt(memory.bytes().data()).row(0), count);
            const auto expectChannel = [&](int channel, const wide::Sample& low, const wide::Sample& high) {
                const auto bytes = [](wide::S16 x, wide::S16 y) {
                    return samplesOf<u8>(
                        layouts::inMemoryOrder<layouts::Order::any>(wide::narrow(wide::Byte(x.v), wide::Byte(y.v))));
                };
                const auto words = bytes(low, high);
                const auto upper = bytes(asS16(low.in256ths >> 8), asS16(high.in256ths >> 8));
                for (int i = 0; i < 32; ++i) {
                    const u8 told = i < count ? memory.bytes()[(firstColumn + i) * PixelBytes + channel] : u8{};
                    ASSERT_EQ(words[i], told) << "channel " << channel << " of pixel " << i << " of " << count;
                    ASSERT_EQ(upper[i], told) << "channel " << channel << " of pixel " << i << " of " << count;
                }
            };
            expectChannel(0, pixels.a.a, pixels.b.a);
            expectChannel(1, pixels.a.b, pixels.b.b);
            expectChannel(2, pixels.a.c, pixels.b.c);
        }
    }
}

TEST(BytesAsWords, C3Loads)
{
    expectWordsLoad<3>([](const u8* first) { return layouts::c3AsWords(first, 0); });
}

TEST(BytesAsWords, AC4Loads)
{
    expectWordsLoad<4>([](const u8* first) { return layouts::ac4AsWords(first, 0); });
}

} // namespace
