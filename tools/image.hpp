// An image in memory, in any format of the catalogue.
#pragma once

#include "format.hpp"

#include <array>
#include <cstddef>
#include <vector>

namespace tool
{

/// The largest pictures that the tool takes.
inline constexpr int maxSide = 32768;
inline constexpr long long maxPixels = 1LL << 26;

class Image
{
public:
    enum class Rows {
        padded, ///< each row begins at a multiple of 64 bytes
        tight,  ///< rows follow on each other, as the exports without steps expect
    };

    Image(Format format, RoiSize size, Rows rows = Rows::padded);

    const Format& format() const { return format_; }
    const catalog::Side& side() const { return format_.side; }
    RoiSize size() const { return size_; }
    int planes() const { return format_.side.planes; }

    u8* plane(int index) { return bytes() + offset_[index]; }
    const u8* plane(int index) const { return bytes() + offset_[index]; }
    int step(int index) const { return step_[index]; }

    /// Bytes that the pixels take, without any padding.
    std::size_t tightBytes() const;

    /// The same pixels under another name, such as another encoding.
    void rename(Format format) { format_ = std::move(format); }

private:
    struct alignas(64) Line {
        u8 bytes[64];
    };
    u8* bytes() { return lines_.data()->bytes; }
    const u8* bytes() const { return lines_.data()->bytes; }

    Format format_;
    RoiSize size_;
    std::array<int, 4> step_ = {};
    std::array<std::size_t, 4> offset_ = {};
    std::vector<Line> lines_;
};

/// Copies the pixels that both images have; the formats must be equal, the spacing of rows need not.
void copyPixels(const Image& from, Image& to);

/// The upper left part.
Image cropped(const Image& image, RoiSize size);

} // namespace tool
