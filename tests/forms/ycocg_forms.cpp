// The forms of YCoCg: vector instances against scalar ones, of bytes on every input, of words at random.
#include "ycocg/ycocg_forms.hpp"
#include "layouts/avx2/interleave.hpp"
#include "ycocg/depths.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::ycocg;

/// What registers hold, in the order in which bytes are widened: each half of a register by itself.
template <class Sample, class Register> std::array<Sample, 32 / sizeof(Sample)> lanesOf(const Register& x)
{
    std::array<Sample, 32 / sizeof(Sample)> lanes;
    layouts::storeSamples(reinterpret_cast<u8*>(lanes.data()), x);
    return lanes;
}

/// The columns of a block of bytes among two registers of words.
std::array<s16, 32> columnsOf(const Two<wide::S16>& x)
{
    const auto low = lanesOf<s16>(x.a), high = lanesOf<s16>(x.b);
    std::array<s16, 32> columns;
    for (int i = 0; i < 32; ++i) columns[i] = (i / 8 % 2 == 0 ? low : high)[i % 8 + i / 16 * 8];
    return columns;
}

template <class Form> void expectWordsOfEveryInput(const Form& form)
{
    const auto thirds = [](int first) {
        std::array<u8, 32> samples;
        for (int i = 0; i < 32; ++i) samples[i] = static_cast<u8>(first + i);
        return layouts::loadSamples<wide::U8>(samples.data());
    };
    for (int a = 0; a < 256; ++a) {
        for (int b = 0; b < 256; ++b) {
            for (int c = 0; c < 256; c += 32) {
                const auto wide = apply(toDoubleWidth(form), Three{wide::U8(a), wide::U8(b), thirds(c)});
                const auto x = columnsOf(wide.a), y = columnsOf(wide.b), z = columnsOf(wide.c);
                for (int i = 0; i < 32; ++i) {
                    const auto one = form(scalar::S16(a), scalar::S16(b), scalar::S16(c + i));
                    ASSERT_EQ(x[i], one.a.v) << a << ' ' << b << ' ' << c + i;
                    ASSERT_EQ(y[i], one.b.v) << a << ' ' << b << ' ' << c + i;
                    ASSERT_EQ(z[i], one.c.v) << a << ' ' << b << ' ' << c + i;
                }
            }
        }
    }
}

TEST(YCoCgForm, PlainOfEveryBytes) { expectWordsOfEveryInput(PlainForward{}); }
TEST(YCoCgForm, ReversibleOfEveryBytes) { expectWordsOfEveryInput(ReversibleForward<Wrapping>{}); }
TEST(YCoCgForm, OffsetOfEveryBytes) { expectWordsOfEveryInput(OffsetForward{}); }
TEST(YCoCgForm, OffsetInverseOfEveryBytes) { expectWordsOfEveryInput(OffsetInverse{}); }

template <class Form> void expectWordsAgree(const Form& form)
{
    std::mt19937 random(1);
    constexpr s16 ends[] = {-32768, -32767, -1, 0, 1, 32766, 32767};
    for (int round = 0; round < 100000; ++round) {
        std::array<std::array<s16, 16>, 3> in;
        for (auto& channel : in) {
            for (s16& sample : channel) sample = random() % 2 == 0 ? ends[random() % 7] : static_cast<s16>(random());
        }
        const auto load = [&](int c) {
            return layouts::loadSamples<wide::S16>(reinterpret_cast<const u8*>(in[c].data()));
        };
        const auto wide = apply(inWords(form), Three{load(0), load(1), load(2)});
        const auto a = lanesOf<s16>(wide.a), b = lanesOf<s16>(wide.b), c = lanesOf<s16>(wide.c);
        for (int i = 0; i < 16; ++i) {
            const auto one = form(scalar::S16(in[0][i]), scalar::S16(in[1][i]), scalar::S16(in[2][i]));
            ASSERT_EQ(a[i], one.a.v);
            ASSERT_EQ(b[i], one.b.v);
            ASSERT_EQ(c[i], one.c.v);
        }
    }
}

TEST(YCoCgForm, WordsWrap)
{
    expectWordsAgree(PlainInverse{});
    expectWordsAgree(ReversibleForward<Wrapping>{});
    expectWordsAgree(ReversibleInverse<Wrapping>{});
}

TEST(YCoCgForm, WordsSaturate)
{
    expectWordsAgree(ReversibleForward<Saturating>{});
    expectWordsAgree(ReversibleInverse<Saturating>{});
}

} // namespace
