// Several registers as one lane type: an operation is made on all of them before the next one is. A long chain of
// dependent operations so leaves the processor others to do meanwhile.
#pragma once

#include "lanes/groups.hpp"
#include "lanes/inline.hpp"

#include <array>
#include <type_traits>

namespace pyxcc
{

template <class Lane, int N> struct Several;

/// What `operation` makes of the parts of each place.
template <class Operation, int N, class... Lanes>
PYXCC_INLINE auto each(const Operation& operation, const Several<Lanes, N>&... x)
{
    Several<decltype(operation(x.part[0]...)), N> result;
    for (int i = 0; i < N; ++i) result.part[i] = operation(x.part[i]...);
    return result;
}

template <class Lane, int N> struct Several {
    std::array<Lane, N> part;

    Several() = default;

    /// The same number in all lanes.
    template <class Number>
    requires std::is_arithmetic_v<Number> PYXCC_INLINE Several(Number k)
    {
        for (Lane& lane : part) lane = Lane(k);
    }

    friend PYXCC_INLINE Several operator+(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return a + b; }, x, y);
    }
    friend PYXCC_INLINE Several operator-(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return a - b; }, x, y);
    }
    friend PYXCC_INLINE Several operator-(const Several& x)
    {
        return each([](Lane a) PYXCC_INLINE_LAMBDA { return -a; }, x);
    }
    friend PYXCC_INLINE Several operator*(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return a * b; }, x, y);
    }
    friend PYXCC_INLINE Several operator/(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return a / b; }, x, y);
    }
    friend PYXCC_INLINE Several operator&(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return a & b; }, x, y);
    }
    friend PYXCC_INLINE Several operator>>(const Several& x, int n)
    {
        return each([n](Lane a) PYXCC_INLINE_LAMBDA { return a >> n; }, x);
    }
    friend PYXCC_INLINE Several fused(const Several& x, const Several& y, const Several& z)
    {
        return each([](Lane a, Lane b, Lane c) PYXCC_INLINE_LAMBDA { return fused(a, b, c); }, x, y, z);
    }
    friend PYXCC_INLINE Several greater(const Several& x, const Several& y)
    {
        return each([](Lane a, Lane b) PYXCC_INLINE_LAMBDA { return greater(a, b); }, x, y);
    }
    friend PYXCC_INLINE Several whereLess(const Several& x, const Several& y, const Several& yes, const Several& no)
    {
        return each([](Lane a, Lane b, Lane c, Lane d) PYXCC_INLINE_LAMBDA { return whereLess(a, b, c, d); }, x, y, yes,
                    no);
    }
};

template <class F64, int N> PYXCC_INLINE auto sqrt(const Several<F64, N>& x)
{
    return each([](F64 a) PYXCC_INLINE_LAMBDA { return sqrt(a); }, x);
}

template <class F32, int N> PYXCC_INLINE auto trunc(const Several<F32, N>& x)
{
    return each([](F32 a) PYXCC_INLINE_LAMBDA { return trunc(a); }, x);
}

template <class F32, int N> PYXCC_INLINE auto roundedToEven(const Several<F32, N>& x)
{
    return each([](F32 a) PYXCC_INLINE_LAMBDA { return roundedToEven(a); }, x);
}

template <class F32, int N> PYXCC_INLINE auto timesPowerOf2(const Several<F32, N>& x, const Several<F32, N>& n)
{
    return each([](F32 a, F32 b) PYXCC_INLINE_LAMBDA { return timesPowerOf2(a, b); }, x, n);
}

template <class F32, int N> PYXCC_INLINE auto withoutLowBits(const Several<F32, N>& x, int count)
{
    return each([count](F32 a) PYXCC_INLINE_LAMBDA { return withoutLowBits(a, count); }, x);
}

template <class F32, class S32, int N>
PYXCC_INLINE auto whereEqual(const Several<F32, N>& x, const Several<F32, N>& y, const Several<S32, N>& yes,
                             const Several<S32, N>& no)
{
    return each([](F32 a, F32 b, S32 c, S32 d) PYXCC_INLINE_LAMBDA { return whereEqual(a, b, c, d); }, x, y, yes, no);
}

template <class Lane, class... Lanes> PYXCC_INLINE auto several(Lane first, Lanes... rest)
{
    Several<Lane, 1 + sizeof...(Lanes)> result;
    result.part = {first, rest...};
    return result;
}

// A register of floats has the lanes of two registers of doubles.

template <class F32, int N> PYXCC_INLINE auto toF64(const Several<F32, N>& x)
{
    using F64 = decltype(toF64(x.part[0]).a);
    Several<F64, 2 * N> result;
    for (int i = 0; i < N; ++i) {
        const Two<F64> doubles = toF64(x.part[i]);
        result.part[2 * i] = doubles.a;
        result.part[2 * i + 1] = doubles.b;
    }
    return result;
}

template <class S32, int N> PYXCC_INLINE auto toF32(const Several<S32, N>& x)
{
    if constexpr (requires { toF32(Two{x.part[0], x.part[0]}); }) {
        Several<decltype(toF32(Two{x.part[0], x.part[0]})), N / 2> result;
        for (int i = 0; i < N / 2; ++i) result.part[i] = toF32(Two{x.part[2 * i], x.part[2 * i + 1]});
        return result;
    } else {
        return each([](S32 a) PYXCC_INLINE_LAMBDA { return toF32(a); }, x);
    }
}

template <class F64, int N> PYXCC_INLINE auto upperWords(const Several<F64, N>& x)
{
    Several<decltype(upperWords(Two{x.part[0], x.part[0]})), N / 2> result;
    for (int i = 0; i < N / 2; ++i) result.part[i] = upperWords(Two{x.part[2 * i], x.part[2 * i + 1]});
    return result;
}

} // namespace pyxcc
