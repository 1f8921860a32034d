#include "preview.hpp"

#include "component.hpp"
#include "repack.hpp"

#include <algorithm>
#include <cmath>

namespace tool
{

namespace
{

using catalog::Element;

/// Calls `pixel(x, y, mean)` with the mean of the samples that each pixel of a smaller grid covers.
template <class Pixel> void resample(const ConstComponent& from, RoiSize size, Pixel pixel)
{
    // The samples that one of `parts` covers; at least one.
    const auto span = [](int part, int parts, int whole) {
        const int first = static_cast<int>(static_cast<long long>(part) * whole / parts);
        const int end = static_cast<int>(static_cast<long long>(part + 1) * whole / parts);
        return std::pair(first, std::max(end, first + 1));
    };
    for (int y = 0; y < size.height; ++y) {
        const auto [top, bottom] = span(y, size.height, from.size.height);
        for (int x = 0; x < size.width; ++x) {
            const auto [left, right] = span(x, size.width, from.size.width);
            double sum = 0;
            for (int v = top; v < bottom; ++v) {
                for (int u = left; u < right; ++u) sum += from.at(u, v);
            }
            pixel(x, y, sum / (static_cast<double>(bottom - top) * (right - left)));
        }
    }
}

/// The smallest and the largest value.
Range extent(const ConstComponent& values)
{
    Range range = {HUGE_VAL, -HUGE_VAL};
    for (int y = 0; y < values.size.height; ++y) {
        for (int x = 0; x < values.size.width; ++x) {
            const double value = values.at(x, y);
            if (!std::isfinite(value)) continue;
            range = {std::min(range.low, value), std::max(range.high, value)};
        }
    }
    return range;
}

bool isUnsigned(Element element)
{
    return element == Element::u8 || element == Element::u16 || element == Element::bit;
}

Range shownRange(const catalog::Side& side, const ConstComponent& values)
{
    if (hasScale(side) || isUnsigned(side.element)) return values.range;
    const Range range = extent(values);
    return range.high > range.low ? range : Range{range.low - 1, range.low + 1};
}

} // namespace

Format pictureFormat(const Format& format)
{
    const catalog::Side& side = format.side;
    const bool wide = side.element == Element::u16 && !isPacked(side);
    const Element element = wide && hasScale(side) ? Element::u16 : Element::u8;
    if (isGray(side)) return gray(element);
    const bool alpha = isRgb(side) && !side.spareFourth && componentsOf(side).size() == 4;
    return rgb(alpha ? "C4" : "C3", element);
}

std::optional<Route> wayToPicture(const Graph& graph, const Format& format)
{
    return graph.find(format, pictureFormat(format));
}

RoiSize fitted(RoiSize shape, RoiSize box)
{
    const double scale =
        std::min({1.0, static_cast<double>(box.width) / shape.width, static_cast<double>(box.height) / shape.height});
    const auto scaled = [scale](s32 length) { return std::max(static_cast<s32>(std::lround(length * scale)), 1); };
    return {scaled(shape.width), scaled(shape.height)};
}

Image scaledDown(const Image& image, RoiSize box)
{
    Image result(image.format(), fitted(image.size(), box));
    for (int channel = 0; channel < image.side().samples; ++channel) {
        const Component target = component(result, channel);
        resample(component(image, channel), result.size(), [&](int x, int y, double mean) { target.set(x, y, mean); });
    }
    return result;
}

Image eightBit(const Image& image)
{
    const catalog::Side& side = image.side();
    return repack(image, {catalog::sideOf(side.model, side.layout, Element::u8), {}});
}

Image componentTiles(const Image& image, RoiSize tile)
{
    const int count = static_cast<int>(componentsOf(image.side()).size());
    const int gap = count > 1 ? std::max(tile.width / 32, 1) : 0;
    Image result(rgb("C4"), {count * (tile.width + gap) - gap, tile.height});
    const Component targets[] = {component(result, 0), component(result, 1), component(result, 2)};
    const Component alpha = component(result, 3);
    for (int index = 0; index < count; ++index) {
        const ConstComponent values = component(image, index);
        const Range range = shownRange(image.side(), values);
        const int left = index * (tile.width + gap);
        resample(values, tile, [&](int x, int y, double mean) {
            const double level = 255 * (mean - range.low) / (range.high - range.low);
            for (const Component& target : targets) target.set(left + x, y, level);
            alpha.set(left + x, y, 255);
        });
    }
    return result;
}

} // namespace tool
