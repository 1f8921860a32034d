#include "support/compare.hpp"

#include "support/samples.hpp"

#include <cmath>
#include <cstring>
#include <sstream>

namespace support
{

namespace
{

/// A byte's place in a plane: in a row, or outside of all rows.
struct Place {
    int row;
    std::ptrdiff_t byte; ///< of the row, or of the memory
    bool inRow;
};

/// Where rows overlap, the last one counts, as it is the last to be written.
Place placeOf(const Plane& plane, std::ptrdiff_t offset)
{
    const Geometry& geometry = plane.geometry();
    for (int row = geometry.shape.rows - 1; row >= 0; --row) {
        const std::ptrdiff_t byte = offset - std::ptrdiff_t{row} * geometry.step;
        if (byte >= 0 && byte < geometry.shape.rowBytes) return {row, byte, true};
    }
    return {0, offset, false};
}

bool close(double expected, double actual, double tolerance)
{
    if (std::isnan(expected) || std::isnan(actual)) return std::isnan(expected) && std::isnan(actual);
    return std::abs(expected - actual) <= tolerance;
}

/// Whether bytes that differ may do so. Zeros of either sign are told apart.
bool acceptable(const Plane& expected, const Plane& actual, const Place& place, double tolerance)
{
    const catalog::Element element = expected.geometry().element;
    const auto first = place.byte - place.byte % catalog::sizeOf(element);
    const double a = load(element, expected.row(place.row).data() + first);
    const double b = load(element, actual.row(place.row).data() + first);
    return close(a, b, tolerance) && !(a == 0 && b == 0 && tolerance == 0);
}

std::string describe(const Plane& expected, const Plane& actual, std::ptrdiff_t offset, const Place& place)
{
    std::ostringstream text;
    if (place.inRow) {
        text << "row " << place.row << ", byte " << place.byte;
    } else {
        text << "byte " << offset << " from the first pixel, which belongs to no row";
    }
    text << ": expected " << int{expected.base()[offset]} << ", found " << int{actual.base()[offset]};
    const catalog::Element element = expected.geometry().element;
    if (const int size = catalog::sizeOf(element); place.inRow && size > 1) {
        const auto sample = place.byte / size;
        text << " (sample " << sample << ": expected " << load(element, expected.row(place.row).data() + sample * size)
             << ", found " << load(element, actual.row(place.row).data() + sample * size) << ")";
    }
    return text.str();
}

std::optional<std::string> firstDifference(const Plane& expected, const Plane& actual, double tolerance)
{
    const auto wanted = expected.all(), found = actual.all();
    if (std::memcmp(wanted.data(), found.data(), wanted.size()) == 0) return std::nullopt;
    for (std::size_t i = 0; i < wanted.size(); ++i) {
        if (wanted[i] == found[i]) continue;
        const std::ptrdiff_t offset = wanted.data() + i - expected.base();
        const Place place = placeOf(expected, offset);
        if (place.inRow && acceptable(expected, actual, place, tolerance)) continue;
        return describe(expected, actual, offset, place);
    }
    return std::nullopt;
}

} // namespace

std::optional<std::string> firstDifference(const Image& expected, const Image& actual, double tolerance)
{
    for (std::size_t i = 0; i < expected.size(); ++i) {
        if (const auto text = firstDifference(expected[i], actual[i], tolerance)) {
            return "plane " + std::to_string(i) + ", " + *text;
        }
    }
    return std::nullopt;
}

} // namespace support
