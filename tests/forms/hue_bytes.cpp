// HLS and HSV of bytes on every input, against the plain statements: whole blocks compute on bytes what can be told of
// bytes, and take other ways to the same floats.
#include "rounding_modes.hpp"

#include "pyxcc/hls.h"
#include "pyxcc/hsv.h"
#include "reference/hls.hpp"
#include "reference/hsv.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace
{

using Interleaved = PyxStatus (*)(const u8*, int, u8*, int, RoiSize);
using ToPlanes = PyxStatus (*)(const u8*, int, u8* const*, int, RoiSize);

/// A conversion to planes as one to pixels that lie plane by plane in the target.
template <ToPlanes convert> PyxStatus planar(const u8* src, int srcStep, u8* dst, int, RoiSize roi)
{
    const int step = srcStep / 3;
    u8* const planes[3] = {dst, dst + step * roi.height, dst + 2 * step * roi.height};
    return convert(src, srcStep, planes, step, roi);
}

struct Conversion {
    const char* name;
    Interleaved library, plain;
};

class HueOfBytes : public testing::TestWithParam<Conversion>
{
};

/// All pixels whose first sample is given, in rows of a width.
void expectAgreement(const Conversion& conversion, int first, int width)
{
    constexpr int pixels = 65536;
    std::vector<u8> source(3 * pixels);
    for (int i = 0; i < pixels; ++i) {
        source[3 * i] = static_cast<u8>(first);
        source[3 * i + 1] = static_cast<u8>(i >> 8);
        source[3 * i + 2] = static_cast<u8>(i);
    }
    for (int done = 0; done < pixels;) {
        const RoiSize roi = {std::min(width, pixels - done), std::max((pixels - done) / width, 1)};
        const int step = 3 * roi.width, count = roi.width * roi.height;
        std::vector<u8> actual(3 * count), expected(3 * count);
        conversion.library(source.data() + 3 * done, step, actual.data(), step, roi);
        conversion.plain(source.data() + 3 * done, step, expected.data(), step, roi);
        const auto at = std::mismatch(actual.begin(), actual.end(), expected.begin());
        ASSERT_EQ(actual.end() - at.first, 0) << "first sample " << first << ", sample " << at.first - actual.begin()
                                              << " of rows of " << roi.width << " from pixel " << done;
        done += count;
    }
}

TEST_P(HueOfBytes, WholeBlocks)
{
    for (int first = 0; first < 256; ++first) expectAgreement(GetParam(), first, 512);
}

TEST_P(HueOfBytes, Tails)
{
    for (int first = 0; first < 256; ++first) expectAgreement(GetParam(), first, 3);
}

/// The first samples include those at which the sextants of a hue begin.
TEST_P(HueOfBytes, WholeBlocksInEveryMode)
{
    for (const int mode : forms::roundingModes) {
        forms::roundingBy(mode, [] {
            for (const int first : {0, 1, 42, 43, 84, 85, 100, 127, 128, 169, 170, 171, 212, 213, 254, 255})
                expectAgreement(GetParam(), first, 512);
        });
    }
}

constexpr Conversion conversions[] = {
    {"RGBToHLS", pyxiRGBToHLS_8u_C3R, reference::pyxiRGBToHLS_8u_C3R},
    {"HLSToRGB", pyxiHLSToRGB_8u_C3R, reference::pyxiHLSToRGB_8u_C3R},
    {"BGRToHLS", planar<pyxiBGRToHLS_8u_C3P3R>, planar<reference::pyxiBGRToHLS_8u_C3P3R>},
    {"HLSToBGR", planar<pyxiHLSToBGR_8u_C3P3R>, planar<reference::pyxiHLSToBGR_8u_C3P3R>},
    {"RGBToHSV", pyxiRGBToHSV_8u_C3R, reference::pyxiRGBToHSV_8u_C3R},
    {"HSVToRGB", pyxiHSVToRGB_8u_C3R, reference::pyxiHSVToRGB_8u_C3R},
};

INSTANTIATE_TEST_SUITE_P(EveryPixel, HueOfBytes, testing::ValuesIn(conversions),
                         [](const auto& info) { return std::string(info.param.name); });

/// Hues of words, each of them with several lightnesses and saturations: whole blocks tell their sextants on words.
template <class Convert> void expectAgreementOfHues(const Convert& library, const Convert& plain)
{
    std::vector<u16> source, actual, expected;
    for (int hue = 0; hue < 65536; ++hue) {
        for (const int second : {1, 9000, 32767, 32768, 50001, 65535}) {
            for (const int third : {0, 1, 12345, 40000, 65535})
                for (const int sample : {hue, second, third}) source.push_back(static_cast<u16>(sample));
        }
    }
    actual.resize(source.size()), expected.resize(source.size());
    const int width = 30 * 512, step = 6 * width;
    for (const int mode : forms::roundingModes) {
        forms::roundingBy(mode, [&] {
            library(source.data(), step, actual.data(), step, {width, 128});
            plain(source.data(), step, expected.data(), step, {width, 128});
        });
        const auto at = std::mismatch(actual.begin(), actual.end(), expected.begin());
        ASSERT_EQ(actual.end() - at.first, 0) << "mode " << mode << ", sample " << at.first - actual.begin();
    }
}

using OfWords = PyxStatus (*)(const u16*, int, u16*, int, RoiSize);

TEST(HueOfWords, EveryHueOfHLS)
{
    expectAgreementOfHues<OfWords>(pyxiHLSToRGB_16u_C3R, reference::pyxiHLSToRGB_16u_C3R);
}

TEST(HueOfWords, EveryHueOfHSV)
{
    expectAgreementOfHues<OfWords>(pyxiHSVToRGB_16u_C3R, reference::pyxiHSVToRGB_16u_C3R);
}

} // namespace
