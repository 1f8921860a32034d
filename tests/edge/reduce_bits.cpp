// Images at fewer levels: limits, ties of the methods, what is carried from sample to sample and from channel to
// channel.
#include "pyxcc/pyxcc.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <numeric>
#include <vector>

using namespace edge;

namespace
{

template <typename S, typename D>
using Conversion = PyxStatus (*)(const S*, int, D*, int, RoiSize, u32 noise, u32 method, s32 levels);

struct Parameters {
    u32 noise, method;
    s32 levels;
};

/// What the samples of a target hold before the call.
constexpr int untouched = 77;

/// One row of pixels of so many samples.
template <typename S, typename D>
std::vector<D> rowOf(Conversion<S, D> convert, const std::vector<S>& source, Parameters with, int channels = 1)
{
    std::vector<D> target(source.size(), static_cast<D>(untouched));
    const int width = static_cast<int>(source.size()) / channels;
    EXPECT_EQ(convert(source.data(), 0, target.data(), 0, {width, 1}, with.noise, with.method, with.levels), pyxOk);
    return target;
}

Samples bytes(const Samples& source, Parameters with) { return rowOf<u8, u8>(pyxiReduceBits_8u_C1R, source, with); }

} // namespace

TEST(ReduceBits, DiffusionOfAllLevelsLeavesBytesAsTheyAre)
{
    Samples all(256);
    std::iota(all.begin(), all.end(), u8{0});
    for (const u32 method : {1u, 2u, 3u}) EXPECT_EQ(bytes(all, {0, method, 256}), all) << method;
}

// Half of 255 is 127.5, and of three levels 63.75 and 191.25.
TEST(ReduceBits, NearestLevel)
{
    for (const int count : {1, 5, 8, 13, 40}) {
        const auto times = [count](u8 sample) { return Samples(static_cast<std::size_t>(count), sample); };
        EXPECT_EQ(bytes(times(127), {0, 0, 2}), times(0)) << count;
        EXPECT_EQ(bytes(times(128), {0, 0, 2}), times(255)) << count;
        EXPECT_EQ(bytes(times(63), {0, 0, 3}), times(0)) << count;
        EXPECT_EQ(bytes(times(64), {0, 0, 3}), times(127)) << count;
        EXPECT_EQ(bytes(times(191), {0, 0, 3}), times(127)) << count;
        EXPECT_EQ(bytes(times(192), {0, 0, 3}), times(255)) << count;
        EXPECT_EQ(bytes(times(0), {0, 0, 3}), times(0)) << count;
        EXPECT_EQ(bytes(times(255), {0, 0, 3}), times(255)) << count;
        EXPECT_EQ(bytes(times(127), {100, 0, 2}), times(0)) << "noise makes no difference";
    }
}

// Of two levels the thresholds are 17 k for the entries k of the matrix, so that 100 is above those of 0 to 5.
TEST(ReduceBits, OrderedMatrixOfTwoLevels)
{
    const Samples pattern[4] = {{255, 0, 255, 0}, {0, 255, 0, 0}, {255, 0, 255, 0}, {0, 0, 0, 255}};
    for (const int width : {4, 8, 13, 23}) {
        const std::size_t count = static_cast<std::size_t>(width);
        const Samples source(count * 6, 100);
        Samples target(count * 6, untouched), source4(count * 24, 100), target4(count * 24, untouched);
        EXPECT_EQ(pyxiReduceBits_8u_C1R(source.data(), width, target.data(), width, {width, 6}, 0, 4, 2), pyxOk);
        EXPECT_EQ(pyxiReduceBits_8u_C4R(source4.data(), 4 * width, target4.data(), 4 * width, {width, 6}, 0, 4, 2),
                  pyxOk);
        for (std::size_t i = 0; i < target.size(); ++i) {
            const u8 expected = pattern[i / count % 4][i % count % 4];
            EXPECT_EQ(target[i], expected) << width << ", " << i;
            for (std::size_t k = 0; k < 4; ++k) EXPECT_EQ(target4[4 * i + k], expected) << width << ", " << i;
        }
    }
}

// 127 is below the half of 255 and leaves 127, of which the next sample gets 7/16: 182.6.
TEST(ReduceBits, ErrorsGoToTheNextSample)
{
    EXPECT_EQ(bytes({127, 127}, {0, 1, 2}), (Samples{0, 255}));
    EXPECT_EQ(bytes({128, 127}, {0, 1, 2}), (Samples{255, 0}));
    // 7/48 of it make 145.5, and 8/42 make 151.2.
    EXPECT_EQ(bytes({127, 127}, {0, 2, 2}), (Samples{0, 255}));
    EXPECT_EQ(bytes({127, 127}, {0, 3, 2}), (Samples{0, 255}));
}

