// Means of bytes and the forms of column filters: vector instances against scalar ones.
#include "every_input.hpp"

#include "subsampled/column_filters.hpp"

#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::subsampled;

/// The bytes that a form makes of rows, a lane of each.
std::array<u8, 1> bytesOf(scalar::U8 x) { return {x.v}; }
std::array<u8, 2> bytesOf(const Two<scalar::U8>& x) { return {x.a.v, x.b.v}; }
std::array<std::array<u8, 32>, 1> lanesOf(wide::U8 x) { return {forms::lanesOf(x)}; }
std::array<std::array<u8, 32>, 2> lanesOf(const Two<wide::U8>& x) { return {forms::lanesOf(x.a), forms::lanesOf(x.b)}; }

using Lanes = std::array<u8, 32>;

/// A lane of each row.
template <class Form, std::size_t N> void expectInstancesAgree(const Form& form, const std::array<Lanes, N>& rows)
{
    const auto load = [](const Lanes& row) { return layouts::loadSamples(row.data()); };
    const auto wide = std::apply([&](const auto&... row) { return lanesOf(form(load(row)...)); }, rows);
    for (int i = 0; i < 32; ++i) {
        const auto one = std::apply([&](const auto&... row) { return bytesOf(form(scalar::U8(row[i])...)); }, rows);
        for (std::size_t k = 0; k < one.size(); ++k) {
            ASSERT_EQ(int{wide[k][i]}, int{one[k]}) << "output " << k << " of a register and of one value, lane " << i;
        }
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

struct MeanDown : frame::OnColumns {
    template <class Sample> auto operator()(const Sample& x, const Sample& y) const { return avgDown(x, y); }
};

} // namespace

TEST(ColumnFilters, MeansOfTwoAgreeOnEveryInput)
{
    expectAgreementOnPairs(Between{});
    expectAgreementOnPairs(MeanDown{});
    expectAgreementOnPairs(TopFieldHalved{});
    expectAgreementOnPairs(BottomFieldHalved{});
    expectAgreementOnPairs(SmoothedAtEdge{});
    expectAgreementOnPairs(RaisedAtEdge{});
}

TEST(ColumnFilters, FormsOfThreeRowsAgreeOnEveryInput)
{
    expectAgreementOnTriples(TopFieldDoubled{});
    expectAgreementOnTriples(BottomFieldDoubled{});
    expectAgreementOnTriples(Smoothed{});
}

// The row and the one below it add, those around them take off: every sum of either kind against the ends and the
// middle of the other, and a million in between.
TEST(ColumnFilters, FourTapsAgree)
{
    const FourTaps form;
    for (int x = 0; x < 256; ++x) {
        for (int y = 0; y < 256; y += 32) {
            for (const int other : {0, 1, 127, 128, 254, 255}) {
                const Lanes a = filled(x), b = upFrom(y), c = filled(other);
                ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{c, a, b, c}));
                ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, std::array{a, c, c, b}));
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
