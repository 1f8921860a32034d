// Images in watched memory.
#pragma once

#include "catalog.hpp"
#include "support/memory.hpp"

#include <vector>

namespace support
{

/// How the rows of a plane lie, as seen from its first byte.
struct Geometry {
    catalog::PlaneShape shape;
    catalog::Element element;
    int step;
    std::ptrdiff_t low, high; ///< the bytes that may be touched
};

/// Room for the rows that a step leads to.
Geometry geometryOf(catalog::PlaneShape shape, catalog::Element element, int step);

/// A plane of samples; a copy has memory of its own, alike in placement and alignment.
class Plane
{
public:
    /// `alignment` is the distance of the first row from a multiple of 64.
    Plane(const Geometry& geometry, Placement placement, int alignment);
    Plane(const Plane& other);
    Plane& operator=(const Plane& other) { return *this = Plane(other); }
    Plane(Plane&&) = default;
    Plane& operator=(Plane&&) = default;

    const Geometry& geometry() const { return geometry_; }
    u8* base() const { return memory_.bytes().data() - geometry_.low; }
    std::span<u8> row(int y) const;
    std::span<u8> all() const { return memory_.all(); }

private:
    Geometry geometry_;
    Placement placement_;
    int alignment_;
    Memory memory_;
};

using Image = std::vector<Plane>;

} // namespace support