// 190 becomes 127.5 and leaves 62.5, with which 250 is 277.3. Were the 22.3 above the top left to the last sample, it
// would be 72.8 and above the threshold of 63.75.
TEST(ReduceBits, ErrorsAreDroppedAtTheLimits)
{
    EXPECT_EQ(bytes({190, 250, 63}, {0, 1, 3}), (Samples{127, 255, 0}));
    EXPECT_EQ(bytes({255, 63}, {0, 1, 3}), (Samples{255, 0}));
    // 64 becomes 127.5 and leaves -63.5, with which 20 is below zero; 64 starts afresh.
    EXPECT_EQ(bytes({64, 20, 64}, {0, 1, 3}), (Samples{127, 0, 127}));
}

// A channel finds the error rows as the channel before has left them. With 127 in each, the second channel has 5/16,
// 7/48 or 8/42 of 127 from above: 166.7, 145.5 or 151.2. The third has that of the second, which is negative, and in
// the larger kernels that of the first as well: 99.4, 124.3, 119.3.
TEST(ReduceBits, AChannelSeesTheErrorsOfTheOneBefore)
{
    for (const u32 method : {1u, 2u, 3u}) {
        EXPECT_EQ((rowOf<u8, u8>(pyxiReduceBits_8u_C3R, {127, 127, 127}, {0, method, 2}, 3)), (Samples{0, 255, 0}))
            << method;
        EXPECT_EQ((rowOf<u8, u8>(pyxiReduceBits_8u_AC4R, {127, 127, 127, 9}, {0, method, 2}, 4)),
                  (Samples{0, 255, 0, untouched}))
            << method;
    }
}

TEST(ReduceBits, AlphaIsLeftAloneInOneLayoutAndConvertedInAnother)
{
    for (const u32 method : {0u, 1u, 2u, 3u, 4u}) {
        EXPECT_EQ((rowOf<u8, u8>(pyxiReduceBits_8u_AC4R, repeated({255, 255, 255, 255}, 11), {0, method, 2}, 4)),
                  repeated({255, 255, 255, untouched}, 11))
            << method;
        EXPECT_EQ((rowOf<u8, u8>(pyxiReduceBits_8u_C4R, repeated({255, 255, 255, 255}, 11), {0, method, 2}, 4)),
                  repeated({255, 255, 255, 255}, 11))
            << method;
    }
}

// The middle one of three levels is 32767.5. The half that is added in one diffusion from signed words to bytes brings
// it to 32768, which is 128 of 256.
TEST(ReduceBits, WordsRoundInOneDiffusionOfOneDepth)
{
    EXPECT_EQ((rowOf<u16, u16>(pyxiReduceBits_16u_C1R, {32767}, {0, 1, 3})), (std::vector<u16>{32767}));
    EXPECT_EQ((rowOf<s16, s16>(pyxiReduceBits_16s_C1R, {-1}, {0, 1, 3})), (std::vector<s16>{-1}));
    EXPECT_EQ((rowOf<u16, u8>(pyxiReduceBits_16u8u_C1R, {32767}, {0, 1, 3})), (Samples{127}));
    EXPECT_EQ((rowOf<s16, u8>(pyxiReduceBits_16s8u_C1R, {-1}, {0, 1, 3})), (Samples{128}));
    EXPECT_EQ((rowOf<s16, u8>(pyxiReduceBits_16s8u_C1R, {-1}, {0, 2, 3})), (Samples{127}));
    EXPECT_EQ((rowOf<s16, u8>(pyxiReduceBits_16s8u_C1R, {-1}, {0, 3, 3})), (Samples{127}));
}

// A half is 127.5 of bytes and 32767.5 of words.
TEST(ReduceBits, FloatsRoundInOneDiffusion)
{
    EXPECT_EQ((rowOf<f32, u8>(pyxiReduceBits_32f8u_C1R, {0.5f}, {0, 1, 3})), (Samples{128}));
    EXPECT_EQ((rowOf<f32, u16>(pyxiReduceBits_32f16u_C1R, {0.5f}, {0, 1, 3})), (std::vector<u16>{32768}));
    EXPECT_EQ((rowOf<f32, s16>(pyxiReduceBits_32f16s_C1R, {0.5f}, {0, 1, 3})), (std::vector<s16>{0}));
    for (const u32 method : {2u, 3u, 4u}) {
        EXPECT_EQ((rowOf<f32, u8>(pyxiReduceBits_32f8u_C1R, {0.5f}, {0, method, 3})), (Samples{127})) << method;
        EXPECT_EQ((rowOf<f32, u16>(pyxiReduceBits_32f16u_C1R, {0.5f}, {0, method, 3})), (std::vector<u16>{32767}))
            << method;
        EXPECT_EQ((rowOf<f32, s16>(pyxiReduceBits_32f16s_C1R, {0.5f}, {0, method, 3})), (std::vector<s16>{-1}))
            << method;
    }
}

