// The table of 16-bit gamma, for all 65536 words.
//
// Words that follow each other lie close together on the curve: from the middle of a run of them, five terms of the
// power's series reach its ends with the 40 bits that exact words take.
#pragma once

#include "tone/gamma_forms.hpp"
#include "tone/gamma_images.hpp"

#include <array>
#include <bit>
#include <numeric>

namespace pyxcc::tone
{

inline constexpr int wordTableSize = 65536;

/// The first terms of (1 + u)^p - 1.
constexpr std::array<f64, 5> powerSeries(f64 p)
{
    std::array<f64, 5> terms{p};
    for (int k = 1; k < 5; ++k) terms[k] = terms[k - 1] * (p - k) / (k + 1);
    return terms;
}

/// The curve around a word, where it is a power of the word plus an offset, less a constant.
template <class Curve> struct GammaOfRun : frame::OnSamples {
    f64 middle;
    std::array<f64, 6> k;

    explicit GammaOfRun(int word) : middle(word), k{}
    {
        constexpr std::array<f64, 5> series = powerSeries(Curve::exponent);
        k[0] = gammaOfWord<Curve>(scalar::F64(middle)).v;
        f64 power = k[0] + 65535.0 * Curve::less;
        for (int i = 0; i < 5; ++i) {
            power /= middle + 65535.0 * Curve::offset;
            k[i + 1] = power * series[i];
        }
    }

    template <class F32> PYXCC_INLINE auto operator()(const F32& samples) const
    {
        const auto t = toF64(samples) - middle;
        return roundedToWord(fused(fused(fused(fused(fused(t, k[5], k[4]), t, k[3]), t, k[2]), t, k[1]), t, k[0]));
    }
};

/// Runs are a 32nd of the octave that they lie in.
template <class Curve> void fillTable(u16* table)
{
    std::iota(table, table + wordTableSize, u16{0});
    const auto take = [table]<class Form>(const Form& form, int from, int to) {
        EachSample<Form>{form}(InPlane{}, {to - from, 1}, table + from, 1, table + from, 1);
    };
    int from = Curve::firstRun;
    take(GammaOfWords<Curve>{}, 0, from);
    for (int octave = static_cast<int>(std::bit_floor(static_cast<u32>(from))); octave < wordTableSize; octave *= 2) {
        for (const int run = octave / 32; from < 2 * octave; from += run)
            take(GammaOfRun<Curve>(from + run / 2), from, from + run);
    }
}

} // namespace pyxcc::tone
