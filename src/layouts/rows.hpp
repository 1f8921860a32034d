// Rows: blocks of pixels loaded and stored by their first column, whole or in part.
//
// A block is as many pixels as a register holds samples, or as several registers do. A partial block passes through a
// buffer of a whole one, cleared first, so that nothing beyond the row is read or written and the lanes without a pixel
// compute on zeros.
#pragma once

#include "lanes/several.hpp"
#include "layouts/avx2/interleave.hpp"
#include "layouts/bytes.hpp"

#include <array>

namespace pyxcc::layouts
{

/// Three interleaved samples a pixel.
template <class Register> struct C3 {
    using Samples = Register;
    static constexpr int pixelBytes = 3 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Three<Samples> load(const u8* p) { return loadTriples<Samples>(p); }
    static PYXCC_INLINE void store(u8* p, const Three<Samples>& pixels) { storeTriples(p, pixels); }
    static PYXCC_INLINE void stream(u8* p, const Three<Samples>& pixels) { storeTriples<Stores::streamed>(p, pixels); }
};

/// Four interleaved samples a pixel, the fourth not taking part: a store puts it back as it was.
template <class Register, Order order = Order::ofMemory> struct AC4 {
    using Samples = Register;
    static constexpr int pixelBytes = 4 * sampleBytes<Samples>;
    static constexpr bool readsTarget = true;

    static PYXCC_INLINE Three<Samples> load(const u8* p)
    {
        const Four<Samples> pixels = loadQuadruples<Samples, order>(p);
        return {pixels.a, pixels.b, pixels.c};
    }
    static PYXCC_INLINE void store(u8* p, const Three<Samples>& pixels) { storeTriplesOfQuadruples<order>(p, pixels); }
};

/// Four interleaved samples a pixel, all of which take part.
template <class Register, Order order = Order::ofMemory> struct C4 {
    using Samples = Register;
    static constexpr int pixelBytes = 4 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Four<Samples> load(const u8* p) { return loadQuadruples<Samples, order>(p); }
    static PYXCC_INLINE void store(u8* p, const Four<Samples>& pixels) { storeQuadruples<order>(p, pixels); }
    static PYXCC_INLINE void stream(u8* p, const Four<Samples>& pixels)
    {
        storeQuadruples<order, Stores::streamed>(p, pixels);
    }
};

/// Four interleaved samples a pixel, the fourth set.
template <class Register, Order order = Order::ofMemory> struct C4Set {
    using Samples = Register;
    static constexpr int pixelBytes = 4 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;
    Samples fourth;

    PYXCC_INLINE void store(u8* p, const Three<Samples>& pixels) const
    {
        storeQuadruples<order>(p, Four<Samples>{pixels.a, pixels.b, pixels.c, fourth});
    }
};

/// A packing with its three channels in reverse order.
template <class Packing> struct Reversed {
    using Samples = typename Packing::Samples;
    static constexpr int pixelBytes = Packing::pixelBytes;
    static constexpr bool readsTarget = Packing::readsTarget;
    Packing packing;

    PYXCC_INLINE Three<Samples> load(const u8* p) const { return reverse(packing.load(p)); }
    template <class Lanes> PYXCC_INLINE void store(u8* p, const Three<Lanes>& pixels) const
    {
        packing.store(p, reverse(pixels));
    }

private:
    template <class Lanes> static PYXCC_INLINE Three<Lanes> reverse(const Three<Lanes>& x) { return {x.c, x.b, x.a}; }
};

/// Registers of samples as they lie, for forms to which all channels are alike. Of pixels of four samples the first
/// three take part: a store puts the fourth back as it was.
template <class Register, int PixelSamples> struct AsTheyLie {
    using Samples = Register;
    /// Floats are what long computations are made on: a plane gives them two registers at once.
    static constexpr int registers = PixelSamples == 1 && sampleBytes<Samples> == 4 ? 2 : PixelSamples;
    static constexpr int block = registers * Samples::count / PixelSamples;
    static constexpr int pixelBytes = PixelSamples * sampleBytes<Samples>;
    static constexpr bool readsTarget = PixelSamples == 4;

    static PYXCC_INLINE Several<Samples, registers> load(const u8* p)
    {
        Several<Samples, registers> samples;
        for (int i = 0; i < registers; ++i, p += 32) samples.part[i] = loadSamples<Samples>(p);
        return samples;
    }

    static PYXCC_INLINE void store(u8* p, const Several<Samples, registers>& samples)
    {
        for (int i = 0; i < registers; ++i, p += 32) {
            if constexpr (PixelSamples == 4) {
                storeButFourths(p, samples.part[i]);
            } else {
                storeSamples(p, samples.part[i]);
            }
        }
    }
};

/// The pixels of a block: those of a register of samples, or what the packing says.
template <class Packing> inline constexpr int blockOf = Packing::Samples::count;
template <class Register, int PixelSamples>
inline constexpr int blockOf<AsTheyLie<Register, PixelSamples>> = AsTheyLie<Register, PixelSamples>::block;

/// Whether pixels come as forms take them, with no more than a load.
template <class Packing> inline constexpr bool loadsAtOnce = requires { requires Packing::loadedAtOnce; };

template <class Packing, class Byte, Hints hints = Hints::far> struct InterleavedRow {
    static constexpr int block = blockOf<Packing>;
    static constexpr int pixelBytes = Packing::pixelBytes;
    static constexpr bool loadedAtOnce = loadsAtOnce<Packing>;
    Byte* at;
    Packing packing;

    PYXCC_INLINE auto load(int x) const
    {
        expectFrom<hintedLoads<hints>>(pixel(x));
        return packing.load(pixel(x));
    }

    PYXCC_INLINE auto load(int x, int count) const
    {
        alignas(32) u8 buffer[block * pixelBytes] = {};
        copyBytes(buffer, pixel(x), count * pixelBytes);
        if constexpr (requires { Packing::completeLastPair(buffer, at, x); }) {
            if (count % 2 != 0) Packing::completeLastPair(buffer + count * pixelBytes, at, x + count);
        }
        return packing.load(buffer);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, const Pixels& pixels) const
    {
        expectFrom<hintedStores<hints>>(pixel(x));
        packing.store(pixel(x), pixels);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Pixels& pixels) const
    {
        alignas(32) u8 buffer[block * pixelBytes];
        if constexpr (Packing::readsTarget) copyBytes(buffer, pixel(x), count * pixelBytes);
        packing.store(buffer, pixels);
        copyBytes(pixel(x), buffer, count * pixelBytes);
    }

    PYXCC_INLINE Byte* pixel(int x) const { return at + static_cast<std::ptrdiff_t>(x) * pixelBytes; }
};

/// A row of one plane of samples. One of two that are taken together hints ahead.
template <class Samples, class Byte, bool oneOfTwo = false> struct SampleRow {
    static constexpr int block = Samples::count;
    Byte* at;

    PYXCC_INLINE Samples load(int x) const
    {
        if constexpr (oneOfTwo) expectFrom<hintedStores<Hints::near>, 1>(sample(x));
        return loadSamples<Samples>(sample(x));
    }

    PYXCC_INLINE Samples load(int x, int count) const
    {
        alignas(32) u8 buffer[32] = {};
        copyBytes(buffer, sample(x), count * sampleBytes<Samples>);
        return loadSamples<Samples>(buffer);
    }

    PYXCC_INLINE void store(int x, Samples samples) const
    {
        if constexpr (oneOfTwo) expectFrom<hintedStores<Hints::near>, 1>(sample(x));
        storeSamples(sample(x), samples);
    }

    PYXCC_INLINE void store(int x, int count, Samples samples) const
    {
        alignas(32) u8 buffer[32];
        storeSamples(buffer, samples);
        copyBytes(sample(x), buffer, count * sampleBytes<Samples>);
    }

private:
    PYXCC_INLINE Byte* sample(int x) const { return at + static_cast<std::ptrdiff_t>(x) * sampleBytes<Samples>; }
};

/// A row of each of three planes of samples, all of one width, or of four.
template <class Samples, class Byte, int Planes, bool oneOfTwo = false> struct PlanarRow {
    static_assert(Planes == 3 || Planes == 4);
    static constexpr int block = Samples::count;
    std::array<SampleRow<Samples, Byte, oneOfTwo>, Planes> plane;

    PYXCC_INLINE auto load(int x) const
    {
        return group([x](const auto& row) PYXCC_INLINE_LAMBDA { return row.load(x); });
    }

    PYXCC_INLINE auto load(int x, int count) const
    {
        return group([x, count](const auto& row) PYXCC_INLINE_LAMBDA { return row.load(x, count); });
    }

    template <class Pixels> PYXCC_INLINE void store(int x, const Pixels& pixels) const
    {
        plane[0].store(x, pixels.a);
        plane[1].store(x, pixels.b);
        plane[2].store(x, pixels.c);
        if constexpr (Planes == 4) plane[3].store(x, pixels.d);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Pixels& pixels) const
    {
        plane[0].store(x, count, pixels.a);
        plane[1].store(x, count, pixels.b);
        plane[2].store(x, count, pixels.c);
        if constexpr (Planes == 4) plane[3].store(x, count, pixels.d);
    }

private:
    template <class OfRow> PYXCC_INLINE auto group(const OfRow& ofRow) const
    {
        if constexpr (Planes == 4) {
            return Four<Samples>{ofRow(plane[0]), ofRow(plane[1]), ofRow(plane[2]), ofRow(plane[3])};
        } else {
            return Three<Samples>{ofRow(plane[0]), ofRow(plane[1]), ofRow(plane[2])};
        }
    }
};

/// Two rows that are read or written together.
template <class Row> struct RowPair {
    static constexpr int block = Row::block;
    Row upper, lower;

    PYXCC_INLINE auto load(int x) const { return Two{upper.load(x), lower.load(x)}; }
    PYXCC_INLINE auto load(int x, int count) const { return Two{upper.load(x, count), lower.load(x, count)}; }

    template <class Pixels> PYXCC_INLINE void store(int x, const Two<Pixels>& pixels) const
    {
        upper.store(x, pixels.a);
        lower.store(x, pixels.b);
    }

    template <class Pixels> PYXCC_INLINE void store(int x, int count, const Two<Pixels>& pixels) const
    {
        upper.store(x, count, pixels.a);
        lower.store(x, count, pixels.b);
    }
};

template <class Row> RowPair(Row, Row) -> RowPair<Row>;

} // namespace pyxcc::layouts
