// The examples on the pages about packed pixels, as tests: what is between the marks is what the pages show.
#include <pyxcc/pyxcc.h>

#include <gtest/gtest.h>

#include <vector>

namespace
{

TEST(Documentation, PackedRgb)
{
    //! [packed-rgb]
    const u8 bgr[2 * 3] = {255, 255, 255, 0, 0, 255}; // a white pixel and a red one
    u16 pixels[2];
    u8 back[2 * 3];
    pyxiBGRToBGR565_8u16u_C3R(bgr, 6, pixels, 4, {2, 1});  // 0xffff and 0xf800
    pyxiBGR565ToBGR_16u8u_C3R(pixels, 4, back, 6, {2, 1}); // 248, 252, 248 and 0, 0, 248
    //! [packed-rgb]
    EXPECT_EQ(pixels[0], 0xffff);
    EXPECT_EQ(pixels[1], 0xf800);
    EXPECT_EQ(std::vector<u8>(back, back + 6), (std::vector<u8>{248, 252, 248, 0, 0, 248}));
}

TEST(Documentation, YCbCrToPacked)
{
    //! [ycbcr-to-packed]
    const u8 y[3 * 3] = {235, 235, 235, 235, 235, 235, 235, 235, 235}, chroma[2 * 2] = {128, 128, 128, 128};
    const u8* const planes[3] = {y, chroma, chroma}; // 4:2:0, and a chroma sample for the odd column and row
    const int steps[3] = {3, 2, 2};
    u16 pixels[3 * 3];
    pyxiYCbCr420ToBGR565_8u16u_P3C3R(planes, steps, pixels, 3 * 2, {3, 3}); // 254 in 8 bits: 0xffff everywhere
    //! [ycbcr-to-packed]
    EXPECT_EQ(std::vector<u16>(pixels, pixels + 9), std::vector<u16>(9, 0xffff));
}

TEST(Documentation, DitheredPacked)
{
    //! [dithered-packed]
    const std::vector<u8> y(4 * 4, 126), chroma(4 * 4, 128); // a flat gray, which is 128 in 8 bits
    const u8* const planes[3] = {y.data(), chroma.data(), chroma.data()};
    u16 pixels[4 * 4];
    pyxiYCbCrToBGR444Dither_8u16u_P3C3R(planes, 4, pixels, 4 * 2, {4, 4});
    // 0x888 where the threshold is below 2304, 0x777 elsewhere
    //! [dithered-packed]
    // t = floor(128 * 110 * 9535 / 65536) = 2048, and 2048 >> 4 = 128; q = 128 * 15 >> 8 = 7; 128 * 256 - 7 * 4352 =
    // 2304
    constexpr u16 low = 0x777, high = 0x888;
    EXPECT_EQ(std::vector<u16>(pixels, pixels + 16), (std::vector<u16>{high, low, high, low, low, high, low, high, high,
                                                                       low, high, low, low, high, low, high}));
}

} // namespace
