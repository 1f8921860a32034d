// What the samples of an image mean and how they lie in memory: a node in the graph of conversions.
#pragma once

#include "catalog.hpp"

#include <string>
#include <vector>

namespace tool
{

struct Format {
    catalog::Side side;
    std::string encoding; ///< the flavour of a model that takes an inverse of its own: "709CSC", "Rev"

    /// How a signature gives the steps is no matter of the format.
    friend bool operator==(const Format& a, const Format& b);
};

Format rgb(std::string_view layout = "C3", catalog::Element element = catalog::Element::u8);
Format gray(catalog::Element element = catalog::Element::u8);

/// The formats that an export reads and writes. One without a model works on RGB or gray here.
Format sourceOf(const catalog::Export& entry);
Format targetOf(const catalog::Export& entry);

/// "YCbCr420 P3 u8"
std::string nameOf(const Format& format);
std::string nameOf(const catalog::Side& side);

/// The names of the components in the order of memory: "R", "G", "B", and "A" for a fourth sample.
std::vector<std::string_view> componentsOf(const catalog::Side& side);

/// A 16-bit pixel of three bit fields.
bool isPacked(const catalog::Side& side);
/// R, G and B in any order and depth.
bool isRgb(const catalog::Side& side);
bool isGray(const catalog::Side& side);
/// The samples have a black and a white.
bool hasScale(const catalog::Side& side);

} // namespace tool
