// Planes of samples that are twice as wide as those on the other side of a conversion: a block is two registers a
// plane.
#pragma once

#include "layouts/avx2/double_width.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// A row of one plane.
template <class Register, class Byte> struct DoubleWidthSamples {
    static constexpr int block = 2 * Register::count;
    Byte* at;

    PYXCC_INLINE Two<Register> load(int x) const { return loadForNarrowing<Register>(sample(x)); }

    PYXCC_INLINE Two<Register> load(int x, int count) const
    {
        alignas(32) u8 buffer[64] = {};
        copyBytes(buffer, sample(x), count * sampleBytes<Register>);
        return loadForNarrowing<Register>(buffer);
    }

    PYXCC_INLINE void store(int x, const Two<Register>& samples) const { storeWidened(sample(x), samples); }

    PYXCC_INLINE void store(int x, int count, const Two<Register>& samples) const
    {
        alignas(32) u8 buffer[64];
        storeWidened(buffer, samples);
        copyBytes(sample(x), buffer, count * sampleBytes<Register>);
    }

private:
    PYXCC_INLINE Byte* sample(int x) const { return at + static_cast<std::ptrdiff_t>(x) * sampleBytes<Register>; }
};

/// A row of each of three planes.
template <class Register, class Byte> struct DoubleWidthRow {
    using Plane = DoubleWidthSamples<Register, Byte>;
    static constexpr int block = Plane::block;
    Three<Plane> plane;

    PYXCC_INLINE Three<Two<Register>> load(int x) const { return {plane.a.load(x), plane.b.load(x), plane.c.load(x)}; }

    PYXCC_INLINE Three<Two<Register>> load(int x, int count) const
    {
        return {plane.a.load(x, count), plane.b.load(x, count), plane.c.load(x, count)};
    }

    PYXCC_INLINE void store(int x, const Three<Two<Register>>& pixels) const
    {
        plane.a.store(x, pixels.a);
        plane.b.store(x, pixels.b);
        plane.c.store(x, pixels.c);
    }

    PYXCC_INLINE void store(int x, int count, const Three<Two<Register>>& pixels) const
    {
        plane.a.store(x, count, pixels.a);
        plane.b.store(x, count, pixels.b);
        plane.c.store(x, count, pixels.c);
    }
};

template <class Register, class Byte> struct DoubleWidthPlanes {
    Three<Byte*> first;
    std::ptrdiff_t step;

    PYXCC_INLINE DoubleWidthRow<Register, Byte> row(int y) const
    {
        return {{{rowAt(first.a, step, y)}, {rowAt(first.b, step, y)}, {rowAt(first.c, step, y)}}};
    }
};

/// Three planes with one step.
template <class Sample> auto p3DoubleWidth(Sample* const planes[3], std::ptrdiff_t step)
{
    return DoubleWidthPlanes<detail::RegisterOf<Sample>, detail::ByteOf<Sample>>{
        {bytes(planes[0]), bytes(planes[1]), bytes(planes[2])}, step};
}

} // namespace pyxcc::layouts
