// Packed pixels from and to RGB, and to YCbCr and YUV: widening and narrowing of fields, and what becomes of a last odd
// column and row.
#include "pyxcc/pyxcc.h"

#include "edge/packed.hpp"

using namespace edge;

namespace
{

using PackedToPlanes = PyxStatus (*)(const u16*, int, u8* const*, const int*, RoiSize);
using PackedToPairs = PyxStatus (*)(const u16*, int, u8*, int, RoiSize);

/// What becomes of untouched planes.
YCbCrPlanes planesOf(PackedToPlanes convert, const PackedRow& pixels, RoiSize roi, Block block, PyxStatus expected)
{
    YCbCrPlanes target = untouchedPlanes(roi, block);
    u8* const dst[3] = {target.y.data(), target.cb.data(), target.cr.data()};
    const int chromaStep = chromaSize(roi, block).width;
    const int dstStep[3] = {roi.width, chromaStep, chromaStep};
    EXPECT_EQ(convert(pixels.data(), 2 * roi.width, dst, dstStep, roi), expected);
    return target;
}

/// What becomes of a row with one untouched byte after it.
Samples pairsOf(PackedToPairs convert, const PackedRow& pixels)
{
    Samples target(2 * pixels.size() + 1, untouched);
    EXPECT_EQ(convert(pixels.data(), 0, target.data(), 0, {static_cast<int>(pixels.size()), 1}), pyxOk);
    return target;
}

constexpr u8 none = untouched;
constexpr u16 red555 = 0x7c00, red565 = 0xf800;

// Fields of 31 stand for 248. Y = 134744 * 31 + 0x108000 = 80.2 of 2^16. Of any number of pixels
// Cb = -77592 * 31 - 0x7fe000 = -164.6 of 2^16 and Cr = 230160 * 31 - 0x7fe000 = -19.004 of 2^16.
constexpr Colour red = {80, 91, 236};

constexpr RoiSize odd = {3, 3};

} // namespace

TEST(PackedRgb, UnpackingMovesFieldsUp)
{
    const PackedRow source = {0xffff, 0x1021, 0x001f, 0x07e0, 0xf800};
    const Samples expected = {248, 252, 248, 8, 4, 16, 248, 0, 0, 0, 252, 0, 0, 0, 248};
    for (const auto convert : {pyxiBGR565ToBGR_16u8u_C3R, pyxiRGB565ToRGB_16u8u_C3R}) {
        Samples target(15, none);
        EXPECT_EQ(convert(source.data(), 10, target.data(), 15, {5, 1}), pyxOk);
        EXPECT_EQ(target, expected);
    }
}

TEST(PackedRgb, PackingDropsLowBits)
{
    const Samples pixels = {8, 4, 16, 15, 7, 23, 255, 255, 255, 7, 3, 7};
    const PackedRow expected = {0x1021, 0x1021, 0xffff, 0};
    for (const auto convert : {pyxiBGRToBGR565_8u16u_C3R, pyxiRGBToRGB565_8u16u_C3R}) {
        PackedRow target(4, untouchedPixel);
        EXPECT_EQ(convert(pixels.data(), 12, target.data(), 8, {4, 1}), pyxOk);
        EXPECT_EQ(target, expected);
        for (const int width : {1, 15, 16, 17, 45})
            EXPECT_EQ(packedRowOf(convert, repeated({15, 7, 23}, width), width),
                      PackedRow(static_cast<std::size_t>(width), 0x1021))
                << width;
    }
}

TEST(PackedRgb, PackingAndUnpackingLosesTheLowBits)
{
    const Samples white(3, 255);
    u16 pixel = untouchedPixel;
    Samples target(3, none);
    EXPECT_EQ(pyxiRGBToRGB565_8u16u_C3R(white.data(), 3, &pixel, 2, {1, 1}), pyxOk);
    EXPECT_EQ(pyxiRGB565ToRGB_16u8u_C3R(&pixel, 2, target.data(), 3, {1, 1}), pyxOk);
    EXPECT_EQ(target, (Samples{248, 252, 248}));
}

