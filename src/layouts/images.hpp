// Images: a layout, where the first row starts and how far it is to the next. `row(y)` gives a row that loads and
// stores blocks of pixels by their first column.
#pragma once

#include "layouts/rows.hpp"

#include <array>
#include <type_traits>

namespace pyxcc::layouts
{

/// A packing that is another one in every row says which it is in row `y`.
template <class Packing> PYXCC_INLINE Packing packingOfRow(const Packing& packing, [[maybe_unused]] int y)
{
    if constexpr (requires { packing.ofRow(y); }) {
        return packing.ofRow(y);
    } else {
        return packing;
    }
}

template <class Packing> PYXCC_INLINE Reversed<Packing> packingOfRow(const Reversed<Packing>& reversed, int y)
{
    return {packingOfRow(reversed.packing, y)};
}

template <class Packing, class Byte> struct InterleavedImage {
    Byte* first;
    std::ptrdiff_t step;
    Packing packing;

    template <Hints hints = Hints::far> PYXCC_INLINE auto row(int y) const
    {
        return InterleavedRow<Packing, Byte, hints>{rowAt(first, step, y), packingOfRow(packing, y)};
    }

    /// Rows 2 j and 2 j + 1.
    PYXCC_INLINE auto rowPair(int j) const { return RowPair{row<Hints::near>(2 * j), row<Hints::near>(2 * j + 1)}; }

    /// The same pair where it has no second row.
    PYXCC_INLINE auto halfPair(int j) const { return row(2 * j); }
};

template <class Samples, class Byte, int Planes> struct PlanarImage {
    std::array<Byte*, Planes> first;
    std::array<std::ptrdiff_t, Planes> step;

    template <bool oneOfTwo = false> PYXCC_INLINE auto row(int y) const
    {
        PlanarRow<Samples, Byte, Planes, oneOfTwo> rows;
        for (int i = 0; i < Planes; ++i) rows.plane[i] = {rowAt(first[i], step[i], y)};
        return rows;
    }

    /// Rows 2 j and 2 j + 1.
    PYXCC_INLINE auto rowPair(int j) const { return RowPair{row<true>(2 * j), row<true>(2 * j + 1)}; }
};

namespace detail
{

template <class Sample> using RegisterOf = wide::RegisterOf<std::remove_const_t<Sample>>;
template <class Sample> using ByteOf = std::conditional_t<std::is_const_v<Sample>, const u8, u8>;

template <class Packing, class Sample> auto interleaved(Sample* first, std::ptrdiff_t step, const Packing& packing)
{
    return InterleavedImage<Packing, ByteOf<Sample>>{bytes(first), step, packing};
}

} // namespace detail

template <class Sample> auto c3(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C3<detail::RegisterOf<Sample>>{});
}

/// Four channels, of which the first three take part: a target keeps its fourth. Pixels may be loaded and stored in any
/// order within a block where source and target are both so.
template <Order order = Order::ofMemory, class Sample> auto ac4(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, AC4<detail::RegisterOf<Sample>, order>{});
}

/// Four channels, all of which take part.
template <Order order = Order::ofMemory, class Sample> auto c4(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C4<detail::RegisterOf<Sample>, order>{});
}

/// A target whose fourth channel is set.
template <Order order = Order::ofMemory, class Sample>
auto c4(Sample* first, std::ptrdiff_t step, std::type_identity_t<Sample> fourth)
{
    return detail::interleaved(first, step, C4Set<detail::RegisterOf<Sample>, order>{fourth});
}

/// Pixels of 1, 3 or 4 samples, for forms to which all channels are alike; a fourth takes no part, and a target keeps
/// it.
template <int PixelSamples, class Sample> auto asItLies(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, AsTheyLie<detail::RegisterOf<Sample>, PixelSamples>{});
}

namespace detail
{

template <int Planes, class Sample> auto planes(Sample* const first[], std::ptrdiff_t step)
{
    PlanarImage<RegisterOf<Sample>, ByteOf<Sample>, Planes> image;
    for (int i = 0; i < Planes; ++i) image.first[i] = bytes(first[i]);
    image.step.fill(step);
    return image;
}

} // namespace detail

/// Three planes with one step.
template <class Sample> auto p3(Sample* const planes[3], std::ptrdiff_t step)
{
    return detail::planes<3>(planes, step);
}

/// Four planes with one step.
template <class Sample> auto p4(Sample* const planes[4], std::ptrdiff_t step)
{
    return detail::planes<4>(planes, step);
}

/// The same image with its channels in reverse order, B G R for R G B.
template <class Packing, class Byte> auto reversed(const InterleavedImage<Packing, Byte>& image)
{
    return InterleavedImage<Reversed<Packing>, Byte>{image.first, image.step, {image.packing}};
}

} // namespace pyxcc::layouts
