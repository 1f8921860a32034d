// What is made of the samples around a place of a mosaic: vector instances against scalar ones, and both against plain
// numbers.
#include "every_input.hpp"

#include "mosaic/ahd_forms.hpp"
#include "mosaic/cfa_forms.hpp"

#include <algorithm>
#include <cstdlib>
#include <random>
#include <type_traits>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::mosaic;

std::mt19937 numbers(5);

template <class Samples> Samples exactMeanOfFour(Samples a, Samples b, Samples c, Samples d)
{
    return meanOfFour(a, b, c, d, avgUp(a, b), avgUp(c, d));
}

/// A mean of four depends on the two sums alone: on their halves, rounded up, and on their lowest bits.
TEST(MeanOfFour, IsRoundedOnceForAllBytes)
{
    for (int first = 0; first <= 510; ++first) {
        for (int second = 0; second <= 510; ++second) {
            using scalar::U8;
            const U8 a = first / 2, b = first - first / 2, c = second / 2, d = second - second / 2;
            ASSERT_EQ(int{exactMeanOfFour(a, b, c, d).v}, (first + second + 2) >> 2) << first << ", " << second;
        }
    }
}

TEST(MeanOfFour, IsRoundedOnceForWords)
{
    for (int i = 0; i < 1000000; ++i) {
        using scalar::U16;
        const auto word = [] { return static_cast<int>(numbers() & 0xffff); };
        const int a = word(), b = word(), c = word(), d = word();
        ASSERT_EQ(int{exactMeanOfFour(U16(a), U16(b), U16(c), U16(d)).v}, (a + b + c + d + 2) >> 2);
    }
}

/// The samples around a site and its partner, in one order.
template <class Samples> std::array<Samples Pair<Samples>::*, 10> nearPlaces()
{
    using P = Pair<Samples>;
    return {&P::site,  &P::green, &P::innerSite, &P::outerGreen, &P::above,
            &P::below, &P::upper, &P::lower,     &P::outerUpper, &P::outerLower};
}
template <class Samples> std::array<Samples WidePair<Samples>::*, 3> farPlaces()
{
    using P = WidePair<Samples>;
    return {&P::outerSite, &P::farAbove, &P::farBelow};
}

/// Random samples, of few values for equal distances to be among them.
template <class Wide, class Scalar, class T>
void makePairs(WidePair<Wide>& wide, std::array<WidePair<Scalar>, Wide::count>& lanes, int mask)
{
    const auto fill = [mask](Wide& to, auto&& lane) {
        std::array<T, Wide::count> values;
        for (int i = 0; i < Wide::count; ++i) {
            values[i] = static_cast<T>(numbers() & mask);
            lane(i) = Scalar(values[i]);
        }
        to = layouts::loadSamples<Wide>(reinterpret_cast<const u8*>(values.data()));
    };
    for (std::size_t k = 0; k < nearPlaces<Wide>().size(); ++k) {
        fill(wide.near.*nearPlaces<Wide>()[k],
             [&lanes, k](int i) -> Scalar& { return lanes[i].near.*nearPlaces<Scalar>()[k]; });
    }
    for (std::size_t k = 0; k < farPlaces<Wide>().size(); ++k) {
        fill(wide.*farPlaces<Wide>()[k], [&lanes, k](int i) -> Scalar& { return lanes[i].*farPlaces<Scalar>()[k]; });
    }
}

using Values = std::array<int, 6>;

template <class Samples> std::array<Values, Samples::count> valuesOf(const Colors<Samples>& colors)
{
    constexpr int lanes = Samples::count;
    using T = std::conditional_t<lanes == 32, u8, u16>;
    std::array<Values, lanes> values;
    const std::array channels = {colors.site.a,  colors.site.b,  colors.site.c,
                                 colors.green.a, colors.green.b, colors.green.c};
    for (std::size_t k = 0; k < channels.size(); ++k) {
        std::array<T, lanes> samples;
        layouts::storeSamples(reinterpret_cast<u8*>(samples.data()), channels[k]);
        for (int i = 0; i < lanes; ++i) values[i][k] = samples[i];
    }
    return values;
}

template <class T> Values valuesOf(const Colors<scalar::Lane<T>>& colors)
{
    return {colors.site.a.v, colors.site.b.v, colors.site.c.v, colors.green.a.v, colors.green.b.v, colors.green.c.v};
}

