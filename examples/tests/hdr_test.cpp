#include "program.hpp"

#include <cstring>

namespace
{

using Hdr = example::Program;

/// A picture of grays, from the lowest row up.
std::string pfm(const std::string& size, std::initializer_list<float> grays)
{
    std::string bytes = "PF\n" + size + "\n-1\n";
    for (const float gray : grays) {
        char sample[sizeof gray];
        std::memcpy(sample, &gray, sizeof gray);
        for (int channel = 0; channel < 3; ++channel) bytes.append(sample, sizeof sample);
    }
    return bytes;
}

std::string ppm(const std::string& size, std::initializer_list<int> grays)
{
    std::string bytes = "P6\n" + size + "\n255\n";
    for (const int gray : grays) bytes.append(3, static_cast<char>(gray));
    return bytes;
}

// The mean is 2, so 4 is white: 1 is 63.75, cut to 63, and 3 is 191. The curve makes 124.1 and 220.8 of them.
TEST_F(Hdr, TwiceTheMeanIsWhite)
{
    writeFile("in.pfm", pfm("2 3", {0, 0, 1, 3, 4, 4}));
    run("bin/hdr in.pfm out.ppm");
    ASSERT_EQ(status, 0) << errors;
    EXPECT_EQ(readFile("out.ppm"), ppm("2 3", {255, 255, 124, 221, 0, 0}));
}

// Of 8, 2 is 63.75 as well, and 6 is 191.25.
TEST_F(Hdr, TheBrightestIsWhite)
{
    writeFile("in.pfm", pfm("2 2", {0, 8, 2, 6}));
    run("bin/hdr --brightest in.pfm out.ppm");
    ASSERT_EQ(status, 0) << errors;
    EXPECT_EQ(readFile("out.ppm"), ppm("2 2", {124, 221, 0, 255}));
}

// By the mean the sky can be seen, beside a white sun; by the brightest sample there is only the sun.
TEST_F(Hdr, SunOverHills)
{
    run("bin/hdr mean.ppm && bin/hdr --brightest brightest.ppm");
    ASSERT_EQ(status, 0) << errors;
    const std::string mean = readFile("mean.ppm"), brightest = readFile("brightest.ppm");
    ASSERT_EQ(mean.size(), 15U + 480 * 320 * 3);
    const auto red = [](const std::string& picture, int x, int y) {
        return static_cast<unsigned char>(picture[15 + (y * 480 + x) * 3]);
    };
    constexpr int sunX = 336, sunY = 80, skyX = 100, skyY = 40;
    EXPECT_EQ(red(mean, sunX, sunY), 255);
    EXPECT_GT(red(mean, skyX, skyY), 40);
    EXPECT_EQ(red(brightest, sunX, sunY), 255);
    EXPECT_LT(red(brightest, skyX, skyY), 10);
}

TEST_F(Hdr, Failures)
{
    run("bin/hdr");
    EXPECT_EQ(status, 1);
    EXPECT_NE(errors.find("usage: hdr"), std::string::npos);
    writeFile("dark.pfm", pfm("2 2", {-1, -1, -1, -1}));
    run("bin/hdr dark.pfm out.ppm");
    EXPECT_EQ(errors, "bin/hdr: the picture is darker than black\n");
    writeFile("short.pfm", pfm("2 2", {1, 1, 1}));
    run("bin/hdr short.pfm out.ppm");
    EXPECT_EQ(errors, "bin/hdr: short.pfm ends too early\n");
    writeFile("big.pfm", "PF\n2 2\n1\n");
    run("bin/hdr big.pfm out.ppm");
    EXPECT_EQ(errors, "bin/hdr: big.pfm must have its least byte first, as the processor\n");
    EXPECT_FALSE(std::filesystem::exists(folder / "out.ppm"));
}

} // namespace
