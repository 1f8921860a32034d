#include "support/image.hpp"

#include <algorithm>

namespace support
{

namespace
{

/// The alignment of the lowest byte that puts the first row at `alignment`.
std::size_t lowestAlignment(const Geometry& geometry, int alignment)
{
    return static_cast<std::size_t>((alignment + geometry.low) & 63);
}

} // namespace

Geometry geometryOf(catalog::PlaneShape shape, catalog::Element element, int step)
{
    const bool empty = shape.rows == 0 || shape.rowBytes == 0;
    const std::ptrdiff_t lastRow = empty ? 0 : std::ptrdiff_t{shape.rows - 1} * step;
    return {shape, element, step, std::min<std::ptrdiff_t>(lastRow, 0),
            std::max<std::ptrdiff_t>(lastRow, 0) + (empty ? 0 : shape.rowBytes)};
}

Plane::Plane(const Geometry& geometry, Placement placement, int alignment)
    : geometry_(geometry), placement_(placement), alignment_(alignment),
      memory_(placement, static_cast<std::size_t>(geometry.high - geometry.low), lowestAlignment(geometry, alignment))
{
}

Plane::Plane(const Plane& other) : Plane(other.geometry_, other.placement_, other.alignment_)
{
    std::ranges::copy(other.all(), all().begin());
}

std::span<u8> Plane::row(int y) const
{
    return {base() + std::ptrdiff_t{y} * geometry_.step, static_cast<std::size_t>(geometry_.shape.rowBytes)};
}

} // namespace support
