// Samples of a row as floats, 32 at a time, and integers of that order back to samples of another type.
#pragma once

#include "layouts/avx2/interleave.hpp"

#include <type_traits>

namespace pyxcc::layouts
{

/// Reads 32 samples in the order that widening gives; signed words come 32768 larger.
template <class Sample> PYXCC_INLINE Four<wide::F32> loadAsFloats(const u8* p)
{
    if constexpr (sizeof(Sample) == 4) {
        return {loadSamples<wide::F32>(p), loadSamples<wide::F32>(p + 32), loadSamples<wide::F32>(p + 64),
                loadSamples<wide::F32>(p + 96)};
    } else if constexpr (sizeof(Sample) == 2) {
        const auto words = [](const u8* at) PYXCC_INLINE_LAMBDA {
            if constexpr (std::is_signed_v<Sample>) return toF32ByDifference(raised(loadSamples<wide::S16>(at)));
            return toF32ByDifference(loadSamples<wide::U16>(at));
        };
        const Two<wide::F32> low = words(p), high = words(p + 32);
        return {low.a, low.b, high.a, high.b};
    } else {
        return toF32(loadSamples<wide::U8>(p));
    }
}

/// Reads 32 floats in the order in which samples of that type come.
template <class Sample> PYXCC_INLINE Four<wide::F32> loadFloatsInOrderOf(const f32* p)
{
    const auto fours = [p](int low, int high) PYXCC_INLINE_LAMBDA {
        return wide::F32(_mm256_set_m128(_mm_loadu_ps(p + high), _mm_loadu_ps(p + low)));
    };
    if constexpr (sizeof(Sample) == 4) {
        return {fours(0, 4), fours(8, 12), fours(16, 20), fours(24, 28)};
    } else if constexpr (sizeof(Sample) == 2) {
        return {fours(0, 8), fours(4, 12), fours(16, 24), fours(20, 28)};
    } else {
        return {fours(0, 16), fours(4, 20), fours(8, 24), fours(12, 28)};
    }
}

/// Reads 64 bytes of words, signed ones 32768 larger.
template <class Sample> PYXCC_INLINE Two<wide::U16> loadAsWords(const u8* p)
{
    if constexpr (std::is_signed_v<Sample>) {
        return {raised(loadSamples<wide::S16>(p)), raised(loadSamples<wide::S16>(p + 32))};
    } else {
        return {loadSamples<wide::U16>(p), loadSamples<wide::U16>(p + 32)};
    }
}

/// Reads 32 words in the order of widened bytes.
PYXCC_INLINE Two<wide::U16> loadWordsInOrderOfBytes(const u16* p)
{
    const auto eights = [p](int low, int high) PYXCC_INLINE_LAMBDA {
        const auto eight = [p](int at) { return _mm_loadu_si128(reinterpret_cast<const __m128i*>(p + at)); };
        return wide::U16(_mm256_set_m128i(eight(high), eight(low)));
    };
    return {eights(0, 16), eights(8, 24)};
}

/// A register that integers of the order of `Sample` were narrowed to, in the order of memory.
template <class Sample, class Register> PYXCC_INLINE Register inMemoryOrderFrom(Register x)
{
    constexpr int halvings = static_cast<int>(sizeof(Sample)) / sampleBytes<Register>;
    if constexpr (halvings == 1) {
        return x; // narrowing undoes what widening did
    } else if constexpr (halvings == 2) {
        return detail::as<Register>(_mm256_permute4x64_epi64(detail::raw(x), 0xd8));
    } else {
        return inMemoryOrder<Order::any>(x);
    }
}

} // namespace pyxcc::layouts
