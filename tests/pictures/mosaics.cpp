// Mosaics made of a photograph, whole and cut into regions: the library against the reference, and regions against the
// whole.
#include "pyxcc/pyxcc.h"

#include "reference/cfa_to_rgb.hpp"
#include "reference/demosaic_ahd.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <limits>
#include <random>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <vector>

namespace
{

struct Picture {
    RoiSize size;
    std::vector<u8> rgb;
};

Picture readPicture()
{
    const char* const path = std::getenv("PYXCC_PICTURE");
    std::ifstream file(path != nullptr ? path : PICTURE, std::ios::binary);
    std::string kind;
    int most = 0;
    Picture picture;
    file >> kind >> picture.size.width >> picture.size.height >> most;
    file.get();
    if (!file || kind != "P6" || most != 255) throw std::runtime_error("the picture is not a PPM file of 8 bits");
    picture.rgb.resize(std::size_t{3} * picture.size.width * picture.size.height);
    file.read(reinterpret_cast<char*>(picture.rgb.data()), static_cast<std::streamsize>(picture.rgb.size()));
    if (!file) throw std::runtime_error("the picture's file ends too early");
    return picture;
}

/// Which of R, G and B a place has.
int channelAt(int grid, int x, int y)
{
    constexpr int channels[4][2][2] = {{{2, 1}, {1, 0}}, {{0, 1}, {1, 2}}, {{1, 2}, {0, 1}}, {{1, 0}, {2, 1}}};
    return channels[grid][y & 1][x & 1];
}

template <class T> struct Mosaic {
    RoiSize size;
    int grid;
    std::vector<T> samples;

    Mosaic(const Picture& picture, int colors) : size(picture.size), grid(colors)
    {
        for (int y = 0; y < size.height; ++y) {
            for (int x = 0; x < size.width; ++x) {
                const int sample =
                    picture.rgb[3 * (std::size_t(size.width) * y + x) + std::size_t(channelAt(grid, x, y))];
                // Between the levels of the picture 16 bits have some of their own.
                samples.push_back(sizeof(T) == 1
                                      ? static_cast<T>(sample)
                                      : static_cast<T>(sample * 256 + (sample * 37 + x * 11 + y * 29) % 256));
            }
        }
    }

    /// Black and white at random. Many sums of scores are zero, and so many places do as those in front of them.
    Mosaic(RoiSize of, int colors) : size(of), grid(colors)
    {
        std::mt19937 numbers(static_cast<unsigned>(colors));
        for (int i = 0; i < size.width * size.height; ++i) {
            samples.push_back(numbers() % 2 == 0 ? T{0} : std::numeric_limits<T>::max());
        }
    }

    int step() const { return size.width * static_cast<int>(sizeof(T)); }
    RoiRect whole() const { return {0, 0, size.width, size.height}; }
};

/// Room around a region for strips that are written beyond it.
constexpr int margin = 8;

template <class T> struct Target {
    RoiSize size;
    std::vector<T> samples;

    explicit Target(const RoiRect& region)
        : size{region.width + 2 * margin, region.height + 2 * margin},
          samples(std::size_t{3} * size.width * size.height, T{77})
    {
    }

    int step() const { return 3 * size.width * static_cast<int>(sizeof(T)); }
    T* pixel(int x, int y) { return &samples[3 * (std::size_t(size.width) * (y + margin) + (x + margin))]; }
};

struct InOnePass {
    static constexpr long long pixelsAChange = std::numeric_limits<long long>::max(); // none

    template <class T> static Target<T> convert(const Mosaic<T>& mosaic, RoiRect region, bool byLibrary)
    {
        Target<T> target(region);
        const auto call = [&](auto function) {
            EXPECT_EQ(function(mosaic.samples.data(), region, mosaic.size, mosaic.step(), target.pixel(0, 0),
                               target.step(), mosaic.grid, 0),
                      pyxOk);
        };
        if constexpr (sizeof(T) == 1) {
            call(byLibrary ? pyxiCFAToRGB_8u_C1C3R : reference::pyxiCFAToRGB_8u_C1C3R);
        } else {
            call(byLibrary ? pyxiCFAToRGB_16u_C1C3R : reference::pyxiCFAToRGB_16u_C1C3R);
        }
        return target;
    }
};

struct ByHomogeneity {
    /// Where the scores of both candidates are equal from the beginning of a block on, it matters where that is.
    static constexpr long long pixelsAChange = 100;

