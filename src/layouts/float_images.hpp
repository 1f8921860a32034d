// Images for forms over floats, in the way of loading and storing that costs them least. Source and target of a
// conversion are to have the same layout and samples: the order of the pixels in a block is the layout's own.
#pragma once

#include "layouts/avx2/eights.hpp"
#include "layouts/avx2/eights_of_words.hpp"
#include "layouts/avx2/sixteens.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// Three interleaved bytes a pixel: floats in, integers out.
template <class Byte> struct C3Eights {
    using Samples = wide::F32;
    static constexpr int pixelBytes = 3;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Three<wide::F32> load(const u8* p) { return loadEightTriples<Byte>(p); }
    template <class Levels> static PYXCC_INLINE void store(u8* p, const Three<Levels>& pixels)
    {
        storeEightTriples<Byte>(p, pixels);
    }
};

/// The same, sixteen pixels a block: factors in, integers out.
template <class Byte> struct C3Sixteens {
    using Samples = Factor<Byte>;
    static constexpr int pixelBytes = 3;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE auto load(const u8* p) { return loadSixteenTriples<Byte>(p); }
    static PYXCC_INLINE void store(u8* p, const Two<Three<wide::S32>>& pixels) { storeSixteenTriples<Byte>(p, pixels); }
};
template <class Byte> inline constexpr int blockOf<C3Sixteens<Byte>> = 16;

/// Three interleaved unsigned words a pixel, eight pixels a block too.
template <> struct C3Eights<u16> {
    using Samples = wide::F32;
    static constexpr int pixelBytes = 6;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Three<wide::F32> load(const u8* p)
    {
        const Three<wide::S32> words = loadEightTriplesOfWords(p);
        return {toF32(words.a), toF32(words.b), toF32(words.c)};
    }
    static PYXCC_INLINE void store(u8* p, const Three<wide::S32>& pixels) { storeEightTriplesOfWords(p, pixels); }
};

/// Three interleaved bytes and a fourth one, which a store puts back as it was.
template <class Byte> struct AC4Eights {
    using Samples = wide::F32;
    static constexpr int pixelBytes = 4;
    static constexpr bool readsTarget = true;

    static PYXCC_INLINE Three<wide::F32> load(const u8* p) { return loadEightQuadruples<Byte>(p); }
    static PYXCC_INLINE void store(u8* p, const Three<wide::S32>& pixels) { storeEightQuadruples<Byte>(p, pixels); }
};

/// Blocks of eight pixels, whatever the samples on the other side.
template <class Sample> auto c3Eights(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C3Eights<std::remove_const_t<Sample>>{});
}

template <class Byte> auto c3ForFactors(Byte* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C3Sixteens<std::remove_const_t<Byte>>{});
}

template <class Sample> auto c3ForFloats(Sample* first, std::ptrdiff_t step)
{
    if constexpr (sizeof(Sample) == 1) {
        return detail::interleaved(first, step, C3Eights<std::remove_const_t<Sample>>{});
    } else {
        return c3(first, step);
    }
}

template <class Sample> auto ac4ForFloats(Sample* first, std::ptrdiff_t step)
{
    if constexpr (sizeof(Sample) == 1) {
        return detail::interleaved(first, step, AC4Eights<std::remove_const_t<Sample>>{});
    } else {
        return ac4<Order::any>(first, step);
    }
}

template <class Sample> auto c4ForFloats(Sample* first, std::ptrdiff_t step) { return c4<Order::any>(first, step); }

} // namespace pyxcc::layouts
