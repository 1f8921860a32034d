// The forms of RGB and full-range YUV, with chroma of each pixel's own and with shared chroma.
#include "chroma_of_sums.hpp"
#include "every_input.hpp"
#include "every_shared_chroma.hpp"

#include "subsampled/tight_images.hpp"
#include "subsampled/yuv_forms.hpp"

namespace
{

using namespace pyxcc::subsampled;
using forms::OfPixels;

template <class Form> class YuvForwardForm : public testing::Test
{
};

using ForwardForms = testing::Types<YuvFwdExactA, YuvFwdExactB, YuvFwdExactC, YuvFwdHigh, YuvFwdPlanar, YuvLumaNearest,
                                    YuvLumaFloor, YuvLumaFloor14, YuvLumaFloor15>;

struct ForwardNames {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"exactA",      "exactB",    "exactC",      "high",       "planar",
                          "lumaNearest", "lumaFloor", "lumaFloor14", "lumaFloor15"}[i];
    }
};

TYPED_TEST_SUITE(YuvForwardForm, ForwardForms, ForwardNames);

TYPED_TEST(YuvForwardForm, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

template <class Case> class YuvSharedChroma : public testing::Test
{
};

using ChromaForms = testing::Types<OfPixels<YuvChroma14, 4>, OfPixels<YuvChroma16, 4>, OfPixels<YuvChroma32768, 2>,
                                   OfPixels<YuvChroma65535, 2>, OfPixels<YuvChromaAlone, 1>,
                                   OfPixels<YuvChroma15<16383, 32767>, 1>, OfPixels<YuvChroma15<0, 0>, 1>>;

struct ChromaNames {
    template <class Case> static std::string GetName(int i)
    {
        return std::array{"exact14", "exact16", "exact32768", "exact65535", "alone", "odd15", "oddFloor15"}[i];
    }
};

TYPED_TEST_SUITE(YuvSharedChroma, ChromaForms, ChromaNames);

TYPED_TEST(YuvSharedChroma, InstancesAgreeOnSums) { TypeParam::expectInstancesAgreeOnSums(); }

template <class Form> class YuvInverseForm : public testing::Test
{
};

using InverseForms = testing::Types<YuvInvExactA, YuvInvExactB, YuvInvExactC, YuvInvExactD, YuvInvHigh3, YuvInvHigh4,
                                    YuvInvHigh4x, YuvInvHigh7, YuvInvHigh8, Yuv422OddInv13>;

struct InverseNames {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"exactA", "exactB", "exactC", "exactD", "high3",
                          "high4",  "high4x", "high7",  "high8",  "oddInv13"}[i];
    }
};

TYPED_TEST_SUITE(YuvInverseForm, InverseForms, InverseNames);

