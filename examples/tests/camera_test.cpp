#include "program.hpp"

#include <cmath>

namespace
{

using Camera = example::Program;

/// The curve of video, and luma and chroma of studio range.
struct Expected {
    double y, cb, cr;
};

double curve(double light) { return light < 0.018 ? 4.5 * light : 1.099 * std::pow(light, 0.45) - 0.099; }

Expected expected(double red, double green, double blue)
{
    const double r = curve(red), g = curve(green), b = curve(blue);
    const double luma = 0.299 * r + 0.587 * g + 0.114 * b;
    return {16 + 219 * luma, 128 + 112 * (b - luma) / 0.886, 128 + 112 * (r - luma) / 0.701};
}

int byteAt(const std::string& bytes, int at) { return static_cast<unsigned char>(bytes.at(at)); }

// The lamp has no part in the frame: each patch comes out as it is in white light.
TEST_F(Camera, PatchesOfTheChart)
{
    run("bin/camera chart.nv12");
    ASSERT_EQ(status, 0) << errors;
    const std::string frame = readFile("chart.nv12");
    ASSERT_EQ(frame.size(), 384U * 256 * 3 / 2);
    const Expected patches[] = {expected(0.75, 0.75, 0.75), expected(0.18, 0.18, 0.18), expected(0.03, 0.03, 0.03),
                                expected(0.40, 0.05, 0.04), expected(0.06, 0.30, 0.07), expected(0.03, 0.06, 0.30)};
    for (int patch = 0; patch < 6; ++patch) {
        const int x = 64 + 128 * (patch % 3), y = 64 + 128 * (patch / 3);
        const int chroma = 384 * 256 + y / 2 * 384 + x;
        EXPECT_NEAR(byteAt(frame, y * 384 + x), patches[patch].y, 1.5) << patch;
        EXPECT_NEAR(byteAt(frame, chroma), patches[patch].cb, 1.5) << patch;
        EXPECT_NEAR(byteAt(frame, chroma + 1), patches[patch].cr, 1.5) << patch;
    }
}

// Sensors of 10 bits: 460 of 1023, and of red and blue as much less as the lamp has them.
TEST_F(Camera, MosaicFromAFile)
{
    std::string mosaic = "P5\n# a sensor\n8 6\n1023\n";
    for (int y = 0; y < 6; ++y) {
        for (int x = 0; x < 8; ++x) {
            const int sample = y % 2 + x % 2 == 0 ? 230 : y % 2 + x % 2 == 1 ? 460 : 307;
            mosaic += {static_cast<char>(sample >> 8), static_cast<char>(sample & 255)};
        }
    }
    writeFile("gray.pgm", mosaic);
    run("bin/camera gray.pgm gray.nv12");
    ASSERT_EQ(status, 0) << errors;
    const std::string frame = readFile("gray.nv12");
    ASSERT_EQ(frame.size(), 8U * 6 * 3 / 2);
    const double luma = 16 + 219 * curve(460 / 1023.0);
    for (int i = 0; i < 48; ++i) EXPECT_NEAR(byteAt(frame, i), luma, 1.5) << i;
    for (int i = 48; i < 72; ++i) EXPECT_NEAR(byteAt(frame, i), 128, 1.5) << i;
}

TEST_F(Camera, Failures)
{
    run("bin/camera");
    EXPECT_EQ(status, 1);
    EXPECT_NE(errors.find("usage: camera [mosaic.pgm] frame.nv12"), std::string::npos) << errors;
    writeFile("short.pgm", "P5 8 6 1023\nabc");
    run("bin/camera short.pgm frame.nv12");
    EXPECT_EQ(status, 1);
    EXPECT_EQ(errors, "bin/camera: short.pgm ends too early\n");
    for (const auto* const header : {"P6 8 6 1023\n", "", "P5 8 x 1023\n"}) {
        writeFile("wrong.pgm", header);
        run("bin/camera wrong.pgm frame.nv12");
        EXPECT_EQ(errors, "bin/camera: wrong.pgm is not a picture of kind P5\n") << header;
    }
    for (const auto* const header : {"P5 8 1 1023\n", "P5 -8 6 1023\n", "P5 20000 6 1023\n"}) {
        writeFile("wrong.pgm", header);
        run("bin/camera wrong.pgm frame.nv12");
        EXPECT_EQ(errors, "bin/camera: wrong.pgm must be 2 to 16384 pixels wide and high\n") << header;
    }
    run("bin/camera missing/frame.nv12");
    EXPECT_EQ(errors, "bin/camera: cannot write missing/frame.nv12\n");
    EXPECT_FALSE(std::filesystem::exists(folder / "frame.nv12"));
}

} // namespace
