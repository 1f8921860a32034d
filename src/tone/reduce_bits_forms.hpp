// Fewer levels where no sample depends on another: the nearest level, and the ordered matrix. Wide and tail forms
// differ in what is fused.
#pragma once

#include "layouts/samples_as_floats.hpp"
#include "tone/byte_steps.hpp"
#include "tone/reduce_bits_depths.hpp"

#include <numeric>

namespace pyxcc::tone
{

/// The nearest level. Samples are brought to 0 to 1 first.
template <class Depth> struct Nearest {
    static constexpr bool storedLate = true;
    f32 s, iv, hf;

    explicit Nearest(s32 levels) : s(static_cast<f32>(levels - 1)), iv(1.0f / s), hf(0.5f / s) {}

    /// What level n is stored as in bytes.
    u8 valueOf(int n) const
    {
        return scalar::saturate<u8>(storedValue(scalar::F32(static_cast<f32>(n)) * scalar::F32(iv)));
    }

protected:
    /// The level below, by its number and its value, and what is left.
    template <class F32> struct Below {
        decltype(trunc(F32())) number;
        F32 q, pr, r;
    };

    template <class F32> PYXCC_INLINE Below<F32> below(const F32& p) const
    {
        if constexpr (std::is_same_v<typename Depth::Source, f32>) {
            const auto number = trunc(p * F32(s));
            const F32 q = toF32(number), pr = F32(iv) * q;
            return {number, q, pr, p - pr};
        } else {
            const F32 c = Working<typename Depth::Source>::unit;
            const auto number = trunc(c * p * F32(s));
            const F32 q = toF32(number), pr = F32(iv) * q;
            return {number, q, pr, fused(c, p, -pr)};
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
        const auto [number, q, pr, r] = this->below(p);
        return this->storedValue(fused(q, F32(this->iv), whereLess(F32(this->hf), r, F32(this->iv), F32(0))));
    }
};

template <class Depth> struct NearestTail : Nearest<Depth> {
    using Nearest<Depth>::Nearest;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p) const
    {
        const auto [number, q, pr, r] = this->below(p);
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

/// What so many steps are stored as in bytes.
template <class Depth> u8 valueOfStep(int n, f32 step)
{
    return scalar::saturate<u8>(stored<Depth, false>(scalar::F32(static_cast<f32>(n)) * scalar::F32(step)));
}

/// The level below, or the one above it where what is left exceeds the threshold.
template <class Depth> struct OrderedWide {
    static constexpr bool storedLate = true, takesThreshold = true;

    Levels levels;

    template <class F32> PYXCC_INLINE auto operator()(const F32& p, const F32& threshold) const
    {
        const F32 step = levels.step, qi = toF32(trunc(p * F32(levels.inv)));
        const F32 r = fused(-qi, step, p);
        return storedValue<Depth>(p, fused(qi, step, whereLess(threshold, r, step, F32(0))));
    }
};

template <class Depth> struct OrderedTail {
    static constexpr bool takesThreshold = true;

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

/// Bytes of few levels, of which a register can look up what each is stored as: a level is told by its number. The
/// value of level n is n times the unit, rounded once, whether or not n is one more than what trunc() gives.
struct FewLevels {
    static constexpr int most = 16;

    std::array<u8, most> valueOf;

    template <class ValueOf> explicit FewLevels(const ValueOf& valueOfLevel)
    {
        for (int n = 0; n < most; ++n) valueOf[n] = valueOfLevel(n);
    }
};

template <class Depth> struct NearestOfFew : Nearest<Depth> {
    FewLevels levels;

    explicit NearestOfFew(s32 count) : Nearest<Depth>(count), levels([this](int n) { return this->valueOf(n); }) {}

    /// The number of the level.
    template <class F32> PYXCC_INLINE auto operator()(const F32& p) const
    {
        const auto below = this->below(p);
        return oneMoreWhereLess(F32(this->hf), below.r, below.number);
    }
};

/// A threshold below zero can take the number beyond that of the last level, for which there has to be a place.
template <class Depth> struct OrderedOfFew {
    static constexpr bool storedLate = true;

    Levels levels;
    FewLevels few;

    explicit OrderedOfFew(const Levels& levels)
        : levels(levels), few([&](int n) { return valueOfStep<Depth>(n, levels.step); })
    {
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& p, const F32& threshold) const
    {
        const auto number = trunc(p * F32(levels.inv));
        return oneMoreWhereLess(threshold, fused(-toF32(number), F32(levels.step), p), number);
    }
};

template <class Depth> PYXCC_INLINE auto apply(const NearestOfFew<Depth>& form, const Four<wide::F32>& p)
{
    const auto numbers = saturate<wide::U8>(Four{form(p.a), form(p.b), form(p.c), form(p.d)});
    return several(lookUp(form.levels.valueOf, numbers));
}

template <class Depth>
PYXCC_INLINE auto apply(const OrderedOfFew<Depth>& form, const Two<Four<wide::F32>>& samplesAndThresholds)
{
    const auto& [p, t] = samplesAndThresholds;
    const auto numbers = saturate<wide::U8>(Four{form(p.a, t.a), form(p.b, t.b), form(p.c, t.c), form(p.d, t.d)});
    return several(lookUp(form.few.valueOf, numbers));
}

/// Levels of bytes as steps.
template <class Steps> struct SteppedBytes {
    Steps steps;
};

/// Bytes of a row, and where what belongs to their columns is.
struct BytesInPlace {
    wide::U8 bytes;
    const u16* offsets;
    const f32* thresholds;
};

template <class Steps> PYXCC_INLINE auto apply(const SteppedBytes<Steps>& form, const BytesInPlace& x)
{
    return several(lookUp(form.steps, x.bytes, layouts::loadWordsInOrderOfBytes(x.offsets)));
}

template <class Depth> PYXCC_INLINE auto apply(const NearestTail<Depth>& form, const BytesInPlace& x)
{
    return apply(form, toF32(x.bytes));
}

template <class Depth> PYXCC_INLINE auto apply(const OrderedTail<Depth>& form, const BytesInPlace& x)
{
    return apply(form, Two{toF32(x.bytes), layouts::loadFloatsInOrderOf<u8>(x.thresholds)});
}

/// What a form makes of each byte.
template <class Form> ByteFunction ofEveryByte(const Form& form)
{
    ByteFunction bytes, results;
    std::iota(bytes.begin(), bytes.end(), u8{0});
    for (int x = 0; x < 256; x += wide::U8::count)
        layouts::storeSamples(&results[x], form(toF32(layouts::loadSamples<wide::U8>(&bytes[x]))).part[0]);
    return results;
}

} // namespace pyxcc::tone
