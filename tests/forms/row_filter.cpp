// The forms of RGB to YCbCr with chroma filtered along the row, against their formulas.
#include "every_input.hpp"

#include "subsampled/row_filter.hpp"

#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::subsampled;

int luma(int r, int g, int b) { return (8422 * r + 16515 * g + 3212 * b + 0x84000) >> 15; }

using Lanes = std::array<u8, 32>;

Three<wide::U8> load(const std::array<Lanes, 3>& channels)
{
    const auto channel = [&](int c) { return layouts::loadSamples(channels[c].data()); };
    return {channel(0), channel(1), channel(2)};
}

/// What a block gives by the formulas: luma, and the chroma of each pair behind the pixel `before`.
struct Expected {
    Lanes luma;
    std::array<u8, 16> cb, cr;
};

Expected byFormulas(const std::array<Lanes, 3>& channels, const std::array<u8, 3>& before)
{
    const auto& [r, g, b] = channels;
    Expected expected;
    for (int i = 0; i < 32; ++i) expected.luma[i] = static_cast<u8>(luma(r[i], g[i], b[i]));
    const auto oddCb = [](int red, int green, int blue) { return 3596 * blue - 1213 * red - 2385 * green; };
    const auto oddCr = [](int red, int green, int blue) { return 3596 * red - 3015 * green - 582 * blue; };
    int carryCb = oddCb(before[0], before[1], before[2]), carryCr = oddCr(before[0], before[1], before[2]);
    for (int p = 0; p < 16; ++p) {
        const int e = 2 * p, o = e + 1;
        const int ownCb = oddCb(r[o], g[o], b[o]), ownCr = oddCr(r[o], g[o], b[o]);
        const int cb = 7193 * b[e] - 2426 * r[e] - 4769 * g[e] + ownCb + carryCb + 0x403FFF;
        const int cr = 7193 * r[e] - 6030 * g[e] - 1164 * b[e] + ownCr + carryCr + 0x403FFF;
        expected.cb[p] = static_cast<u8>(cb >> 15);
        expected.cr[p] = static_cast<u8>(cr >> 15);
        carryCb = ownCb;
        carryCr = ownCr;
    }
    return expected;
}

void expectFormulas(const std::array<Lanes, 3>& channels, const std::array<u8, 3>& before)
{
    const Expected expected = byFormulas(channels, before);
    const auto block =
        apply(FilteredPairs<AsStored>{}, layouts::AfterPixel<Three<wide::U8>>{load(channels), before.data()});
    std::array<u8, 16> cb, cr;
    layouts::storeApart<2>(cb.data(), cr.data(), block.chroma);
    ASSERT_EQ(forms::lanesOf(block.luma), expected.luma);
    ASSERT_EQ(cb, expected.cb);
    ASSERT_EQ(cr, expected.cr);
}

} // namespace

TEST(RowFilter, LumaIsTheFormulaOnEveryInput)
{
    Lanes blue;
    for (int r = 0; r < 256; ++r) {
        for (int g = 0; g < 256; ++g) {
            for (int first = 0; first < 256; first += 32) {
                for (int i = 0; i < 32; ++i) blue[i] = static_cast<u8>(first + i);
                const Three pixels{wide::U8(r), wide::U8(g), layouts::loadSamples(blue.data())};
                const Lanes y = forms::lanesOf(apply(lumaExact15, pixels));
                for (int i = 0; i < 32; ++i) {
                    const int b = first + i, expected = luma(r, g, b);
                    ASSERT_EQ(int{y[i]}, expected) << r << ", " << g << ", " << b;
                    const scalar::Byte one = lumaExact15(scalar::S16(r), scalar::S16(g), scalar::S16(b));
                    ASSERT_EQ(int{one.v}, expected) << "one value of " << r << ", " << g << ", " << b;
                }
            }
        }
    }
}

// Samples at both ends of their range take the sums there; a million others come between.
TEST(RowFilter, ChromaIsTheFormulaInEveryPair)
{
    std::mt19937 random(1422);
    for (int round = 0; round < 1 << 16; ++round) {
        const bool ends = round % 2 == 0;
        const auto sample = [&] { return static_cast<u8>(ends ? (random() & 1 ? 255 : 0) : random()); };
        std::array<Lanes, 3> channels;
        for (Lanes& channel : channels) {
            for (u8& x : channel) x = sample();
        }
        ASSERT_NO_FATAL_FAILURE(expectFormulas(channels, {sample(), sample(), sample()}));
    }
}

TEST(RowFilter, GammaTakesThePixelInFrontAsWell)
{
    std::mt19937 random(45);
    std::array<Lanes, 3> channels, mapped;
    std::array<u8, 3> before, mappedBefore;
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < 32; ++i) {
            channels[c][i] = static_cast<u8>(random());
            mapped[c][i] = tone::gammaForwardTable[channels[c][i]];
        }
        before[c] = static_cast<u8>(random());
        mappedBefore[c] = tone::gammaForwardTable[before[c]];
    }
    const auto block =
        apply(FilteredPairs<GammaCorrected>{}, layouts::AfterPixel<Three<wide::U8>>{load(channels), before.data()});
    const Expected expected = byFormulas(mapped, mappedBefore);
    std::array<u8, 16> cb, cr;
    layouts::storeApart<2>(cb.data(), cr.data(), block.chroma);
    EXPECT_EQ(forms::lanesOf(block.luma), expected.luma);
    EXPECT_EQ(cb, expected.cb);
    EXPECT_EQ(cr, expected.cr);
}
