#include "format.hpp"

#include <algorithm>
#include <array>
#include <tuple>

namespace tool
{

namespace
{

using Names = std::array<std::string_view, 3>;

struct Model {
    std::string_view stem;
    Names components; // in the order of memory
};

constexpr Model models[] = {
    {"RGB", {"R", "G", "B"}},     {"BGR", {"B", "G", "R"}},     {"SBGR", {"B", "G", "R"}}, {"YCbCr", {"Y", "Cb", "Cr"}},
    {"YCrCb", {"Y", "Cr", "Cb"}}, {"CbYCr", {"Cb", "Y", "Cr"}}, {"YUV", {"Y", "U", "V"}},  {"YCC", {"Y", "C1", "C2"}},
    {"XYZ", {"X", "Y", "Z"}},     {"HLS", {"H", "L", "S"}},     {"HSV", {"H", "S", "V"}},  {"Lab", {"L", "a", "b"}},
    {"LUV", {"L", "u", "v"}},     {"YCoCg", {"Y", "Co", "Cg"}},
};

/// The model without its subsampling or its depth: "YCbCr" of "YCbCr420".
std::string_view stemOf(std::string_view model) { return model.substr(0, model.find_first_of("0123456789")); }

Format formatOf(const catalog::Export& entry, const catalog::Side& side)
{
    Format format{side, {}};
    if (side.model == "Color") format.side.model = "RGB";
    if (side.model.empty()) format.side.model = side.samples * side.planes == 1 ? "Gray" : "RGB";
    for (std::string_view variant : {"709CSC", "709HDTV", "Rev"}) {
        if (entry.variant == variant && !isRgb(side)) format.encoding = variant;
    }
    return format;
}

} // namespace

bool operator==(const Format& a, const Format& b)
{
    const auto key = [](const Format& format) {
        return std::tie(format.side.model, format.side.layout, format.side.element, format.encoding);
    };
    return key(a) == key(b);
}

Format rgb(std::string_view layout, catalog::Element element) { return {catalog::sideOf("RGB", layout, element), {}}; }

Format gray(catalog::Element element) { return {catalog::sideOf("Gray", "C1", element), {}}; }

Format sourceOf(const catalog::Export& entry) { return formatOf(entry, entry.source); }

Format targetOf(const catalog::Export& entry) { return formatOf(entry, entry.target); }

std::string nameOf(const catalog::Side& side)
{
    return (side.model.empty() ? "any" : side.model) + " " + side.layout + " " +
           std::string(catalog::nameOf(side.element));
}

std::string nameOf(const Format& format)
{
    return nameOf(format.side) + (format.encoding.empty() ? "" : " (" + format.encoding + ")");
}

std::vector<std::string_view> componentsOf(const catalog::Side& side)
{
    const bool chromaPairs = side.arrangement == catalog::Arrangement::semiPlanar || side.layout == "C2";
    const int stored = chromaPairs || isPacked(side) ? 3 : side.samples * side.planes;
    if (stored == 1) return {"gray"};

    const auto known = std::ranges::find(models, stemOf(side.model), &Model::stem);
    const Names names = known == std::end(models) ? Names{"1", "2", "3"} : known->components;
    std::vector<std::string_view> components(names.begin(), names.end());
    if (stored == 4) components.push_back("A");
    return components;
}

bool isPacked(const catalog::Side& side)
{
    return side.element == catalog::Element::u16 && side.samples == 1 && side.layout == "C3";
}

bool isRgb(const catalog::Side& side)
{
    const std::string_view stem = stemOf(side.model);
    return stem == "RGB" || stem == "BGR" || stem == "SBGR";
}

bool isGray(const catalog::Side& side) { return side.model == "Gray"; }

bool hasScale(const catalog::Side& side) { return isRgb(side) || isGray(side); }

} // namespace tool