TYPED_TEST(YuvInverseForm, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

TYPED_TEST(YuvInverseForm, InstancesAgreeOnSharedChroma) { forms::expectSharedInstancesAgree(TypeParam{}); }

// The forms whose chroma is the difference to luma before its rounding.

using pyxcc::Three;
using pyxcc::Two;
using pyxcc::scalar::S16;
using pyxcc::wide::U8;

constexpr int columns = U8::count;
using RowOfBytes = std::array<u8, columns>;
using Pixels = std::array<RowOfBytes, 3>; // a row, R, G, B by themselves

Three<U8> load(const Pixels& row)
{
    const auto channel = [&](int i) { return pyxcc::layouts::loadSamples(row[i].data()); };
    return {channel(0), channel(1), channel(2)};
}

template <class Form> S16 fineOf(const Pixels& row, int x)
{
    return Form::fine(S16(row[0][x]), S16(row[1][x]), S16(row[2][x]));
}

template <class Form> void expectLuma(U8 luma, const Pixels& row)
{
    const auto lanes = forms::lanesOf(luma);
    for (int x = 0; x < columns; ++x) ASSERT_EQ(int{lanes[x]}, int{Form::luma(fineOf<Form>(row, x)).v}) << x;
}

/// Of the pairs of columns of one row or two.
template <class Form, std::size_t Rows>
void expectChroma(pyxcc::layouts::NarrowedPairs chroma, const std::array<Pixels, Rows>& rows)
{
    std::array<u8, columns / 2> u, v;
    pyxcc::layouts::storeApart<2>(u.data(), v.data(), chroma);
    for (int pair = 0; pair < columns / 2; ++pair) {
        S16 red = 0, blue = 0, luma = 0;
        for (const Pixels& row : rows) {
            for (const int x : {2 * pair, 2 * pair + 1}) {
                red = red + S16(row[0][x]);
                blue = blue + S16(row[2][x]);
                luma = luma + fineOf<Form>(row, x);
            }
        }
        const auto one = forms::bytesOf(Form::chroma(red, blue, luma));
        ASSERT_EQ(int{u[pair]}, int{one[0]}) << "U of pair " << pair;
        ASSERT_EQ(int{v[pair]}, int{one[1]}) << "V of pair " << pair;
    }
}

/// Pairs of rows: any pixels, pixels of nothing but least and greatest samples, and gray ones nearly.
template <class Check> void eachPairOfRows(const Check& check)
{
    std::mt19937 random(420);
    const auto sampleOf = [&](int kind, int gray) {
        if (kind == 0) return static_cast<u8>(random());
        if (kind == 1) return static_cast<u8>(random() % 2 ? 255 : 0);
        return static_cast<u8>(std::clamp(gray + static_cast<int>(random() % 5) - 2, 0, 255));
    };
    std::array<Pixels, 2> rows;
    for (int number = 0; number < 30000; ++number) {
        const int gray = static_cast<int>(random() % 256);
        for (Pixels& row : rows) {
            for (RowOfBytes& channel : row) {
                for (u8& sample : channel) sample = sampleOf(number % 3, gray);
            }
        }
        ASSERT_NO_FATAL_FAILURE(check(rows));
    }
    for (Pixels& row : rows) row.fill(RowOfBytes{});
    check(rows);
    for (Pixels& row : rows) {
        for (RowOfBytes& channel : row) channel.fill(255);
    }
    check(rows);
}

} // namespace

TEST(YuvRoundForms, InstancesAgreeOnPairsOfRows)
{
    eachPairOfRows([](const std::array<Pixels, 2>& rows) {
        const auto result = apply(yuv420Round, Two{load(rows[0]), load(rows[1])});
        expectLuma<YuvRound<4>>(result.luma.a, rows[0]);
        expectLuma<YuvRound<4>>(result.luma.b, rows[1]);
        expectChroma<YuvRound<4>>(result.chroma, rows);
    });
}

TEST(YuvRoundForms, InstancesAgreeOnRows)
{
    eachPairOfRows([](const std::array<Pixels, 2>& rows) {
        const auto result = apply(yuv422Round, load(rows[0]));
        expectLuma<YuvRound<2>>(result.luma, rows[0]);
        expectChroma<YuvRound<2>>(result.chroma, std::array<Pixels, 1>{rows[0]});
    });
}

TEST(TightImages, RowsOfEvenWidthMergeFrom256Pixels)
{
    const auto expect = [](RoiSize size, RoiSize told) {
        const RoiSize rows = asOneRow(size);
        EXPECT_EQ(rows.width, told.width) << size.width << " by " << size.height;
        EXPECT_EQ(rows.height, told.height) << size.width << " by " << size.height;
    };
    expect({2, 127}, {2, 127});
    expect({2, 128}, {256, 1});
    expect({254, 1}, {254, 1});
    expect({16, 16}, {256, 1});
    expect({640, 480}, {307200, 1});
    expect({17, 100}, {17, 100});
    expect({1, 1000}, {1, 1000});
    expect({32766, 65540}, {2147483640, 1});
    expect({32768, 65536}, {32768, 65536}); // 2^31
    expect({65536, 65536}, {65536, 65536}); // 2^32
}