// White of 555 is 248 in all: Y = 31 * 450368 + 0x108000 = 229.5 of 2^16. White of 565 has green of 252: Y = 231.6,
// Cb = -4 * 19071 - 0x7fe000 = -129.04 and Cr = -4 * 24117 - 0x7fe000 = -129.3 of 2^16.
TEST(PackedRgb, WhiteOf565IsALittleGreen)
{
    for (const int width : {2, 8, 34}) {
        const RoiSize roi = {width, 2};
        const PackedRow white(pixelCount(roi), 0xffff);
        EXPECT_EQ(planesOf(pyxiBGR555ToYCbCr420_16u8u_C3P3R, white, roi, block420, pyxOk),
                  filledPlanes({229, 128, 128}, roi, block420));
        EXPECT_EQ(planesOf(pyxiBGR565ToYCbCr420_16u8u_C3P3R, white, roi, block420, pyxOk),
                  filledPlanes({231, 126, 126}, roi, block420));
        EXPECT_EQ(planesOf(pyxiBGR555ToYCbCr422_16u8u_C3P3R, white, roi, block422, pyxOk),
                  filledPlanes({229, 128, 128}, roi, block422));
        EXPECT_EQ(planesOf(pyxiBGR565ToYCbCr422_16u8u_C3P3R, white, roi, block422, pyxOk),
                  filledPlanes({231, 126, 126}, roi, block422));
    }
    const RoiSize roi = {40, 1};
    const PackedRow white(40, 0xffff);
    EXPECT_EQ(planesOf(pyxiBGR555ToYCbCr411_16u8u_C3P3R, white, roi, block411, pyxOk),
              filledPlanes({229, 128, 128}, roi, block411));
    EXPECT_EQ(planesOf(pyxiBGR565ToYCbCr411_16u8u_C3P3R, white, roi, block411, pyxOk),
              filledPlanes({231, 126, 126}, roi, block411));
}

TEST(PackedRgb, TheHighestBitOf555DoesNotCount)
{
    EXPECT_EQ(pairsOf(pyxiBGR555ToYCbCr422_16u8u_C3C2R, {0x8000, 0x8000}), (Samples{16, 128, 16, 128, none}));
    EXPECT_EQ(planesOf(pyxiBGR555ToYUV420_16u8u_C3P3R, PackedRow(4, 0x8000), {2, 2}, block420, pyxOk),
              filledPlanes({0, 128, 128}, {2, 2}, block420));
}

// Black but for the last column and row, whose chroma is that of their own pixels.
TEST(PackedRgb, ALastOddColumnAndRowHaveChromaOfTheirOwn)
{
    const auto image = [](u16 r) { return PackedRow{0, 0, r, 0, 0, r, r, r, r}; };
    const YCbCrPlanes expected = {{16, 16, 80, 16, 16, 80, 80, 80, 80}, {128, 91, 91, 91}, {128, 236, 236, 236}};
    const YCbCrPlanes exchanged = {expected.y, expected.cr, expected.cb};
    EXPECT_EQ(planesOf(pyxiBGR555ToYCbCr420_16u8u_C3P3R, image(red555), odd, block420, pyxOk), expected);
    EXPECT_EQ(planesOf(pyxiBGR565ToYCbCr420_16u8u_C3P3R, image(red565), odd, block420, pyxOk), expected);
    EXPECT_EQ(planesOf(pyxiBGR555ToYCrCb420_16u8u_C3P3R, image(red555), odd, block420, pyxOk), exchanged);
    EXPECT_EQ(planesOf(pyxiBGR565ToYCrCb420_16u8u_C3P3R, image(red565), odd, block420, pyxOk), exchanged);
}

