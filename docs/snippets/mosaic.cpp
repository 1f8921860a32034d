// The examples on the pages about mosaics, as tests: what is between the marks is what the pages show.
#include <pyxcc/pyxcc.h>

#include <gtest/gtest.h>

#include <vector>

namespace
{

using Bytes = std::vector<u8>;

/// A scene of one colour, red 200, green 100 and blue 50, seen through a mosaic of grid 1: R G over G B.
Bytes flatScene(int width, int height)
{
    Bytes mosaic;
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) mosaic.push_back((x + y) % 2 != 0 ? 100 : (y % 2 == 0 ? 200 : 50));
    }
    return mosaic;
}

void expectTheScene(const Bytes& rgb)
{
    for (std::size_t i = 0; i < rgb.size(); i += 3) {
        ASSERT_EQ(Bytes(rgb.begin() + static_cast<std::ptrdiff_t>(i), rgb.begin() + static_cast<std::ptrdiff_t>(i) + 3),
                  (Bytes{200, 100, 50}))
            << i / 3;
    }
}

TEST(Documentation, Cfa)
{
    constexpr int width = 12, height = 10;
    const Bytes mosaic = flatScene(width, height);
    //! [cfa]
    // the middle of a mosaic that begins with R G over G B: `mosaic` is its first sample, and the region lies within
    const RoiRect region = {2, 2, 8, 6};
    Bytes rgb(8 * 6 * 3);
    pyxiCFAToRGB_8u_C1C3R(mosaic.data(), region, {width, height}, width, rgb.data(), 8 * 3, 1, 0);
    //! [cfa]
    expectTheScene(rgb);
}

TEST(Documentation, DemosaicAhd)
{
    constexpr int width = 24, height = 20;
    const Bytes mosaic = flatScene(width, height);
    //! [demosaic-ahd]
    Bytes rgb(width * height * 3), workspace(30 * (width + 6));
    pyxiDemosaicAHD_8u_C1C3R(mosaic.data(), {0, 0, width, height}, {width, height}, width, rgb.data(), width * 3, 1,
                             workspace.data(), width + 6);
    //! [demosaic-ahd]
    expectTheScene(rgb);
}

} // namespace
