#include "repack.hpp"

#include "component.hpp"

#include <algorithm>

namespace tool
{

namespace
{

using Names = std::vector<std::string_view>;

/// Where `name` stands in `names`, or -1.
int find(const Names& names, std::string_view name)
{
    const auto at = std::ranges::find(names, name);
    return at == names.end() ? -1 : static_cast<int>(at - names.begin());
}

/// The component that a sensor sees at a place, in rows of B G and G R.
std::string_view mosaicColor(int x, int y)
{
    if (((x ^ y) & 1) != 0) return "G";
    return (y & 1) != 0 ? "R" : "B";
}

bool isMosaic(const catalog::Side& side) { return side.model == "CFA"; }

bool sameColors(Names a, Names b)
{
    for (Names* names : {&a, &b}) std::erase(*names, "A");
    return std::ranges::is_permutation(a, b);
}

double rescale(double value, Range from, Range to)
{
    return to.low + (value - from.low) * (to.high - to.low) / (from.high - from.low);
}

void copyComponent(const ConstComponent& from, const Component& to)
{
    const bool sameScale = from.range.low == to.range.low && from.range.high == to.range.high;
    const RoiSize size = {std::min(from.size.width, to.size.width), std::min(from.size.height, to.size.height)};
    for (int y = 0; y < size.height; ++y) {
        for (int x = 0; x < size.width; ++x) {
            const double value = from.at(x, y);
            to.set(x, y, sameScale ? value : rescale(value, from.range, to.range));
        }
    }
}

void drawMosaic(const Image& from, Image& to)
{
    const Names names = componentsOf(from.side());
    const ConstComponent colors[] = {component(from, 0), component(from, 1), component(from, 2)};
    const Component mosaic = component(to, 0);
    for (int y = 0; y < to.size().height; ++y) {
        for (int x = 0; x < to.size().width; ++x) {
            mosaic.set(x, y, colors[find(names, mosaicColor(x, y))].at(x, y));
        }
    }
}

} // namespace

bool canRepack(const Format& from, const Format& to)
{
    const catalog::Side &a = from.side, &b = to.side;
    if (from.encoding != to.encoding || a.chromaX != b.chromaX || a.chromaY != b.chromaY) return false;
    if (isMosaic(a) || isMosaic(b)) return isRgb(a) && !isPacked(a) && isMosaic(b) && a.element == b.element;
    if (isGray(a) && isRgb(b)) return true;
    if (!sameColors(componentsOf(a), componentsOf(b))) return false;
    if (hasScale(a) && hasScale(b)) return true; // a change of depth is a change of scale
    return a.element == b.element && isGray(a) == isGray(b);
}

Image repack(const Image& from, const Format& to)
{
    Image result(to, from.size());
    makeOpaque(result);
    if (isMosaic(to.side)) {
        drawMosaic(from, result);
        return result;
    }
    const Names sources = componentsOf(from.side()), targets = componentsOf(to.side);
    for (int index = 0; index < static_cast<int>(targets.size()); ++index) {
        int source = find(sources, targets[index]);
        if (source < 0 && isGray(from.side()) && targets[index] != "A") source = 0;
        if (source >= 0) copyComponent(component(from, source), component(result, index));
    }
    return result;
}

} // namespace tool
