// 16-bit gamma of every sample, singly and by the table, against the C library's power.
#include "layouts/avx2/interleave.hpp"
#include "rounding_modes.hpp"
#include "tone/gamma_word_table.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

namespace
{

using namespace pyxcc;

struct Forward {
    using Curve = tone::ForwardCurve;
    static double of(double x, double v)
    {
        if (0.018 > x) return v * 4.5;
        return std::fma(std::pow(x, 0.45), 1.099, -0.099) * 65535.0;
    }
};

struct Inverse {
    using Curve = tone::InverseCurve;
    static double of(double x, double v)
    {
        if (0.0812 > x) return v * 0.2222222222222222;
        const double w = (x + 0.099) * 0.9099181073703366;
        return std::pow(w, 2.2222222222222223) * 65535.0;
    }
};

template <class Direction> u16 plain(int v)
{
    const float z = static_cast<float>(0.5 + Direction::of(1.5259021896696422e-5 * v, v));
    int t = static_cast<int>(z);
    if (t % 2 == 1 && z == static_cast<float>(t)) --t;
    return static_cast<u16>(t);
}

template <class Direction> void expectAllWords(int mode)
{
    constexpr int block = wide::U16::count;
    const tone::GammaOfWords<typename Direction::Curve> form;
    std::vector<u16> found(65536), table(65536), expected(65536);
    forms::roundingBy(mode, [&] {
        for (int v = 0; v < 65536; ++v) expected[v] = plain<Direction>(v);
        for (int v = 0; v < 65536; ++v) found[v] = static_cast<u16>(v);
        for (int v = 0; v < 65536; v += block) {
            u8* const at = reinterpret_cast<u8*>(&found[v]);
            layouts::storeSamples(at, apply(form, several(layouts::loadSamples<wide::U16>(at))).part[0]);
        }
        tone::fillTable<typename Direction::Curve>(table.data());
    });
    for (int v = 0; v < 65536; ++v) {
        ASSERT_EQ(found[v], expected[v]) << "of " << v << " in mode " << mode;
        ASSERT_EQ(table[v], expected[v]) << "of " << v << " in mode " << mode << ", by the table";
    }
}

TEST(GammaOfWords, ForwardIsThePlainStatement)
{
    for (const int mode : forms::roundingModes) expectAllWords<Forward>(mode);
}

TEST(GammaOfWords, InverseIsThePlainStatement)
{
    for (const int mode : forms::roundingModes) expectAllWords<Inverse>(mode);
}

} // namespace
