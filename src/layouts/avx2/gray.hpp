// Pixels all of whose channels are one sample.
#pragma once

#include "layouts/avx2/interleave.hpp"

namespace pyxcc::layouts
{

namespace detail
{

/// The places of samples that come three times each: register K of three, whose lanes are made of one lane of samples
/// by threes.
template <int Bytes, int K>
constexpr std::array<u8, 32> threefold = [] {
    constexpr int samples = 16 / Bytes;
    std::array<u8, 32> places{};
    for (int i = 0; i < 32; ++i) {
        const int part = (2 * K + i / 16) % 3;
        places[i] = static_cast<u8>((part * samples + i % 16 / Bytes) / 3 * Bytes + i % Bytes);
    }
    return places;
}();

/// The places of samples that come three times each with a gap behind, which is cleared: register K of four.
template <int Bytes, int K>
constexpr Places threeOfFour = [] {
    constexpr int pixels = 4 / Bytes;
    Places places{};
    for (int i = 0; i < 16; ++i) {
        const int pixel = i / Bytes / 4;
        places[i] = i / Bytes % 4 == 3 ? 0x80 : static_cast<u8>((K * pixels + pixel) * Bytes + i % Bytes);
    }
    return places;
}();

/// What stays of samples in those gaps.
template <int Bytes> PYXCC_INLINE __m256i onlyFourths(__m256i x)
{
    constexpr Places gaps = [] {
        Places places{};
        for (int i = 0; i < 16; ++i) places[i] = i / Bytes % 4 == 3 ? 0xff : 0;
        return places;
    }();
    return _mm256_and_si256(x, inBothLanes(gaps));
}

} // namespace detail

/// Writes each sample of a block three times, 96 bytes.
template <class Samples> PYXCC_INLINE void storeThreefold(u8* p, Samples samples)
{
    constexpr int bytes = sampleBytes<Samples>;
    const auto places = [](const std::array<u8, 32>& at) PYXCC_INLINE_LAMBDA { return detail::loadWhole(at.data()); };
    const __m256i x = detail::raw(samples);
    const __m256i low = _mm256_permute2x128_si256(x, x, 0x00), high = _mm256_permute2x128_si256(x, x, 0x11);
    detail::storeWhole(p, _mm256_shuffle_epi8(low, places(detail::threefold<bytes, 0>)));
    detail::storeWhole(p + 32, _mm256_shuffle_epi8(x, places(detail::threefold<bytes, 1>)));
    detail::storeWhole(p + 64, _mm256_shuffle_epi8(high, places(detail::threefold<bytes, 2>)));
}

/// Writes each sample of a block three times and one of `fourths` behind, 128 bytes.
template <class Samples> PYXCC_INLINE void storeThreefold(u8* p, Samples samples, Samples fourths)
{
    constexpr int bytes = sampleBytes<Samples>;
    static_assert(bytes <= 4);
    // A register takes its first lane's samples from the one lane and its second lane's from the other.
    const __m256i byLanes = _mm256_setr_epi32(0, 2, 4, 6, 1, 3, 5, 7);
    const __m256i x = _mm256_permutevar8x32_epi32(detail::raw(samples), byLanes);
    const __m256i fourth = detail::onlyFourths<bytes>(detail::raw(fourths));
    detail::storeWhole(p, _mm256_or_si256(detail::shuffle(x, detail::threeOfFour<bytes, 0>), fourth));
    detail::storeWhole(p + 32, _mm256_or_si256(detail::shuffle(x, detail::threeOfFour<bytes, 1>), fourth));
    detail::storeWhole(p + 64, _mm256_or_si256(detail::shuffle(x, detail::threeOfFour<bytes, 2>), fourth));
    detail::storeWhole(p + 96, _mm256_or_si256(detail::shuffle(x, detail::threeOfFour<bytes, 3>), fourth));
}

} // namespace pyxcc::layouts
