// The two powers of the gamma curves, in doubles.
//
// A root makes precision cheap. Let z be near to x^(-1/20), with so few bits that z^4 is exact. Then z^20 x is 1 + e
// for a small e, known to the last bit but for the rounding of three products, and x^(-1/20) = z (1 + e)^(-1/20): what
// is left of the error in e is divided by 20. In every rounding mode the result is within 0.5 units in the last place
// of the exact power, more or less, before its own rounding.
//
// The exponents are the doubles next to 9/20 and 20/9. What they differ by from the fractions shows in the last bit,
// and goes into the correction as its share of log x.
#pragma once

#include "lanes/inline.hpp"

#include <numbers>

namespace pyxcc::tone
{

/// How to approximate x^p for x = 2^e (1 + m): the power of 2^e by exp2, that of 1 + m by a polynomial of its own.
struct CoarsePower {
    float p;
    float mantissa[4];
    float excess; ///< of the exponent meant over p, in the unit of coarse(): times 2^-20 log 2
};

inline constexpr float excessUnit = 0x1p-20f * std::numbers::ln2_v<float>;

inline constexpr CoarsePower near045 = {
    -0.05f, {0.99997586f, -0.04910313f, 0.02082935f, -0.00578907f}, 0x1p-53f * 0.1f * excessUnit};
inline constexpr CoarsePower near222 = {
    0.22222222f, {1.00006301f, 0.21980145f, -0.07162767f, 0.01836575f}, 0x1p-53f * 8 / 9 * excessUnit};

/// x^(-1/9), for powers of words.
inline constexpr CoarsePower near222OfWords = {-0.11111111f, {0.99993195f, -0.10876627f, 0.04809288f, -0.01343126f}, 0};

template <class F64> struct Coarse {
    F64 power;  ///< 13 bits, off by less than 1 / 6000
    F64 excess; ///< excess * log x, where log2 x is off by less than 0.09
};

/// For x from 2^-60 to 2^400.
template <class F64> PYXCC_INLINE Coarse<F64> coarse(const F64& x, const CoarsePower& k)
{
    const auto bits = upperWords(x) - (1023 << 20);
    const auto power = toF32(bits >> 20) * k.p;
    const auto whole = roundedToEven(power);
    const auto t = power - whole;
    const auto t2 = t * t;
    const auto exp2 =
        fused(t2, fused(t2, 0.009570679f, fused(t, 0.055921273f, 0.24026212f)), fused(t, 0.69316411f, 1.0000603f));
    const auto m = toF32(bits & 0xfffff) * 0x1p-20f;
    const auto mantissa = fused(m * m, fused(m, k.mantissa[3], k.mantissa[2]), fused(m, k.mantissa[1], k.mantissa[0]));
    return {toF64(withoutLowBits(timesPowerOf2(exp2 * mantissa, whole), 11)), toF64(toF32(bits) * k.excess)};
}

/// The result, which is above half of `less`, but that where what is not finite has made the result anything.
template <class F64> PYXCC_INLINE F64 finiteOr(const F64& less, const F64& result)
{
    return greater(result, less * 0.5);
}

/// (1 + e)^p - 1 for small e, by its first coefficients, plus `more`.
template <class F64> PYXCC_INLINE F64 correction(const F64& e, const double (&k)[5], const F64& more)
{
    const F64 e2 = e * e;
    return fused(fused(e2, fused(e2, k[4], fused(e, k[3], k[2])), fused(e, k[1], k[0])), e, more);
}

/// x^0.45, where 0.45 is 9/20 and a tenth of 2^-53, for x from 0.018 up, infinity and NaN included.
template <class F64> PYXCC_INLINE F64 power045(const F64& x)
{
    const auto near = coarse(x, near045);
    const F64 z = near.power, z2 = z * z, z4 = z2 * z2, z8 = z4 * z4;
    const F64 e = fused(z8 * z8 * z4, x, -1.0);
    const F64 c = correction(
        e, {-0.05, 0.02624999999794327, -0.0179374999968003, 0.013677653413640382, -0.011078969603955506}, near.excess);
    // x^0.45 is the square root by x^(-1/20). The exact root is s + (x - s^2) / 2 s, and 1 / s is near to z^10.
    const F64 s = sqrt(x), rest = fused(-s, s, x), ofRest = z8 * z2 * (z * 0.5);
    const F64 y = s * z;
    return finiteOr(y, fused(s, z, fused(y, c, rest * ofRest)));
}

/// w^2.2222222222222223, whose exponent is 20/9 and 8/9 of 2^-53, for w from 0.16 up, infinity and NaN included.
template <class F64> PYXCC_INLINE F64 power222(const F64& w)
{
    const auto near = coarse(w, near222);
    const F64 z = near.power, z2 = z * z, z4 = z2 * z2, z9 = z4 * z4 * z;
    // z is near to w^(2/9), and z^9 to w^2 = square + rest.
    const F64 square = w * w, rest = fused(w, w, -square);
    const F64 e = fused(w, w, -z9) / z9;
    const F64 c = correction(
        e, {0.1111111111111111, -0.04938271604912385, 0.031092821215886007, -0.02245606215528491, 0.01746585757377671},
        near.excess);
    const F64 y = square * z; // w^(2/9) is above 0.66
    return finiteOr(square, fused(square, z, fused(rest, z, y * c)));
}

// A word has 16 bits, and its rounding looks at no more than 24: powers that are off by less than 2^-40 give every word
// that exact ones do. With z^20 x, or z^9 x, being 1 + e as above, x^0.45 is x (1 + e)^(-11/20) z^11, and x^2.22... is
// x^3 (1 + e)^(-7/9) z^7: no root, and no quotient.

/// y (1 + e)^p for small e, by its first coefficients.
template <class F64> PYXCC_INLINE F64 corrected(const F64& y, const F64& e, const double (&k)[4])
{
    const F64 e2 = e * e;
    return fused(y, fused(e2, fused(e, k[3], k[2]), fused(e, k[1], k[0])) * e, y);
}

/// x^0.45, for x from 0.018 to 1.
template <class F64> PYXCC_INLINE F64 power045OfWords(const F64& x)
{
    const F64 z = coarse(x, near045).power, z2 = z * z, z4 = z2 * z2, z8 = z4 * z4;
    const F64 e = fused(z8 * z8 * z4, x, -1.0);
    return corrected(z8 * x * (z2 * z), e, {-0.55, 0.42625, -0.3623125, 0.32155234375});
}

/// w^2.2222222222222223, for w from 0.16 to 1.
template <class F64> PYXCC_INLINE F64 power222OfWords(const F64& w)
{
    const F64 z = coarse(w, near222OfWords).power, z2 = z * z, z4 = z2 * z2;
    const F64 e = fused(z4 * z4 * z, w, -1.0);
    return corrected(w * w * w * (z4 * (z2 * z)), e,
                     {-0.7777777777777778, 0.691358024691358, -0.6401463191586648, 0.6045826347609612});
}

} // namespace pyxcc::tone
