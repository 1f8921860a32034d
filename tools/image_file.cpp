#include "image_file.hpp"

#include "failure.hpp"

#include <cstring>

namespace tool
{

namespace
{

/// Calls `row(bytes, count)` for every row of every plane.
template <class AnyImage, class Row> void forEachRow(AnyImage& image, Row row)
{
    for (int plane = 0; plane < image.planes(); ++plane) {
        const catalog::PlaneShape shape = catalog::shapeOf(image.side(), plane, image.size());
        for (int y = 0; y < shape.rows; ++y) {
            row(image.plane(plane) + static_cast<std::ptrdiff_t>(y) * image.step(plane),
                static_cast<std::size_t>(shape.rowBytes));
        }
    }
}

} // namespace

Image readPicture(const fs::path& path)
{
    const Bytes bytes = readFile(path);
    if (looksLikePng(bytes)) return decodePng(bytes, path.string());
    if (looksLikePnm(bytes)) return decodePnm(bytes, path.string());
    fail(path.string(), " is not a PNG, PPM, PGM or PFM file; raw planes need --size");
}

Image readRaw(const fs::path& path, const Format& format, RoiSize size)
{
    checkSize(size.width, size.height, path.string());
    Image image(format, size);
    const Bytes bytes = readFile(path);
    if (bytes.size() != image.tightBytes()) {
        fail(path.string(), " has ", bytes.size(), " bytes, but ", nameOf(format), " at ", size.width, "x", size.height,
             " takes ", image.tightBytes());
    }
    const u8* from = bytes.data();
    forEachRow(image, [&from](u8* row, std::size_t count) {
        if (count > 0) std::memcpy(row, from, count);
        from += count;
    });
    return image;
}

Bytes rawBytes(const Image& image)
{
    Bytes bytes;
    bytes.reserve(image.tightBytes());
    forEachRow(image, [&bytes](const u8* row, std::size_t count) { bytes.insert(bytes.end(), row, row + count); });
    return bytes;
}

void checkSize(long long width, long long height, const std::string& name)
{
    if (width < 1 || height < 1) fail(name, ": ", width, "x", height, " is not a size of a picture");
    if (width > maxSide || height > maxSide || width * height > maxPixels) {
        fail(name, ": ", width, "x", height, " is too large; the most is ", maxSide, " a side and ", maxPixels,
             " pixels in all");
    }
}

} // namespace tool
