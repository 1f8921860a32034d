// Fewer levels: vector instances of the forms against scalar ones, and several rows of a diffusion at once against one
// row after the other.
#include "rounding_modes.hpp"

#include "pyxcc/reduce_bits.h"
#include "reference/reduce_bits.hpp"
#include "tone/diffusion.hpp"
#include "tone/reduce_bits.hpp"

#include <gtest/gtest.h>

#include <numeric>
#include <random>
#include <type_traits>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::tone;

template <class TypeOfDepth> class ReduceBitsForm : public testing::Test
{
};

using Depths = testing::Types<Depth<u8, u8>, Depth<u16, u16>, Depth<s16, s16>, Depth<u16, u8>, Depth<s16, u8>,
                              Depth<f32, u8>, Depth<f32, u16>, Depth<f32, s16>>;
TYPED_TEST_SUITE(ReduceBitsForm, Depths);

/// All samples of a source; of floats some within the range and some beyond, and what is no number.
template <class Sample> std::vector<Sample> everySample()
{
    std::vector<Sample> samples(sizeof(Sample) == 1 ? 256 : 65536);
    if constexpr (std::is_same_v<Sample, f32>) {
        std::mt19937 random(1);
        std::uniform_real_distribution<f32> number(-0.25f, 1.25f);
        for (f32& sample : samples) sample = number(random);
        const f32 special[] = {0, -0.0f, 1, 1e-7f, 1.2e-7f, 1e30f, -1e30f, INFINITY, -INFINITY, NAN, 40000, -40000};
        std::copy(std::begin(special), std::end(special), samples.begin());
    } else {
        std::iota(samples.begin(), samples.end(), std::numeric_limits<Sample>::min());
    }
    return samples;
}

template <class Target> Target storedOf(scalar::S32 x) { return scalar::saturate<Target>(x); }

/// Signed words are held to the range of unsigned ones first.
template <class Target> Target storedFromUnsigned(scalar::S32 x)
{
    if constexpr (std::is_same_v<Target, s16>) {
        return static_cast<s16>(int{scalar::saturate<u16>(x)} - 32768);
    } else {
        return scalar::saturate<Target>(x);
    }
}

/// Not inline, so that all of it happens under the mode in force.
template <class Depth, class Form>
[[gnu::noinline]] void throughRegisters(const Form& form, const typename Depth::Source* in, const f32* thresholds,
                                        typename Depth::Target* out)
{
    using Source = typename Depth::Source;
    const auto samples = layouts::loadAsFloats<Source>(layouts::bytes(in));
    const auto store = [&](const auto& registers) {
        layouts::FromFloats<Source, typename Depth::Target, false>::store(layouts::bytes(out), registers);
    };
    if constexpr (requires { apply(form, samples); }) {
        store(apply(form, samples));
    } else {
        store(apply(form, Two{samples, layouts::loadFloatsInOrderOf<Source>(thresholds)}));
    }
}

template <class Depth, class Form>
[[gnu::noinline]] void oneByOne(const Form& form, const typename Depth::Source* in, const f32* thresholds,
                                typename Depth::Target* out)
{
    using Target = typename Depth::Target;
    for (int i = 0; i < 32; ++i) {
        const scalar::F32 p = workingValue(in[i]);
        if constexpr (requires { form(p); }) {
            out[i] = storedOf<Target>(form(p));
        } else {
            out[i] = storedFromUnsigned<Target>(form(p, scalar::F32(thresholds[i])));
        }
    }
}

template <class Depth, class Form> void expectInstancesAgree(const Form& form, f32 step)
{
    const auto samples = everySample<typename Depth::Source>();
    f32 thresholds[32];
    for (int i = 0; i < 32; ++i) thresholds[i] = step * static_cast<f32>(i - 2) / 29;
    for (const int mode : forms::roundingModes) {
        for (std::size_t first = 0; first < samples.size(); first += 32) {
            typename Depth::Target wide[32], one[32];
            forms::roundingBy(mode, [&] {
                throughRegisters<Depth>(form, &samples[first], thresholds, wide);
                oneByOne<Depth>(form, &samples[first], thresholds, one);
            });
            for (std::size_t i = 0; i < 32; ++i)
                ASSERT_EQ(wide[i], one[i]) << "sample " << +samples[first + i] << ", mode " << mode;
        }
    }
}

