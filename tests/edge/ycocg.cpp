// YCoCg: what comes back, what saturates and what wraps, and sizes that are not tested.
#include "pyxcc/ycocg.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <array>
#include <vector>

using namespace edge;

namespace
{

template <typename T> using Plane = std::vector<T>;

/// Y, Co and Cg.
template <typename T> struct Planes {
    explicit Planes(std::size_t count) : planes{Plane<T>(count), Plane<T>(count), Plane<T>(count)} {}

    std::array<Plane<T>, 3> planes;
    const T* const src[3] = {planes[0].data(), planes[1].data(), planes[2].data()};
    T* const dst[3] = {planes[0].data(), planes[1].data(), planes[2].data()};
};

/// One value up to a column, another from there on.
template <typename T> Plane<T> twoSpans(T first, int count, T second, int width)
{
    Plane<T> plane(count, first);
    plane.resize(width, second);
    return plane;
}

using Words = std::vector<s16>;

/// `count` samples a pixel, the same pixel throughout.
Words words(std::vector<s16> pixel, int width)
{
    Words row;
    for (int i = 0; i < width; ++i) row.insert(row.end(), pixel.begin(), pixel.end());
    return row;
}

using Forward16 = PyxStatus (*)(const s16*, int, s16* const*, int, RoiSize);

std::array<Plane<s16>, 3> forward(Forward16 convert, const Words& source, int width)
{
    Planes<s16> target(width);
    EXPECT_EQ(convert(source.data(), 0, target.dst, 0, {width, 1}), pyxOk);
    return target.planes;
}

/// Every word that is near a bound, and some between.
std::vector<s16> telling()
{
    std::vector<s16> samples;
    for (const int centre : {-32768, -16384, -1, 0, 16384, 32767}) {
        for (int i = -2; i <= 2; ++i) {
            if (centre + i >= -32768 && centre + i <= 32767) samples.push_back(static_cast<s16>(centre + i));
        }
    }
    for (int i = -32000; i < 32768; i += 5003) samples.push_back(static_cast<s16>(i));
    return samples;
}

/// Every B, G, R of those.
Words tellingPixels()
{
    const std::vector<s16> samples = telling();
    Words pixels;
    for (const s16 b : samples) {
        for (const s16 g : samples) {
            for (const s16 r : samples) pixels.insert(pixels.end(), {b, g, r});
        }
    }
    return pixels;
}

} // namespace

TEST(YCoCg, EveryTripleOfBytesComesBack)
{
    constexpr int side = 256;
    const RoiSize size = {side, side};
    Samples source(3 * side * side), target(3 * side * side);
    Planes<s16> planes(side * side);
    for (int r = 0; r < 256; ++r) {
        for (int i = 0; i < side * side; ++i) {
            source[3 * i] = static_cast<u8>(i & 255);
            source[3 * i + 1] = static_cast<u8>(i >> 8);
            source[3 * i + 2] = static_cast<u8>(r);
        }
        ASSERT_EQ(pyxiBGRToYCoCg_Rev_8u16s_C3P3R(source.data(), 3 * side, planes.dst, 2 * side, size), pyxOk);
        ASSERT_EQ(pyxiYCoCgToBGR_Rev_16s8u_P3C3R(planes.src, 2 * side, target.data(), 3 * side, size), pyxOk);
        ASSERT_EQ(target, source) << "red " << r;
    }
}

TEST(YCoCg, TriplesOfWordsComeBackThrough32Bits)
{
    const Words source = tellingPixels();
    const int width = static_cast<int>(source.size() / 3);
    Planes<s32> planes(width);
    Words target(source.size());
    ASSERT_EQ(pyxiSBGRToYCoCg_Rev_16s32s_C3P3R(source.data(), 0, planes.dst, 0, {width, 1}), pyxOk);
    ASSERT_EQ(pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(planes.src, 0, target.data(), 0, {width, 1}), pyxOk);
    EXPECT_EQ(target, source);
}