TEST(PackedRgb, ALastOddPixelOfPlanesHasChromaOfItsOwn)
{
    const YCbCrPlanes expected = {{16, 16, 80}, {128, 91}, {128, 236}};
    EXPECT_EQ(planesOf(pyxiBGR555ToYCbCr422_16u8u_C3P3R, {0, 0, red555}, {3, 1}, block422, pyxOk), expected);
    EXPECT_EQ(planesOf(pyxiBGR565ToYCbCr422_16u8u_C3P3R, {0, 0, red565}, {3, 1}, block422, pyxOk), expected);
}

TEST(PackedRgb, ALastOddPixelOfPairsHasNoPlaceForItsCr)
{
    const Samples expected = {16, 128, 16, 128, 80, 91, none};
    EXPECT_EQ(pairsOf(pyxiBGR555ToYCbCr422_16u8u_C3C2R, {0, 0, red555}), expected);
    EXPECT_EQ(pairsOf(pyxiBGR565ToYCbCr422_16u8u_C3C2R, {0, 0, red565}), expected);
}

TEST(PackedRgb, TheChromaPlanesOfYCrCbGoWithTheirSteps)
{
    const PackedRow pixels(8, red555);
    Samples y(8, none), cr(4, none), cb(3, none);
    u8* const dst[3] = {y.data(), cr.data(), cb.data()};
    const int dstStep[3] = {2, 3, 2};
    EXPECT_EQ(pyxiBGR555ToYCrCb420_16u8u_C3P3R(pixels.data(), 4, dst, dstStep, {2, 4}), pyxOk);
    EXPECT_EQ(y, Samples(8, red.y));
    EXPECT_EQ(cr, (Samples{red.cr, none, none, red.cr}));
    EXPECT_EQ(cb, (Samples{red.cb, none, red.cb}));
}

TEST(PackedRgb, ChromaOfFourLeavesWhatMakesNoBlock)
{
    for (const auto& [convert, r] : {std::pair<PackedToPlanes, u16>{pyxiBGR555ToYCbCr411_16u8u_C3P3R, red555},
                                     {pyxiBGR565ToYCbCr411_16u8u_C3P3R, red565}}) {
        EXPECT_EQ(planesOf(convert, PackedRow(7, r), {7, 1}, block411, pyxWarnOddSize),
                  (YCbCrPlanes{{80, 80, 80, 80, none, none, none}, {91, none}, {236, none}}));
        EXPECT_EQ(planesOf(convert, PackedRow(8, r), {8, 1}, block411, pyxOk), filledPlanes(red, {8, 1}, block411));
    }
}

TEST(PackedRgb, YuvLeavesALastOddColumnAndRow)
{
    const YCbCrPlanes expected = {
        {0, 0, none, 0, 0, none, none, none, none}, {128, none, none, none}, {128, none, none, none}};
    for (const auto convert :
         {pyxiBGR555ToYUV420_16u8u_C3P3R, pyxiBGR565ToYUV420_16u8u_C3P3R, pyxiRGB565ToYUV420_16u8u_C3P3R})
        EXPECT_EQ(planesOf(convert, PackedRow(9, 0), odd, block420, pyxWarnOddSize), expected);
    EXPECT_EQ(planesOf(pyxiRGB565ToYUV422_16u8u_C3P3R, PackedRow(3, 0), {3, 1}, block422, pyxWarnOddSize),
              (YCbCrPlanes{{0, 0, none}, {128, none}, {128, none}}));
    EXPECT_EQ(planesOf(pyxiRGB565ToYUV420_16u8u_C3P3R, {0}, {1, 1}, block420, pyxWarnOddSize),
              untouchedPlanes({1, 1}, block420));
    EXPECT_EQ(planesOf(pyxiRGB565ToYUV422_16u8u_C3P3R, {0}, {1, 1}, block422, pyxWarnOddSize),
              untouchedPlanes({1, 1}, block422));
}

