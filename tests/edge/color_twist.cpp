// Colour twists: borders of kernels, ties, bounds, what is kept and in which order arguments are tested.
#include "pyxcc/color_twist.h"

#include <gtest/gtest.h>

#include <array>
#include <cfenv>
#include <cmath>
#include <limits>
#include <numeric>
#include <vector>
#include <xmmintrin.h>

namespace
{

constexpr f32 identity[3][4] = {{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}};
constexpr f32 mixing[3][4] = {{0.25f, 0.5f, 0.25f, 1}, {-0.5f, 1.25f, 0.125f, 8}, {0.75f, 0, 0.5f, -3}};
constexpr f32 notANumber = std::numeric_limits<f32>::quiet_NaN();

template <class T> std::vector<T> counted(int count)
{
    std::vector<T> samples(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) samples[static_cast<std::size_t>(i)] = static_cast<T>((i * 37 + i / 7) % 251);
    return samples;
}

/// The vector unit's and the old unit's mode, put back at the end.
class RoundingMode
{
public:
    explicit RoundingMode(int mode) : before(std::fegetround()) { std::fesetround(mode); }
    ~RoundingMode() { std::fesetround(before); }
    RoundingMode(const RoundingMode&) = delete;
    RoundingMode& operator=(const RoundingMode&) = delete;

private:
    int before;
};

constexpr std::array modes = {FE_TONEAREST, FE_DOWNWARD, FE_UPWARD, FE_TOWARDZERO};

} // namespace

TEST(ColorTwist, OnePixelAtATimeIsTheSameAsARow)
{
    constexpr int width = 45;
    const auto bytes = counted<u8>(3 * width);
    const auto floats = counted<f32>(3 * width);
    std::vector<u8> byteRow(3 * width), lone(3);
    std::vector<f32> floatRow(3 * width), loneFloat(3);
    ASSERT_EQ(pyxiColorTwist32f_8u_C3R(bytes.data(), 3 * width, byteRow.data(), 3 * width, {width, 1}, mixing), pyxOk);
    ASSERT_EQ(pyxiColorTwist_32f_C3R(floats.data(), 12 * width, floatRow.data(), 12 * width, {width, 1}, mixing),
              pyxOk);
    for (int x = 0; x < width; ++x) {
        ASSERT_EQ(pyxiColorTwist32f_8u_C3R(bytes.data() + 3 * x, 3, lone.data(), 3, {1, 1}, mixing), pyxOk);
        ASSERT_EQ(pyxiColorTwist_32f_C3R(floats.data() + 3 * x, 12, loneFloat.data(), 12, {1, 1}, mixing), pyxOk);
        for (int c = 0; c < 3; ++c) {
            EXPECT_EQ(lone[c], byteRow[3 * x + c]) << "column " << x;
            EXPECT_EQ(loneFloat[c], floatRow[3 * x + c]) << "column " << x;
        }
    }
}

TEST(ColorTwist, TiesGoToEvenWhateverTheCallersMode)
{
    // 255 / 2 is 127.5 and 253 / 2 is 126.5: 128 and 126 are even.
    constexpr f32 halves[3][4] = {{0.5f, 0, 0, 0}, {0, 0.5f, 0, 0}, {0, 0, 0.5f, 0}};
    const u8 source[3] = {255, 253, 1};
    for (const int mode : modes) {
        const RoundingMode set(mode);
        const unsigned before = _mm_getcsr() & 0x6000;
        u8 target[3] = {};
        EXPECT_EQ(pyxiColorTwist32f_8u_C3R(source, 3, target, 3, {1, 1}, halves), pyxOk);
        EXPECT_EQ(_mm_getcsr() & 0x6000, before);
        EXPECT_EQ(target[0], 128);
        EXPECT_EQ(target[1], 126);
        EXPECT_EQ(target[2], 0);
    }
}

TEST(ColorTwist, FloatsFollowTheCallersMode)
{
    // 1 + 2^-30 lies between 1 and the next float, 1 + 2^-23.
    constexpr f32 add[3][4] = {{1, 0, 0, 0x1p-30f}, {0, 1, 0, 0x1p-30f}, {0, 0, 1, 0x1p-30f}};
    const f32 source[3] = {1, 1, 1};
    for (const int mode : modes) {
        const RoundingMode set(mode);
        f32 target[3] = {};
        EXPECT_EQ(pyxiColorTwist_32f_C3R(source, 12, target, 12, {1, 1}, add), pyxOk);
        for (const f32 sample : target) EXPECT_EQ(sample, mode == FE_UPWARD ? 1 + 0x1p-23f : 1.0f);
    }
}