TEST(YCoCg, TriplesOfWordsComeBackWhereSumsWrap)
{
    Words source;
    const Words colours = tellingPixels();
    for (std::size_t i = 0; i < colours.size(); i += 3) {
        source.insert(source.end(), {colours[i], colours[i + 1], colours[i + 2], 9});
    }
    const int width = static_cast<int>(source.size() / 4);
    Planes<s16> planes(width);
    Words target(source.size());
    ASSERT_EQ(pyxiSBGRToYCoCg_Rev_16s_C4P3R(source.data(), 0, planes.dst, 0, {width, 1}), pyxOk);
    ASSERT_EQ(pyxiYCoCgToSBGR_Rev_16s_P3C4R(planes.src, 0, target.data(), 0, {width, 1}, 9), pyxOk);
    EXPECT_EQ(target, source);
}

// R = 32767 and B = -32768: Co is 65536 >> 1 = 32768. Y is (-1 + 2) >> 2 = 0, and so is Cg, (1 + 2) >> 2.
TEST(YCoCg, OrangeSaturatesInBlocksOf4AndWrapsBeyond)
{
    for (const int width : {1, 3, 4, 5, 7, 8, 16, 35}) {
        const auto planes = forward(pyxiSBGRToYCoCg_16s_C3P3R, words({-32768, 0, 32767}, width), width);
        EXPECT_EQ(planes[0], Plane<s16>(width, 0));
        EXPECT_EQ(planes[1], twoSpans<s16>(32767, width & ~3, -32768, width));
        EXPECT_EQ(planes[2], Plane<s16>(width, 0));
        const auto same = forward(pyxiSBGRToYCoCg_16s_C4P3R, words({-32768, 0, 32767, 9}, width), width);
        EXPECT_EQ(same, planes);
    }
}

// G = 32767, R and B = -32768: Cg is (65534 + 65536 + 2) >> 2 = 32768. Y is (65534 - 65536 + 2) >> 2 = 0.
TEST(YCoCg, GreenSaturatesInBlocksOf4AndWrapsBeyond)
{
    for (const int width : {1, 4, 7, 35}) {
        const auto planes = forward(pyxiSBGRToYCoCg_16s_C3P3R, words({-32768, 32767, -32768}, width), width);
        EXPECT_EQ(planes[0], Plane<s16>(width, 0));
        EXPECT_EQ(planes[1], Plane<s16>(width, 0));
        EXPECT_EQ(planes[2], twoSpans<s16>(32767, width & ~3, -32768, width));
    }
}

TEST(YCoCg, OrangeFitsIn32Bits)
{
    for (const int width : {1, 4, 7}) {
        const Words source = words({-32768, 0, 32767}, width);
        Planes<s32> target(width);
        EXPECT_EQ(pyxiSBGRToYCoCg_16s32s_C3P3R(source.data(), 0, target.dst, 0, {width, 1}), pyxOk);
        EXPECT_EQ(target.planes[1], Plane<s32>(width, 32768));
    }
}

// Saturated: Co = 32767, t = -32768 + 16383 = -16385, Cg = 16385, Y = -16385 + 8192 = -8193. Wrapped: Co = -1, t =
// -32769, which is 32767, Cg = -32767, Y = 32767 - 16384 = 16383.
TEST(YCoCg, ReversibleWordsSaturateInBlocksOf16AndWrapBeyond)
{
    for (const int width : {1, 15, 16, 17, 31, 50}) {
        const int body = width & ~15;
        const auto planes = forward(pyxiSBGRToYCoCg_Rev_16s_C3P3R, words({-32768, 0, 32767}, width), width);
        EXPECT_EQ(planes[0], twoSpans<s16>(-8193, body, 16383, width));
        EXPECT_EQ(planes[1], twoSpans<s16>(32767, body, -1, width));
        EXPECT_EQ(planes[2], twoSpans<s16>(16385, body, -32767, width));
        const auto four = forward(pyxiSBGRToYCoCg_Rev_16s_C4P3R, words({-32768, 0, 32767, 9}, width), width);
        EXPECT_EQ(four[0], Plane<s16>(width, 16383));
        EXPECT_EQ(four[1], Plane<s16>(width, -1));
        EXPECT_EQ(four[2], Plane<s16>(width, -32767));
    }
}

