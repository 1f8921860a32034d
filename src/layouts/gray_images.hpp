// Images of one sample a pixel, and of pixels whose channels are one sample.
#pragma once

#include "layouts/avx2/chroma.hpp"
#include "layouts/avx2/eights.hpp"
#include "layouts/avx2/gray.hpp"
#include "layouts/avx2/stream.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// One sample a pixel.
template <class Register, Order order = Order::ofMemory> struct C1 {
    using Samples = Register;
    static constexpr int pixelBytes = sampleBytes<Samples>;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE Samples load(const u8* p) { return loadSamples<Samples>(p); }
    static PYXCC_INLINE void store(u8* p, Samples samples) { storeSamples(p, inMemoryOrder<order>(samples)); }
    static PYXCC_INLINE void stream(u8* p, Samples samples) { streamSamples(p, inMemoryOrder<order>(samples)); }
};

/// Three samples a pixel, all of them the same.
template <class Register> struct C3Gray {
    using Samples = Register;
    static constexpr int pixelBytes = 3 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;

    static PYXCC_INLINE void store(u8* p, Samples samples) { storeThreefold(p, samples); }
};

/// Four samples a pixel, the fourth set and the others the same.
template <class Register> struct C4Gray {
    using Samples = Register;
    static constexpr int pixelBytes = 4 * sampleBytes<Samples>;
    static constexpr bool readsTarget = false;
    Samples fourth;

    PYXCC_INLINE void store(u8* p, Samples samples) const { storeThreefold(p, samples, fourth); }
};

/// Three bytes a pixel, or four of which the first three take part, as words.
template <int PixelBytes> struct BytesAsWords {
    using Samples = wide::U8;
    static constexpr int pixelBytes = PixelBytes;

    static PYXCC_INLINE Two<Three<wide::Sample>> load(const u8* p) { return loadAsWords<PixelBytes>(p); }
};

/// Floats on the way to bytes: as many registers as fill one of bytes.
struct FloatsForBytes {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 4;

    static PYXCC_INLINE Four<wide::F32> load(const u8* p)
    {
        return {loadSamples<wide::F32>(p), loadSamples<wide::F32>(p + 32), loadSamples<wide::F32>(p + 64),
                loadSamples<wide::F32>(p + 96)};
    }
};

/// Luma and chroma bytes in turn, of which the luma is taken.
struct LumaOfC2 {
    using Samples = wide::U8;
    static constexpr int pixelBytes = 2;

    static PYXCC_INLINE Samples load(const u8* p) { return loadAlternating(p).a; }
};

/// A target with an order other than that of memory is for sources that load pixels in it.
template <Order order = Order::ofMemory, class Sample> auto c1(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C1<detail::RegisterOf<Sample>, order>{});
}

template <class Sample> auto c3Gray(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, C3Gray<detail::RegisterOf<Sample>>{});
}

template <class Sample> auto c4Gray(Sample* first, std::ptrdiff_t step, Sample fourth)
{
    return detail::interleaved(first, step, C4Gray<detail::RegisterOf<Sample>>{fourth});
}

/// Sources of words, for targets of any order.
inline auto c3AsWords(const u8* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, BytesAsWords<3>{});
}
inline auto ac4AsWords(const u8* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, BytesAsWords<4>{});
}

inline auto lumaOfC2(const u8* first, std::ptrdiff_t step) { return detail::interleaved(first, step, LumaOfC2{}); }

/// A row of floats for bytesOfFloats(), which takes what they are narrowed to.
inline auto floatsForBytes(const u8* row) { return InterleavedRow<FloatsForBytes, const u8>{row, {}}; }
inline auto bytesOfFloats(u8* row) { return InterleavedRow<C1<wide::U8, Order::any>, u8>{row, {}}; }

} // namespace pyxcc::layouts
