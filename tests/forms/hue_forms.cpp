// The forms of HLS and HSV: vector instances against scalar ones, for bytes on every input.
#include "every_input.hpp"
#include "rounding_modes.hpp"

#include "perceptual/hls_float_forms.hpp"
#include "perceptual/hls_to_rgb_blocks.hpp"
#include "perceptual/hsv_blocks.hpp"
#include "perceptual/rgb_to_hls_blocks.hpp"

#include <bit>
#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::perceptual;

template <class Form> class HueFormOfBytes : public testing::Test
{
};

using FormsOfBytes = testing::Types<RgbToHls<u8>, RgbToHlsTail<u8, Truncated>, RgbToHlsTail<u8, Nearest>, BgrToHls,
                                    BgrToHlsTail, HlsToRgb<u8>, HlsToRgbTailOfBytes, HlsToBgr, HlsToBgrTail, RgbToHsv,
                                    RgbToHsvTail, HsvToRgb<u8>, HsvToRgbTail<u8>>;

struct NamesOfBytes {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"rgbToHls",     "rgbToHlsTailCut", "rgbToHlsTailNearest", "bgrToHls",
                          "bgrToHlsTail", "hlsToRgb",        "hlsToRgbTail",        "hlsToBgr",
                          "hlsToBgrTail", "rgbToHsv",        "rgbToHsvTail",        "hsvToRgb",
                          "hsvToRgbTail"}[i];
    }
};

TYPED_TEST_SUITE(HueFormOfBytes, FormsOfBytes, NamesOfBytes);

TYPED_TEST(HueFormOfBytes, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

template <class T> using Channels = std::array<std::array<T, 32 / sizeof(T)>, 3>;

/// Not inline, so that all of it happens under the mode in force.
template <class T, class Form>
[[gnu::noinline]] void throughRegister(const Form& form, const Channels<T>& in, Channels<T>& out)
{
    const auto load = [&](int c) {
        return layouts::loadSamples<wide::RegisterOf<T>>(reinterpret_cast<const u8*>(in[c].data()));
    };
    const auto x = apply(form, Three{load(0), load(1), load(2)});
    layouts::storeSamples(reinterpret_cast<u8*>(out[0].data()), x.a);
    layouts::storeSamples(reinterpret_cast<u8*>(out[1].data()), x.b);
    layouts::storeSamples(reinterpret_cast<u8*>(out[2].data()), x.c);
}

template <std::derived_from<frame::OnChannels> Form> std::array<u16, 3> ofOne(const Form& form, u16 a, u16 b, u16 c)
{
    using scalar::U16;
    const Three<U16> x = form(U16(a), U16(b), U16(c));
    return {x.a.v, x.b.v, x.c.v};
}
template <std::derived_from<frame::OnFloats> Form> std::array<u16, 3> ofOne(const Form& form, u16 a, u16 b, u16 c)
{
    using scalar::F32;
    const auto x = form(F32(a), F32(b), F32(c));
    return {scalar::saturate<u16>(x.a), scalar::saturate<u16>(x.b), scalar::saturate<u16>(x.c)};
}
template <std::derived_from<frame::OnFloats> Form> std::array<f32, 3> ofOne(const Form& form, f32 a, f32 b, f32 c)
{
    using scalar::F32;
    const auto x = form(F32(a), F32(b), F32(c));
    return {x.a.v, x.b.v, x.c.v};
}

template <class T, class Form>
[[gnu::noinline]] void oneByOne(const Form& form, const Channels<T>& in, Channels<T>& out)
{
    for (std::size_t i = 0; i < in[0].size(); ++i) {
        const std::array<T, 3> x = ofOne(form, in[0][i], in[1][i], in[2][i]);
        for (int c = 0; c < 3; ++c) out[c][i] = x[c];
    }
}

/// A form is made under the mode that it runs in, since some take the mode in. Floats are compared bit by bit.
template <class Form, class T, class Fill> void expectInstancesAgree(int rounds, const Fill& fill)
{
    for (int i = 0; i < rounds; ++i) {
        Channels<T> in, wide = {}, one = {};
        fill(i, in);
        for (const int mode : forms::roundingModes) {
            forms::roundingBy(mode, [&] {
                const Form form;
                throughRegister(form, in, wide);
                oneByOne(form, in, one);
            });
            for (int c = 0; c < 3; ++c) {
                for (std::size_t k = 0; k < in[0].size(); ++k) {
                    using Bits = std::conditional_t<sizeof(T) == 4, u32, u16>;
                    ASSERT_EQ(std::bit_cast<Bits>(wide[c][k]), std::bit_cast<Bits>(one[c][k]))
                        << "channel " << c << " of (" << in[0][k] << ", " << in[1][k] << ", " << in[2][k] << "), mode "
                        << mode;
                }
            }
        }
    }
}

template <class Form> class HueFormOfWords : public testing::Test
{
};

using FormsOfWords = testing::Types<RgbToHls<u16>, RgbToHlsTail<u16, Truncated>, HlsToRgb<u16>, HlsToRgbTailOfWords,
                                    RgbToHsvOfWords, HsvToRgb<u16>, HsvToRgbTail<u16>>;

struct NamesOfWords {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"rgbToHls", "rgbToHlsTail", "hlsToRgb",    "hlsToRgbTail",
                          "rgbToHsv", "hsvToRgb",     "hsvToRgbTail"}[i];
    }
};

TYPED_TEST_SUITE(HueFormOfWords, FormsOfWords, NamesOfWords);

/// Every value of the first channel, many times over, beside any values of the others; in places two channels are
/// equal, or at an end of their range.
TYPED_TEST(HueFormOfWords, InstancesAgreeInEveryMode)
{
    std::mt19937 numbers(11);
    expectInstancesAgree<TypeParam, u16>(20 * 4096, [&](int i, Channels<u16>& in) {
        for (int k = 0; k < 16; ++k) {
            in[0][k] = static_cast<u16>(16 * i + k);
            for (int c = 1; c < 3; ++c) {
                const u16 choices[] = {static_cast<u16>(numbers()), static_cast<u16>(numbers()), in[0][k], 0, 65535};
                in[c][k] = choices[numbers() % std::size(choices)];
            }
        }
    });
}

template <class Form> class HueFormOfFloats : public testing::Test
{
};

using FormsOfFloats = testing::Types<RgbToHlsOfFloats, HlsToRgbOfFloats, HlsToRgbTailOfFloats>;

struct NamesOfFloats {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"rgbToHls", "hlsToRgb", "hlsToRgbTail"}[i];
    }
};

TYPED_TEST_SUITE(HueFormOfFloats, FormsOfFloats, NamesOfFloats);

/// Any fractions, those that sextants begin with, and what is outside of the range of fractions.
TYPED_TEST(HueFormOfFloats, InstancesAgreeInEveryMode)
{
    std::mt19937 numbers(12);
    expectInstancesAgree<TypeParam, f32>(40000, [&](int, Channels<f32>& in) {
        for (int k = 0; k < 8; ++k) {
            for (int c = 0; c < 3; ++c) {
                const f32 fraction = static_cast<f32>(numbers() >> 8) * 0x1p-24f;
                const f32 choices[] = {fraction, fraction,        fraction, static_cast<f32>(numbers() % 7) / 6,
                                       in[0][k], 4 * fraction - 2};
                in[c][k] = choices[numbers() % (c == 0 ? 4 : std::size(choices))];
            }
        }
    });
}

} // namespace