// Y = 32767 and Cg = -2: t = 32768. Saturated it is 32767, G 32765, B 32767 and R, with Co = 1, 32767. Wrapped it is
// -32768, G -32770, which is 32766, B -32768 and R -32767.
TEST(YCoCg, ReversibleWordsBackSaturateInBlocksOf16AndWrapBeyond)
{
    for (const int width : {1, 15, 16, 17, 50}) {
        Planes<s16> source(width);
        source.planes[0].assign(width, 32767);
        source.planes[1].assign(width, 1);
        source.planes[2].assign(width, -2);
        Words target(3 * width), withAlpha(4 * width);
        const Planes<s16>& planes = source;
        EXPECT_EQ(pyxiYCoCgToSBGR_Rev_16s_P3C3R(planes.src, 0, target.data(), 0, {width, 1}), pyxOk);
        Words expected = words({32767, 32765, 32767}, width & ~15);
        const Words tail = words({-32768, 32766, -32767}, width & 15);
        expected.insert(expected.end(), tail.begin(), tail.end());
        EXPECT_EQ(target, expected);
        EXPECT_EQ(pyxiYCoCgToSBGR_Rev_16s_P3C4R(planes.src, 0, withAlpha.data(), 0, {width, 1}, -5), pyxOk);
        EXPECT_EQ(withAlpha, words({-32768, 32766, -32767, -5}, width));
    }
}

// Y = Co = 32767 add up to -2 in 16 bits, which is clamped to 0, as red. Y alone is green, clamped to 255. With Cg =
// -32768 red is -2 + 32768 and clamped to 255, green is -1, and blue is 32768, which wraps.
TEST(YCoCg, BytesAreClampedAfterTheSumsWrap)
{
    for (const int width : {1, 7, 8, 16, 35}) {
        Planes<s16> source(width);
        source.planes[0].assign(width, 32767);
        source.planes[1].assign(width, 32767);

        Samples target(3 * width), withAlpha(4 * width);
        EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C3R(source.src, 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({0, 255, 0}, width));
        EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C4R(source.src, 0, withAlpha.data(), 0, {width, 1}, 9), pyxOk);
        EXPECT_EQ(withAlpha, repeated({0, 255, 0, 9}, width));
        source.planes[2].assign(width, -32768);
        EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C3R(source.src, 0, target.data(), 0, {width, 1}), pyxOk);
        EXPECT_EQ(target, repeated({0, 0, 255}, width));
    }
}

// A red of 255: Y = 257 >> 2, Co = 128 + 128 is held at 255, Cg = (-253 >> 2) + 128. A green of 255: Cg = 128 + 128.
TEST(YCoCg, BytesAbout128)
{
    const auto converted = [](std::initializer_list<u8> pixel) {
        const Samples source = repeated(pixel, 5);
        Planes<u8> target(5);
        EXPECT_EQ(pyxiRGBToYCoCg_8u_C3P3R(source.data(), 0, target.dst, 0, {5, 1}), pyxOk);
        for (const Samples& plane : target.planes) EXPECT_EQ(plane, Samples(5, plane[0]));
        return Samples{target.planes[0][0], target.planes[1][0], target.planes[2][0]};
    };
    EXPECT_EQ(converted({0, 0, 0}), (Samples{0, 128, 128}));
    EXPECT_EQ(converted({255, 255, 255}), (Samples{255, 128, 128}));
    EXPECT_EQ(converted({255, 0, 0}), (Samples{64, 255, 64}));
    EXPECT_EQ(converted({0, 255, 0}), (Samples{128, 128, 255}));
    EXPECT_EQ(converted({0, 0, 255}), (Samples{64, 1, 64}));
}

// Back from red: 64 + 255 - 64 = 255, 64 + 64 - 128 = 0 and 64 - 255 - 64 + 256 = 1.
TEST(YCoCg, BytesAbout128Back)
{
    const auto converted = [](u8 y, u8 co, u8 cg) {
        Samples target(3);
        const u8* const src[3] = {&y, &co, &cg};
        EXPECT_EQ(pyxiYCoCgToRGB_8u_P3C3R(src, 0, target.data(), 0, {1, 1}), pyxOk);
        return target;
    };
    EXPECT_EQ(converted(0, 128, 128), (Samples{0, 0, 0}));
    EXPECT_EQ(converted(255, 128, 128), (Samples{255, 255, 255}));
    EXPECT_EQ(converted(64, 255, 64), (Samples{255, 0, 1}));
    EXPECT_EQ(converted(255, 255, 0), (Samples{255, 127, 255}));
    EXPECT_EQ(converted(0, 0, 255), (Samples{0, 127, 1}));
}

