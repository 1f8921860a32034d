// The powers of the gamma curves against the C library's, and registers against single values.
#include "rounding_modes.hpp"
#include "tone/gamma_forms.hpp"

#include <gtest/gtest.h>

#include <array>
#include <bit>
#include <cmath>
#include <cstring>
#include <limits>
#include <random>

namespace
{

using namespace pyxcc;

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double nan = std::numeric_limits<double>::quiet_NaN();

struct Power045 {
    static constexpr double exponent = 0.45, least = 0.018;
    template <class F64> static F64 of(const F64& x) { return tone::power045(x); }
};

struct Power222 {
    static constexpr double exponent = 2.2222222222222223, least = 0.16;
    template <class F64> static F64 of(const F64& x) { return tone::power222(x); }
};

using Eight = std::array<double, 8>;

template <class Power> Eight inRegisters(const Eight& x)
{
    using wide::F64;
    Several<F64, 2> lanes;
    std::memcpy(&lanes, x.data(), sizeof lanes);
    lanes = Power::of(lanes);
    Eight y;
    std::memcpy(y.data(), &lanes, sizeof y);
    return y;
}

/// Distance in units in the last place.
long distance(double x, double y) { return std::labs(std::bit_cast<long>(x) - std::bit_cast<long>(y)); }

template <class Power> void expectPowers(const Eight& x)
{
    for (const int mode : forms::roundingModes) {
        Eight wide, single, library;
        forms::roundingBy(mode, [&] {
            wide = inRegisters<Power>(x);
            for (int i = 0; i < 8; ++i) single[i] = Power::of(scalar::F64(x[i])).v;
            for (int i = 0; i < 8; ++i) library[i] = std::pow(x[i], Power::exponent);
        });
        for (int i = 0; i < 8; ++i) {
            ASSERT_EQ(std::bit_cast<long>(wide[i]), std::bit_cast<long>(single[i])) << x[i] << " in mode " << mode;
            ASSERT_LE(distance(wide[i], library[i]), 1) << x[i] << " in mode " << mode;
        }
    }
}

template <class Power> class GammaPower : public testing::Test
{
};
using Powers = testing::Types<Power045, Power222>;
TYPED_TEST_SUITE(GammaPower, Powers);

TYPED_TEST(GammaPower, WithinOneUnitOfTheLibrarys)
{
    std::mt19937_64 random(1);
    std::uniform_real_distribution<double> level(TypeParam::least, 1);
    // As far as a quotient of floats goes.
    std::uniform_real_distribution<double> log2(std::log2(TypeParam::least), 277);
    for (int i = 0; i < 50000; ++i) {
        Eight x;
        for (double& value : x) value = level(random);
        ASSERT_NO_FATAL_FAILURE(expectPowers<TypeParam>(x));
        for (double& value : x) value = std::exp2(log2(random));
        ASSERT_NO_FATAL_FAILURE(expectPowers<TypeParam>(x));
    }
}

TYPED_TEST(GammaPower, AtTheEndsOfItsRange)
{
    const double least = TypeParam::least;
    expectPowers<TypeParam>({least, std::nextafter(least, 1), 1, std::nextafter(1, 0), std::nextafter(1, 2), 2,
                             std::nextafter(2, 0), 0x1p277});
    expectPowers<TypeParam>({0.25, 0.5, 4, 1024, 0x1p20, 0x1p40, 0x1p127, 0x1.fffffep127});
}

TYPED_TEST(GammaPower, InfinityAndNaNPassThrough)
{
    const Eight y = inRegisters<TypeParam>({1, infinity, nan, 1, 1, 1, infinity, 1});
    EXPECT_EQ(y[0], 1);
    EXPECT_EQ(y[1], infinity);
    EXPECT_TRUE(std::isnan(y[2]));
    EXPECT_EQ(y[6], infinity);
    EXPECT_EQ(TypeParam::of(scalar::F64(infinity)).v, infinity);
    EXPECT_TRUE(std::isnan(TypeParam::of(scalar::F64(nan)).v));
}

/// Floats of every kind between bounds: the same in registers and singly, in all rounding modes.
template <class Curve> void expectFloats(f32 vMin, f32 vMax)
{
    constexpr f32 most = std::numeric_limits<f32>::max(), least = std::numeric_limits<f32>::denorm_min();
    constexpr f32 none = std::numeric_limits<f32>::quiet_NaN(), beyond = std::numeric_limits<f32>::infinity();
    const std::array<f32, 24> special = {0,      -0.0f,   least,  -least, 1,     -1,     most,       -most,
                                         beyond, -beyond, none,   vMin,   vMax,  0.018f, 0.0812f,    0.5f,
                                         0.25f,  2,       100.5f, 1e-30f, 1e30f, -1e-5f, 0.9999999f, 1.0000001f};
    for (const int mode : forms::roundingModes) {
        forms::roundingBy(mode, [&] {
            const tone::GammaBetween<Curve> form(vMin, vMax);
            Several<wide::F32, 3> lanes;
            std::memcpy(&lanes, special.data(), sizeof lanes);
            lanes = apply(form, lanes);
            std::array<f32, 24> found;
            std::memcpy(found.data(), &lanes, sizeof lanes);
            for (int i = 0; i < 24; ++i) {
                const f32 single = form(scalar::F32(special[i])).v;
                EXPECT_TRUE(found[i] == single || (std::isnan(found[i]) && std::isnan(single)))
                    << special[i] << " between " << vMin << " and " << vMax << ": " << found[i] << ", " << single;
            }
        });
    }
}

TEST(GammaBetween, InstancesAgree)
{
    for (const auto& [vMin, vMax] : {std::pair{0.0f, 1.0f}, {-1.5f, 3.25f}, {0.0f, 1e-38f}, {-1e38f, 2e38f}}) {
        expectFloats<tone::ForwardCurve>(vMin, vMax);
        expectFloats<tone::InverseCurve>(vMin, vMax);
    }
}

} // namespace