TYPED_TEST(ReduceBitsForm, InstancesAgreeOnEverySample)
{
    for (const s32 count : {2, 3, 7, 100, 255, 256, 65535, 65536}) {
        if (count > TypeParam::maxLevels) continue;
        SCOPED_TRACE(count);
        const Levels levels = levelsOf<typename TypeParam::Source>(count);
        expectInstancesAgree<TypeParam>(NearestWide<TypeParam>(count), levels.step);
        expectInstancesAgree<TypeParam>(NearestTail<TypeParam>(count), levels.step);
        expectInstancesAgree<TypeParam>(OrderedWide<TypeParam>{levels}, levels.step);
        expectInstancesAgree<TypeParam>(OrderedTail<TypeParam>{levels}, levels.step);
    }
}

/// Forms of few levels give what the others give, in registers as these do.
template <class Depth> void expectFewAreAsMany(s32 count)
{
    if constexpr (std::is_integral_v<typename Depth::Source> && sizeof(typename Depth::Target) == 1) {
        using Source = typename Depth::Source;
        const auto samples = everySample<Source>();
        for (const int mode : forms::roundingModes) {
            for (std::size_t first = 0; first < samples.size(); first += 32) {
                u8 few[32], many[32];
                const auto expectEqual = [&](const char* form, f32 threshold) {
                    for (std::size_t i = 0; i < 32; ++i)
                        ASSERT_EQ(few[i], many[i]) << form << ", sample " << +samples[first + i] << ", mode " << mode
                                                   << ", threshold " << threshold << " of " << count << " levels";
                };
                forms::roundingBy(mode, [&] {
                    throughRegisters<Depth>(NearestOfFew<Depth>(count), &samples[first], nullptr, few);
                    oneByOne<Depth>(NearestWide<Depth>(count), &samples[first], nullptr, many);
                });
                ASSERT_NO_FATAL_FAILURE(expectEqual("nearest", 0));
                const Levels levels = levelsOf<Source>(count);
                for (int k = count == 16 ? 0 : -15; k <= 30; ++k) { // of one more level than 15, without noise alone
                    f32 thresholds[32];
                    std::fill_n(thresholds, 32, levels.step * (static_cast<f32>(k) / 15.0f));
                    forms::roundingBy(mode, [&] {
                        const Levels ofMode = levelsOf<Source>(count);
                        throughRegisters<Depth>(OrderedOfFew<Depth>(ofMode), &samples[first], thresholds, few);
                        oneByOne<Depth>(OrderedWide<Depth>{ofMode}, &samples[first], thresholds, many);
                    });
                    ASSERT_NO_FATAL_FAILURE(expectEqual("ordered", thresholds[0]));
                }
            }
        }
    }
}

TYPED_TEST(ReduceBitsForm, FewLevelsAreAsMany)
{
    for (const s32 count : {2, 3, 4, 7, 8, 15, 16}) ASSERT_NO_FATAL_FAILURE(expectFewAreAsMany<TypeParam>(count));
}

using Bytes = Depth<u8, u8>;

/// A line that is found tells a function of bytes exactly, in registers as well.
template <class Steps> void expectTold(const Steps& steps, u16 offset, const ByteFunction& function)
{
    std::array<u16, 32> offsets;
    offsets.fill(offset);
    for (int x = 0; x < 256; ++x) ASSERT_EQ(lookUp(steps, static_cast<u8>(x), offset), function[x]) << x;
    ByteFunction bytes, results;
    std::iota(bytes.begin(), bytes.end(), u8{0});
    for (int x = 0; x < 256; x += 32) {
        const auto samples = layouts::loadSamples<wide::U8>(&bytes[x]);
        layouts::storeSamples(&results[x], lookUp(steps, samples, layouts::loadWordsInOrderOfBytes(offsets.data())));
    }
    ASSERT_EQ(results, function);
}

/// Without a line for each the faster way would not be taken, which no result would tell.
TEST(ByteSteps, TellFewLevelsOfBytes)
{
    for (const s32 count : {2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16}) {
        SCOPED_TRACE(count);
        ByteSteps nearest(count - 1);
        ByteFunction function;
        for (int x = 0; x < 256; ++x)
            function[x] = storedOf<u8>(NearestWide<Bytes>(count)(scalar::F32(static_cast<f32>(x))));
        const auto offset = nearest.offsetOf(function);
        ASSERT_TRUE(offset);
        ASSERT_NO_FATAL_FAILURE(expectTold(nearest, *offset, function));

        ByteSteps ordered(count - 1);
        const Levels levels = levelsOf<u8>(count);
        for (int k = 0; k < 16; ++k) {
            const scalar::F32 threshold = levels.step * tone::detail::matrix[k / 4][k % 4];
            for (int x = 0; x < 256; ++x)
                function[x] = storedOf<u8>(OrderedWide<Bytes>{levels}(scalar::F32(static_cast<f32>(x)), threshold));
            const auto offsetOfEntry = ordered.offsetOf(function);
            ASSERT_TRUE(offsetOfEntry) << "entry " << k;
            ASSERT_NO_FATAL_FAILURE(expectTold(ordered, *offsetOfEntry, function));
        }
    }
}

