// XYZ and YCC: the vector instance of each form against its scalar one, and against the sums as they are told.
#include "every_input.hpp"
#include "rounding_modes.hpp"

#include "layouts/pixel_images.hpp"
#include "matrix/xyz_ycc_forms.hpp"

#include <algorithm>
#include <bit>
#include <cmath>
#include <random>

namespace
{

using namespace pyxcc;
using namespace pyxcc::matrix;

using Bytes = std::array<u8, 3>;

u8 byteOf(int x) { return static_cast<u8>(std::clamp(x, 0, 255)); }

template <class Form> Bytes oneByOne(const Form& form, const Bytes& in)
{
    const auto r = asPixelWords(form(scalar::Pixel{{in[0], in[1], in[2]}}));
    return {byteOf((r.upperFirst >> 16).v), byteOf(r.others.lower.v), byteOf(r.others.upper.v)};
}

template <class Form, class Layout, int PixelBytes>
std::array<Bytes, 8> throughRegister(const Form& form, const std::array<Bytes, 8>& in)
{
    std::array<u8, 8 * PixelBytes> pixels = {};
    for (int i = 0; i < 8; ++i) std::copy(in[i].begin(), in[i].end(), pixels.begin() + i * PixelBytes);
    Layout::store(pixels.data(), frame::apply(form, Layout::load(pixels.data())));
    std::array<Bytes, 8> out;
    for (int i = 0; i < 8; ++i) std::copy_n(pixels.begin() + i * PixelBytes, 3, out[i].begin());
    return out;
}

/// The sums as they are told, in 32 bits.
struct RgbToXyzTold : RgbToXyzBytes {
    static Bytes told(int R, int G, int B)
    {
        return {byteOf((27030 * R + 23434 * G + 11824 * B) >> 16), byteOf((13937 * R + 46868 * G + 4729 * B) >> 16),
                byteOf((1267 * R + 7811 * G + 62274 * B) >> 16)};
    }
};
struct XyzToRgbTold : XyzToRgbBytes {
    static Bytes told(int X, int Y, int Z)
    {
        return {byteOf((212368 * X - 100738 * Y - 32671 * Z) >> 16), byteOf((-63521 * X + 122944 * Y + 2723 * Z) >> 16),
                byteOf((3646 * X - 13372 * Y + 69291 * Z) >> 16)};
    }
};
struct RgbToYccTold : RgbToYccBytes {
    static Bytes told(int R, int G, int B)
    {
        const int s = 4898 * R + 9617 * G + 1867 * B;
        return {static_cast<u8>((s >> 10) * 2921 >> 16), static_cast<u8>((((B * 16384 - s) >> 10) * 1789 >> 16) - 100),
                static_cast<u8>((((R * 16384 - s) >> 10) * 2178 >> 16) - 119)};
    }
};
struct YccToRgbTold : YccToRgbBytes {
    static Bytes told(int Y, int C1, int C2)
    {
        const int y = 5564 * Y, a = 9084 * C1 - 1417104, b = 7460 * C2 - 1022020;
        return {byteOf((y + b) >> 12), byteOf((16 * y - 794 * (a >> 8) - 2084 * (b >> 8)) >> 16),
                byteOf((y + a) >> 12)};
    }
};

template <class Form> class XyzYccBytes : public testing::Test
{
};
struct Names {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"rgbToXyz", "xyzToRgb", "rgbToYcc", "yccToRgb"}[i];
    }
};
using Forms = testing::Types<RgbToXyzTold, XyzToRgbTold, RgbToYccTold, YccToRgbTold>;
TYPED_TEST_SUITE(XyzYccBytes, Forms, Names);

TYPED_TEST(XyzYccBytes, EveryInput)
{
    const TypeParam form;
    std::array<Bytes, 8> in;
    for (int first = 0; first < 256; ++first) {
        for (int second = 0; second < 256; ++second) {
            for (int third = 0; third < 256; third += 8) {
                for (int i = 0; i < 8; ++i) {
                    in[i] = {static_cast<u8>(first), static_cast<u8>(second), static_cast<u8>(third + i)};
                }
                const auto ofThree = throughRegister<TypeParam, layouts::C3Pixels, 3>(form, in);
                const auto ofFour = throughRegister<TypeParam, layouts::AC4Pixels, 4>(form, in);
                for (int i = 0; i < 8; ++i) {
                    const Bytes told = TypeParam::told(first, second, third + i);
                    ASSERT_EQ(oneByOne(form, in[i]), told) << first << ", " << second << ", " << third + i;
                    ASSERT_EQ(ofThree[i], told) << first << ", " << second << ", " << third + i;
                    ASSERT_EQ(ofFour[i], told) << first << ", " << second << ", " << third + i;
                }
            }
        }
    }
}

std::mt19937 numbers(13);

template <class T, std::size_t N> using Channels = std::array<std::array<T, N>, 3>;