/// What the samples are to become, in plain numbers.
template <class T> Values stated(const WidePair<scalar::Lane<T>>& wide, bool alongEdges)
{
    const Pair<scalar::Lane<T>>& x = wide.near;
    const auto meanOf = [](auto... lanes) { return (0 + ... + lanes.v); };
    const int alongRow = (meanOf(x.green, x.outerGreen) + 1) >> 1, alongColumn = (meanOf(x.above, x.below) + 1) >> 1;
    int green = (meanOf(x.green, x.outerGreen, x.above, x.below) + 2) >> 2;
    const int h = std::abs(wide.outerSite.v - x.innerSite.v), v = std::abs(wide.farAbove.v - wide.farBelow.v);
    if (alongEdges && v < h) green = alongColumn;
    if (alongEdges && v > h) green = alongRow;
    const int third = (meanOf(x.upper, x.lower, x.outerUpper, x.outerLower) + 2) >> 2;
    return {
        x.site.v, green, third, (meanOf(x.site, x.innerSite) + 1) >> 1, x.green.v, (meanOf(x.upper, x.lower) + 1) >> 1};
}

template <class T> void expectInstancesAgree()
{
    using Wide = wide::RegisterOf<T>;
    using Scalar = scalar::Lane<T>;
    for (int round = 0; round < 3000; ++round) {
        WidePair<Wide> pairs;
        std::array<WidePair<Scalar>, Wide::count> lanes;
        makePairs<Wide, Scalar, T>(pairs, lanes, round % 3 == 0 ? 3 : 0xffff);
        const auto along = valuesOf(meansAlongEdges(pairs)), plain = valuesOf(meansAround(pairs.near));
        for (int i = 0; i < Wide::count; ++i) {
            ASSERT_EQ(along[i], valuesOf<T>(meansAlongEdges(lanes[i]))) << "lane " << i;
            ASSERT_EQ(along[i], stated<T>(lanes[i], true)) << "lane " << i;
            ASSERT_EQ(plain[i], valuesOf<T>(meansAround(lanes[i].near))) << "lane " << i;
            ASSERT_EQ(plain[i], stated<T>(lanes[i], false)) << "lane " << i;
        }
    }
}

TEST(MosaicForms, InstancesAgreeOnBytes) { expectInstancesAgree<u8>(); }
TEST(MosaicForms, InstancesAgreeOnWords) { expectInstancesAgree<u16>(); }

/// The largest sum of two squares lies between two of the outermost colours of each blue chroma.
TEST(Homogeneity, SquaresOfTheChromaOfBytesFit16Bits)
{
    constexpr int zero = 128, values = 256;
    std::array<int, values> least, most;
    least.fill(1000), most.fill(-1000);
    for (int r = 0; r < 256; ++r) {
        for (int g = 0; g < 256; ++g) {
            for (int b = 0; b < 256; ++b) {
                const int cb = zero + ((-38 * r - 74 * g + 112 * b + 128) >> 8);
                const int cr = (112 * r - 94 * g - 18 * b + 128) >> 8;
                least[cb] = std::min(least[cb], cr), most[cb] = std::max(most[cb], cr);
            }
        }
    }
    int largest = 0;
    for (int i = 0; i < values; ++i) {
        for (int k = 0; k < values; ++k) {
            if (most[i] < least[i] || most[k] < least[k]) continue;
            const int cr = std::max(most[i] - least[k], most[k] - least[i]);
            largest = std::max(largest, (i - k) * (i - k) + cr * cr);
        }
    }
    EXPECT_GT(largest, 32767); // but only without a sign
    EXPECT_LT(largest, 65536);
}

/// Luma and chroma by differences against their weights.
template <class T> void expectLumaAndChroma(const std::vector<std::array<T, 3>>& colors)
{
    constexpr int columns = 64;
    // Of 16 bits luma is that of samples 32768 lower.
    constexpr int lessLuma = sizeof(T) == 1 ? 0 : (66 + 129 + 25) * 32768 / 256;
    for (std::size_t first = 0; first < colors.size(); first += columns) {
        std::array<std::array<T, columns>, 3> samples = {};
        const int count = static_cast<int>(std::min<std::size_t>(columns, colors.size() - first));
        for (int x = 0; x < count; ++x) {
            for (std::size_t c = 0; c < 3; ++c) samples[c][x] = colors[first + x][c];
        }
        LumaChroma<columns> converted;
        toLumaChroma(samples[0].data(), samples[1].data(), samples[2].data(), converted, count);
        for (int x = 0; x < count; ++x) {
            const s32 r = samples[0][x], g = samples[1][x], b = samples[2][x];
            ASSERT_EQ(converted.y[x] + lessLuma, (66 * r + 129 * g + 25 * b + 128) >> 8) << r << ", " << g << ", " << b;
            ASSERT_EQ(converted.cb[x], (-38 * r - 74 * g + 112 * b + 128) >> 8) << r << ", " << g << ", " << b;
            ASSERT_EQ(converted.cr[x], (112 * r - 94 * g - 18 * b + 128) >> 8) << r << ", " << g << ", " << b;
        }
    }
}