TEST(ColorTwist, LastOrdinaryAndFirstStreamedSizeAgree)
{
    // 11664 pixels are 34992 samples, 11665 are 34995, the first count past it.
    constexpr int width = 11665;
    const auto source = counted<f32>(3 * width);
    std::vector<f32> streamed(3 * width), ordinary(3 * width);
    ASSERT_EQ(pyxiColorTwist_32f_C3R(source.data(), 12 * width, streamed.data(), 12 * width, {width, 1}, mixing),
              pyxOk);
    ASSERT_EQ(pyxiColorTwist_32f_C3R(source.data(), 12 * width, ordinary.data(), 12 * width, {width - 1, 1}, mixing),
              pyxOk);
    ASSERT_EQ(pyxiColorTwist_32f_C3R(source.data() + 3 * (width - 1), 12, ordinary.data() + 3 * (width - 1), 12, {1, 1},
                                     mixing),
              pyxOk);
    EXPECT_EQ(streamed, ordinary);
}

TEST(ColorTwist, LargePlanesAreThoseOfTheirRows)
{
    // 1401 x 1000 pixels are 4203000 samples, where planes go past the cache. They may begin anywhere, alike or not.
    constexpr int width = 1401, height = 1000, step = 4 * 1408;
    constexpr std::size_t samples = std::size_t{1408} * height + 16;
    const std::array<std::vector<f32>, 3> source = {counted<f32>(samples), counted<f32>(samples + 5),
                                                    counted<f32>(samples + 9)};
    const f32* const from[] = {source[0].data(), source[1].data() + 5, source[2].data() + 9};
    for (const auto& [first, third] : {std::pair{0, 0}, {3, 3}, {3, 4}}) {
        std::array<std::vector<f32>, 3> whole, byRows;
        whole.fill(std::vector<f32>(samples, -7)), byRows = whole;
        f32* const to[] = {whole[0].data() + first, whole[1].data() + first, whole[2].data() + third};
        f32* const rows[] = {byRows[0].data() + first, byRows[1].data() + first, byRows[2].data() + third};
        ASSERT_EQ(pyxiColorTwist_32f_P3R(from, step, to, step, {width, height}, mixing), pyxOk);
        for (int y = 0; y < height; ++y) {
            const std::ptrdiff_t at = std::ptrdiff_t{y} * step / 4;
            const f32* const fromRow[] = {from[0] + at, from[1] + at, from[2] + at};
            f32* const toRow[] = {rows[0] + at, rows[1] + at, rows[2] + at};
            ASSERT_EQ(pyxiColorTwist_32f_P3R(fromRow, step, toRow, step, {width, 1}, mixing), pyxOk);
        }
        EXPECT_TRUE(whole == byRows) << first << ", " << third;
    }
}

TEST(ColorTwist, FourthSampleStays)
{
    constexpr f32 white[3][4] = {{0, 0, 0, 255}, {0, 0, 0, 255}, {0, 0, 0, 255}};
    const std::vector<u8> source(4 * 21, 9);
    std::vector<u8> target(4 * 21, 77), place(4 * 21, 66);
    EXPECT_EQ(pyxiColorTwist32f_8u_AC4R(source.data(), 84, target.data(), 84, {21, 1}, white), pyxOk);
    EXPECT_EQ(pyxiColorTwist32f_8u_AC4IR(place.data(), 84, {21, 1}, white), pyxOk);
    for (int x = 0; x < 21; ++x) {
        EXPECT_EQ(target[4 * x + 2], 255);
        EXPECT_EQ(target[4 * x + 3], 77);
        EXPECT_EQ(place[4 * x + 2], 255);
        EXPECT_EQ(place[4 * x + 3], 66);
    }
}

TEST(ColorTwist, IdentityKeepsEverySignedByte)
{
    std::vector<s8> source(3 * 256);
    for (int i = 0; i < 3 * 256; ++i) source[i] = static_cast<s8>(i / 3 - 128);
    std::vector<s8> target(source.size());
    EXPECT_EQ(pyxiColorTwist32f_8s_C3R(source.data(), 768, target.data(), 768, {256, 1}, identity), pyxOk);
    EXPECT_EQ(target, source);
}

