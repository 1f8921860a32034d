// Fewer levels where no sample depends on another: the nearest level, and the ordered matrix. Wide and tail forms
// differ in what is fused.
#pragma once

#include "layouts/samples_as_floats.hpp"
#include "tone/reduce_bits_depths.hpp"

namespace pyxcc::tone
{

/// The nearest level. Samples are brought to 0 to 1 first.
template <class Depth> struct Nearest {
    f32 s, iv, hf;

    explicit Nearest(s32 levels) : s(static_cast<f32>(levels - 1)), iv(1.0f / s), hf(0.5f / s) {}

protected:
    /// The level below, and what is left.
    template <class F32> struct Below {
        F32 q, pr, r;
    };

    template <class F32> PYXCC_INLINE Below<F32> below(const F32& p) const
    {
        if constexpr (std::is_same_v<typename Depth::Source, f32>) {
            const F32 q = toF32(trunc(p * F32(s))), pr = F32(iv) * q;
            return {q, pr, p - pr};
        } else {
            const F32 c = Working<typename Depth::Source>::unit;
            const F32 q = toF32(trunc(c * p * F32(s))), pr = F32(iv) * q;
            return {q, pr, fused(c, p, -pr)};
        }
    }

    template <class F32> PYXCC_INLINE auto storedValue(const F32& v) const
    {
        const auto integer = trunc(v * F32(Depth::targetTop));
        if constexpr (std::is_same_v<typename Depth::Target, s16>) {
            return integer - 32768;
        } else {
            return integer;
        }
    }
};

template <class Depth> struct NearestWide : Nearest<Depth> {
    using Nearest<Depth>::Nearest;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p) const
    {
        const auto [q, pr, r] = this->below(p);
        return this->storedValue(fused(q, F32(this->iv), whereLess(F32(this->hf), r, F32(this->iv), F32(0))));
    }
};

template <class Depth> struct NearestTail : Nearest<Depth> {
    using Nearest<Depth>::Nearest;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p) const
    {
        const auto [q, pr, r] = this->below(p);
        return this->storedValue(whereLess(F32(this->hf), r, pr + F32(this->iv), pr));
    }
};

/// Floats are held to their range first. Integers cannot leave theirs but by a step.
template <class Depth, class F32> PYXCC_INLINE auto storedValue(const F32& p, const F32& value)
{
    if constexpr (std::is_same_v<typename Depth::Source, f32>) {
        return stored<Depth, false>(whereWithin<f32>(p, value, 1.0f, 0.0f));
    } else {
        return stored<Depth, false>(value);
    }
}

/// The level below, or the one above it where what is left exceeds the threshold.
template <class Depth> struct OrderedWide {
    Levels levels;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p, const F32& threshold) const
    {
        const F32 step = levels.step, qi = toF32(trunc(p * F32(levels.inv)));
        const F32 r = fused(-qi, step, p);
        return storedValue<Depth>(p, fused(qi, step, whereLess(threshold, r, step, F32(0))));
    }
};

template <class Depth> struct OrderedTail {
    Levels levels;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p, const F32& threshold) const
    {
        const F32 step = levels.step, pr = toF32(trunc(p * F32(levels.inv))) * step;
        return storedValue<Depth>(p, pr + whereLess(threshold, p - pr, step, F32(0)));
    }
};

namespace detail
{

/// 32 integers as samples.
template <class Target> PYXCC_INLINE auto saturated(const Four<wide::S32>& x)
{
    if constexpr (sizeof(Target) == 1) {
        return several(saturate<wide::U8>(x));
    } else {
        using Register = wide::RegisterOf<Target>;
        return several(wide::saturate<Register>(Two{x.a, x.b}), wide::saturate<Register>(Two{x.c, x.d}));
    }
}

/// Integers of the range of unsigned words, which 32768 is taken off then.
template <class Target> PYXCC_INLINE auto saturatedThenLowered(const Four<wide::S32>& x)
{
    if constexpr (std::is_same_v<Target, s16>) {
        return each([](wide::U16 words) PYXCC_INLINE_LAMBDA { return lowered(words); }, saturated<u16>(x));
    } else {
        return saturated<Target>(x);
    }
}

} // namespace detail

template <class Depth> PYXCC_INLINE auto apply(const NearestWide<Depth>& form, const Four<wide::F32>& p)
{
    return detail::saturated<typename Depth::Target>(Four{form(p.a), form(p.b), form(p.c), form(p.d)});
}

template <class Depth> PYXCC_INLINE auto apply(const NearestTail<Depth>& form, const Four<wide::F32>& p)
{
    return detail::saturated<typename Depth::Target>(Four{form(p.a), form(p.b), form(p.c), form(p.d)});
}

namespace detail
{

template <class Target, class Form>
PYXCC_INLINE auto ordered(const Form& form, const Four<wide::F32>& p, const Four<wide::F32>& threshold)
{
    return saturatedThenLowered<Target>(
        Four{form(p.a, threshold.a), form(p.b, threshold.b), form(p.c, threshold.c), form(p.d, threshold.d)});
}

} // namespace detail

template <class Depth>
PYXCC_INLINE auto apply(const OrderedWide<Depth>& form, const Two<Four<wide::F32>>& samplesAndThresholds)
{
    return detail::ordered<typename Depth::Target>(form, samplesAndThresholds.a, samplesAndThresholds.b);
}

template <class Depth>
PYXCC_INLINE auto apply(const OrderedTail<Depth>& form, const Two<Four<wide::F32>>& samplesAndThresholds)
{
    return detail::ordered<typename Depth::Target>(form, samplesAndThresholds.a, samplesAndThresholds.b);
}

} // namespace pyxcc::tone
