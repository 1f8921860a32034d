#include "frame/plane_service.hpp"

#include "layouts/avx2/interleave.hpp"
#include "layouts/avx2/stream.hpp"
#include "layouts/bytes.hpp"
#include "pyxcc/core.h"

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace pyxcc::frame
{

namespace
{

using layouts::rowAt;

constexpr std::size_t line = 64; // bytes of a cache line

/// The size of the largest cache in bytes, or 0 if it is not known.
std::size_t largestCache()
{
    s32 size = 0;
    return pyxGetMaxCacheSizeB(&size) == pyxOk ? static_cast<std::size_t>(size) : 0;
}

/// The rows of a plane: a plane without gaps is one long row.
struct Rows {
    std::size_t bytes;
    int count;

    Rows(int width, int height, bool withoutGaps)
        : bytes(static_cast<std::size_t>(width) * (withoutGaps ? static_cast<std::size_t>(height) : 1)),
          count(withoutGaps ? 1 : height)
    {
    }

    std::size_t planeBytes() const { return bytes * static_cast<std::size_t>(count); }
};

/// The bytes in front of the next line's start, but `count` at the most.
std::size_t toNextLine(const u8* p, std::size_t count)
{
    return std::min((line - reinterpret_cast<std::uintptr_t>(p) % line) % line, count);
}

enum class Way { throughCache, pastCache };

/// By whole lines of the target. A plane goes through memory faster than the processor's own look-ahead expects.
template <Way way> void copyRow(const u8* src, u8* dst, std::size_t count)
{
    const std::size_t head = toNextLine(dst, count);
    std::memcpy(dst, src, head);
    std::size_t x = head;
    for (; count - x >= line; x += line) {
        const wide::U8 first = layouts::loadSamples(src + x), second = layouts::loadSamples(src + x + line / 2);
        if constexpr (way == Way::pastCache) {
            layouts::streamSamples(dst + x, first);
            layouts::streamSamples(dst + x + line / 2, second);
        } else {
            layouts::expectFrom<layouts::expectedLoads, 1>(src + x);
            layouts::expectFrom<layouts::expectedStores, 1>(dst + x);
            layouts::storeSamples(dst + x, first);
            layouts::storeSamples(dst + x + line / 2, second);
        }
    }
    std::memcpy(dst + x, src + x, count - x);
}

void streamFill(u8 value, u8* dst, std::size_t count)
{
    const std::size_t head = toNextLine(dst, count);
    std::memset(dst, value, head);
    std::size_t x = head;
    for (; count - x >= line; x += line) {
        layouts::streamSamples(dst + x, wide::U8(value));
        layouts::streamSamples(dst + x + line / 2, wide::U8(value));
    }
    std::memset(dst + x, value, count - x);
}

} // namespace

bool fillsHalfTheCache(std::size_t bytes)
{
    const std::size_t cache = largestCache();
    return cache != 0 && bytes >= cache / 2;
}

PyxStatus copyPlane8u(const u8* src, int srcStep, u8* dst, int dstStep, int width, int height)
{
    if (!src || !dst) return pyxErrNullPtr;
    if (width < 1 || height < 1) return pyxErrSize;

    const Rows rows(width, height, width == srcStep && width == dstStep);
    const bool stream = rows.bytes >= line && rows.planeBytes() >= 0x100000 && fillsHalfTheCache(rows.planeBytes());
    for (int y = 0; y < rows.count; ++y) {
        const u8* from = rowAt(src, srcStep, y);
        u8* to = rowAt(dst, dstStep, y);
        if (stream) {
            copyRow<Way::pastCache>(from, to, rows.bytes);
        } else {
            copyRow<Way::throughCache>(from, to, rows.bytes);
        }
    }
    if (stream) layouts::fenceStreams();
    return pyxOk;
}

void fillPlane8u(u8 value, u8* dst, int dstStep, int width, int height)
{
    if (width < 1 || height < 1) return;
    const Rows rows(width, height, width == dstStep);
    bool stream = false;
    if (rows.planeBytes() > 0x600000) {
        const std::size_t cache = largestCache();
        stream = cache != 0 && rows.planeBytes() >= cache;
    }
    for (int y = 0; y < rows.count; ++y) {
        u8* to = rowAt(dst, dstStep, y);
        if (stream) {
            streamFill(value, to, rows.bytes);
        } else {
            std::memset(to, value, rows.bytes);
        }
    }
    if (stream) layouts::fenceStreams();
}

} // namespace pyxcc::frame
