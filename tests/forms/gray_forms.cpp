// Weighted sums: the vector instance of each form against its scalar one.
#include "every_input.hpp"
#include "rounding_modes.hpp"

#include "matrix/gray_forms.hpp"

#include <bit>
#include <cmath>
#include <limits>
#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::matrix;

std::mt19937 numbers(11);

constexpr GrayWeights<int> bytesWeights{9798, 19235, 3736};

TEST(GrayHigh, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(GrayHigh(bytesWeights)); }
TEST(GrayExact, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(GrayExact(bytesWeights)); }

/// Sums that saturate or wrap.
TEST(GrayHigh, InstancesAgreeBeyondWhite) { forms::expectInstancesAgree(GrayHigh({32768, 65535, 40000})); }
TEST(GrayExact, InstancesAgreeBeyondWhite) { forms::expectInstancesAgree(GrayExact({-32768, 65535, 40000})); }

std::array<std::array<u8, 32>, 3> randomBytes()
{
    std::array<std::array<u8, 32>, 3> channels;
    for (auto& channel : channels) {
        for (u8& x : channel) x = static_cast<u8>(numbers());
    }
    return channels;
}

template <class Form> void expectInstancesAgreeOn(const Form& form, const std::array<std::array<u8, 32>, 3>& in)
{
    using layouts::loadSamples;
    const auto wide = forms::lanesOf(
        frame::apply(form, Three{loadSamples(in[0].data()), loadSamples(in[1].data()), loadSamples(in[2].data())}));
    for (int i = 0; i < 32; ++i) {
        using scalar::S16;
        ASSERT_EQ(int{wide[i]}, int{form(S16(in[0][i]), S16(in[1][i]), S16(in[2][i])).v})
            << "weights " << form.weights.a << ", " << form.weights.b << ", " << form.weights.c;
    }
}

TEST(GrayBytes, InstancesAgreeForAnyWeights)
{
    const auto weight = [] {
        constexpr int odd[] = {0, 1, -1, 32767, 32768, 65535, 65536, INT32_MIN, INT32_MAX};
        const auto number = static_cast<int>(numbers());
        return numbers() % 4 == 0 ? odd[numbers() % std::size(odd)] : number >> numbers() % 24;
    };
    for (int i = 0; i < 20000; ++i) {
        const GrayWeights<int> weights{weight(), weight(), weight()};
        const auto bytes = randomBytes();
        expectInstancesAgreeOn(GrayExact(weights), bytes);
        expectInstancesAgreeOn(GrayHigh(weights), bytes);
    }
}

TEST(GrayBytes, WeightsAreCutOffAfterHalfAStep)
{
    EXPECT_EQ(in32768ths(0.299f), 9798);  // 9797.63 and a half
    EXPECT_EQ(in32768ths(0.587f), 19235); // 19234.82
    EXPECT_EQ(in32768ths(0.114f), 3736);  // 3735.55
    EXPECT_EQ(in32768ths(1.0f), 32768);
    EXPECT_EQ(in32768ths(0.0f), 0);
    EXPECT_EQ(in32768ths(-0x1p-15f), 0); // -1 and a half
    EXPECT_EQ(in32768ths(-0x1p-14f), -1);
    EXPECT_EQ(in32768ths(1e30f), INT32_MIN);
}

TEST(GrayBytes, NegativeWeightsDoNotSuitUnsignedProducts)
{
    EXPECT_TRUE(GrayHigh::suits({0, 0, 0}));
    EXPECT_TRUE(GrayHigh::suits({32768, 65535, 70000}));
    EXPECT_FALSE(GrayHigh::suits({-1, 5, 5}));
    EXPECT_FALSE(GrayHigh::suits({5, -1, 5}));
    EXPECT_FALSE(GrayHigh::suits({5, 5, INT32_MIN}));
}

template <class Float> Float anyFloat()
{
    constexpr Float odd[] = {
        0, -Float{0}, 1, -1, std::numeric_limits<Float>::infinity(), std::numeric_limits<Float>::quiet_NaN()};
    if (numbers() % 20 == 0) return odd[numbers() % std::size(odd)];
    return std::ldexp(static_cast<Float>(static_cast<s32>(numbers())), -31 + static_cast<int>(numbers() % 8));
}

template <class Float> using FloatRegister = wide::RegisterOf<Float>;

/// Not inline, so that all of it happens under the mode in force.
template <class Float, std::size_t N>
[[gnu::noinline]] void throughRegister(const GraySum<Float>& form, const std::array<std::array<Float, N>, 3>& in,
                                       std::array<Float, N>& out)
{
    const auto load = [&](int c) {
        return layouts::loadSamples<FloatRegister<Float>>(reinterpret_cast<const u8*>(in[c].data()));
    };
    const FloatRegister<Float> y = frame::apply(form, Three{load(0), load(1), load(2)});
    layouts::storeSamples(reinterpret_cast<u8*>(out.data()), y);
}

