// Packed 16-bit pixels against the plain statement of their fields: the first in the lowest bits, each the leading bits
// of a byte.
#include "layouts/packed_pixels.hpp"
#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <string>

namespace
{

namespace layouts = pyxcc::layouts;
using pyxcc::Three;
using pyxcc::wide::U8;
using support::Memory;
using support::Placement;

using Channels = std::array<std::array<u8, U8::count>, 3>;

template <layouts::FieldWidths Widths> struct Model {
    static constexpr layouts::FieldWidths widths = Widths;

    /// The leading bits of the bytes, side by side.
    static u16 pixel(u8 first, u8 second, u8 third)
    {
        return static_cast<u16>(first >> (8 - Widths.first) | second >> (8 - Widths.second) << Widths.first |
                                third >> (8 - Widths.third) << (Widths.first + Widths.second));
    }

    /// A field of a pixel, widened by zeros.
    static u8 channel(u16 pixel, int field)
    {
        const int width[] = {Widths.first, Widths.second, Widths.third};
        const int place[] = {0, Widths.first, Widths.first + Widths.second};
        return static_cast<u8>((pixel >> place[field] & ((1 << width[field]) - 1)) << (8 - width[field]));
    }
};

template <class Model> class PackedPixels : public testing::Test
{
protected:
    static auto image(const u16* first) { return layouts::packedPixels<Model::widths>(first, 0); }
    static auto image(u16* first) { return layouts::packedPixels<Model::widths>(first, 0); }

    static Channels channelsOf(const Three<U8>& pixels)
    {
        Channels channels;
        layouts::storeSamples(channels[0].data(), pixels.a);
        layouts::storeSamples(channels[1].data(), pixels.b);
        layouts::storeSamples(channels[2].data(), pixels.c);
        return channels;
    }

    static Three<U8> registersOf(const Channels& channels)
    {
        return {layouts::loadSamples(channels[0].data()), layouts::loadSamples(channels[1].data()),
                layouts::loadSamples(channels[2].data())};
    }
};

using Models = testing::Types<Model<layouts::fields444>, Model<layouts::fields555>, Model<layouts::fields565>>;
struct Names {
    template <class Model> static std::string GetName(int i) { return std::array{"444", "555", "565"}[i]; }
};
TYPED_TEST_SUITE(PackedPixels, Models, Names);

TYPED_TEST(PackedPixels, LoadsTheFieldsOfEveryPixel)
{
    const Memory row(Placement::endAtGuard, U8::count * sizeof(u16));
    u16* const pixels = reinterpret_cast<u16*>(row.bytes().data());
    for (int first = 0; first < 65536; first += U8::count) {
        for (int i = 0; i < U8::count; ++i) pixels[i] = static_cast<u16>(first + i);
        const Channels channels = this->channelsOf(this->image(static_cast<const u16*>(pixels)).row(0).load(0));
        for (int i = 0; i < U8::count; ++i) {
            for (int field = 0; field < 3; ++field) {
                ASSERT_EQ(int{channels[field][i]}, int{TypeParam::channel(pixels[i], field)})
                    << "field " << field << " of " << pixels[i];
            }
        }
    }
}

TYPED_TEST(PackedPixels, StoresTheLeadingBitsOfEveryByte)
{
    support::Random random{1};
    const Memory row(Placement::endAtGuard, U8::count * sizeof(u16));
    u16* const pixels = reinterpret_cast<u16*>(row.bytes().data());
    for (int c = 0; c < 256; ++c) {
        Channels channels;
        for (auto& channel : channels) random.fill(channel);
        channels[c % 3].fill(static_cast<u8>(c));
        channels[(c + 1) % 3].fill(static_cast<u8>(255 - c));
        this->image(pixels).row(0).store(0, this->registersOf(channels));
        for (int i = 0; i < U8::count; ++i) {
            ASSERT_EQ(int{pixels[i]}, int{TypeParam::pixel(channels[0][i], channels[1][i], channels[2][i])})
                << int{channels[0][i]} << ", " << int{channels[1][i]} << ", " << int{channels[2][i]};
        }
    }
}

TYPED_TEST(PackedPixels, KeepsWithinThePartOfABlock)
{
    support::Random random{2};
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int count = 1; count < U8::count; ++count) {
            const Memory row(placement, 2 * sizeof(u16) * count);
            random.fill(row.all());
            const auto pixelAt = [&](int x) {
                u16 pixel;
                std::memcpy(&pixel, row.bytes().data() + 2 * x, sizeof pixel);
                return pixel;
            };
            // The second half of the row goes through and into the first one, changed to its own fields.
            auto* pixels = reinterpret_cast<u16*>(row.bytes().data());
            const Three<U8> loaded = this->image(static_cast<const u16*>(pixels)).row(0).load(count, count);
            const u16 behind = pixelAt(count);
            this->image(pixels).row(0).store(0, count, loaded);
            for (int x = 0; x < count; ++x) {
                const u16 from = pixelAt(count + x);
                ASSERT_EQ(int{pixelAt(x)},
                          int{TypeParam::pixel(TypeParam::channel(from, 0), TypeParam::channel(from, 1),
                                               TypeParam::channel(from, 2))})
                    << x << " of " << count;
            }
            ASSERT_EQ(pixelAt(count), behind) << count;
        }
    }
}

TEST(PackedPixelSteps, LoseTheirLastBitWhereRowsLieWholePixelsApart)
{
    u16 pixels[64] = {};
    u16* const middle = pixels + 32;
    const auto distance = [&](const auto& image) { return image.row(1).at - image.row(0).at; };
    EXPECT_EQ(distance(layouts::packedPixelsApart<layouts::fields565>(middle, 41)), 40);
    EXPECT_EQ(distance(layouts::packedPixelsApart<layouts::fields565>(middle, -41)), -42);
    EXPECT_EQ(distance(layouts::packedPixelsApart<layouts::fields565>(middle, 40)), 40);
    EXPECT_EQ(distance(layouts::packedPixels<layouts::fields565>(middle, 41)), 41);
}

} // namespace
