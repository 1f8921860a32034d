// What is made of the samples around a place of a mosaic: vector instances against scalar ones, and both against plain
// numbers.
#include "every_input.hpp"

#include "mosaic/ahd_homogeneity.hpp"
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

/// Green between its neighbours, as its definition has it.
int statedGreen(int before, int behind, int at, int farBefore, int farBehind)
{
    const int bent = ((before + behind) >> 1) + (((at - farBefore) - (farBehind - at)) >> 2);
    return std::clamp(bent, std::min(before, behind), std::max(before, behind));
}

/// Random samples, of which every other one is near an end of what it can be.
template <class T> std::array<T, wide::RegisterOf<T>::count> samplesNearTheEnds()
{
    std::array<T, wide::RegisterOf<T>::count> samples;
    for (T& sample : samples) {
        const auto number = static_cast<T>(numbers());
        const unsigned kind = numbers() % 4;
        sample = kind == 0 ? static_cast<T>(number & 3) : kind == 1 ? static_cast<T>(~(number & 3)) : number;
    }
    return samples;
}

template <class T> void expectGreenBetween()
{
    for (int round = 0; round < 200000; ++round) {
        const auto a = samplesNearTheEnds<T>(), b = samplesNearTheEnds<T>(), c = samplesNearTheEnds<T>(),
                   f = samplesNearTheEnds<T>(), g = samplesNearTheEnds<T>();
        std::array<T, wide::RegisterOf<T>::count> green;
        storeRegister(green.data(), greenBetween(registerOf(a.data()), registerOf(b.data()), registerOf(c.data()),
                                                 registerOf(f.data()), registerOf(g.data())));
        for (std::size_t i = 0; i < green.size(); ++i) {
            ASSERT_EQ(green[i], statedGreen(a[i], b[i], c[i], f[i], g[i]))
                << +a[i] << ", " << +b[i] << ", " << +c[i] << ", " << +f[i] << ", " << +g[i];
        }
    }
}

TEST(GreenBetween, IsThatOfBytes) { expectGreenBetween<u8>(); }
TEST(GreenBetween, IsThatOfWords) { expectGreenBetween<u16>(); }

/// Red and blue of a row by their definition, at both kinds of sites, with greens that are any.
template <bool greenFirst, class T> void expectColors()
{
    constexpr int columns = 64;
    using Number = NumberFor<T>;
    std::array<std::array<int, columns>, 3> samples, greens;
    Line<T, columns> mosaic = {}, ofRow = {}, ofOthers = {};
    GreenRow<T, columns> rows[3] = {};
    for (int y = 0; y < 3; ++y) {
        // In the rows above and below green sites are the other ones.
        const int site = (greenFirst ? 1 : 0) ^ (y == 1 ? 0 : 1);
        for (int x = 0; x < columns; ++x) {
            samples[y][x] = samplesNearTheEnds<T>()[0];
            greens[y][x] = x % 2 == site ? samplesNearTheEnds<T>()[0] : samples[y][x];
            *rows[y].green.at(x) = static_cast<T>(greens[y][x]);
            if (x % 2 == site) *rows[y].differences.at(x / 2) = static_cast<Number>(samples[y][x] - greens[y][x]);
            if (y == 1) *mosaic.at(x) = static_cast<T>(samples[y][x]);
        }
    }
    interpolateColors<greenFirst, T>(mosaic.at(), GreensAround<T, columns>{rows[0], rows[1], rows[2]}, ofRow.at(),
                                     ofOthers.at(), columns);
    for (int x = 1; x < columns - 1; ++x) {
        const auto difference = [&](int y, int at) { return samples[y][at] - greens[y][at]; };
        const auto held = [](int value) { return std::clamp<int>(value, 0, std::numeric_limits<T>::max()); };
        const int green = greens[1][x];
        if (x % 2 == (greenFirst ? 0 : 1)) {
            ASSERT_EQ(*ofRow.at(x), held(green + ((difference(1, x - 1) + difference(1, x + 1)) >> 1))) << x;
            ASSERT_EQ(*ofOthers.at(x), held(green + ((difference(0, x) + difference(2, x)) >> 1))) << x;
        } else {
            const int diagonal =
                difference(0, x - 1) + difference(0, x + 1) + difference(2, x - 1) + difference(2, x + 1);
            ASSERT_EQ(*ofRow.at(x), samples[1][x]) << x;
            ASSERT_EQ(*ofOthers.at(x), held(green + (diagonal >> 2))) << x;
        }
    }
}