TEST(ReduceBits, FloatsBeyondTheRangeAreItsEnds)
{
    for (const u32 method : {1u, 2u, 3u, 4u}) {
        EXPECT_EQ((rowOf<f32, u8>(pyxiReduceBits_32f8u_C1R, {1.0f, -2.0f, 7.5f, 1e-7f}, {0, method, 3})),
                  (Samples{255, 0, 255, 0}))
            << method;
        EXPECT_EQ((rowOf<f32, s16>(pyxiReduceBits_32f16s_C1R, {1.0f, -2.0f, 7.5f, 1e-7f}, {0, method, 3})),
                  (std::vector<s16>{32767, -32768, 32767, -32768}))
            << method;
    }
}

// The places are 0, 133, 216, 412, 361, ... and the noise there makes thresholds of -127.0, 108.4, 89.6, 285.8, 1.6,
// 230.8, 178.5, -65.5, 356.3, -33.8, against 128.0, 72.4, 159.7, 86.3, 165.8, 89.0, 166.9, 201.0, 104.4, 173.7.
TEST(ReduceBits, NoiseMovesTheThresholdOfTheDiffusion)
{
    for (int call = 0; call < 2; ++call)
        EXPECT_EQ(bytes(Samples(10, 128), {100, 1, 2}), (Samples{255, 0, 255, 0, 255, 0, 0, 255, 0, 255}));
}

// 255 times the sum of entry and noise: -127.3, 126.5, 15.1, 249.2, -62.9, 187.7, 59.5, 73.5, 114.4, 55.4.
TEST(ReduceBits, NoiseMovesTheEntriesOfTheMatrix)
{
    EXPECT_EQ(bytes(Samples(10, 100), {50, 4, 2}), (Samples{255, 0, 255, 0, 255, 0, 255, 255, 0, 255}));
}

TEST(ReduceBits, AnUnknownMethodDoesNothing)
{
    EXPECT_EQ(bytes({1, 2, 3}, {0, 5, 2}), Samples(3, untouched));
    EXPECT_EQ(bytes({1, 2, 3}, {0, 0xffffffff, 2}), Samples(3, untouched));
}

TEST(ReduceBits, ArgumentsAreTestedInTheirOrder)
{
    const Samples source(4, 1);
    Samples target(4, untouched);
    std::vector<u16> words(4, untouched);
    const u8* src = source.data();
    u8* dst = target.data();
    EXPECT_EQ(pyxiReduceBits_8u_C1R(nullptr, 4, dst, 4, {0, 1}, 101, 0, 1), pyxErrNullPtr);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, nullptr, 4, {1, 1}, 0, 0, 2), pyxErrNullPtr);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {0, 1}, 101, 0, 1), pyxErrSize);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {1, 0}, 0, 0, 2), pyxErrSize);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {1, 1}, 101, 5, 1), pyxErrNoise);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {1, 1}, 0xffffffff, 0, 2), pyxErrNoise);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {1, 1}, 100, 5, 1), pyxErrLevels);
    EXPECT_EQ(pyxiReduceBits_8u_C1R(src, 4, dst, 4, {1, 1}, 0, 0, 257), pyxErrLevels);
    const u16 word = 1;
    EXPECT_EQ(pyxiReduceBits_16u8u_C1R(&word, 4, dst, 4, {1, 1}, 0, 0, 257), pyxErrLevels);
    EXPECT_EQ(pyxiReduceBits_16u_C1R(&word, 4, words.data(), 4, {1, 1}, 0, 0, 65537), pyxErrLevels);
    EXPECT_EQ(target, Samples(4, untouched));
    EXPECT_EQ(words, std::vector<u16>(4, untouched));
    EXPECT_EQ(pyxiReduceBits_16u_C1R(&word, 4, words.data(), 4, {1, 1}, 0, 1, 65536), pyxOk);
    EXPECT_EQ(words[0], 1);
}
