// Exact weighted sums of 16-bit lanes in the notation of a formula:
//
//     (16843 * exact(r) + 33030 * exact(g) + 6423 * exact(b) + 0x108000) >> 16
//
// Products and sums are 32 bits wide and the shift is arithmetic. The sum must keep within 32 bits and the shifted sum
// within 16. Weights and addends are constants to the compiler once all is inlined, and how the lanes reach the sum is
// their own affair: one value multiplies, a register goes by pairs (see shiftedSum).
#pragma once

#include "lanes/inline.hpp"
#include "lanes/scalar.hpp"

#include <array>
#include <cstddef>

namespace pyxcc
{

template <class S16> struct Exact {
    S16 x;
};

template <class S16> PYXCC_INLINE Exact<S16> exact(S16 x) { return {x}; }

template <class S16> struct Term {
    S16 x;
    int weight;
};

template <class S16, std::size_t N> struct ExactSum {
    std::array<Term<S16>, N> terms;
    int addend;

    friend PYXCC_INLINE ExactSum operator+(ExactSum sum, int k) { return {sum.terms, sum.addend + k}; }
    friend PYXCC_INLINE ExactSum operator-(ExactSum sum, int k) { return {sum.terms, sum.addend - k}; }
    friend PYXCC_INLINE S16 operator>>(const ExactSum& sum, int shift) { return shiftedSum(sum, shift); }
};

template <class S16> PYXCC_INLINE ExactSum<S16, 1> operator*(int weight, Exact<S16> lane)
{
    return {{{{lane.x, weight}}}, 0};
}

template <class S16, std::size_t N, std::size_t M>
PYXCC_INLINE ExactSum<S16, N + M> operator+(const ExactSum<S16, N>& left, const ExactSum<S16, M>& right)
{
    ExactSum<S16, N + M> sum;
    for (std::size_t i = 0; i < N; ++i) sum.terms[i] = left.terms[i];
    for (std::size_t i = 0; i < M; ++i) sum.terms[N + i] = right.terms[i];
    sum.addend = left.addend + right.addend;
    return sum;
}

template <class S16, std::size_t N, std::size_t M>
PYXCC_INLINE ExactSum<S16, N + M> operator-(const ExactSum<S16, N>& left, ExactSum<S16, M> right)
{
    for (Term<S16>& term : right.terms) term.weight = -term.weight;
    right.addend = -right.addend;
    return left + right;
}

namespace scalar
{

template <std::size_t N> S16 shiftedSum(const ExactSum<S16, N>& sum, int shift)
{
    s32 total = sum.addend;
    for (const Term<S16>& term : sum.terms) total += term.x.v * term.weight;
    return total >> shift;
}

} // namespace scalar

} // namespace pyxcc
