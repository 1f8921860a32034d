// Images as runs of samples that forms over floats take, to which all samples are alike: 32 at a time as floats, and
// back as samples of another type. Columns here are samples.
#pragma once

#include "layouts/avx2/samples_as_floats.hpp"
#include "layouts/images.hpp"

namespace pyxcc::layouts
{

/// 32 samples as floats.
template <class Sample> struct AsFloats {
    using Samples = wide::U8;
    static constexpr int pixelBytes = sizeof(Sample);

    static PYXCC_INLINE Four<wide::F32> load(const u8* p) { return loadAsFloats<Sample>(p); }
};

/// 32 samples of words, signed ones 32768 larger.
template <class Sample> struct AsWords {
    using Samples = wide::U8;
    static constexpr int pixelBytes = sizeof(Sample);

    static PYXCC_INLINE Two<wide::U16> load(const u8* p) { return loadAsWords<Sample>(p); }
};

/// 32 samples, narrowed from what was made of samples of `Source`. Each fourth may be put back as it was.
template <class Source, class Sample, bool KeepFourths> struct FromFloats {
    using Samples = wide::U8;
    static constexpr int pixelBytes = sizeof(Sample);
    static constexpr bool readsTarget = KeepFourths;

    template <class Register, int N> static PYXCC_INLINE void store(u8* p, const Several<Register, N>& samples)
    {
        for (int i = 0; i < N; ++i, p += 32) {
            const Register inOrder = inMemoryOrderFrom<Source>(samples.part[i]);
            if constexpr (KeepFourths) {
                storeButFourths(p, inOrder);
            } else {
                storeSamples(p, inOrder);
            }
        }
    }
};

template <class Sample> auto asFloats(const Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, AsFloats<Sample>{});
}

template <class Sample> auto asWords(const Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, AsWords<Sample>{});
}

template <class Source, bool KeepFourths, class Sample> auto fromFloats(Sample* first, std::ptrdiff_t step)
{
    return detail::interleaved(first, step, FromFloats<Source, Sample, KeepFourths>{});
}

} // namespace pyxcc::layouts
