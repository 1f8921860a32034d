#include "tone/noise_generator.hpp"

#include "frame/checks.hpp"
#include "frame/scratch.hpp"

#include <cmath>
#include <memory>

using namespace pyxcc::frame;

namespace pyxcc::tone
{

namespace
{

/// What sets the varieties apart: a record's tag, the element that its memory is counted in, and what the numbers are
/// stored as.
template <class Number> struct Variety;

template <> struct Variety<s16> {
    static constexpr u32 tag = 36;
    using Unit = u16;
    using Stored = u16;
};

template <> struct Variety<f32> {
    static constexpr u32 tag = 37;
    using Unit = f32;
    using Stored = f32;
};

constexpr s32 recordUnits = 56;

constexpr u32 next(u32 x) { return x * 69069 + 1013904243; }

/// One number of 32 bits, of any sign. Whether it borrows nobody can foretell, so that nothing branches on it.
template <class Number> s32 step(NoiseGenerator<Number>& record)
{
    const u32 t = record.s1 - record.s2 + record.d;
    record.d = 0 - (t >> 31); // all bits where it borrows
    record.s2 = record.s1;
    record.s1 = record.s0;
    record.s0 = t - (record.d & 18);
    record.x = next(record.x);
    return static_cast<s32>(record.s0 + record.x);
}

template <class Number> auto isOfVariety(const NoiseGenerator<Number>* record)
{
    return [=]() -> PyxStatus { return record->tag == Variety<Number>::tag ? pyxOk : pyxErrContext; };
}

template <class Number> PyxStatus init(NoiseGenerator<Number>** record, Number low, Number high, u32 seed)
{
    if (const PyxStatus failure = firstFailure(notNull(record))) return failure;
    auto memory = allocate<typename Variety<Number>::Unit>(recordUnits);
    static_assert(sizeof(NoiseGenerator<Number>) <= recordUnits * sizeof(memory[0]));
    if (!memory) return pyxErrNoMemory;
    const u32 s1 = next(seed);
    const auto sum = low + high, difference = high - low; // integers of integers
    *record = new (memory.release()) NoiseGenerator<Number>{.tag = Variety<Number>::tag,
                                                            .seed = seed,
                                                            .low = low,
                                                            .high = high,
                                                            .mid = static_cast<f64>(sum) * 0.5,
                                                            .scale = static_cast<f64>(difference) * 2.3283064365387e-10,
                                                            .x = 1131199209,
                                                            .s0 = seed,
                                                            .s1 = s1,
                                                            .s2 = next(s1),
                                                            .d = ~0u};
    return pyxOk;
}

template <class Number>
PyxStatus fill(typename Variety<Number>::Stored* array, s32 length, NoiseGenerator<Number>* record)
{
    const auto isLong = [=]() -> PyxStatus { return length >= 1 ? pyxOk : pyxErrSize; };
    if (const PyxStatus failure = firstFailure(notNull(array, record), isLong, isOfVariety(record))) return failure;
    NoiseGenerator<Number> state = *record; // in registers
    const f64 scale = state.scale, mid = state.mid;
    const auto stored = [&](s32 number) {
        const f64 scaled = std::fma(scale, static_cast<f64>(number), mid);
        if constexpr (Variety<Number>::tag == 36) {
            return static_cast<u16>(static_cast<s32>(scaled));
        } else {
            return static_cast<f32>(scaled);
        }
    };
    // The steps are a chain, and what follows is none.
    constexpr s32 some = 64;
    s32 i = 0;
    for (; length - i >= some; i += some) {
        s32 numbers[some];
        for (s32& number : numbers) number = step(state);
        for (s32 j = 0; j < some; ++j) array[i + j] = stored(numbers[j]);
    }
    for (; i < length; ++i) array[i] = stored(step(state));
    *record = state;
    return pyxOk;
}

template <class Number> PyxStatus giveBack(NoiseGenerator<Number>* record)
{
    if (const PyxStatus failure = firstFailure(notNull(record), isOfVariety(record))) return failure;
    pyxFree(record);
    return pyxOk;
}

} // namespace

PyxStatus noiseGenInitU16(NoiseGeneratorU16** record, s16 low, s16 high, u32 seed)
{
    return init(record, low, high, seed);
}

PyxStatus noiseGenFillU16(u16* array, s32 length, NoiseGeneratorU16* record) { return fill(array, length, record); }
PyxStatus noiseGenFreeU16(NoiseGeneratorU16* record) { return giveBack(record); }

PyxStatus noiseGenInitF32(NoiseGeneratorF32** record, f32 low, f32 high, u32 seed)
{
    return init(record, low, high, seed);
}

PyxStatus noiseGenFillF32(f32* array, s32 length, NoiseGeneratorF32* record) { return fill(array, length, record); }
PyxStatus noiseGenFreeF32(NoiseGeneratorF32* record) { return giveBack(record); }

} // namespace pyxcc::tone