/// Half of 256 bytes at 0 and half at 255 are a step; what goes down again, or up where there is no room, is none.
TEST(ByteSteps, RefuseOtherFunctions)
{
    ByteFunction half = {}, other;
    std::fill(half.begin() + 128, half.end(), u8{255});
    EXPECT_TRUE(ByteSteps(1).offsetOf(half));

    other = half;
    other[255] = 0;
    EXPECT_FALSE(ByteSteps(1).offsetOf(other)) << "down again";
    std::iota(other.begin(), other.end(), u8{0});
    EXPECT_FALSE(ByteSteps(15).offsetOf(other)) << "256 values";
    other = half;
    std::fill(other.begin() + 130, other.end(), u8{7});
    EXPECT_FALSE(ByteSteps(2).offsetOf(other)) << "two steps, of which one takes two bytes";

    ByteSteps shared(1);
    EXPECT_TRUE(shared.offsetOf(half));
    std::fill(half.begin() + 128, half.end(), u8{254});
    EXPECT_FALSE(shared.offsetOf(half)) << "another value of the same step";
}

ByteFunction nearestOfEveryByte(s32 count)
{
    ByteFunction function;
    for (int x = 0; x < 256; ++x)
        function[x] = storedOf<u8>(NearestWide<Bytes>(count)(scalar::F32(static_cast<f32>(x))));
    return function;
}

/// Rounding leaves few functions without a line.
TEST(FineSteps, TellNearlyAllLevelsOfBytes)
{
    int told = 0, ofMatrix = 0;
    for (s32 count = 17; count <= 256; ++count) {
        SCOPED_TRACE(count);
        const FineSteps nearest(count - 1, [&](int n) { return NearestWide<Bytes>(count).valueOf(n); });
        const ByteFunction function = nearestOfEveryByte(count);
        if (const auto offset = nearest.offsetOf(function, 127)) {
            ++told;
            ASSERT_NO_FATAL_FAILURE(expectTold(nearest, *offset, function));
        }

        const Levels levels = levelsOf<u8>(count);
        tone::detail::MatrixOffsets<FineSteps> ordered{
            FineSteps(count - 1, [&](int n) { return valueOfStep<Bytes>(n, levels.step); }), {}};
        if (!ordered.find<Bytes>(levels)) continue;
        ++ofMatrix;
        for (int k = 0; k < 16; ++k) {
            const scalar::F32 threshold = levels.step * tone::detail::matrix[k / 4][k % 4];
            ByteFunction ofEntry;
            for (int x = 0; x < 256; ++x)
                ofEntry[x] = storedOf<u8>(OrderedWide<Bytes>{levels}(scalar::F32(static_cast<f32>(x)), threshold));
            ASSERT_NO_FATAL_FAILURE(expectTold(ordered.steps, ordered.of[k / 4][k % 4], ofEntry)) << "entry " << k;
        }
    }
    EXPECT_GE(told, 230);
    EXPECT_GE(ofMatrix, 225);
}

/// A level in the wrong place, or of another value, is no step of the line.
TEST(FineSteps, RefuseOtherFunctions)
{
    const FineSteps steps(99, [](int n) { return NearestWide<Bytes>(100).valueOf(n); });
    ByteFunction function = nearestOfEveryByte(100);
    ASSERT_TRUE(steps.offsetOf(function, 127));
    ++function[100];
    EXPECT_FALSE(steps.offsetOf(function, 127)) << "another value of one byte";
    EXPECT_FALSE(steps.offsetOf(nearestOfEveryByte(101), 127)) << "more steps";
}

