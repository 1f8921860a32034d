#include "tone/color_twist_forms.hpp"
#include "layouts/float_images.hpp"

#include <gtest/gtest.h>

#include <array>
#include <bit>
#include <cfenv>
#include <cmath>
#include <limits>
#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::tone;

std::mt19937 numbers(7);

bool oneIn(unsigned count) { return numbers() % count == 0; }

/// Between -1 and 1, with all the bits of a float in use.
f32 fraction() { return static_cast<f32>(static_cast<s32>(numbers())) * 0x1p-31f; }

/// What a matrix or an image of floats may hold: mostly near 1, now and then anything.
f32 anyFloat()
{
    constexpr f32 odd[] = {0.f,
                           -0.f,
                           1.f,
                           -1.f,
                           std::numeric_limits<f32>::infinity(),
                           -std::numeric_limits<f32>::infinity(),
                           std::numeric_limits<f32>::quiet_NaN(),
                           std::numeric_limits<f32>::max(),
                           std::numeric_limits<f32>::denorm_min()};
    if (oneIn(20)) return odd[numbers() % std::size(odd)];
    if (oneIn(10)) return std::ldexp(fraction(), static_cast<int>(numbers() % 60) - 30);
    return 2 * fraction();
}

template <int Rows> void fill(f32 (&twist)[Rows][4], f32 constantScale)
{
    for (f32(&row)[4] : twist) {
        for (f32& k : row) k = anyFloat();
        row[3] *= constantScale;
    }
}

template <class T, std::size_t N> using Channels = std::array<std::array<T, 32 / sizeof(T)>, N>;

template <class Sample> Channels<Sample, 3> throughRegister(const auto& form, const Channels<Sample, 3>& in)
{
    using Samples = wide::RegisterOf<Sample>;
    const auto load = [&](int c) { return layouts::loadSamples<Samples>(reinterpret_cast<const u8*>(in[c].data())); };
    const Three<Samples> x = frame::apply(form, Three{load(0), load(1), load(2)});
    Channels<Sample, 3> out;
    layouts::storeSamples(reinterpret_cast<u8*>(out[0].data()), x.a);
    layouts::storeSamples(reinterpret_cast<u8*>(out[1].data()), x.b);
    layouts::storeSamples(reinterpret_cast<u8*>(out[2].data()), x.c);
    return out;
}

template <class Sample> Channels<Sample, 3> oneByOne(const auto& form, const Channels<Sample, 3>& in)
{
    Channels<Sample, 3> out;
    for (std::size_t i = 0; i < in[0].size(); ++i) {
        using scalar::F32;
        const auto x = form(F32(in[0][i]), F32(in[1][i]), F32(in[2][i]));
        out[0][i] = scalar::saturate<Sample>(x.a);
        out[1][i] = scalar::saturate<Sample>(x.b);
        out[2][i] = scalar::saturate<Sample>(x.c);
    }
    return out;
}

template <class Sample> Channels<Sample, 3> randomSamples()
{
    using Limits = std::numeric_limits<Sample>;
    Channels<Sample, 3> samples;
    for (auto& channel : samples) {
        for (Sample& x : channel) x = static_cast<Sample>(numbers());
        channel[0] = Limits::min();
        channel[1] = Limits::max();
        channel[2] = 0;
    }
    return samples;
}

template <class Sample> class IntegerTwist : public testing::Test
{
};

struct Names {
    template <class Sample> static std::string GetName(int i) { return std::array{"u8", "s8", "u16", "s16"}[i]; }
};
using IntegerSamples = testing::Types<u8, s8, u16, s16>;
TYPED_TEST_SUITE(IntegerTwist, IntegerSamples, Names);

TYPED_TEST(IntegerTwist, InstancesAgree)
{
    for (int i = 0; i < 20000; ++i) {
        f32 twist[3][4];
        fill(twist, std::numeric_limits<TypeParam>::max());
        const auto samples = randomSamples<TypeParam>();
        const TwistToInteger<TypeParam> form(twist);
        ASSERT_EQ(throughRegister<TypeParam>(form, samples), oneByOne<TypeParam>(form, samples)) << "matrix " << i;
    }
}