TEST(YCoCg, AlphaIsTheValueGiven)
{
    for (const int width : {1, 4, 15, 33}) {
        Planes<s16> source(width);
        Samples target(4 * width, 77);
        EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C4R(source.src, 0, target.data(), 0, {width, 1}, 200), pyxOk);
        EXPECT_EQ(target, repeated({0, 0, 0, 200}, width));
        EXPECT_EQ(pyxiYCoCgToBGR_Rev_16s8u_P3C4R(source.src, 0, target.data(), 0, {width, 1}, 201), pyxOk);
        EXPECT_EQ(target, repeated({0, 0, 0, 201}, width));
    }
}

TEST(YCoCg, SomeDoNotTestTheSizeButAllTestThePointers)
{
    Planes<u8> bytes(1);
    Planes<s16> planes(1);
    Planes<s32> wide(1);
    const s16* const withoutCg[3] = {planes.src[0], planes.src[1], nullptr};
    u8 pixel[4] = {77, 77, 77, 77};
    s16 wordPixel[4] = {77, 77, 77, 77};
    const RoiSize none = {0, 1}, negative = {1, -1};
    EXPECT_EQ(pyxiYCoCgToRGB_8u_P3C3R(bytes.src, 0, pixel, 0, none), pyxOk);
    EXPECT_EQ(pyxiRGBToYCoCg_8u_C3P3R(pixel, 0, bytes.dst, 0, none), pyxErrSize);
    EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C3R(planes.src, 0, pixel, 0, negative), pyxOk);
    EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C4R(planes.src, 0, pixel, 0, none, 1), pyxOk);
    EXPECT_EQ(pyxiYCoCgToBGR_Rev_16s8u_P3C3R(planes.src, 0, pixel, 0, none), pyxOk);
    EXPECT_EQ(pyxiYCoCgToBGR_Rev_16s8u_P3C4R(planes.src, 0, pixel, 0, none, 1), pyxOk);
    EXPECT_EQ(pyxiYCoCgToBGR_16s8u_P3C3R(withoutCg, 0, pixel, 0, none), pyxErrNullPtr);
    EXPECT_EQ(pyxiYCoCgToSBGR_16s_P3C3R(planes.src, 0, wordPixel, 0, none), pyxOk);
    EXPECT_EQ(pyxiYCoCgToSBGR_16s_P3C4R(planes.src, 0, wordPixel, 0, none, 1), pyxErrSize);
    EXPECT_EQ(pyxiYCoCgToSBGR_32s16s_P3C3R(wide.src, 0, wordPixel, 0, none), pyxErrSize);
    EXPECT_EQ(pyxiYCoCgToSBGR_Rev_32s16s_P3C3R(wide.src, 0, wordPixel, 0, none), pyxOk);
    EXPECT_EQ(pyxiSBGRToYCoCg_16s32s_C3P3R(wordPixel, 0, wide.dst, 0, none), pyxErrSize);
    EXPECT_EQ(pyxiSBGRToYCoCg_16s32s_C4P3R(wordPixel, 0, wide.dst, 0, none), pyxOk);
    EXPECT_EQ(pyxiSBGRToYCoCg_Rev_16s_C3P3R(wordPixel, 0, planes.dst, 0, negative), pyxOk);
    EXPECT_EQ(pyxiSBGRToYCoCg_Rev_16s_C3P3R(nullptr, 0, planes.dst, 0, negative), pyxErrNullPtr);
    for (const u8 sample : pixel) EXPECT_EQ(sample, 77);
    for (const s16 sample : wordPixel) EXPECT_EQ(sample, 77);
    EXPECT_EQ(wide.planes[0][0], 0);
}