/// Not inline, so that all of it happens under the mode in force.
template <class Sample, std::size_t N, class Form>
[[gnu::noinline]] void samplesThroughRegister(const Form& form, const Channels<Sample, N>& in, Channels<Sample, N>& out)
{
    const auto load = [&](int c) {
        return layouts::loadSamples<wide::RegisterOf<Sample>>(reinterpret_cast<const u8*>(in[c].data()));
    };
    const auto store = [&](int c, const auto& x) { layouts::storeSamples(reinterpret_cast<u8*>(out[c].data()), x); };
    const auto r = frame::apply(form, Three{load(0), load(1), load(2)});
    store(0, r.a), store(1, r.b), store(2, r.c);
}

template <std::size_t N, class Form>
[[gnu::noinline]] void floatsOneByOne(const Form& form, const Channels<f32, N>& in, Channels<f32, N>& out)
{
    using scalar::F32;
    for (std::size_t i = 0; i < N; ++i) {
        const auto r = form(F32(in[0][i]), F32(in[1][i]), F32(in[2][i]));
        out[0][i] = r.a.v, out[1][i] = r.b.v, out[2][i] = r.c.v;
    }
}

template <class Sample, class Form>
[[gnu::noinline]] void wordsOneByOne(const Form& form, const Channels<Sample, 16>& in, Channels<Sample, 16>& out)
{
    constexpr int offset = std::is_signed_v<Sample> ? 32768 : 0;
    for (int i = 0; i < 16; ++i) {
        const auto float32 = [&](int c) { return scalar::F32(static_cast<f32>(in[c][i] + offset)); };
        const auto r = form(float32(0), float32(1), float32(2));
        const scalar::S32 results[] = {r.a, r.b, r.c};
        for (int c = 0; c < 3; ++c) out[c][i] = static_cast<Sample>(scalar::saturate<u16>(results[c]) - offset);
    }
}

template <class Form> class XyzYccFloats : public testing::Test
{
};
using FloatForms = testing::Types<ThirdHeld<RgbToXyz>, Held<XyzToRgb>, RgbToYcc<yccZeros>, Held<YccToRgb<yccZeros>>>;
TYPED_TEST_SUITE(XyzYccFloats, FloatForms, Names);

TYPED_TEST(XyzYccFloats, InstancesAgreeInEveryMode)
{
    for (int i = 0; i < 50000; ++i) {
        Channels<f32, 8> in, wide = {}, scalar = {};
        for (auto& channel : in) { // from -1 to 2, and the ends
            for (f32& x : channel) x = static_cast<f32>(numbers()) * (3 * 0x1p-32f) - 1;
            channel[0] = static_cast<f32>(numbers() % 2);
        }
        for (const int mode : forms::roundingModes) {
            forms::roundingBy(mode, [&] {
                samplesThroughRegister(TypeParam{}, in, wide);
                floatsOneByOne(TypeParam{}, in, scalar);
            });
            for (int c = 0; c < 3; ++c) {
                for (int k = 0; k < 8; ++k) {
                    ASSERT_EQ(std::bit_cast<u32>(wide[c][k]), std::bit_cast<u32>(scalar[c][k]))
                        << "channel " << c << ", mode " << mode;
                }
            }
        }
    }
}

template <class Form> class XyzYccWords : public testing::Test
{
};
using WordForms = testing::Types<ToWords<RgbToXyz>, ToWords<XyzToRgb>, ToWords<RgbToYcc<yccZerosOfWords>>,
                                 ToWords<YccToRgb<yccZerosOfWords>>>;
TYPED_TEST_SUITE(XyzYccWords, WordForms, Names);

template <class Sample> void fillWords(Channels<Sample, 16>& in)
{
    using Limits = std::numeric_limits<Sample>;
    for (auto& channel : in) {
        for (Sample& x : channel) x = static_cast<Sample>(numbers());
        channel[0] = numbers() % 2 == 0 ? Limits::min() : Limits::max();
    }
}

template <class Sample, class Form, class Plain> void expectWordsAgree(const Form& form, const Plain& plain)
{
    for (int i = 0; i < 20000; ++i) {
        Channels<Sample, 16> in, wide = {}, scalar = {};
        fillWords(in);
        for (const int mode : forms::roundingModes) {
            forms::roundingBy(mode, [&] {
                samplesThroughRegister(form, in, wide);
                wordsOneByOne(plain, in, scalar);
            });
            ASSERT_EQ(wide, scalar) << "mode " << mode;
        }
    }
}

TYPED_TEST(XyzYccWords, InstancesAgreeInEveryMode) { expectWordsAgree<u16>(TypeParam{}, TypeParam{}); }
TYPED_TEST(XyzYccWords, SignedInstancesAgreeInEveryMode)
{
    expectWordsAgree<s16>(frame::OnRaisedWords<TypeParam>{}, TypeParam{});
}

} // namespace