// Blue of 8 is Y = 59768 of 2^16, which rounds up where it rounds. Of four pixels U = (32 * 65536 - 4 * 59768 +
// 0x1ffff)
// >> 16 = 30, 30 * 32244 >> 18 = 3, and V = (-239072 + 0x1ffff) >> 16 = -2, -2 * 57475 >> 18 = -1. Of two
// U = (16 * 65536 - 119536 + 65535) >> 16 = 15, 15 * 32244 >> 17 = 3, and V is -1 again.
TEST(PackedRgb, LumaOfYuvRoundsInBgrOnly)
{
    const RoiSize roi = {38, 2};
    const std::size_t count = pixelCount(roi);
    EXPECT_EQ(planesOf(pyxiBGR555ToYUV420_16u8u_C3P3R, PackedRow(count, 0x0001), roi, block420, pyxOk),
              filledPlanes({1, 131, 127}, roi, block420));
    EXPECT_EQ(planesOf(pyxiBGR565ToYUV420_16u8u_C3P3R, PackedRow(count, 0x0001), roi, block420, pyxOk),
              filledPlanes({1, 131, 127}, roi, block420));
    EXPECT_EQ(planesOf(pyxiRGB565ToYUV420_16u8u_C3P3R, PackedRow(count, 0x0800), roi, block420, pyxOk),
              filledPlanes({0, 131, 127}, roi, block420));
    EXPECT_EQ(planesOf(pyxiRGB565ToYUV422_16u8u_C3P3R, PackedRow(count, 0x0800), roi, block422, pyxOk),
              filledPlanes({0, 131, 127}, roi, block422));
}

TEST(PackedRgb, AnOddStepOfPackedSourcesLosesItsLowBit)
{
    const PackedRow source = {0x1021, 0, 0xffff};
    Samples target(6, none);
    EXPECT_EQ(pyxiBGR565ToBGR_16u8u_C3R(source.data(), 5, target.data(), 3, {1, 2}), pyxOk);
    EXPECT_EQ(target, (Samples{8, 4, 16, 248, 252, 248}));
}

TEST(PackedRgb, SmallestSizes)
{
    const PackedRow source(8, 0);
    Samples target(8, none);
    u8* const dst[3] = {target.data(), target.data(), target.data()};
    const int steps[3] = {1, 1, 1};
    for (const auto convert :
         {pyxiBGR555ToYCbCr420_16u8u_C3P3R, pyxiBGR565ToYCbCr420_16u8u_C3P3R, pyxiBGR555ToYCrCb420_16u8u_C3P3R,
          pyxiBGR565ToYCrCb420_16u8u_C3P3R, pyxiBGR555ToYUV420_16u8u_C3P3R, pyxiBGR565ToYUV420_16u8u_C3P3R}) {
        EXPECT_EQ(convert(source.data(), 2, dst, steps, {1, 2}), pyxErrSize);
        EXPECT_EQ(convert(source.data(), 2, dst, steps, {2, 1}), pyxErrSize);
    }
    for (const auto convert : {pyxiBGR555ToYCbCr422_16u8u_C3P3R, pyxiBGR565ToYCbCr422_16u8u_C3P3R})
        EXPECT_EQ(convert(source.data(), 2, dst, steps, {1, 1}), pyxErrSize);
    for (const auto convert : {pyxiBGR555ToYCbCr422_16u8u_C3C2R, pyxiBGR565ToYCbCr422_16u8u_C3C2R})
        EXPECT_EQ(convert(source.data(), 2, target.data(), 2, {1, 1}), pyxErrSize);
    for (const auto convert : {pyxiBGR555ToYCbCr411_16u8u_C3P3R, pyxiBGR565ToYCbCr411_16u8u_C3P3R})
        EXPECT_EQ(convert(source.data(), 2, dst, steps, {3, 1}), pyxErrSize);
    EXPECT_EQ(target, Samples(8, none));
}
