// HLS: body and tail, grays, ties, what is cut and what is rounded. Hue and saturation of bytes and words go by the
// processor's approximate reciprocal, so that they are told to within its error.
#include "pyxcc/hls.h"

#include "edge/samples.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <vector>

using namespace edge;

namespace
{

template <typename T> using Pixels = std::vector<std::array<T, 3>>;
template <typename T> using Converted = PyxStatus (*)(const T*, int, T*, int, RoiSize);

/// A row of equal pixels, converted.
template <typename T> Pixels<T> row(Converted<T> convert, std::array<T, 3> pixel, int width)
{
    const Pixels<T> source(width, pixel);
    Pixels<T> target(width);
    EXPECT_EQ(convert(source[0].data(), 0, target[0].data(), 0, {width, 1}), pyxOk);
    return target;
}

/// The same of pixels of four samples, the last of which is 9 in the source and 77 in the target.
template <typename T> Pixels<T> rowWithAlpha(Converted<T> convert, std::array<T, 3> pixel, int width)
{
    const std::vector<std::array<T, 4>> source(width, {pixel[0], pixel[1], pixel[2], 9});
    std::vector<std::array<T, 4>> target(width, {0, 0, 0, 77});
    const int step = static_cast<int>(4 * width * sizeof(T));
    EXPECT_EQ(convert(source[0].data(), step, target[0].data(), step, {width, 1}), pyxOk);
    Pixels<T> colours;
    for (const auto& p : target) {
        EXPECT_EQ(p[3], 77);
        colours.push_back({p[0], p[1], p[2]});
    }
    return colours;
}

template <typename T> Pixels<T> twoSpans(std::array<T, 3> body, int bodyWidth, std::array<T, 3> tail, int width)
{
    Pixels<T> pixels(bodyWidth, body);
    pixels.resize(width, tail);
    return pixels;
}

Samples lightness(const Pixels<u8>& pixels)
{
    Samples l;
    for (const auto& pixel : pixels) l.push_back(pixel[1]);
    return l;
}

/// Planes of a sample each.
struct Planes {
    explicit Planes(std::array<u8, 4> pixel, int width)
        : planes{Samples(width, pixel[0]), Samples(width, pixel[1]), Samples(width, pixel[2]), Samples(width, pixel[3])}
    {
    }

    std::array<Samples, 4> planes;
    const u8* const src[4] = {planes[0].data(), planes[1].data(), planes[2].data(), planes[3].data()};
    u8* const dst[4] = {planes[0].data(), planes[1].data(), planes[2].data(), planes[3].data()};
};

} // namespace

TEST(Hls, GrayHasNoHueAndNoSaturation)
{
    using Word = std::array<u16, 3>;
    for (const int width : {1, 4, 7, 8, 9, 19}) {
        for (int level = 0; level < 256; ++level) {
            const u8 l = static_cast<u8>(level);
            EXPECT_EQ(row<u8>(pyxiRGBToHLS_8u_C3R, {l, l, l}, width), Pixels<u8>(width, {0, l, 0}));
            EXPECT_EQ(rowWithAlpha<u8>(pyxiRGBToHLS_8u_AC4R, {l, l, l}, width), Pixels<u8>(width, {0, l, 0}));
            EXPECT_EQ(rowWithAlpha<u8>(pyxiBGRToHLS_8u_AC4R, {l, l, l}, width), Pixels<u8>(width, {0, l, 0}));
            const u16 w = static_cast<u16>(257 * level);
            EXPECT_EQ(row<u16>(pyxiRGBToHLS_16u_C3R, {w, w, w}, width), Pixels<u16>(width, Word{0, w, 0}));
            const s16 s = static_cast<s16>(w - 32768);
            EXPECT_EQ(row<s16>(pyxiRGBToHLS_16s_C3R, {s, s, s}, width), Pixels<s16>(width, {-32768, s, -32768}));
        }
    }
}

