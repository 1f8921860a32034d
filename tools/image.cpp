#include "image.hpp"

#include <algorithm>
#include <cstring>

namespace tool
{

namespace
{

constexpr int lineBytes = 64;

constexpr int roundUp(int value, int multiple) { return (value + multiple - 1) / multiple * multiple; }

/// Room for whole chroma blocks, since some conversions write a block that the region covers in part.
catalog::PlaneShape roomOf(const catalog::Side& side, int plane, RoiSize size)
{
    return catalog::shapeOf(side, plane, {roundUp(size.width, 4), roundUp(size.height, 4)});
}

} // namespace

Image::Image(Format format, RoiSize size, Rows rows) : format_(std::move(format)), size_(size)
{
    std::size_t total = 0;
    for (int plane = 0; plane < planes(); ++plane) {
        const catalog::PlaneShape room = roomOf(side(), plane, size);
        step_[plane] =
            rows == Rows::tight ? catalog::shapeOf(side(), plane, size).rowBytes : roundUp(room.rowBytes, lineBytes);
        offset_[plane] = total;
        const std::size_t span = std::max(step_[plane], room.rowBytes);
        total += (span * room.rows + lineBytes - 1) / lineBytes * lineBytes;
    }
    lines_.resize(total / lineBytes + 1);
}

std::size_t Image::tightBytes() const
{
    std::size_t total = 0;
    for (int plane = 0; plane < planes(); ++plane) {
        const catalog::PlaneShape shape = catalog::shapeOf(side(), plane, size_);
        total += static_cast<std::size_t>(shape.rowBytes) * shape.rows;
    }
    return total;
}

void copyPixels(const Image& from, Image& to)
{
    const RoiSize size = {std::min(from.size().width, to.size().width), std::min(from.size().height, to.size().height)};
    for (int plane = 0; plane < from.planes(); ++plane) {
        const catalog::PlaneShape room = roomOf(from.side(), plane, size);
        const std::size_t rowBytes = std::min({room.rowBytes, from.step(plane), to.step(plane)});
        for (int row = 0; row < room.rows; ++row) {
            std::memcpy(to.plane(plane) + static_cast<std::ptrdiff_t>(row) * to.step(plane),
                        from.plane(plane) + static_cast<std::ptrdiff_t>(row) * from.step(plane), rowBytes);
        }
    }
}

Image cropped(const Image& image, RoiSize size)
{
    Image part(image.format(), size);
    copyPixels(image, part);
    return part;
}

} // namespace tool
