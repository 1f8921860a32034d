// The tables of 8-bit gamma against the rule that makes them, and looked up by a register against one value at a time.
#include "tone/gamma_tables.hpp"
#include "layouts/avx2/interleave.hpp"
#include "tone/gamma_forms.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cmath>

namespace
{

using namespace pyxcc;

/// Rounds half an integer to the even one.
int nearestEven(double y)
{
    const double below = std::floor(y), rest = y - below;
    const bool odd = std::fmod(below, 2) != 0;
    return static_cast<int>(rest > 0.5 || (rest == 0.5 && odd) ? below + 1 : below);
}

double forward(int v)
{
    const double x = v / 255.0;
    return x < 0.018 ? 4.5 * v : (1.099 * std::pow(x, 0.45) - 0.099) * 255;
}

double inverse(int v)
{
    const double x = v / 255.0;
    return x < 0.0812 ? v / 4.5 : std::pow((x + 0.099) / 1.099, 1 / 0.45) * 255;
}

template <const ByteCurve& curve> void expectTable(const ByteTable& table, double (*rule)(int))
{
    for (int first = 0; first < 256; first += wide::U8::count) {
        std::array<u8, wide::U8::count> bytes;
        for (int i = 0; i < wide::U8::count; ++i) bytes[i] = static_cast<u8>(first + i);
        layouts::storeSamples(bytes.data(), wide::lookUp<curve>(layouts::loadSamples(bytes.data())));
        for (int i = 0; i < wide::U8::count; ++i) {
            const int v = first + i;
            EXPECT_EQ(table[v], nearestEven(rule(v))) << v;
            EXPECT_EQ(bytes[i], table[v]) << v;
            EXPECT_EQ(lookUp(curve, static_cast<u8>(v)), table[v]) << v;
        }
    }
}

TEST(GammaTable, FollowsTheRuleForward)
{
    expectTable<tone::gammaForward>(tone::gammaForwardTable, forward);
    EXPECT_EQ(tone::gammaForwardTable[1], 4); // a tie
}

TEST(GammaTable, FollowsTheRuleInverse) { expectTable<tone::gammaInverse>(tone::gammaInverseTable, inverse); }

/// Curves that no slopes and bits can tell are refused.
TEST(GammaTable, AnyOtherTableIsNoCurve)
{
    constexpr auto changed = [](int v, int by) {
        ByteTable table = tone::gammaForwardTable;
        table[v] = static_cast<u8>(table[v] + by);
        return table;
    };
    EXPECT_FALSE(tells(asCurve(changed(200, 3)), changed(200, 3)));
    EXPECT_FALSE(tells(asCurve(changed(3, 9)), changed(3, 9)));
    EXPECT_FALSE(tells(tone::gammaForward, tone::gammaInverseTable));
}

} // namespace
