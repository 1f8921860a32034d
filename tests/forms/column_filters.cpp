// Means of bytes and the forms of column filters: vector instances against scalar ones.
#include "every_input.hpp"

#include "layouts/avx2/interleave.hpp"
#include "subsampled/column_filters.hpp"

#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::subsampled;

using Lanes = std::array<u8, 32>;

/// A lane of each row.
template <class Form, std::size_t N> void expectInstancesAgree(const Form& form, const std::array<Lanes, N>& rows)
{
    const auto load = [](const Lanes& row) { return layouts::loadSamples(row.data()); };
    const Lanes wide = std::apply([&](const auto&... row) { return forms::lanesOf(form(load(row)...)); }, rows);
    for (int i = 0; i < 32; ++i) {
        const scalar::U8 one = std::apply([&](const auto&... row) { return form(scalar::U8(row[i])...); }, rows);
        ASSERT_EQ(int{wide[i]}, int{one.v}) << "of a register and of one value, lane " << i;
    }
}

/// Bytes counting up from `first`.
Lanes upFrom(int first)
{
    Lanes lanes;
    for (int i = 0; i < 32; ++i) lanes[i] = static_cast<u8>(first + i);
    return lanes;
}

Lanes filled(int value)
{
    Lanes lanes;
    lanes.fill(static_cast<u8>(value));
    return lanes;
}

/// Every pair of bytes.
template <class Form> void expectAgreementOnPairs(const Form& form)
{
    for (int x = 0; x < 256; ++x) {
        for (int y = 0; y < 256; y += 32) {
            ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{filled(x), upFrom(y)}));
        }
    }
}

/// Every triple of bytes.
template <class Form> void expectAgreementOnTriples(const Form& form)
{
    for (int x = 0; x < 256; ++x) {
        for (int y = 0; y < 256; ++y) {
            for (int z = 0; z < 256; z += 32) {
                ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{filled(x), filled(y), upFrom(z)}));
            }
        }
    }
}

struct HalfWayDown {
    template <class Sample> Sample operator()(const Sample& x, const Sample& y) const { return avgDown(x, y); }
};

template <class... Forms> void expectAgreementOnPairsOf(const Forms&... forms) { (expectAgreementOnPairs(forms), ...); }

} // namespace

TEST(ColumnFilters, MeansOfTwoAgreeOnEveryInput)
{
    expectAgreementOnPairsOf(HalfWay{}, HalfWayDown{}, Between<2, 3, 1>{}, Between<2, 1, 3>{}, Between<3, 1, 7>{},
                             Between<3, 7, 1>{}, Between<3, 3, 5>{}, Between<3, 5, 3>{}, SmoothedAtEdge{},
                             RaisedAtEdge{});
}

TEST(ColumnFilters, MeansOfMeansAgreeOnEveryInput) { expectAgreementOnTriples(Smoothed{}); }

// The row and the one below it add, those around them take off: every sum of either kind against the ends and the
// middle of the other, and a million in between.
TEST(ColumnFilters, FourTapsAgree)
{
    const FourTaps form;
    for (int x = 0; x < 256; ++x) {
        for (int y = 0; y < 256; y += 32) {
            for (const int other : {0, 1, 127, 128, 254, 255}) {
                const Lanes a = filled(x), b = upFrom(y), c = filled(other);
                ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{a, b, c, c}));
                ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{c, c, a, b}));
            }
        }
    }
    std::mt19937 random(9991);
    std::array<Lanes, 4> rows;
    for (int block = 0; block < 1 << 15; ++block) {
        for (Lanes& row : rows) {
            for (u8& sample : row) sample = static_cast<u8>(random());
        }
        ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, rows));
    }
}