/// All words in all places of the matrix, in an image for which steps are sought.
TEST(ByWords, EveryWordInEveryPlace)
{
    const RoiSize roi = {1024, 256};
    const std::size_t count = std::size_t{1024} * 256;
    std::vector<u16> source(count);
    std::vector<u8> expected(count), found(count);
    for (int shift = 0; shift < 4; ++shift) {
        for (int y = 0; y < roi.height; ++y) {
            for (int x = 0; x < roi.width; ++x) {
                const int word = (y + shift) % 64 * 1024 + (x + y / 64) % 1024;
                source[static_cast<std::size_t>(y) * 1024 + static_cast<std::size_t>(x)] = static_cast<u16>(word);
            }
        }
        for (const s32 levels : {2, 5, 15, 16, 17, 64, 100, 136, 172, 201, 256}) {
            for (const u32 method : {0u, 4u}) {
                ASSERT_EQ(reference::pyxiReduceBits_16u8u_C1R(source.data(), 2048, expected.data(), 1024, roi, 0,
                                                              method, levels),
                          pyxOk);
                ASSERT_EQ(pyxiReduceBits_16u8u_C1R(source.data(), 2048, found.data(), 1024, roi, 0, method, levels),
                          pyxOk);
                ASSERT_EQ(found, expected) << levels << " levels by method " << method;
            }
        }
    }
}

/// An image of one channel through a diffusion by bands of so many rows.
template <class F32, class Neighbours, class Depth>
[[gnu::noinline]] std::vector<typename Depth::Target> diffused(const std::vector<typename Depth::Source>& source,
                                                               RoiSize roi, s32 count, const Noise* noise)
{
    constexpr int bandRows = tone::detail::lanesOf<F32>;
    std::vector<typename Depth::Target> target(source.size());
    tone::detail::ErrorRows<f32, Neighbours::rows> errorRows(roi.width, Neighbours::reach);
    const Levels levels = levelsOf<typename Depth::Source>(count);
    for (int pass = 0; pass < 3; ++pass) { // as channels, of which the last is left
        for (int y = 0; y < roi.height; y += bandRows) {
            const std::ptrdiff_t first = std::ptrdiff_t{y} * roi.width;
            const std::ptrdiff_t sourceStep = roi.width * std::ptrdiff_t{sizeof source[0]};
            const std::ptrdiff_t targetStep = roi.width * std::ptrdiff_t{sizeof target[0]};
            const tone::detail::Band band = {layouts::bytes(source.data() + first),
                                             sourceStep,
                                             layouts::bytes(target.data() + first),
                                             targetStep,
                                             1,
                                             roi.width,
                                             std::min(bandRows, roi.height - y),
                                             y};
            tone::detail::diffuseBand<F32>(band, tone::detail::LevelDiffusion<Depth, Neighbours>{levels, noise},
                                           errorRows);
        }
    }
    return target;
}

template <class Neighbours, class Depth> void expectBandsAgree(const Noise* noise)
{
    using Source = typename Depth::Source;
    std::mt19937 random(7);
    const auto all = everySample<Source>();
    for (const int mode : forms::roundingModes) {
        for (const RoiSize roi : {RoiSize{1, 1}, {2, 3}, {1, 20}, {3, 9}, {20, 1}, {37, 2}, {130, 17}, {61, 24}}) {
            std::vector<Source> source(static_cast<std::size_t>(roi.width) * static_cast<std::size_t>(roi.height));
            for (Source& sample : source) sample = all[16 + random() % (all.size() - 16)];
            for (const s32 count : {2, 5, 256}) {
                std::vector<typename Depth::Target> atOnce, inTurn;
                forms::roundingBy(mode, [&] {
                    atOnce = diffused<wide::F32, Neighbours, Depth>(source, roi, count, noise);
                    inTurn = diffused<scalar::F32, Neighbours, Depth>(source, roi, count, noise);
                });
                ASSERT_EQ(atOnce, inTurn) << roi.width << " x " << roi.height << ", " << count << " levels";
            }
        }
    }
}

TYPED_TEST(ReduceBitsForm, RowsAtOnceAreRowsInTurn)
{
    Noise noise;
    ASSERT_EQ(noise.make(-10, 100), pyxOk);
    for (const Noise* const some : {static_cast<const Noise*>(nullptr), static_cast<const Noise*>(&noise)}) {
        expectBandsAgree<FourNeighbours<TypeParam>, TypeParam>(some);
        expectBandsAgree<TwelveNeighbours<in48ths>, TypeParam>(some);
        expectBandsAgree<TwelveNeighbours<in42nds>, TypeParam>(some);
    }
}

} // namespace
