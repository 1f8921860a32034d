// RGB to packed YCbCr with chroma filtered along the row: the chroma of a pair reaches over to the pixel in front of
// it, by the taps 1, 2, 1 over 4.
#pragma once

#include "layouts/pixel_before.hpp"
#include "layouts/shared_chroma.hpp"
#include "matrix/forward_forms.hpp"
#include "subsampled/shared_chroma.hpp"
#include "tone/gamma_tables.hpp"

namespace pyxcc::subsampled
{

using namespace matrix;

/// (8422 R + 16515 G + 3212 B + 0x84000) >> 15, at twice the scale.
inline constexpr LumaExact<Weights{2 * 8422, 2 * 16515, 2 * 3212}, 2 * 0x84000> lumaExact15;

/// Samples of a channel around a pair's even pixel: their sum under the taps, and the even one by itself.
template <class Word> struct Taps {
    Word sum, even;
};

/// In 32768ths of a step of the odd pixels' weights; 128.5 steps less the last part are added. The weights of an even
/// pixel are twice those of an odd one, and one more where that is told by itself.
struct ChromaOfTaps {
    template <class Word>
    PYXCC_INLINE auto operator()(const Taps<Word>& R, const Taps<Word>& G, const Taps<Word>& B) const
    {
        return Two{sat8(exactSum<15, 0x403FFF, -1213, 3596, -2385, 1>(R.sum, B.sum, G.sum, B.even + G.even)),
                   sat8(exactSum<15, 0x403FFF, 3596, -582, -3015, 1>(R.sum, B.sum, G.sum, R.even))};
    }
};

/// What a sample is taken for.
struct AsStored {
    static PYXCC_INLINE u8 of(u8 sample) { return sample; }
    static PYXCC_INLINE wide::U8 of(wide::U8 samples) { return samples; }
};

struct GammaCorrected {
    static PYXCC_INLINE u8 of(u8 sample) { return tone::gammaForwardTable[sample]; }
    static PYXCC_INLINE wide::U8 of(wide::U8 samples) { return wide::lookUp<tone::gammaForward>(samples); }
};

/// Every whole pair of a row.
template <class Samples> struct FilteredPairs {
};

template <class Samples>
PYXCC_INLINE auto apply(FilteredPairs<Samples>, const layouts::AfterPixel<Three<wide::U8>>& row)
{
    const Three<wide::U8> pixels{Samples::of(row.pixels.a), Samples::of(row.pixels.b), Samples::of(row.pixels.c)};
    const auto taps = [&](wide::U8 x, int channel) PYXCC_INLINE_LAMBDA {
        return Taps<wide::S16>{layouts::tapSums(x, Samples::of(row.before[channel])), layouts::lowBytes(x)};
    };
    return layouts::ChromaOfSums<2, wide::U8>{
        apply(lumaExact15, pixels),
        layouts::narrowPairs(ChromaOfTaps{}(taps(pixels.a, 0), taps(pixels.b, 1), taps(pixels.c, 2)))};
}

/// A last odd pixel, which nothing reaches over to.
template <class Samples, class Form> struct LonePixel {
    Form form;
};

template <class Samples, class Form> constexpr auto lonePixel(Form form) { return LonePixel<Samples, Form>{form}; }

template <class Samples, class Form>
PYXCC_INLINE auto apply(const LonePixel<Samples, Form>& form, const layouts::AfterPixel<Three<wide::U8>>& row)
{
    const Three<wide::U8>& pixels = row.pixels;
    return apply(form.form, Three{Samples::of(pixels.a), Samples::of(pixels.b), Samples::of(pixels.c)});
}

} // namespace pyxcc::subsampled
