// Images: a layout, where the first row starts and how far it is to the next. `row(y)` gives a row that loads and
// stores blocks of pixels by their first column.
#pragma once

#include "layouts/rows.hpp"

namespace pyxcc::layouts
{

template <class Packing, class Byte> struct InterleavedImage {
    Byte* first;
    std::ptrdiff_t step;
    Packing packing;

    PYXCC_INLINE auto row(int y) const { return InterleavedRow<Packing, Byte>{rowAt(first, step, y), packing}; }
};

template <int Count, class Byte> struct PlanarImage {
    std::array<Byte*, Count> first;
    std::array<std::ptrdiff_t, Count> step;

    PYXCC_INLINE auto row(int y) const
    {
        PlanarRow<Count, Byte> row;
        for (int i = 0; i < Count; ++i) row.at[i] = rowAt(first[i], step[i], y);
        return row;
    }
};

inline auto c3(const u8* first, int step) { return InterleavedImage<C3, const u8>{first, step, {}}; }
inline auto c3(u8* first, int step) { return InterleavedImage<C3, u8>{first, step, {}}; }

/// Four channels, of which the first three take part: a target keeps its fourth.
inline auto ac4(const u8* first, int step) { return InterleavedImage<AC4, const u8>{first, step, {}}; }
inline auto ac4(u8* first, int step) { return InterleavedImage<AC4, u8>{first, step, {}}; }

/// A target whose fourth channel is set.
inline auto c4(u8* first, int step, u8 fourth) { return InterleavedImage<C4Set, u8>{first, step, {fourth}}; }

/// Three planes with one step.
template <class Byte> auto p3(Byte* const planes[3], int step)
{
    return PlanarImage<3, Byte>{{planes[0], planes[1], planes[2]}, {step, step, step}};
}

/// The same image with its channels in reverse order, B G R for R G B.
template <class Packing, class Byte> auto reversed(const InterleavedImage<Packing, Byte>& image)
{
    return InterleavedImage<Reversed<Packing>, Byte>{image.first, image.step, {image.packing}};
}

} // namespace pyxcc::layouts