// Lightness of 2 and 1 is 1.5.
TEST(Hls, LightnessIsRoundedInTheBodyAndCutInTheTail)
{
    const auto c3 = [](int width) { return lightness(row<u8>(pyxiRGBToHLS_8u_C3R, {2, 1, 1}, width)); };
    EXPECT_EQ(c3(7), Samples(7, 1));
    EXPECT_EQ(c3(8), Samples(8, 2));
    EXPECT_EQ(c3(9), Samples(8, 2) + Samples(1, 1));
    EXPECT_EQ(c3(39), Samples(32, 2) + Samples(7, 1));
}

// 2.5 goes to 2 and 3.5 to 4.
TEST(Hls, LightnessGoesToTheEvenNeighbour)
{
    EXPECT_EQ(lightness(row<u8>(pyxiRGBToHLS_8u_C3R, {3, 2, 2}, 9)), Samples(9, 2));
    EXPECT_EQ(lightness(row<u8>(pyxiRGBToHLS_8u_C3R, {4, 3, 3}, 9)), Samples(8, 4) + Samples(1, 3));
}

TEST(Hls, FourChannelsRoundInTheTailToo)
{
    for (const int width : {1, 3, 4, 5, 8, 11}) {
        EXPECT_EQ(lightness(rowWithAlpha<u8>(pyxiRGBToHLS_8u_AC4R, {2, 1, 1}, width)), Samples(width, 2));
        EXPECT_EQ(lightness(rowWithAlpha<u8>(pyxiRGBToHLS_8u_AC4R, {3, 2, 2}, width)), Samples(width, 2));
        EXPECT_EQ(lightness(rowWithAlpha<u8>(pyxiBGRToHLS_8u_AC4R, {2, 1, 1}, width)), Samples(width, 1));
    }
}

TEST(Hls, LightnessOfWords)
{
    for (const int width : {3, 4, 7}) {
        const Pixels<u16> words = row<u16>(pyxiRGBToHLS_16u_C3R, {2, 1, 1}, width);
        const Pixels<s16> signedWords = row<s16>(pyxiRGBToHLS_16s_C3R, {-32766, -32767, -32767}, width);
        for (int i = 0; i < width; ++i) {
            EXPECT_EQ(words[i][1], i < (width & ~3) ? 2 : 1);
            EXPECT_EQ(signedWords[i][1], i < (width & ~3) ? -32766 : -32767);
        }
    }
}

// Pure red, green and blue have 0, 120 and 240 degrees: 0, 85 and 170, all of the saturation, and a lightness of 127.5.
TEST(Hls, PureColours)
{
    const std::array<u8, 3> colours[3] = {{255, 0, 0}, {0, 255, 0}, {0, 0, 255}};
    for (int k = 0; k < 3; ++k) {
        for (const auto& pixel : row<u8>(pyxiRGBToHLS_8u_C3R, colours[k], 9)) {
            EXPECT_NEAR(pixel[0], 85 * k, 1);
            EXPECT_NEAR(pixel[2], 255, 1);
        }
        const std::array<u8, 3> bgr = {colours[k][2], colours[k][1], colours[k][0]};
        for (const auto& pixel : rowWithAlpha<u8>(pyxiBGRToHLS_8u_AC4R, bgr, 5)) {
            EXPECT_NEAR(pixel[0], 85 * k, 1);
            EXPECT_EQ(pixel[1], 127);
            EXPECT_NEAR(pixel[2], 255, 1);
        }
    }
}

TEST(Hls, Floats)
{
    // d = 0.75, l = 0.625 and 0.75 / (2 - 1.25) = 1; the hue is 0.25 * 60 / 0.75 = 20 degrees.
    const Pixels<f32> expected(5, {20.0f / 360.0f, 0.625f, 1});
    EXPECT_EQ(row<f32>(pyxiRGBToHLS_32f_C3R, {1, 0.5f, 0.25f}, 5), expected);
    EXPECT_EQ(rowWithAlpha<f32>(pyxiRGBToHLS_32f_AC4R, {1, 0.5f, 0.25f}, 5), expected);
}

