// The examples on the pages about tone and depth, as tests: what is between the marks is what the pages show.
#include <pyxcc/pyxcc.h>

#include <gtest/gtest.h>

#include <vector>

namespace
{

using Bytes = std::vector<u8>;

TEST(Documentation, ColorTwist)
{
    //! [color-twist]
    static const f32 halved[3][4] = {{0.5f, 0, 0, 0}, {0, 0.5f, 0, 0}, {0, 0, 1, 10}}; // and 10 more of the third
    u8 pixel[3] = {255, 253, 250};
    pyxiColorTwist32f_8u_C3IR(pixel, 3, {1, 1}, halved); // 128, 126, 255: ties to even, and held to a byte
    //! [color-twist]
    EXPECT_EQ(Bytes(pixel, pixel + 3), (Bytes{128, 126, 255}));
}

TEST(Documentation, Gamma)
{
    //! [gamma]
    u8 pixel[3] = {0, 1, 255};
    pyxiGammaFwd_8u_C3IR(pixel, 3, {1, 1}); // 0, 4, 255: 4.5 lies half way, and goes to the even one
    //! [gamma]
    EXPECT_EQ(Bytes(pixel, pixel + 3), (Bytes{0, 4, 255}));
}

TEST(Documentation, ReduceBits)
{
    //! [reduce-bits]
    const u8 gray[4] = {0, 100, 200, 255};
    u8 two[4];
    pyxiReduceBits_8u_C1R(gray, 4, two, 4, {4, 1}, 0, 0, 2); // no noise, the nearest of 2 levels: 0, 0, 255, 255
    //! [reduce-bits]
    EXPECT_EQ(Bytes(two, two + 4), (Bytes{0, 0, 255, 255}));
}

TEST(Documentation, ReduceBits1u)
{
    //! [reduce-bits-1u]
    const u8 gray[10] = {255, 0, 255, 0, 255, 0, 255, 0, 128, 127};
    u8 bits[2] = {0, 0xff};
    pyxiReduceBits_8u1u_C1R(gray, 10, bits, 2, 0, {10, 1}, 0, 0, 0, 127);
    // 0xaa and 0xbf: of the second byte the two highest bits were written, 1 and 0, and the others kept
    //! [reduce-bits-1u]
    EXPECT_EQ(bits[0], 0xaa);
    EXPECT_EQ(bits[1], 0xbf);
}

TEST(Documentation, ToneMap)
{
    //! [tone-map]
    const f32 radiance[4] = {0, 1, 2, 4};
    u8 gray[4];
    pyxiToneMapLinear_32f8u_C1R(radiance, sizeof radiance, gray, 4, {4, 1}); // 0, 63, 127, 255
    //! [tone-map]
    EXPECT_EQ(Bytes(gray, gray + 4), (Bytes{0, 63, 127, 255}));
}

} // namespace
