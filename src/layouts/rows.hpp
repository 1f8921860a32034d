// Rows: blocks of pixels loaded and stored by their first column, whole or in part.
//
// A partial block passes through a buffer of a whole one, cleared first, so that nothing beyond the row is read or
// written and the lanes without a pixel compute on zeros.
#pragma once

#include "layouts/avx2/interleave.hpp"
#include "layouts/bytes.hpp"

#include <array>

namespace pyxcc::layouts
{

/// Three interleaved bytes a pixel.
struct C3 {
    static constexpr int pixelBytes = 3;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Three<wide::U8> load(const u8* p) { return loadTriples(p); }
    static PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) { storeTriples(p, pixels); }
};

/// Four interleaved bytes a pixel, the fourth not taking part: a store puts it back as it was.
struct AC4 {
    static constexpr int pixelBytes = 4;
    static constexpr bool readsTarget = true;

    static PYXCC_INLINE Three<wide::U8> load(const u8* p)
    {
        const Four<wide::U8> pixels = loadQuadruples(p);
        return {pixels.a, pixels.b, pixels.c};
    }
    static PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) { storeTriplesOfQuadruples(p, pixels); }
};

/// Four interleaved bytes a pixel, the fourth set.
struct C4Set {
    static constexpr int pixelBytes = 4;
    static constexpr bool readsTarget = false;
    u8 fourth;

    PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) const
    {
        storeQuadruples(p, {pixels.a, pixels.b, pixels.c, wide::U8(fourth)});
    }
};

/// A packing with its three channels in reverse order.
template <class Packing> struct Reversed {
    static constexpr int pixelBytes = Packing::pixelBytes;
    static constexpr bool readsTarget = Packing::readsTarget;
    Packing packing;

    PYXCC_INLINE Three<wide::U8> load(const u8* p) const { return reverse(packing.load(p)); }
    PYXCC_INLINE void store(u8* p, const Three<wide::U8>& pixels) const { packing.store(p, reverse(pixels)); }

private:
    static PYXCC_INLINE Three<wide::U8> reverse(const Three<wide::U8>& x) { return {x.c, x.b, x.a}; }
};

template <class Packing, class Byte> struct InterleavedRow {
    static constexpr int block = wide::U8::count;
    static constexpr int pixelBytes = Packing::pixelBytes;
    Byte* at;
    Packing packing;

    PYXCC_INLINE auto load(int x) const { return packing.load(pixel(x)); }

    PYXCC_INLINE auto load(int x, int count) const
    {
        alignas(32) u8 buffer[block * pixelBytes] = {};
        copyBytes(buffer, pixel(x), count * pixelBytes);
        return packing.load(buffer);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, const Pixels& pixels) const
    {
        packing.store(pixel(x), pixels);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Pixels& pixels) const
    {
        alignas(32) u8 buffer[block * pixelBytes];
        if constexpr (Packing::readsTarget) copyBytes(buffer, pixel(x), count * pixelBytes);
        packing.store(buffer, pixels);
        copyBytes(pixel(x), buffer, count * pixelBytes);
    }

private:
    PYXCC_INLINE Byte* pixel(int x) const { return at + static_cast<std::ptrdiff_t>(x) * pixelBytes; }
};

/// A row of each of several planes of bytes, all of one width.
template <int Count, class Byte> struct PlanarRow {
    static constexpr int block = wide::U8::count;
    std::array<Byte*, Count> at;

    PYXCC_INLINE Three<wide::U8> load(int x) const
    {
        return {loadSamples(at[0] + x), loadSamples(at[1] + x), loadSamples(at[2] + x)};
    }

    PYXCC_INLINE Three<wide::U8> load(int x, int count) const
    {
        return {loadPart(at[0] + x, count), loadPart(at[1] + x, count), loadPart(at[2] + x, count)};
    }

    PYXCC_INLINE void store(int x, const Three<wide::U8>& pixels) const
    {
        storeSamples(at[0] + x, pixels.a);
        storeSamples(at[1] + x, pixels.b);
        storeSamples(at[2] + x, pixels.c);
    }

    PYXCC_INLINE void store(int x, int count, const Three<wide::U8>& pixels) const
    {
        storePart(at[0] + x, count, pixels.a);
        storePart(at[1] + x, count, pixels.b);
        storePart(at[2] + x, count, pixels.c);
    }

private:
    static PYXCC_INLINE wide::U8 loadPart(const u8* p, int count)
    {
        alignas(32) u8 buffer[block] = {};
        copyBytes(buffer, p, count);
        return loadSamples(buffer);
    }

    static PYXCC_INLINE void storePart(u8* p, int count, wide::U8 samples)
    {
        alignas(32) u8 buffer[block];
        storeSamples(buffer, samples);
        copyBytes(p, buffer, count);
    }
};

} // namespace pyxcc::layouts
