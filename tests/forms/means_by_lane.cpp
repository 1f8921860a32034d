// Means of bytes whose halves are rounded up in the first lanes and down in the others: every pair of bytes.
#include "every_input.hpp"

#include "layouts/avx2/interleave.hpp"

#include <gtest/gtest.h>

#include <array>

using namespace pyxcc;

TEST(MeansByLane, HalvesAreRoundedUpInTheFirstLanesOnly)
{
    std::array<u8, 32> row;
    for (int lanes : {-40, -1, 0, 1, 15, 16, 17, 31, 32, 33, 1000}) {
        for (int x = 0; x < 256; ++x) {
            for (int start = 0; start < 256; ++start) {
                for (int i = 0; i < 32; ++i) row[i] = static_cast<u8>(start + i);
                const auto means = forms::lanesOf(wide::avgUpBelow(lanes, x, layouts::loadSamples(row.data())));
                for (int i = 0; i < 32; ++i) {
                    ASSERT_EQ(means[i], (x + row[i] + (i < lanes ? 1 : 0)) / 2)
                        << x << " and " << int{row[i]} << " in lane " << i << ", up below " << lanes;
                }
            }
        }
    }
}