template <class T> void expectColorsOfBothRows()
{
    for (int round = 0; round < 500; ++round) {
        expectColors<true, T>();
        expectColors<false, T>();
    }
}

TEST(ColorsByDifferences, AreThoseOfBytes) { expectColorsOfBothRows<u8>(); }
TEST(ColorsByDifferences, AreThoseOfWords) { expectColorsOfBothRows<u16>(); }

struct Converted {
    int y, cb, cr;
};

template <int Columns> Converted at(const LumaChroma<u8, Columns>& from, int x)
{
    return {*from.y.at(x), *from.cb.at(x), *from.cr.at(x)};
}
/// Luma is that of samples 32768 lower.
template <int Columns> Converted at(const LumaChroma<u16, Columns>& from, int x)
{
    const s32 pair = *(x % 2 == 0 ? from.even : from.odd).at(x / 2);
    return {*from.y.at(x) + (66 + 129 + 25) * 32768 / 256, static_cast<s16>(pair & 0xffff), pair >> 16};
}

/// Luma and chroma by differences against their weights.
template <class T> void expectLumaAndChroma(const std::vector<std::array<T, 3>>& colors)
{
    constexpr int columns = 64;
    for (std::size_t first = 0; first < colors.size(); first += columns) {
        std::array<std::array<T, columns>, 3> samples = {};
        const int count = static_cast<int>(std::min<std::size_t>(columns, colors.size() - first));
        for (int x = 0; x < count; ++x) {
            for (std::size_t c = 0; c < 3; ++c) samples[c][x] = colors[first + x][c];
        }
        LumaChroma<T, columns> converted = {};
        toLumaChroma(samples[0].data(), samples[1].data(), samples[2].data(), converted, columns);
        for (int x = 0; x < count; ++x) {
            const s32 r = samples[0][x], g = samples[1][x], b = samples[2][x];
            const Converted is = at(converted, x);
            ASSERT_EQ(is.y, (66 * r + 129 * g + 25 * b + 128) >> 8) << r << ", " << g << ", " << b;
            ASSERT_EQ(is.cb, (-38 * r - 74 * g + 112 * b + 128) >> 8) << r << ", " << g << ", " << b;
            ASSERT_EQ(is.cr, (112 * r - 94 * g - 18 * b + 128) >> 8) << r << ", " << g << ", " << b;
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

/// All that eight sums can be, each negative, zero or positive, behind either choice, as the first eight and as the
/// last ones, and as two eights of which each bit is doubled.
TEST(Homogeneity, ZeroFollowsTheSumInFront)
{
    constexpr int eights = 3 * 3 * 3 * 3 * 3 * 3 * 3 * 3;
    const auto doubled = [](u32 bits) {
        u32 result = 0;
        for (int i = 0; i < 16; ++i) result |= (bits >> i & 1) * 3 << 2 * i;
        return result;
    };
    for (int sums = 0; sums < eights; ++sums) {
        for (const bool first : {false, true}) {
            u32 negative = 0, zero = 0, expected = 0;
            bool last = first;
            for (int x = 0, rest = sums; x < 8; ++x, rest /= 3) {
                negative |= (rest % 3 == 0 ? 1U : 0U) << x;
                zero |= (rest % 3 == 1 ? 1U : 0U) << x;
                if (rest % 3 != 1) last = rest % 3 == 0;
                expected |= (last ? 1U : 0U) << x;
            }
            u32 carried = first ? 1 : 0;
            EXPECT_EQ(decided(negative, zero, 8, carried), expected) << sums;
            EXPECT_EQ(carried, last ? 1U : 0U) << sums;
            carried = first ? 1 : 0;
            EXPECT_EQ(decided(doubled(negative), doubled(zero), 16, carried), doubled(expected)) << sums;
            EXPECT_EQ(carried, last ? 1U : 0U) << sums;
            // In front of them are zeros that follow the same choice.
            carried = first ? 1 : 0;
            const u32 before = first ? 0x00ffffffU : 0;
            EXPECT_EQ(decided(negative << 24, zero << 24 | 0x00ffffffU, 32, carried), expected << 24 | before) << sums;
            EXPECT_EQ(carried, last ? 1U : 0U) << sums;
        }
    }
}

TEST(Homogeneity, MasksAreBytesOfBits)
{
    for (int round = 0; round < 100000; ++round) {
        const auto bits = static_cast<u32>(numbers());
        std::array<u8, 32> mask;
        layouts::storeSamples(mask.data(), wide::maskOf(bits));
        for (int i = 0; i < 32; ++i) ASSERT_EQ(mask[i], (bits >> i & 1) != 0 ? 255 : 0) << bits << ", " << i;
        ASSERT_EQ(wide::bitsOf(wide::maskOf(bits)), bits);
    }
}

/// The two numbers of a pixel's chroma, side by side.
s32 chromaPair(int cb, int cr) { return cr * 65536 + (cb & 0xffff); }

/// 50000 squared is 2500000000, and 4294967296 less in 32 bits with a sign; 46340 squared is the largest that fits.
TEST(Homogeneity, SquaresOfTheChromaOfWordsWrap)
{
    LumaChroma<u16, 16> a = {}, b = {};
    *a.even.at(0) = chromaPair(25000, 0), *b.even.at(0) = chromaPair(-25000, 0);
    *a.odd.at(0) = chromaPair(0, -25000), *b.odd.at(0) = chromaPair(0, 25000);
    *a.even.at(1) = chromaPair(23170, 0), *b.even.at(1) = chromaPair(-23170, 0);
    *a.odd.at(1) = chromaPair(20000, -20000), *b.odd.at(1) = chromaPair(-20000, 20000);
    *a.y.at(3) = -28157, *b.y.at(3) = 27840;
    Distances<u16, 16> distances;
    measure(a, b, distances, 16);
    EXPECT_EQ(*distances.even.at(0), -1794967296);
    EXPECT_EQ(*distances.odd.at(0), -1794967296);
    EXPECT_EQ(*distances.even.at(1), 2147395600);
    EXPECT_EQ(*distances.odd.at(1), 3200000000 - 4294967296);
    EXPECT_EQ(*distances.luma.at(3), 55997 - 32768);
}

/// Pixels whose chroma is 0, 1, 3, 6, 10, ...: the distances are the squares of 1, 2, 3, ...
TEST(Homogeneity, DistancesBesideAreToTheNextColumn)
{
    LumaChroma<u16, 32> row = {};
    for (int x = 0; x <= 32; ++x) {
        *(x % 2 == 0 ? row.even : row.odd).at(x / 2) = chromaPair(x * (x + 1) / 2, 0);
        *row.y.at(x) = static_cast<s16>(-x * (x + 1) / 2);
    }
    Distances<u16, 32> distances;
    measureBeside(row, distances, 32);
    for (int x = 0; x < 32; ++x) {
        EXPECT_EQ(*(x % 2 == 0 ? distances.even : distances.odd).at(x / 2), (x + 1) * (x + 1)) << x;
        EXPECT_EQ(*distances.luma.at(x), x + 1 - 32768) << x;
    }
}

/// A distance that has wrapped is below all others: it sets the limit, and is within it. In the third column and in the
/// fourth.
TEST(Homogeneity, WrappedDistancesAreTheSmallest)
{
    constexpr s32 wrapped = -1794967296;
    for (const int x : {2, 3}) {
        Distances<u16, 16> hBeside = {}, hAbove = {}, hBelow = {}, vBeside = {}, vAbove = {}, vBelow = {};
        const auto at = [](Distances<u16, 16>& of, int column) -> s32& {
            return *(column % 2 == 0 ? of.even : of.odd).at(column / 2);
        };
        // The larger one beside along the row is 5, the larger one above and below along the column has wrapped: that
        // is the limit.
        at(hBeside, x - 1) = wrapped, at(hBeside, x) = 5, at(hAbove, x) = 0, at(hBelow, x) = 9;
        at(vBeside, x - 1) = 1, at(vBeside, x) = 0, at(vAbove, x) = wrapped, at(vBelow, x) = wrapped;
        Line<u16, 16> scores = {};
        scoreCandidates(DistancesAround<u16, 16>{hBeside, hAbove, hBelow},
                        DistancesAround<u16, 16>{vBeside, vAbove, vBelow}, scores, 16);
        EXPECT_EQ(*scores.at(x) - noScore, 1 - 2) << x;
    }
}

} // namespace
