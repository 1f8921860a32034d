#include "mosaic_figures.hpp"

#include "component.hpp"
#include "convert.hpp"
#include "lookup.hpp"
#include "preview.hpp"
#include "repack.hpp"
#include "test_card.hpp"

#include <algorithm>
#include <cmath>
#include <cstdio>

namespace tool
{

namespace
{

constexpr RoiSize plateSize = {240, 240};
constexpr int shownSide = 120, magnified = 3;

/// The sum of squared differences in the part of that size at (left, top).
double squaredDifferences(const Image& a, const Image& b, int left, int top, RoiSize size)
{
    double sum = 0;
    for (int channel = 0; channel < 3; ++channel) {
        const ConstComponent x = component(a, channel), y = component(b, channel);
        for (int row = top; row < top + size.height; ++row) {
            for (int column = left; column < left + size.width; ++column) {
                const double difference = x.at(column, row) - y.at(column, row);
                sum += difference * difference;
            }
        }
    }
    return sum;
}

struct Corner {
    int x = 0, y = 0;
};

/// Of the parts of that size, the one in which the images differ most, in steps of half a part.
Corner mostDifferent(const Image& a, const Image& b, RoiSize part)
{
    Corner corner;
    double most = -1;
    for (int y = 0; y + part.height <= a.size().height; y += std::max(part.height / 2, 1)) {
        for (int x = 0; x + part.width <= a.size().width; x += std::max(part.width / 2, 1)) {
            const double sum = squaredDifferences(a, b, x, y, part);
            if (sum > most) most = sum, corner = {x, y};
        }
    }
    return corner;
}

/// A part of gray or RGB, each pixel a square.
Image magnifiedPart(const Image& image, Corner corner, RoiSize part)
{
    Image result(image.format(), {part.width * magnified, part.height * magnified});
    for (int channel = 0; channel < image.side().samples; ++channel) {
        const ConstComponent from = component(image, channel);
        const Component to = component(result, channel);
        for (int y = 0; y < to.size.height; ++y) {
            for (int x = 0; x < to.size.width; ++x)
                to.set(x, y, from.at(corner.x + x / magnified, corner.y + y / magnified));
        }
    }
    return result;
}

Image converted(const char* name, const Image& mosaic)
{
    return measure(named(name), mosaic, Parameters(named(name)), 0).target;
}

std::string captionOf(const std::string& method, const Image& picture, const Image& result)
{
    const double decibels = psnr(picture, result);
    if (std::isinf(decibels)) return method + ": the picture itself";
    char text[32];
    std::snprintf(text, sizeof text, ": %.1f\u00a0dB", decibels);
    return method + text;
}

void addFigures(std::vector<NamedImage>& figures, const Image& picture, const std::string& file, const std::string& of)
{
    const RoiSize size = picture.size();
    const RoiSize part = {std::min(size.width, shownSide), std::min(size.height, shownSide)};
    Image mosaic = repack(picture, {catalog::sideOf("CFA", "C1", catalog::Element::u8), {}});
    const Image inOnePass = converted("pyxiCFAToRGB_8u_C1C3R", mosaic);
    const Image byHomogeneity = converted("pyxiDemosaicAHD_8u_C1C3R", mosaic);
    mosaic.rename(gray());
    const Corner corner = mostDifferent(inOnePass, byHomogeneity, part);
    figures.push_back({file + ".mosaic", magnifiedPart(mosaic, corner, part), "The mosaic of " + of});
    figures.push_back(
        {file + ".one-pass", magnifiedPart(inOnePass, corner, part), captionOf("In one pass", picture, inOnePass)});
    figures.push_back({file + ".homogeneity", magnifiedPart(byHomogeneity, corner, part),
                       captionOf("By homogeneity", picture, byHomogeneity)});
}

} // namespace

double psnr(const Image& a, const Image& b)
{
    const double samples = 3.0 * a.size().width * a.size().height;
    return 10 * std::log10(255.0 * 255.0 * samples / squaredDifferences(a, b, 0, 0, a.size()));
}

std::vector<NamedImage> mosaicFigures(const Image& picture)
{
    std::vector<NamedImage> figures;
    const int least = named("pyxiDemosaicAHD_8u_C1C3R").traits.withinImagesFrom;
    if (picture.size().width < least || picture.size().height < least) return figures;
    addFigures(figures, repack(eightBit(picture), rgb()), "picture", "the picture");
    addFigures(figures, zonePlate(plateSize), "zone-plate", "a zone plate");
    return figures;
}

} // namespace tool
