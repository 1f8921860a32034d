// A picture of any brightness (HDR) becomes one of 8 bits.
//
//     hdr [--brightest] [picture.pfm] picture.ppm
//
// Twice the mean becomes white, or, with --brightest, the largest sample. Without a picture, a sun over hills is looked
// at, whose disc is a thousand times as bright as the hills.
#include "example.hpp"

#include <bit>
#include <cmath>
#include <cstdio>
#include <cstring>

using example::check;

namespace
{

/// R, G and B of each pixel as light, from the lowest row up.
struct Light {
    RoiSize size = {0, 0};
    std::vector<f32> samples;
};

Light lookAtSun(RoiSize size)
{
    Light light{size, {}};
    for (int y = 0; y < size.height; ++y) {
        for (int x = 0; x < size.width; ++x) {
            const double right = 1.0 * x / size.width, up = 1.0 * y / size.height;
            const bool hill = up < 0.3 + 0.1 * std::sin(9 * right);
            const double sun = std::hypot((right - 0.7) * size.width / size.height, up - 0.75) < 0.04 ? 1000 : 0;
            const double haze = 2 * (1 - up);
            const double colors[2][3] = {{2 + haze + sun, 3 + haze + sun, 6 + haze + 0.8 * sun},
                                         {1.5 * up + 0.2, 2 * up + 0.4, 0.3}};
            for (const double color : colors[hill]) light.samples.push_back(static_cast<f32>(color));
        }
    }
    return light;
}

/// A PFM file has its lowest row first, too.
Light readLight(const std::string& name)
{
    std::ifstream file(name, std::ios::binary);
    const auto [width, height, scale] = example::readHeader(file, "PF", name);
    if (scale >= 0 || std::endian::native != std::endian::little) {
        example::fail(name + " must have its least byte first, as the processor");
    }
    Light light{{width, height}, std::vector<f32>(std::size_t{3} * width * height)};
    example::readBytes(file, light.samples.data(), light.samples.size() * sizeof(f32), name);
    return light;
}

std::vector<u8> develop(const Light& light, bool brightest)
{
    const RoiSize size = light.size;
    const int step = 3 * size.width;
    std::vector<u8> rgb(light.samples.size());

    // One scale for all three channels keeps the colours: to the tone mapping, the picture is a gray one of three times
    // the width. A negative step turns it upside down on the way.
    const int lightStep = step * static_cast<int>(sizeof(f32));
    const f32* const top = light.samples.data() + std::ptrdiff_t{size.height - 1} * step;
    const auto map = brightest ? pyxiToneMapLinear_32f8u_C1R : pyxiToneMapMean_32f8u_C1R;
    const PyxStatus status = map(top, -lightStep, rgb.data(), step, {step, size.height});
    check(status, "the tone mapping");
    if (status == pyxWarnNegativeLevel) example::fail("the picture is darker than black");

    check(pyxiGammaFwd_8u_C3IR(rgb.data(), step, size), "pyxiGammaFwd_8u_C3IR");
    return rgb;
}

int run(const std::vector<std::string>& arguments)
{
    std::vector<std::string> names;
    bool brightest = false;
    for (const std::string& argument : arguments) {
        if (argument == "--brightest")
            brightest = true;
        else
            names.push_back(argument);
    }
    if (names.empty() || names.size() > 2 || names[0][0] == '-') {
        example::fail("usage: hdr [--brightest] [picture.pfm] picture.ppm");
    }
    const Light light = names.size() == 2 ? readLight(names[0]) : lookAtSun({480, 320});
    const std::string size = std::to_string(light.size.width) + ' ' + std::to_string(light.size.height);
    example::writeFile(names.back(), "P6\n" + size + "\n255\n", develop(light, brightest));
    std::printf("%s: %s\n", names.back().c_str(), size.c_str());
    return 0;
}

} // namespace

int main(int argc, char** argv) { return example::guarded(run, argc, argv); }
