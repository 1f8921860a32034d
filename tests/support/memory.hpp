// Memory whose surroundings are watched: by margins that are compared, or by pages that cannot be touched.
#pragma once

#include "pyxcc/types.h"

#include <cstddef>
#include <memory>
#include <span>
#include <string_view>

namespace support
{

enum class Placement {
    margins,      ///< readable bytes on both sides
    endAtGuard,   ///< the last byte is followed by an unreadable page
    beginAtGuard, ///< the first byte follows an unreadable page
};

inline constexpr Placement allPlacements[] = {Placement::margins, Placement::endAtGuard, Placement::beginAtGuard};

std::string_view nameOf(Placement placement);

class Memory
{
public:
    /// `alignment` is the distance of the first byte from a multiple of 64; a guard page dictates its own.
    Memory(Placement placement, std::size_t size, std::size_t alignment = 0);

    /// The bytes asked for.
    std::span<u8> bytes() const { return bytes_; }

    /// Those and what can be touched around them.
    std::span<u8> all() const { return all_; }

private:
    struct Release {
        std::size_t mapped; ///< 0 for memory from the heap
        void operator()(u8* memory) const;
    };

    void allocateWithMargins(std::size_t size, std::size_t alignment);
    void allocateGuarded(Placement placement, std::size_t size);

    std::unique_ptr<u8, Release> owner_;
    std::span<u8> all_;
    std::span<u8> bytes_;
};

} // namespace support