TEST(Homogeneity, LumaAndChromaOfAllBytes)
{
    for (int r = 0; r < 256; ++r) {
        std::vector<std::array<u8, 3>> colors;
        for (int i = 0; i < 65536; ++i) {
            colors.push_back({static_cast<u8>(r), static_cast<u8>(i >> 8), static_cast<u8>(i & 255)});
        }
        expectLumaAndChroma(colors);
    }
}

TEST(Homogeneity, LumaAndChromaOfWords)
{
    std::vector<std::array<u16, 3>> colors;
    const auto word = [] { return static_cast<u16>(numbers() & 0xffff); };
    for (int i = 0; i < 500000; ++i) colors.push_back({word(), word(), word()});
    for (int i = 0; i < 8; ++i) {
        const auto end = [i](int bit) { return static_cast<u16>((i >> bit & 1) != 0 ? 65535 : 0); };
        colors.push_back({end(0), end(1), end(2)});
    }
    expectLumaAndChroma(colors);
}

/// All that eight sums can be, each negative, zero or positive, behind either choice, and as the second of two eights.
TEST(Homogeneity, ZeroFollowsTheSumInFront)
{
    constexpr int eights = 3 * 3 * 3 * 3 * 3 * 3 * 3 * 3;
    for (int sums = 0; sums < eights; ++sums) {
        for (const bool first : {false, true}) {
            for (const int start : {0, 8}) {
                Signs<16> signs = {};
                if (start == 8) std::fill_n(first ? signs.negative : signs.zero, 8, u8{255});
                std::array<u8, 8> expected;
                bool last = first;
                for (int x = 0, rest = sums; x < 8; ++x, rest /= 3) {
                    signs.negative[start + x] = rest % 3 == 0 ? 255 : 0;
                    signs.zero[start + x] = rest % 3 == 1 ? 255 : 0;
                    if (rest % 3 != 1) last = rest % 3 == 0;
                    expected[x] = last ? 255 : 0;
                }
                // Eight zeros keep what is in front of them; eight negative sums are what they are.
                const std::uint64_t before = first && start == 0 ? 255 : 0;
                EXPECT_EQ(decide(signs, start + 8, before), last ? 255U : 0U) << sums;
                EXPECT_TRUE(std::equal(expected.begin(), expected.end(), signs.negative + start)) << sums;
            }
        }
    }
}

/// 50000 squared is 2500000000, and 4294967296 less in 32 bits with a sign; 46340 squared is the largest that fits.
TEST(Homogeneity, SquaresOfTheChromaOfWordsWrap)
{
    LumaChroma<16> a = {}, b = {};
    a.cb[0] = 25000, b.cb[0] = -25000;
    a.cr[1] = -25000, b.cr[1] = 25000;
    a.cb[2] = 23170, b.cb[2] = -23170;
    a.cb[3] = 20000, b.cb[3] = -20000, a.cr[3] = -20000, b.cr[3] = 20000;
    a.y[3] = -28157, b.y[3] = 27840;
    Distances<u16, 16> distances;
    measure<0>(a, b, distances, 4);
    EXPECT_EQ(distances.chroma[0], -1794967296);
    EXPECT_EQ(distances.chroma[1], -1794967296);
    EXPECT_EQ(distances.chroma[2], 2147395600);
    EXPECT_EQ(distances.chroma[3], 3200000000 - 4294967296);
    EXPECT_EQ(distances.luma[3], 55997);
}

/// A distance that has wrapped is below all others: it sets the limit, and is within it.
TEST(Homogeneity, WrappedDistancesAreTheSmallest)
{
    constexpr s32 wrapped = -1794967296;
    Distances<u16, 16> hBeside = {}, hAbove = {}, hBelow = {}, vBeside = {}, vAbove = {}, vBelow = {};
    // The larger one beside along the row is 5, the larger one above and below along the column has wrapped: that is
    // the limit.
    hBeside.chroma[0] = wrapped, hBeside.chroma[1] = 5, hAbove.chroma[1] = 0, hBelow.chroma[1] = 9;
    vBeside.chroma[0] = 1, vBeside.chroma[1] = 0, vAbove.chroma[1] = wrapped, vBelow.chroma[1] = wrapped;
    u8 score = 0;
    scoreCandidates(DistancesAround<u16, 16>{&hBeside, &hAbove, &hBelow},
                    DistancesAround<u16, 16>{&vBeside, &vAbove, &vBelow}, &score, 3);
    EXPECT_EQ(score - noScore, 1 - 2);
}

} // namespace
