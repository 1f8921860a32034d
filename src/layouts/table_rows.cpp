// A load from the table each sample is the least that there is to do, and gathers into registers are no faster at it.
// Four samples are loaded at once, since loads are what there is too much of. The table itself is too large for the
// first-level cache: waiting for it keeps the processor from running far ahead in the source, which is why that is
// prefetched.
#include "layouts/table_rows.hpp"

#include "lanes/inline.hpp"

#include <cstdint>
#include <cstring>

namespace pyxcc::layouts
{

namespace
{

using Four = std::uint64_t; // samples, the first one lowest

PYXCC_INLINE Four loadFour(const u8* p)
{
    Four samples = 0;
    std::memcpy(&samples, p, sizeof samples);
    return samples;
}

constexpr int farAhead = 1024; // bytes

/// Touches no memory, so that it may lie behind the image.
PYXCC_INLINE void prefetch(const u8* p) { __builtin_prefetch(p); }

template <int I> PYXCC_INLINE u16 at(const u16* table, Four samples)
{
    return table[static_cast<u16>(samples >> 16 * I)];
}

template <class Samples> PYXCC_INLINE void store(u8* p, const Samples& samples)
{
    std::memcpy(p, &samples, sizeof samples);
}

PYXCC_INLINE void lookUpOne(const u16* table, const u8* from, u8* to)
{
    u16 sample = 0;
    std::memcpy(&sample, from, sizeof sample);
    store(to, table[sample]);
}

PYXCC_INLINE void lookUpEight(const u16* table, const u8* from, u8* to)
{
    const Four a = loadFour(from), b = loadFour(from + 8);
    const u16 found[] = {at<0>(table, a), at<1>(table, a), at<2>(table, a), at<3>(table, a),
                         at<0>(table, b), at<1>(table, b), at<2>(table, b), at<3>(table, b)};
    store(to, found);
}

PYXCC_INLINE void lookUpPixel(const u16* table, const u8* from, u8* to)
{
    const Four pixel = loadFour(from);
    store(to, at<0>(table, pixel));
    store(to + 2, at<1>(table, pixel));
    store(to + 4, at<2>(table, pixel));
}

} // namespace

void lookUpSamples(const u16* table, const u8* from, u8* to, std::ptrdiff_t count)
{
    for (; count >= 32; count -= 32, from += 64, to += 64) {
        prefetch(from + farAhead);
        for (int i = 0; i < 64; i += 16) lookUpEight(table, from + i, to + i);
    }
    for (; count > 0; --count, from += 2, to += 2) lookUpOne(table, from, to);
}

void lookUpThreeOfFour(const u16* table, const u8* from, u8* to, std::ptrdiff_t pixels)
{
    for (; pixels >= 8; pixels -= 8, from += 64, to += 64) {
        prefetch(from + farAhead);
        for (int i = 0; i < 64; i += 8) lookUpPixel(table, from + i, to + i);
    }
    for (; pixels > 0; --pixels, from += 8, to += 8) lookUpPixel(table, from, to);
}

} // namespace pyxcc::layouts
