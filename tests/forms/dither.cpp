// Ordered dithering: the scalar instance against the plain rule over all channels and thresholds, registers against
// that.
#include "every_input.hpp"

#include "packed/dithered_pixels.hpp"

namespace
{

using namespace pyxcc::packed;
using pyxcc::layouts::bytes;
using pyxcc::layouts::storeSamples;
using pyxcc::scalar::S16;
using pyxcc::scalar::U16;
using pyxcc::wide::U8;

/// The nearest of `levels` fields below, `unit` / 2^`bits` being a field's share of 256; the next one if what is left
/// is above the threshold.
struct Rule {
    int levels, step, unit, bits;

    int field(int c, int threshold) const
    {
        const int below = c * levels >> 8;
        const int rest = c * 256 - below * step;
        return (rest > threshold ? below + 1 : below) * unit >> bits;
    }
};

template <int Bits> struct Case {
    static constexpr int bits = Bits;
    static constexpr Rule rule = Bits == 4   ? Rule{15, 4352, 1, 0}
                                 : Bits == 5 ? Rule{31, 2105, 2105, 11}
                                             : Rule{63, 1036, 1036, 10};
};

template <class Field> class DitherOfField : public testing::Test
{
};

using Fields = testing::Types<Case<4>, Case<5>, Case<6>>;
struct Names {
    template <class Field> static std::string GetName(int) { return std::to_string(Field::bits) + "Bits"; }
};
TYPED_TEST_SUITE(DitherOfField, Fields, Names);

TYPED_TEST(DitherOfField, FollowsTheRule)
{
    constexpr int bits = TypeParam::bits;
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column) {
            const int threshold = Field<bits>::thresholds[row][column];
            const auto [slope, start] = lineOf<bits>(threshold);
            for (int c = 0; c < 256; ++c) {
                const int word = Dither<bits>{}(S16(c), Line<U16>{slope, start}).v;
                ASSERT_EQ(word >> (16 - bits), TypeParam::rule.field(c, threshold)) << c << " against " << threshold;
            }
        }
    }
}

TYPED_TEST(DitherOfField, InstancesAgree)
{
    constexpr int bits = TypeParam::bits;
    for (int row = 0; row < 8; ++row) {
        const auto lines = linesOfRow<bits>(row);
        for (int c = 0; c < 256; ++c) {
            const auto [low, high] = widen(U8(c));
            std::array<u16, U8::count> words;
            storeSamples(bytes(words.data()), Dither<bits>{}(low, lines));
            storeSamples(bytes(words.data() + words.size() / 2), Dither<bits>{}(high, lines));
            for (std::size_t x = 0; x < words.size(); ++x) {
                const auto [slope, start] = lineOf<bits>(Field<bits>::thresholds[row % 4][x % 4]);
                ASSERT_EQ(words[x], Dither<bits>{}(S16(c), Line<U16>{slope, start}).v)
                    << c << " in column " << x << " of row " << row;
            }
        }
    }
}

} // namespace
