// Rows that go past the cache hold what rows through the cache hold, wherever they start.
#include "frame/streamed_rows.hpp"
#include "frame/float_forms.hpp"

#include "support/memory.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace
{

using namespace pyxcc;
using namespace pyxcc::frame;
using support::Memory;
using support::Placement;

struct Negated : OnFloats {
    template <class F32> Three<F32> operator()(F32 a, F32 b, F32 c) const { return {0.f - a, 0.f - b, 0.f - c}; }
    template <class F32> Four<F32> operator()(F32 a, F32 b, F32 c, F32 d) const
    {
        return {0.f - a, 0.f - b, 0.f - c, 0.f - d};
    }
};

/// `image` makes an image of a pointer and a step; pixels are `samples` floats, and rows start at multiples of `grain`
/// floats.
template <class Image> void expectTheSame(int samples, int grain, const Image& image)
{
    constexpr int height = 3;
    for (int offset = 0; offset < 8; offset += grain) {
        for (int gap = 0; gap < 12; gap += grain) {
            for (int width = 1; width <= 40; ++width) {
                const RoiSize roi{width, height};
                const int rowFloats = width * samples + gap;
                std::vector<f32> source(rowFloats * height);
                for (std::size_t i = 0; i < source.size(); ++i) source[i] = static_cast<f32>(i);
                const Memory cached(Placement::margins, 4 * source.size(), 4 * offset);
                const Memory past(Placement::margins, 4 * source.size(), 4 * offset);
                for (const Memory* memory : {&cached, &past}) std::ranges::fill(memory->all(), u8{0x5a});
                const auto from = image(static_cast<const f32*>(source.data()), 4 * rowFloats);
                const auto to = [&](const Memory& memory) {
                    return image(reinterpret_cast<f32*>(memory.bytes().data()), 4 * rowFloats);
                };
                eachRow(roi, from, to(cached), everyPixel(Negated{}));
                eachRowStreamed(roi, from, layouts::streamed(to(past)), Negated{});
                ASSERT_TRUE(std::ranges::equal(cached.all(), past.all()))
                    << width << " pixels, " << offset << " floats behind, " << gap << " floats between";
            }
        }
    }
}

TEST(StreamedRows, OfThreeFloatsAPixel)
{
    expectTheSame(3, 1, [](auto* first, int step) { return layouts::c3(first, step); });
}

TEST(StreamedRows, OfFourFloatsAPixel)
{
    expectTheSame(4, 4, [](auto* first, int step) { return layouts::c4(first, step); });
}

TEST(StreamedRows, OfFourFloatsAPixelInAnyOrder)
{
    expectTheSame(4, 4, [](auto* first, int step) { return layouts::c4<layouts::Order::any>(first, step); });
}

} // namespace