/// Where the matrix suits it, the form without the upper bound gives what the form with it gives.
TYPED_TEST(IntegerTwist, FormsAgreeWithinIntegers)
{
    using Form = TwistWithinIntegers<TypeParam>;
    int suited = 0;
    for (int i = 0; i < 20000; ++i) {
        f32 twist[3][4];
        fill(twist, std::numeric_limits<TypeParam>::max());
        if (!Form::suits(twist)) continue;
        ++suited;
        const auto samples = randomSamples<TypeParam>();
        const auto told = oneByOne<TypeParam>(TwistToInteger<TypeParam>(twist), samples);
        ASSERT_EQ(oneByOne<TypeParam>(Form(twist), samples), told) << "matrix " << i;
        ASSERT_EQ(throughRegister<TypeParam>(Form(twist), samples), told) << "matrix " << i;
    }
    EXPECT_GT(suited, 1000);
}

/// Where the matrix suits factors, bytes as factors give what converted bytes give: in planes, and interleaved.
template <class Byte> void expectFactorsAgree()
{
    using Samples = wide::RegisterOf<Byte>;
    using Interleaved = layouts::C3Sixteens<Byte>;
    int suited = 0;
    for (int i = 0; i < 20000; ++i) {
        f32 twist[3][4];
        fill(twist, std::numeric_limits<Byte>::max());
        if (!TwistOfBytes<Byte>::suits(twist)) continue;
        ++suited;
        const auto samples = randomSamples<Byte>();
        const auto told = oneByOne<Byte>(TwistToInteger<Byte>(twist), samples);

        const auto load = [&](int c) {
            return layouts::loadSamples<Samples>(reinterpret_cast<const u8*>(samples[c].data()));
        };
        const Three<Samples> x = apply(TwistOfPlanes<Byte>(twist), Three{load(0), load(1), load(2)});
        Channels<Byte, 3> found;
        layouts::storeSamples(reinterpret_cast<u8*>(found[0].data()), x.a);
        layouts::storeSamples(reinterpret_cast<u8*>(found[1].data()), x.b);
        layouts::storeSamples(reinterpret_cast<u8*>(found[2].data()), x.c);
        ASSERT_EQ(found, told) << "planes, matrix " << i;

        for (int first = 0; first < 32; first += 16) {
            u8 pixels[48];
            for (int k = 0; k < 48; ++k) pixels[k] = static_cast<u8>(samples[k % 3][first + k / 3]);
            Interleaved::store(pixels, apply(TwistOfBytes<Byte>(twist), Interleaved::load(pixels)));
            for (int k = 0; k < 48; ++k)
                ASSERT_EQ(pixels[k], static_cast<u8>(told[k % 3][first + k / 3])) << "matrix " << i << ", byte " << k;
        }
    }
    EXPECT_GT(suited, 1000);
}

TEST(TwistOfBytes, FactorsAgreeWithConvertedBytes)
{
    expectFactorsAgree<u8>();
    expectFactorsAgree<s8>();
}

/// Weights that a 2^24th part of which would not be exact, and those that the other forms are for as well.
TEST(TwistOfBytes, SuitsNoWeightsThatAreTooSmallOrTooLarge)
{
    const f32 usual[3][4] = {{0.5f, 0, 0x1p-90f, -1}, {-0x1p-90f, 0, 0, 0}, {1, 2, 3, 0}};
    const f32 small[3][4] = {{0.5f, 0, 0x1p-91f, -1}, {0, 0, 0, 0}, {1, 2, 3, 0}};
    const f32 large[3][4] = {{0.5f, 0, 0, -1}, {0, 0, 0, 0x1p30f}, {1, 2, 3, 0}};
    const f32 noNumber[3][4] = {{0.5f, 0, 0, -1}, {0, 0, std::numeric_limits<f32>::quiet_NaN(), 0}, {1, 2, 3, 0}};
    EXPECT_TRUE(TwistOfBytes<s8>::suits(usual));
    EXPECT_TRUE(TwistOfBytes<u8>::suits(usual));
    EXPECT_FALSE(TwistOfBytes<s8>::suits(small));
    EXPECT_FALSE(TwistOfBytes<u8>::suits(large));
    EXPECT_FALSE(TwistOfBytes<s8>::suits(noNumber));
}

TYPED_TEST(IntegerTwist, ResultsBeyondIntegersAreHeldByTheOtherForm)
{
    using Form = TwistWithinIntegers<TypeParam>;
    using Limits = std::numeric_limits<TypeParam>;
    constexpr f32 none = std::numeric_limits<f32>::quiet_NaN(), infinite = std::numeric_limits<f32>::infinity();
    for (const f32 constant : {0x1p31f, 0x1p32f, 3e38f, infinite, none}) {
        const f32 twist[3][4] = {{1, 0, 0, 0}, {0, 0, 0, constant}, {0, 0, 0, -constant}};
        EXPECT_FALSE(Form::suits(twist)) << constant;
        const auto out = throughRegister<TypeParam>(TwistToInteger<TypeParam>(twist), randomSamples<TypeParam>());
        EXPECT_EQ(out[1][0], Limits::max()) << constant;
        EXPECT_EQ(out[2][0], std::isnan(constant) ? Limits::max() : Limits::min()) << constant;
    }
}

