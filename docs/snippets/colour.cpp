// The examples on the pages about other models of colour, as tests: what is between the marks is what the pages show.
#include <pyxcc/pyxcc.h>

#include <gtest/gtest.h>

#include <vector>

namespace
{

using Bytes = std::vector<u8>;

TEST(Documentation, Gray)
{
    //! [gray]
    const u8 red[3] = {255, 0, 0};
    const f32 thirds[3] = {1 / 3.0f, 1 / 3.0f, 1 / 3.0f};
    u8 luma, mean;
    pyxiRGBToGray_8u_C3C1R(red, 3, &luma, 1, {1, 1});           // 76: 0.299 of 255
    pyxiColorToGray_8u_C3C1R(red, 3, &mean, 1, {1, 1}, thirds); // 85
    //! [gray]
    EXPECT_EQ(luma, 76); // (9798 * 255 + 16384) >> 15
    EXPECT_EQ(mean, 85); // (10923 * 255 + 16384) >> 15
}

TEST(Documentation, XyzYcc)
{
    //! [xyz-ycc]
    const u8 white[3] = {255, 255, 255}, black[3] = {0, 0, 0};
    u8 xyz[3], ycc[3];
    pyxiRGBToXYZ_8u_C3R(white, 3, xyz, 3, {1, 1}); // 242, 254, 255: quotients are cut, and Z is held to a byte
    pyxiRGBToYCC_8u_C3R(black, 3, ycc, 3, {1, 1}); // 0, 156, 137
    //! [xyz-ycc]
    EXPECT_EQ(Bytes(xyz, xyz + 3), (Bytes{242, 254, 255}));
    EXPECT_EQ(Bytes(ycc, ycc + 3), (Bytes{0, 156, 137}));
}

TEST(Documentation, Lab)
{
    //! [lab]
    const f32 white[3] = {1, 1, 1};
    f32 lab[3];
    pyxiRGBToLab_32f_C3R(white, sizeof white, lab, sizeof lab, {1, 1}); // nearly 100, 0, 0
    //! [lab]
    EXPECT_NEAR(lab[0], 100, 1e-2);
    EXPECT_NEAR(lab[1], 0, 2e-2);
    EXPECT_NEAR(lab[2], 0, 2e-2);
}

TEST(Documentation, Luv)
{
    //! [luv]
    const f32 luv[3] = {0, 50, -50}; // no lightness
    f32 rgb[3];
    pyxiLUVToRGB_32f_C3R(luv, sizeof luv, rgb, sizeof rgb, {1, 1}); // 0, 0, 0, whatever u and v are
    //! [luv]
    for (const f32 sample : rgb) EXPECT_EQ(sample, 0);
}

TEST(Documentation, Hls)
{
    //! [hls]
    const f32 red[3] = {1, 0, 0};
    f32 hls[3];
    pyxiRGBToHLS_32f_C3R(red, sizeof red, hls, sizeof hls, {1, 1}); // 0, 0.5, 1
    //! [hls]
    EXPECT_EQ(hls[0], 0);
    EXPECT_EQ(hls[1], 0.5f);
    EXPECT_EQ(hls[2], 1);
}

TEST(Documentation, Hsv)
{
    //! [hsv]
    const u16 green[3] = {0, 65535, 0};
    u16 hsv[3];
    pyxiRGBToHSV_16u_C3R(green, sizeof green, hsv, sizeof hsv, {1, 1}); // 21845, a third of the circle; 65535, 65535
    //! [hsv]
    EXPECT_EQ(std::vector<u16>(hsv, hsv + 3), (std::vector<u16>{21845, 65535, 65535}));
}

TEST(Documentation, Ycocg)
{
    //! [ycocg]
    const u8 bgr[3] = {10, 200, 30};
    s16 y, co, cg;
    s16* const to[3] = {&y, &co, &cg};
    pyxiBGRToYCoCg_Rev_8u16s_C3P3R(bgr, 3, to, sizeof y, {1, 1}); // 110, 20, 180

    const s16* const from[3] = {&y, &co, &cg};
    u8 back[3];
    pyxiYCoCgToBGR_Rev_16s8u_P3C3R(from, sizeof y, back, 3, {1, 1}); // 10, 200, 30 again
    //! [ycocg]
    EXPECT_EQ(y, 110);
    EXPECT_EQ(co, 20);
    EXPECT_EQ(cg, 180);
    EXPECT_EQ(Bytes(back, back + 3), (Bytes{10, 200, 30}));
}

} // namespace
