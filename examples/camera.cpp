// A camera's pipeline: what a sensor saw becomes a frame for a video encoder.
//
//     camera [mosaic.pgm] frame.nv12
//
// The mosaic has red at its first place, green next to it. Without one, a chart of six patches in the light of a lamp
// is looked at.
#include "example.hpp"

#include <cmath>
#include <cstdio>

using example::check;

namespace
{

struct Mosaic {
    RoiSize size = {0, 0};
    std::vector<u16> samples;
};

/// How much more of green the sensor sees under the lamp than of red and of blue.
constexpr double redGain = 2, blueGain = 1.5;

constexpr double chart[2][3][3] = {
    {{0.75, 0.75, 0.75}, {0.18, 0.18, 0.18}, {0.03, 0.03, 0.03}}, // white, gray and black
    {{0.40, 0.05, 0.04}, {0.06, 0.30, 0.07}, {0.03, 0.06, 0.30}}, // red, green and blue
};

Mosaic lookAtChart(RoiSize size)
{
    constexpr double gains[3] = {redGain, 1, blueGain};
    Mosaic mosaic{size, {}};
    for (int y = 0; y < size.height; ++y) {
        for (int x = 0; x < size.width; ++x) {
            const int channel = y % 2 + x % 2; // R G over G B
            const double light = chart[y * 2 / size.height][x * 3 / size.width][channel];
            mosaic.samples.push_back(static_cast<u16>(std::lround(65535 * light / gains[channel])));
        }
    }
    return mosaic;
}

Mosaic readMosaic(const std::string& name)
{
    std::ifstream file(name, std::ios::binary);
    const auto [width, height, top] = example::readHeader(file, "P5", name);
    if (top < 256 || top > 65535) example::fail(name + " must have samples of 16 bits");
    std::vector<u8> bytes(std::size_t{2} * width * height);
    example::readBytes(file, bytes.data(), bytes.size(), name);
    Mosaic mosaic{{width, height}, std::vector<u16>(bytes.size() / 2)};
    for (std::size_t i = 0; i < mosaic.samples.size(); ++i) {
        const int sample = bytes[2 * i] << 8 | bytes[2 * i + 1];
        mosaic.samples[i] = static_cast<u16>(std::lround(std::fmin(sample / top, 1) * 65535));
    }
    return mosaic;
}

/// A plane of luma and, behind it, one of Cb, Cr pairs of half the width and height.
std::vector<u8> develop(const Mosaic& mosaic)
{
    const RoiSize size = mosaic.size;
    const int width = size.width, height = size.height;
    const int wordStep = 3 * width * static_cast<int>(sizeof(u16));

    // Light stays in 16 bits until the curve of gamma has made the best of them.
    std::vector<u16> light(std::size_t{3} * width * height);
    check(pyxiCFAToRGB_16u_C1C3R(mosaic.samples.data(), {0, 0, width, height}, size, 2 * width, light.data(), wordStep,
                                 1, 0),
          "pyxiCFAToRGB_16u_C1C3R");
    static const f32 whiteBalance[3][4] = {{redGain, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, blueGain, 0}};
    check(pyxiColorTwist32f_16u_C3IR(light.data(), wordStep, size, whiteBalance), "pyxiColorTwist32f_16u_C3IR");
    check(pyxiGammaFwd_16u_C3IR(light.data(), wordStep, size), "pyxiGammaFwd_16u_C3IR");

    // All 256 levels, with a pattern (method 4) that hides where one ends and the next begins.
    std::vector<u8> rgb(light.size());
    check(pyxiReduceBits_16u8u_C3R(light.data(), wordStep, rgb.data(), 3 * width, size, 0, 4, 256),
          "pyxiReduceBits_16u8u_C3R");

    std::vector<u8> frame(std::size_t{3} * width * height / 2);
    u8* const chroma = frame.data() + std::size_t{1} * width * height;
    check(pyxiRGBToYCbCr420_8u_C3P2R(rgb.data(), 3 * width, frame.data(), width, chroma, width, size),
          "pyxiRGBToYCbCr420_8u_C3P2R");
    return frame;
}

/// Means of luma and chroma in the middle of a patch.
void describePatch(const std::vector<u8>& frame, RoiSize size, int column, int row)
{
    constexpr int side = 16;
    const int left = ((2 * column + 1) * size.width / 6 - side / 2) & ~1;
    const int top = ((2 * row + 1) * size.height / 4 - side / 2) & ~1;
    const u8* const chroma = frame.data() + std::size_t{1} * size.width * size.height;
    double sums[3] = {};
    for (int y = 0; y < side; ++y) {
        for (int x = 0; x < side; ++x) {
            const u8* const pair = chroma + (top + y) / 2 * size.width + ((left + x) & ~1);
            sums[0] += frame[(top + y) * size.width + left + x];
            sums[1] += pair[0];
            sums[2] += pair[1];
        }
    }
    for (double& sum : sums) sum /= side * side;
    std::printf("Y %3.0f  Cb %3.0f  Cr %3.0f\n", sums[0], sums[1], sums[2]);
}

int run(const std::vector<std::string>& arguments)
{
    if (arguments.empty() || arguments.size() > 2) example::fail("usage: camera [mosaic.pgm] frame.nv12");
    Mosaic mosaic = arguments.size() == 2 ? readMosaic(arguments[0]) : lookAtChart({384, 256});
    if (mosaic.size.width % 2 || mosaic.size.height % 2) example::fail("a frame has an even width and height");
    const std::vector<u8> frame = develop(mosaic);
    example::writeFile(arguments.back(), "", frame);
    std::printf("%s: NV12, %d x %d\n", arguments.back().c_str(), mosaic.size.width, mosaic.size.height);
    if (arguments.size() == 1) {
        for (int patch = 0; patch < 6; ++patch) describePatch(frame, mosaic.size, patch % 3, patch / 3);
    }
    return 0;
}

} // namespace

int main(int argc, char** argv) { return example::guarded(run, argc, argv); }