TEST(Hls, FloatsThatAreAlmostGrayAreGray)
{
    constexpr f32 l = 0.5f + 0x1p-24f;
    EXPECT_EQ(row<f32>(pyxiRGBToHLS_32f_C3R, {0.5f + 0x1p-23f, 0.5f, 0.5f}, 1), Pixels<f32>(1, {0, l, 0}));
    const auto pixel = row<f32>(pyxiRGBToHLS_32f_C3R, {0.5f, 0.5f + 0x1.8p-23f, 0.5f}, 1)[0];
    EXPECT_EQ(pixel[0], 120.0f / 360.0f);
    EXPECT_GT(pixel[2], 0);
}

// With d = 1118485 / 2^24 the product 60 d is rounded up by 2^-22 to 4.0000143, of which a d-th is 60 and 2^-18. Of two
// channels that tie red counts: its hue is that quotient, green's would be 120 less as much.
TEST(Hls, RedWinsOverGreen)
{
    constexpr f32 d = 1118485 * 0x1p-24f;
    EXPECT_EQ(row<f32>(pyxiRGBToHLS_32f_C3R, {d, d, 0}, 1)[0][0], 0x1.e00002p+5f / 360.0f);
}

// Yellow, cyan and magenta are at 60, 180 and 300 degrees, whichever of the two channels counts.
TEST(Hls, TiesOfBytes)
{
    const std::array<u8, 3> ties[3] = {{255, 255, 0}, {0, 255, 255}, {255, 0, 255}};
    const double hues[3] = {42.5, 127.5, 212.5};
    for (int k = 0; k < 3; ++k) {
        for (const auto& pixel : row<u8>(pyxiRGBToHLS_8u_C3R, ties[k], 9)) EXPECT_NEAR(pixel[0], hues[k], 1);
    }
}

// L = 100 and S = 100: the levels are 100 * 355 / 255 = 139.2 and 200 less that, 60.8. Red is at the upper one, green
// and blue are at the lower one.
TEST(Hls, ToRgbIsRoundedInTheBodyAndCutInTheTail)
{
    const std::array<u8, 3> rounded = {139, 61, 61}, cut = {139, 60, 60};
    for (const int width : {1, 7, 8, 9, 23}) {
        const auto expected = twoSpans(rounded, width & ~7, cut, width);
        EXPECT_EQ(row<u8>(pyxiHLSToRGB_8u_C3R, {0, 100, 100}, width), expected);
        EXPECT_EQ(rowWithAlpha<u8>(pyxiHLSToRGB_8u_AC4R, {0, 100, 100}, width), expected);
    }
}

TEST(Hls, ToBgrIsCut)
{
    for (const int width : {1, 3, 4, 5, 23}) {
        const Samples source = repeated({0, 100, 100}, width);
        Planes target({0, 0, 0, 0}, width);
        EXPECT_EQ(pyxiHLSToBGR_8u_C3P3R(source.data(), 3 * width, target.dst, width, {width, 1}), pyxOk);
        EXPECT_EQ(target.planes[0], Samples(width, 60));
        EXPECT_EQ(target.planes[1], Samples(width, 60));
        EXPECT_EQ(target.planes[2], Samples(width, 139));
    }
}

TEST(Hls, WithoutSaturationTheChannelsAreTheLightness)
{
    for (int level = 0; level < 65536; level += 13) {
        const u16 l = static_cast<u16>(level);
        const s16 s = static_cast<s16>(level - 32768);
        for (const int width : {3, 4, 5}) {
            EXPECT_EQ(row<u16>(pyxiHLSToRGB_16u_C3R, {12345, l, 0}, width), Pixels<u16>(width, {l, l, l}));
            EXPECT_EQ(row<s16>(pyxiHLSToRGB_16s_C3R, {-12345, s, -32768}, width), Pixels<s16>(width, {s, s, s}));
        }
    }
    for (int level = 0; level < 256; ++level) {
        const u8 l = static_cast<u8>(level);
        EXPECT_EQ(row<u8>(pyxiHLSToRGB_8u_C3R, {99, l, 0}, 15), Pixels<u8>(15, {l, l, l}));
    }
    EXPECT_EQ(row<f32>(pyxiHLSToRGB_32f_C3R, {0.3f, 0.7f, 0}, 7), Pixels<f32>(7, {0.7f, 0.7f, 0.7f}));
}

