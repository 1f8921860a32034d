// Means of the samples around a place of a mosaic: vector instances against scalar ones, and against the sums.
#include "every_input.hpp"

#include "mosaic/cfa_forms.hpp"

#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::mosaic;

std::mt19937 numbers(5);

/// A mean of four depends on the two sums alone: on their halves, rounded up, and on their lowest bits.
TEST(MeanOfFour, IsRoundedOnceForAllBytes)
{
    for (int first = 0; first <= 510; ++first) {
        for (int second = 0; second <= 510; ++second) {
            using scalar::U8;
            const U8 a = first / 2, b = first - first / 2, c = second / 2, d = second - second / 2;
            ASSERT_EQ(int{meanOfFour(a, b, c, d).v}, (first + second + 2) >> 2) << first << ", " << second;
        }
    }
}

TEST(MeanOfFour, IsRoundedOnceForWords)
{
    for (int i = 0; i < 1000000; ++i) {
        using scalar::U16;
        const auto word = [] { return static_cast<int>(numbers() & 0xffff); };
        const int a = word(), b = word(), c = word(), d = word();
        ASSERT_EQ(int{meanOfFour(U16(a), U16(b), U16(c), U16(d)).v}, (a + b + c + d + 2) >> 2);
    }
}

/// The places of a neighbourhood in one order.
template <class Samples> std::array<Samples Far<Samples>::*, 4> farPlaces()
{
    using F = Far<Samples>;
    return {&F::farLeft, &F::farRight, &F::farUp, &F::farDown};
}
template <class Samples> std::array<Samples Near<Samples>::*, 9> nearPlaces()
{
    using N = Near<Samples>;
    return {&N::at, &N::left, &N::right, &N::up, &N::down, &N::upLeft, &N::upRight, &N::downLeft, &N::downRight};
}

/// Random samples, of few values for equal distances to be among them.
template <class Wide, class Scalar, class T>
void makeFar(Far<Wide>& wide, std::array<Far<Scalar>, Wide::count>& lanes, int mask)
{
    const auto fill = [mask](Wide& to, auto&& lane) {
        std::array<T, Wide::count> values;
        for (int i = 0; i < Wide::count; ++i) {
            values[i] = static_cast<T>(numbers() & mask);
            lane(i) = Scalar(values[i]);
        }
        to = layouts::loadSamples<Wide>(reinterpret_cast<const u8*>(values.data()));
    };
    for (std::size_t k = 0; k < 9; ++k) {
        fill(wide.near.*nearPlaces<Wide>()[k],
             [&lanes, k](int i) -> Scalar& { return lanes[i].near.*nearPlaces<Scalar>()[k]; });
    }
    for (std::size_t k = 0; k < 4; ++k) {
        fill(wide.*farPlaces<Wide>()[k], [&lanes, k](int i) -> Scalar& { return lanes[i].*farPlaces<Scalar>()[k]; });
    }
}

template <class Samples, class T> std::array<T, Samples::count> valuesOf(Samples x)
{
    std::array<T, Samples::count> values;
    layouts::storeSamples(reinterpret_cast<u8*>(values.data()), x);
    return values;
}

template <class T, bool redRow> void expectInstancesAgree(bool greenFirst)
{
    using Wide = wide::RegisterOf<T>;
    using Scalar = scalar::Lane<T>;
    for (int round = 0; round < 20000; ++round) {
        Far<Wide> wideSamples;
        std::array<Far<Scalar>, Wide::count> lanes;
        makeFar<Wide, Scalar, T>(wideSamples, lanes, round % 3 == 0 ? 3 : 0xffff);
        const Wide mask = wide::everyOther<Wide>(greenFirst);
        const Three<Wide> along = MeansAlongEdges<redRow, Wide>{mask}(wideSamples);
        const Three<Wide> plain = MeansAround<redRow, Wide>{mask}(wideSamples.near);
        const auto alongR = valuesOf<Wide, T>(along.a), alongG = valuesOf<Wide, T>(along.b),
                   alongB = valuesOf<Wide, T>(along.c), plainR = valuesOf<Wide, T>(plain.a),
                   plainG = valuesOf<Wide, T>(plain.b), plainB = valuesOf<Wide, T>(plain.c);
        for (int i = 0; i < Wide::count; ++i) {
            const Scalar green = (i % 2 == 0) == greenFirst ? -1 : 0;
            const Three<Scalar> one = MeansAlongEdges<redRow, Scalar>{green}(lanes[i]);
            const Three<Scalar> other = MeansAround<redRow, Scalar>{green}(lanes[i].near);
            ASSERT_EQ((std::array{alongR[i], alongG[i], alongB[i], plainR[i], plainG[i], plainB[i]}),
                      (std::array{one.a.v, one.b.v, one.c.v, other.a.v, other.b.v, other.c.v}))
                << "lane " << i;
        }
    }
}

TEST(MosaicForms, InstancesAgreeOnBytes)
{
    for (const bool greenFirst : {false, true}) {
        expectInstancesAgree<u8, false>(greenFirst);
        expectInstancesAgree<u8, true>(greenFirst);
    }
}

TEST(MosaicForms, InstancesAgreeOnWords)
{
    for (const bool greenFirst : {false, true}) {
        expectInstancesAgree<u16, false>(greenFirst);
        expectInstancesAgree<u16, true>(greenFirst);
    }
}

} // namespace
