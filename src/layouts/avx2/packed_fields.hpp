// Packed 16-bit pixels: three fields, the first in the lowest bits, beside a register of bytes for each of them.
#pragma once

#include "layouts/avx2/chroma.hpp"

namespace pyxcc::layouts
{

/// The fields of a pixel, in bits. The first and the second share the lower byte, the second and the third the upper
/// one.
struct FieldWidths {
    int first, second, third;
};

inline constexpr FieldWidths fields444{4, 4, 4};
inline constexpr FieldWidths fields555{5, 5, 5};
inline constexpr FieldWidths fields565{5, 6, 5};

namespace detail
{

/// Bits `From` and up of every byte, `Count` of them, moved to bits `To` and up; all others are 0. They must not leave
/// the byte.
template <int From, int Count, int To> PYXCC_INLINE __m256i movedBits(wide::U8 x)
{
    static_assert(From >= 0 && To >= 0 && From + Count <= 8 && To + Count <= 8);
    constexpr int mask = ((1 << Count) - 1) << To;
    __m256i moved = x.v;
    if constexpr (To > From) moved = _mm256_slli_epi16(x.v, To - From);
    if constexpr (To < From) moved = _mm256_srli_epi16(x.v, From - To);
    return _mm256_and_si256(moved, _mm256_set1_epi8(static_cast<char>(mask)));
}

PYXCC_INLINE wide::U8 bothOf(__m256i x, __m256i y) { return wide::U8(_mm256_or_si256(x, y)); }

} // namespace detail

/// Reads 32 pixels. Each field comes in the leading bits of a byte, the rest of which is 0.
template <FieldWidths widths> PYXCC_INLINE Three<wide::U8> loadFields(const u8* p)
{
    constexpr int secondInLower = 8 - widths.first, secondInUpper = widths.second - secondInLower;
    const Two<wide::U8> x = loadAlternating(p);
    return {wide::U8(detail::movedBits<0, widths.first, 8 - widths.first>(x.a)),
            detail::bothOf(detail::movedBits<widths.first, secondInLower, 8 - widths.second>(x.a),
                           detail::movedBits<0, secondInUpper, 8 - secondInUpper>(x.b)),
            wide::U8(detail::movedBits<secondInUpper, widths.third, 8 - widths.third>(x.b))};
}

/// Writes 32 pixels, whose fields are the leading bits of bytes.
template <FieldWidths widths> PYXCC_INLINE void storeFields(u8* p, const Three<wide::U8>& fields)
{
    constexpr int first = 8 - widths.first, second = 8 - widths.second, third = 8 - widths.third;
    constexpr int secondInLower = 8 - widths.first, secondInUpper = widths.second - secondInLower;
    storeAlternating(p,
                     detail::bothOf(detail::movedBits<first, widths.first, 0>(fields.a),
                                    detail::movedBits<second, secondInLower, widths.first>(fields.b)),
                     detail::bothOf(detail::movedBits<second + secondInLower, secondInUpper, 0>(fields.b),
                                    detail::movedBits<third, widths.third, secondInUpper>(fields.c)));
}

namespace detail
{

/// The leading bits of every word, `Count` of them, moved to bits `To` and up; all others are 0.
template <int Count, int To> PYXCC_INLINE __m256i leadingBits(wide::U16 x)
{
    constexpr int down = 16 - Count - To, mask = ((1 << Count) - 1) << To;
    const __m256i moved = down == 0 ? x.v : _mm256_srli_epi16(x.v, down);
    return To == 0 ? moved : _mm256_and_si256(moved, wide::U16(mask).v);
}

template <FieldWidths widths> PYXCC_INLINE __m256i joined(wide::U16 a, wide::U16 b, wide::U16 c)
{
    const __m256i firstTwo =
        _mm256_or_si256(leadingBits<widths.first, 0>(a), leadingBits<widths.second, widths.first>(b));
    return _mm256_or_si256(firstTwo, leadingBits<widths.third, widths.first + widths.second>(c));
}

} // namespace detail

/// Writes 32 pixels, whose fields are the leading bits of words in the order of widened bytes.
template <FieldWidths widths> PYXCC_INLINE void storeFields(u8* p, const Three<Two<wide::U16>>& fields)
{
    const auto& [a, b, c] = fields;
    const __m256i low = detail::joined<widths>(a.a, b.a, c.a), high = detail::joined<widths>(a.b, b.b, c.b);
    detail::storeWhole(p, _mm256_permute2x128_si256(low, high, 0x20));
    detail::storeWhole(p + 32, _mm256_permute2x128_si256(low, high, 0x31));
}

} // namespace pyxcc::layouts