TEST(Hls, AlphaIsCopiedWhereBlueComesFirst)
{
    for (const int width : {1, 3, 4, 9}) {
        const Samples gray = repeated({50, 50, 50, 9}, width), hls = repeated({0, 50, 0, 9}, width);
        Planes target({0, 0, 0, 0}, width);
        EXPECT_EQ(pyxiBGRToHLS_8u_AC4P4R(gray.data(), 4 * width, target.dst, width, {width, 1}), pyxOk);
        EXPECT_EQ(target.planes, Planes({0, 50, 0, 9}, width).planes);
        EXPECT_EQ(pyxiHLSToBGR_8u_AC4P4R(hls.data(), 4 * width, target.dst, width, {width, 1}), pyxOk);
        EXPECT_EQ(target.planes, Planes({50, 50, 50, 9}, width).planes);
        const Planes grayPlanes({50, 50, 50, 9}, width), hlsPlanes({0, 50, 0, 9}, width);
        Samples interleaved(4 * width);
        EXPECT_EQ(pyxiBGRToHLS_8u_AP4C4R(grayPlanes.src, width, interleaved.data(), 4 * width, {width, 1}), pyxOk);
        EXPECT_EQ(interleaved, hls);
        EXPECT_EQ(pyxiHLSToBGR_8u_AP4C4R(hlsPlanes.src, width, interleaved.data(), 4 * width, {width, 1}), pyxOk);
        EXPECT_EQ(interleaved, gray);
        EXPECT_EQ(pyxiBGRToHLS_8u_AP4R(grayPlanes.src, width, target.dst, width, {width, 1}), pyxOk);
        EXPECT_EQ(target.planes, hlsPlanes.planes);
    }
}

TEST(Hls, StepsBeforeTheSize)
{
    Planes planes({1, 2, 3, 4}, 1);
    u8 pixel[4] = {};
    EXPECT_EQ(pyxiBGRToHLS_8u_AP4R(planes.src, 0, planes.dst, 1, {0, 1}), pyxErrStep);
    EXPECT_EQ(pyxiBGRToHLS_8u_P3C3R(planes.src, 1, pixel, -1, {1, 0}), pyxErrStep);
    EXPECT_EQ(pyxiHLSToBGR_8u_AC4P4R(pixel, 1, planes.dst, 1, {1, 0}), pyxErrSize);
    EXPECT_EQ(pyxiBGRToHLS_8u_AC4R(pixel, 0, pixel, 0, {0, 1}), pyxErrSize);
    EXPECT_EQ(pyxiBGRToHLS_8u_AC4R(pixel, 0, pixel, 1, {1, 1}), pyxErrStep);
    u8* const withoutAlpha[4] = {pixel, pixel, pixel, nullptr};
    EXPECT_EQ(pyxiBGRToHLS_8u_AC4P4R(pixel, 0, withoutAlpha, 1, {0, 1}), pyxErrNullPtr);
    EXPECT_EQ(pyxiBGRToHLS_8u_C3P3R(pixel, 1, withoutAlpha, 1, {1, 1}), pyxOk);
}

TEST(Hls, StepsOfWordsAndFloatsLoseTheirLowBits)
{
    // The second row is at 6 and at 12 bytes, for steps of 7 and of 15.
    const u16 words[6] = {100, 100, 100, 200, 200, 200};
    u16 wordTarget[6] = {};
    EXPECT_EQ(pyxiRGBToHLS_16u_C3R(words, 7, wordTarget, 7, {1, 2}), pyxOk);
    EXPECT_EQ(wordTarget[1], 100);
    EXPECT_EQ(wordTarget[4], 200);
    const f32 floats[6] = {0.25f, 0.25f, 0.25f, 0.5f, 0.5f, 0.5f};
    f32 floatTarget[6] = {};
    EXPECT_EQ(pyxiRGBToHLS_32f_C3R(floats, 15, floatTarget, 13, {1, 2}), pyxOk);
    EXPECT_EQ(floatTarget[1], 0.25f);
    EXPECT_EQ(floatTarget[4], 0.5f);
}