    template <class T> static Target<T> convert(const Mosaic<T>& mosaic, RoiRect region, bool byLibrary)
    {
        Target<T> target(region);
        const int columns = std::max(region.width, margin) + 6, step = columns * static_cast<int>(sizeof(T));
        std::vector<T> workspace(std::size_t{30} * columns);
        const auto call = [&](auto function) {
            EXPECT_EQ(function(mosaic.samples.data(), region, mosaic.size, mosaic.step(), target.pixel(0, 0),
                               target.step(), mosaic.grid, workspace.data(), step),
                      pyxOk);
        };
        if constexpr (sizeof(T) == 1) {
            call(byLibrary ? pyxiDemosaicAHD_8u_C1C3R : reference::pyxiDemosaicAHD_8u_C1C3R);
        } else {
            call(byLibrary ? pyxiDemosaicAHD_16u_C1C3R : reference::pyxiDemosaicAHD_16u_C1C3R);
        }
        return target;
    }
};

/// Pieces of a length that begin and end at even and at odd places, in all four ways, the first ones smaller than any
/// border.
std::vector<std::pair<int, int>> pieces(int length)
{
    std::vector<std::pair<int, int>> result;
    constexpr int lengths[] = {1, 2, 3, 4, 7, 10, 15, 22, 33, 48, 71, 104};
    int from = 0;
    for (std::size_t i = 0; from < length; i = std::min(i + 1, std::size(lengths) - 1)) {
        const int count = std::min(lengths[i], length - from);
        result.emplace_back(from, count);
        from += count;
    }
    return result;
}

template <class Method, class T> void expectRegionsAsStated(const Picture& picture)
{
    long long pixels = 0, unlikeTheWhole = 0;
    for (int grid = 0; grid < 4; ++grid) {
        const Mosaic<T> mosaic(picture, grid);
        Target<T> whole = Method::convert(mosaic, mosaic.whole(), true);
        ASSERT_EQ(whole.samples, Method::convert(mosaic, mosaic.whole(), false).samples) << "grid " << grid;
        for (const auto& [top, height] : pieces(mosaic.size.height)) {
            for (const auto& [left, width] : pieces(mosaic.size.width)) {
                const RoiRect region = {left, top, width, height};
                Target<T> part = Method::convert(mosaic, region, true);
                ASSERT_EQ(part.samples, Method::convert(mosaic, region, false).samples)
                    << "grid " << grid << ": " << left << ", " << top << ", " << width << " x " << height;
                for (int y = 0; y < height; ++y) {
                    for (int x = 0; x < width; ++x, ++pixels)
                        unlikeTheWhole +=
                            !std::equal(part.pixel(x, y), part.pixel(x, y) + 3, whole.pixel(left + x, top + y));
                }
            }
        }
    }
    EXPECT_LE(unlikeTheWhole, pixels / Method::pixelsAChange);
    std::cout << unlikeTheWhole << " of " << pixels << " pixels of regions are not those of the whole\n";
}

template <class T> void expectWideAndHighAsStated()
{
    for (const RoiSize size : {RoiSize{1111, 24}, {21, 2111}}) {
        for (int grid = 0; grid < 4; ++grid) {
            const Mosaic<T> mosaic(size, grid);
            EXPECT_TRUE(ByHomogeneity::convert(mosaic, mosaic.whole(), true).samples ==
                        ByHomogeneity::convert(mosaic, mosaic.whole(), false).samples)
                << "grid " << grid << ", width " << size.width;
        }
    }
}

} // namespace

// However wide and high a mosaic is, whole rows do as they begin.
TEST(MosaicsAtRandom, ByHomogeneityOfBytes) { expectWideAndHighAsStated<u8>(); }
TEST(MosaicsAtRandom, ByHomogeneityOfWords) { expectWideAndHighAsStated<u16>(); }

TEST(MosaicsOfAPhotograph, InOnePassOfBytes) { expectRegionsAsStated<InOnePass, u8>(readPicture()); }
TEST(MosaicsOfAPhotograph, InOnePassOfWords) { expectRegionsAsStated<InOnePass, u16>(readPicture()); }
TEST(MosaicsOfAPhotograph, ByHomogeneityOfBytes) { expectRegionsAsStated<ByHomogeneity, u8>(readPicture()); }
TEST(MosaicsOfAPhotograph, ByHomogeneityOfWords) { expectRegionsAsStated<ByHomogeneity, u16>(readPicture()); }