/// The farthest sample from zero times the weights, and the constant term, below 2^30.
TEST(IntegerTwist, SuitsUpToABound)
{
    const f32 below[3][4] = {{0, 0, 0, 0x1.fffffep29f}, {0x1p21f, -0x1p21f, 0, 0}, {0, 0, 0, -0x1.fffffep29f}};
    const f32 at[3][4] = {{0, 0, 0, 0}, {0, 0, 0, 0}, {0, 0, 0, -0x1p30f}};
    const f32 byWeights[3][4] = {{0x1p22f, 0, -0x1p22f, 0}, {0, 0, 0, 0}, {0, 0, 0, 0}};
    EXPECT_TRUE(TwistWithinIntegers<u8>::suits(below));
    EXPECT_FALSE(TwistWithinIntegers<u8>::suits(at));
    EXPECT_TRUE(TwistWithinIntegers<s8>::suits(below));      // 128 x 2 x 2^21 is 2^29
    EXPECT_FALSE(TwistWithinIntegers<s8>::suits(byWeights)); // 128 x 2 x 2^22 is 2^30
    EXPECT_FALSE(TwistWithinIntegers<u16>::suits(below));    // 65535 x 2 x 2^21 is beyond
}

/// Not inline, so that all of it happens under the mode in force.
template <std::size_t N, class Form>
[[gnu::noinline]] void floatsThroughRegister(const Form& form, const Channels<f32, 4>& in, Channels<f32, 4>& out)
{
    const auto load = [&](int c) { return layouts::loadSamples<wide::F32>(reinterpret_cast<const u8*>(in[c].data())); };
    const auto store = [&](int c, wide::F32 x) { layouts::storeSamples(reinterpret_cast<u8*>(out[c].data()), x); };
    if constexpr (N == 3) {
        const auto x = frame::apply(form, Three{load(0), load(1), load(2)});
        store(0, x.a), store(1, x.b), store(2, x.c);
    } else {
        const auto x = frame::apply(form, Four{load(0), load(1), load(2), load(3)});
        store(0, x.a), store(1, x.b), store(2, x.c), store(3, x.d);
    }
}

template <std::size_t N, class Form>
[[gnu::noinline]] void floatsOneByOne(const Form& form, const Channels<f32, 4>& in, Channels<f32, 4>& out)
{
    using scalar::F32;
    for (std::size_t i = 0; i < in[0].size(); ++i) {
        if constexpr (N == 3) {
            const auto x = form(F32(in[0][i]), F32(in[1][i]), F32(in[2][i]));
            out[0][i] = x.a.v, out[1][i] = x.b.v, out[2][i] = x.c.v;
        } else {
            const auto x = form(F32(in[0][i]), F32(in[1][i]), F32(in[2][i]), F32(in[3][i]));
            out[0][i] = x.a.v, out[1][i] = x.b.v, out[2][i] = x.c.v, out[3][i] = x.d.v;
        }
    }
}

template <std::size_t N, class Form> void expectInstancesAgree()
{
    for (int i = 0; i < 20000; ++i) {
        f32 twist[N][4];
        fill(twist, 1);
        Channels<f32, 4> samples, wide = {}, scalar = {};
        for (auto& channel : samples) {
            for (f32& x : channel) x = anyFloat();
        }
        const Form form(twist);
        for (const int mode : {FE_TONEAREST, FE_DOWNWARD, FE_UPWARD, FE_TOWARDZERO}) {
            std::fesetround(mode);
            floatsThroughRegister<N>(form, samples, wide);
            floatsOneByOne<N>(form, samples, scalar);
            std::fesetround(FE_TONEAREST);
            for (std::size_t c = 0; c < N; ++c) {
                for (std::size_t k = 0; k < wide[c].size(); ++k) {
                    if (std::isnan(wide[c][k]) && std::isnan(scalar[c][k])) continue;
                    ASSERT_EQ(std::bit_cast<u32>(wide[c][k]), std::bit_cast<u32>(scalar[c][k]))
                        << "matrix " << i << ", channel " << c << ", mode " << mode;
                }
            }
        }
    }
}

TEST(FloatTwist, InstancesAgreeInEveryMode) { expectInstancesAgree<3, TwistOf<f32>>(); }
TEST(FusedTwist, InstancesAgreeInEveryMode) { expectInstancesAgree<4, TwistFused>(); }

} // namespace