template <class Float, std::size_t N>
[[gnu::noinline]] void oneByOne(const GraySum<Float>& form, const std::array<std::array<Float, N>, 3>& in,
                                std::array<Float, N>& out)
{
    using Lane = scalar::Float<Float>;
    for (std::size_t i = 0; i < N; ++i) out[i] = form(Lane(in[0][i]), Lane(in[1][i]), Lane(in[2][i])).v;
}

template <class Float> class GrayFloats : public testing::Test
{
};

struct Names {
    template <class Float> static std::string GetName(int i) { return std::array{"f32", "f64"}[i]; }
};
using Floats = testing::Types<f32, f64>;
TYPED_TEST_SUITE(GrayFloats, Floats, Names);

TYPED_TEST(GrayFloats, InstancesAgreeInEveryMode)
{
    using Bits = std::conditional_t<sizeof(TypeParam) == 4, u32, std::uint64_t>;
    constexpr std::size_t count = FloatRegister<TypeParam>::count;
    for (int i = 0; i < 20000; ++i) {
        const GraySum<TypeParam> form({anyFloat<TypeParam>(), anyFloat<TypeParam>(), anyFloat<TypeParam>()});
        std::array<std::array<TypeParam, count>, 3> in;
        for (auto& channel : in) {
            for (TypeParam& x : channel) x = anyFloat<TypeParam>();
        }
        for (const int mode : forms::roundingModes) {
            std::array<TypeParam, count> wide = {}, scalar = {};
            forms::roundingBy(mode, [&] {
                throughRegister(form, in, wide);
                oneByOne(form, in, scalar);
            });
            for (std::size_t k = 0; k < count; ++k) {
                if (std::isnan(wide[k]) && std::isnan(scalar[k])) continue;
                ASSERT_EQ(std::bit_cast<Bits>(wide[k]), std::bit_cast<Bits>(scalar[k])) << "mode " << mode;
            }
        }
    }
}

/// The samples as the form takes them, and what it gives as samples.
template <class Sample> class GrayWords : public testing::Test
{
};
struct WordNames {
    template <class Sample> static std::string GetName(int i) { return std::array{"u16", "s16"}[i]; }
};
using Words = testing::Types<u16, s16>;
TYPED_TEST_SUITE(GrayWords, Words, WordNames);

auto formFor(u16, const GrayOfWords& form) { return form; }
auto formFor(s16, const GrayOfWords& form) { return frame::OnRaisedWords<GrayOfWords>{form}; }

template <class Sample, class Form>
[[gnu::noinline]] void wordsThroughRegister(const Form& form, const std::array<std::array<Sample, 16>, 3>& in,
                                            std::array<Sample, 16>& out)
{
    const auto load = [&](int c) {
        return layouts::loadSamples<wide::RegisterOf<Sample>>(reinterpret_cast<const u8*>(in[c].data()));
    };
    layouts::storeSamples(reinterpret_cast<u8*>(out.data()), frame::apply(form, Three{load(0), load(1), load(2)}));
}

template <class Sample>
[[gnu::noinline]] void wordsOneByOne(const GrayOfWords& form, const std::array<std::array<Sample, 16>, 3>& in,
                                     std::array<Sample, 16>& out)
{
    constexpr int offset = std::is_signed_v<Sample> ? 32768 : 0;
    for (int i = 0; i < 16; ++i) {
        const auto float32 = [&](int c) { return scalar::F32(static_cast<f32>(in[c][i] + offset)); };
        const scalar::S32 y = form(float32(0), float32(1), float32(2));
        out[i] = static_cast<Sample>(scalar::saturate<u16>(y) - offset);
    }
}

TYPED_TEST(GrayWords, InstancesAgreeInEveryMode)
{
    for (int i = 0; i < 20000; ++i) {
        const GrayOfWords form(i % 2 == 0 ? defaultGray
                                          : GrayWeights<f32>{anyFloat<f32>(), anyFloat<f32>(), anyFloat<f32>()});
        std::array<std::array<TypeParam, 16>, 3> in;
        for (auto& channel : in) {
            for (TypeParam& x : channel) x = static_cast<TypeParam>(numbers());
        }
        for (const int mode : forms::roundingModes) {
            std::array<TypeParam, 16> wide = {}, scalar = {};
            forms::roundingBy(mode, [&] {
                wordsThroughRegister(formFor(TypeParam{}, form), in, wide);
                wordsOneByOne(form, in, scalar);
            });
            ASSERT_EQ(wide, scalar) << "mode " << mode;
        }
    }
}

/// Sums that no integer can hold saturate at the end that they are at.
TEST(GrayWords, SumsBeyondIntegersSaturate)
{
    std::array<std::array<u16, 16>, 3> in;
    for (auto& channel : in) channel.fill(65535);
    for (const f32 weight : {1e6f, 1e30f, std::numeric_limits<f32>::infinity()}) {
        std::array<u16, 16> out = {};
        wordsThroughRegister(GrayOfWords({weight, weight, weight}), in, out);
        EXPECT_EQ(out[0], 65535) << weight;
        wordsThroughRegister(GrayOfWords({-weight, -weight, -weight}), in, out);
        EXPECT_EQ(out[0], 0) << weight;
    }
}

} // namespace