TEST(ColorTwist, IdentityKeepsEvery16BitSample)
{
    std::vector<u16> plane(65536);
    std::iota(plane.begin(), plane.end(), u16{0});
    std::vector<u16> a(65536), b(65536), c(65536);
    const u16* const source[3] = {plane.data(), plane.data(), plane.data()};
    u16* const target[3] = {a.data(), b.data(), c.data()};
    EXPECT_EQ(pyxiColorTwist32f_16u_P3R(source, 512, target, 512, {256, 256}, identity), pyxOk);
    EXPECT_EQ(a, plane);
    EXPECT_EQ(b, plane);
    EXPECT_EQ(c, plane);
}

TEST(ColorTwist, NaNStoresTheUpperBoundOrItself)
{
    constexpr f32 broken[3][4] = {{notANumber, 0, 0, 0}, {0, 1, 0, notANumber}, {0, 0, notANumber, 0}};
    const u8 bytes[3] = {1, 2, 3};
    const s8 signedBytes[3] = {1, 2, 3};
    const u16 words[3] = {1, 2, 3};
    const s16 signedWords[3] = {1, 2, 3};
    const f32 floats[3] = {1, 2, 3};
    u8 byteTarget[3];
    s8 signedByteTarget[3];
    u16 wordTarget[3];
    s16 signedWordTarget[3];
    f32 floatTarget[3];
    EXPECT_EQ(pyxiColorTwist32f_8u_C3R(bytes, 3, byteTarget, 3, {1, 1}, broken), pyxOk);
    EXPECT_EQ(pyxiColorTwist32f_8s_C3R(signedBytes, 3, signedByteTarget, 3, {1, 1}, broken), pyxOk);
    EXPECT_EQ(pyxiColorTwist32f_16u_C3R(words, 6, wordTarget, 6, {1, 1}, broken), pyxOk);
    EXPECT_EQ(pyxiColorTwist32f_16s_C3R(signedWords, 6, signedWordTarget, 6, {1, 1}, broken), pyxOk);
    EXPECT_EQ(pyxiColorTwist_32f_C3R(floats, 12, floatTarget, 12, {1, 1}, broken), pyxOk);
    for (int c = 0; c < 3; ++c) {
        EXPECT_EQ(byteTarget[c], 255);
        EXPECT_EQ(signedByteTarget[c], 127);
        EXPECT_EQ(wordTarget[c], 65535);
        EXPECT_EQ(signedWordTarget[c], 32767);
        EXPECT_TRUE(std::isnan(floatTarget[c]));
    }
}

TEST(ColorTwist, StepsAreTestedLast)
{
    u8 pixel[3] = {};
    EXPECT_EQ(pyxiColorTwist32f_8u_C3R(pixel, 0, pixel, 3, {1, 1}, identity), pyxErrStep);
    EXPECT_EQ(pyxiColorTwist32f_8u_C3R(pixel, 3, pixel, -3, {1, 1}, identity), pyxErrStep);
    EXPECT_EQ(pyxiColorTwist32f_8u_C3R(pixel, 0, pixel, 0, {0, 1}, identity), pyxErrSize);
    EXPECT_EQ(pyxiColorTwist32f_8u_C3R(pixel, 0, pixel, 0, {0, 1}, nullptr), pyxErrNullPtr);
    EXPECT_EQ(pyxiColorTwist32f_8u_C3IR(pixel, 0, {1, 1}, identity), pyxErrStep);
}

TEST(ColorTwist, FourChannelsAtStepsOfFourBytesAPixelAreOneRun)
{
    // Rows of 5 pixels at steps of 20 bytes: all 10 pixels of the run of 160 bytes are converted, once each.
    constexpr f32 twice[4][4] = {{2, 0, 0, 0}, {0, 2, 0, 0}, {0, 0, 2, 0}, {0, 0, 0, 2}};
    const auto source = counted<f32>(40);
    std::vector<f32> target(44, -1), doubled(44, -1);
    for (int i = 0; i < 40; ++i) doubled[i] = 2 * source[i];
    EXPECT_EQ(pyxiColorTwist_32f_C4R(source.data(), 20, target.data(), 20, {5, 2}, twice), pyxOk);
    EXPECT_EQ(target, doubled);

    std::vector<f32> rows(44, -1);
    EXPECT_EQ(pyxiColorTwist_32f_C4R(source.data(), 80, rows.data(), 80, {5, 2}, twice), pyxOk);
    EXPECT_EQ(rows, doubled);
}
