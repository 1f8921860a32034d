// Exact weighted sums of three bytes, by bytes: half of the work of sums in 32 bits.
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::wide
{

namespace detail
{

/// (sum of weights times bytes + Addend) >> 16 in two parts, the upper and the lower bytes of the weights. Bytes count
/// from 128 here, so that a multiply-add takes weights up to 255. What that takes off, and the addend, is `steps` of
/// the result and a rest, the bytes of which ride as the fourth weight of each part.
struct ByteSum {
    int high[4], low[4];
    int steps;

    constexpr ByteSum(int addend, int r, int g, int b) : high{r >> 8, g >> 8, b >> 8}, low{r & 255, g & 255, b & 255}
    {
        const int all = addend + 128 * (r + g + b);
        steps = all >> 16;
        high[3] = (all >> 8) & 255;
        low[3] = all & 255;
    }

    /// Whether no part leaves a word, nor does the sum of the upper part and the lower one's 256th.
    constexpr bool fits() const
    {
        const auto sum = [](const int(&x)[4]) { return x[0] + x[1] + x[2]; };
        return sum(high) <= 255 && sum(low) <= 256;
    }
};

} // namespace detail

template <int Addend, int R, int G, int B>
inline constexpr bool sumsByBytes = R >= 0 && G >= 0 && B >= 0 && detail::ByteSum(Addend, R, G, B).fits();

/// (R r + G g + B b + Addend) >> 16, which must be a byte.
template <int Addend, int R, int G, int B> PYXCC_INLINE U8 exactSumOfBytes(U8 r, U8 g, U8 b)
{
    static_assert(sumsByBytes<Addend, R, G, B>);
    static constexpr detail::ByteSum sum(Addend, R, G, B);
    const auto from128 = [](U8 x) PYXCC_INLINE_LAMBDA { return _mm256_xor_si256(x.v, _mm256_set1_epi8(-128)); };
    const auto weighted = [](const int(&part)[4], __m256i rg, __m256i b1) PYXCC_INLINE_LAMBDA {
        const __m256i weightsOfRg = _mm256_set1_epi16(static_cast<short>(part[0] | part[1] << 8));
        const __m256i weightsOfB1 = _mm256_set1_epi16(static_cast<short>(part[2] | part[3] << 8));
        return S16(_mm256_maddubs_epi16(weightsOfRg, rg)) + S16(_mm256_maddubs_epi16(weightsOfB1, b1));
    };
    const auto shifted = [&](__m256i rg, __m256i b1) PYXCC_INLINE_LAMBDA {
        return (weighted(sum.high, rg, b1) + (weighted(sum.low, rg, b1) >> 8)) >> 8;
    };
    const __m256i x = from128(r), y = from128(g), z = from128(b), one = _mm256_set1_epi8(1);
    const S16 low = shifted(_mm256_unpacklo_epi8(x, y), _mm256_unpacklo_epi8(z, one));
    const S16 high = shifted(_mm256_unpackhi_epi8(x, y), _mm256_unpackhi_epi8(z, one));
    return U8(_mm256_add_epi8(_mm256_packs_epi16(low.v, high.v), _mm256_set1_epi8(static_cast<char>(sum.steps))));
}

} // namespace pyxcc::wide
