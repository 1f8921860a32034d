// Sources with shared chroma against the plain statement of each layout: where luma and chroma of pixel x of a row lie.
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "support/memory.hpp"
#include "support/random.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <vector>

namespace
{

namespace layouts = pyxcc::layouts;
using pyxcc::Three;
using pyxcc::Two;
using pyxcc::wide::U8;
using support::Memory;
using support::Placement;

/// Luma and chroma as they are.
struct Unchanged : pyxcc::frame::OnWords {
    template <class Word> PYXCC_INLINE auto operator()(const Word& Y, const Word& Cb, const Word& Cr) const
    {
        return Three{sat8(Y), sat8(Cb), sat8(Cr)};
    }
};

/// A plane of some bytes in a row.
struct Shape {
    int rowBytes;
    int rows = 1;
};

/// Which byte of which plane a sample is.
struct At {
    int plane, byte;
};

struct Pixel {
    At y, cb, cr;
};

using Pointers = std::array<const u8*, 3>;
using Steps = std::array<int, 3>;

/// Two rows of luma, planes of chroma. A pair that its width cuts has a sample of its own.
struct InHalfPlanes {
    static std::vector<Shape> planes(int width) { return {{width, 2}, {(width + 1) / 2, 1}, {(width + 1) / 2, 1}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::p3<2>(at.data(), steps.data()); }
    static Pixel pixel(int x, int) { return {{0, x}, {1, x / 2}, {2, x / 2}}; }
};

struct InExchangedHalfPlanes : InHalfPlanes {
    static auto image(const Pointers& at, const Steps& steps)
    {
        return chromaExchanged(layouts::p3<2>(at.data(), steps.data()));
    }
    static Pixel pixel(int x, int) { return {{0, x}, {2, x / 2}, {1, x / 2}}; }
};

/// Three columns or less that are left over take the last whole sample.
struct InQuarterPlanes {
    static std::vector<Shape> planes(int width) { return {{width}, {width / 4}, {width / 4}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::p3<4>(at.data(), steps.data()); }
    static Pixel pixel(int x, int width)
    {
        const int sample = std::min(x / 4, width / 4 - 1);
        return {{0, x}, {1, sample}, {2, sample}};
    }
};

struct InPairs {
    static std::vector<Shape> planes(int width) { return {{width, 2}, {(width + 1) / 2 * 2}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::p2(at[0], steps[0], at[1], steps[1]); }
    static Pixel pixel(int x, int) { return {{0, x}, {1, x / 2 * 2}, {1, x / 2 * 2 + 1}}; }
};

struct InExchangedPairs : InPairs {
    static auto image(const Pointers& at, const Steps& steps) { return chromaExchanged(InPairs::image(at, steps)); }
    static Pixel pixel(int x, int) { return {{0, x}, {1, x / 2 * 2 + 1}, {1, x / 2 * 2}}; }
};

/// Y0 Cb Y1 Cr: a last odd pixel takes the Cr of the pair before.
struct InLumaFirst {
    static std::vector<Shape> planes(int width) { return {{2 * width}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::c2LumaFirst(at[0], steps[0]); }
    static Pixel pixel(int x, int width)
    {
        const int pair = x / 2 * 4;
        return {{0, 2 * x}, {0, pair + 1}, {0, pair + 3 < 2 * width ? pair + 3 : pair - 1}};
    }
};

struct InLumaFirstAlone : InLumaFirst {
    static auto image(const Pointers& at, const Steps& steps) { return layouts::c2LumaFirstAlone(at[0], steps[0]); }
};

/// The same in rows that go on to the end of a last pair.
struct InWholePairs {
    static std::vector<Shape> planes(int width) { return {{(width + 1) / 2 * 4}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::c2WholePairs(at[0], steps[0]); }
    static Pixel pixel(int x, int) { return {{0, 2 * x}, {0, x / 2 * 4 + 1}, {0, x / 2 * 4 + 3}}; }
};

struct InExchangedLumaFirst : InLumaFirst {
    static auto image(const Pointers& at, const Steps& steps) { return chromaExchanged(InLumaFirst::image(at, steps)); }
    static Pixel pixel(int x, int width)
    {
        const Pixel p = InLumaFirst::pixel(x, width);
        return {p.y, p.cr, p.cb};
    }
};

/// Cb Y0 Cr Y1, likewise.
struct InChromaFirst {
    static std::vector<Shape> planes(int width) { return {{2 * width}}; }
    static auto image(const Pointers& at, const Steps& steps) { return layouts::c2ChromaFirst(at[0], steps[0]); }
    static Pixel pixel(int x, int width)
    {
        const int pair = x / 2 * 4;
        return {{0, 2 * x + 1}, {0, pair}, {0, pair + 2 < 2 * width ? pair + 2 : pair - 2}};
    }
};

template <class Layout> class SharedChroma : public testing::Test
{
protected:
    /// The planes, which begin or end at pages that cannot be touched.
    void allocate(int width, Placement placement)
    {
        planes_.clear();
        shapes_ = Layout::planes(width);
        for (std::size_t i = 0; i < shapes_.size(); ++i) {
            planes_.emplace_back(placement, static_cast<std::size_t>(shapes_[i].rowBytes * shapes_[i].rows));
            random_.fill(planes_[i].all());
            pointers_[i] = planes_[i].bytes().data();
            steps_[i] = shapes_[i].rowBytes;
        }
    }

    u8 sample(At at, int row) const
    {
        return planes_[at.plane].bytes()[(row < shapes_[at.plane].rows ? row : 0) * steps_[at.plane] + at.byte];
    }

    void expectPixels(const Three<U8>& pixels, int row, int from, int to, int width) const
    {
        std::array<std::array<u8, U8::count>, 3> channels;
        layouts::storeSamples(channels[0].data(), pixels.a);
        layouts::storeSamples(channels[1].data(), pixels.b);
        layouts::storeSamples(channels[2].data(), pixels.c);
        for (int x = from; x < to; ++x) {
            const Pixel told = Layout::pixel(x, width);
            ASSERT_EQ(int{channels[0][x - from]}, int{sample(told.y, row)}) << "Y " << x << " of " << width;
            ASSERT_EQ(int{channels[1][x - from]}, int{sample(told.cb, row)}) << "Cb " << x << " of " << width;
            ASSERT_EQ(int{channels[2][x - from]}, int{sample(told.cr, row)}) << "Cr " << x << " of " << width;
        }
    }

    /// From every column that a span can begin at, a whole block or what is left of the row.
    void expectBlocks(int width) const
    {
        const auto image = Layout::image(pointers_, steps_);
        for (int x = 0; x < width; x += 4) {
            const int count = std::min(width - x, U8::count);
            const auto load = [&](const auto& row) {
                return apply(Unchanged{}, count == U8::count ? row.load(x) : row.load(x, count));
            };
            ASSERT_NO_FATAL_FAILURE(expectPixels(load(image.row(0)), 0, x, x + count, width));
            ASSERT_NO_FATAL_FAILURE(expectPixels(load(image.halfPair(0)), 0, x, x + count, width));
            if constexpr (requires { image.rowPair(0).luma; }) {
                if (Layout::planes(width)[0].rows < 2) continue;
                const Two<Three<U8>> rows = load(image.rowPair(0));
                ASSERT_NO_FATAL_FAILURE(expectPixels(rows.a, 0, x, x + count, width));
                ASSERT_NO_FATAL_FAILURE(expectPixels(rows.b, 1, x, x + count, width));
            }
        }
    }

    Pointers pointers_ = {};
    Steps steps_ = {};

private:
    support::Random random_{1};
    std::vector<Shape> shapes_;
    std::vector<Memory> planes_;
};

struct Names {
    template <class Layout> static std::string GetName(int i)
    {
        return std::array{"P3Halves",      "P3HalvesExchanged", "P3Quarters",       "P2",
                          "P2Exchanged",   "C2LumaFirst",       "C2LumaFirstAlone", "C2LumaFirstExchanged",
                          "C2ChromaFirst", "C2WholePairs"}[i];
    }
};

using Layouts = testing::Types<InHalfPlanes, InExchangedHalfPlanes, InQuarterPlanes, InPairs, InExchangedPairs,
                               InLumaFirst, InLumaFirstAlone, InExchangedLumaFirst, InChromaFirst, InWholePairs>;
TYPED_TEST_SUITE(SharedChroma, Layouts, Names);

/// Widths from 4, the least that all of the layouts have.
TYPED_TEST(SharedChroma, LoadsLumaAndItsChroma)
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (int width = 4; width <= 100; ++width) {
            this->allocate(width, placement);
            ASSERT_NO_FATAL_FAILURE(this->expectBlocks(width));
        }
    }
}

/// The only pixel of a packed row, as Y, Cb, Cr.
std::array<int, 3> loadOnePixel(const auto& image)
{
    const auto pixels = apply(Unchanged{}, image.row(0).load(0, 1));
    std::array<int, 3> pixel;
    std::array<u8, U8::count> channel;
    int i = 0;
    for (const U8& x : {pixels.a, pixels.b, pixels.c}) {
        layouts::storeSamples(channel.data(), x);
        pixel[i++] = channel[0];
    }
    return pixel;
}

constexpr std::array<u8, 3> onePixel = {7, 100, 50}; // behind a byte before the row

TEST(SharedChromaOfOnePixel, LumaFirstTakesTheByteBefore)
{
    EXPECT_EQ(loadOnePixel(layouts::c2LumaFirst(&onePixel[1], 0)), (std::array{100, 50, 7}));
}

TEST(SharedChromaOfOnePixel, LumaFirstAloneTakesThatOfGray)
{
    EXPECT_EQ(loadOnePixel(layouts::c2LumaFirstAlone(&onePixel[1], 0)), (std::array{100, 50, 128}));
}

TEST(SharedChromaOfOnePixel, ChromaFirstTakesItsOwn)
{
    EXPECT_EQ(loadOnePixel(layouts::c2ChromaFirst(&onePixel[1], 0)), (std::array{50, 100, 100}));
}

TEST(PackedPixelsAsWords, GoToFourChannelsInTheOrderOfMemory)
{
    std::vector<u8> packed(8192), quadruples(8192); // with room for what rows hint at
    for (int x = 0; x < 32; ++x) {
        packed[2 * x] = static_cast<u8>(x + 1);
        packed[2 * x + 1] = static_cast<u8>((x % 2 == 0 ? 101 : 151) + x / 2);
    }
    const auto pixels =
        apply(Unchanged{}, layouts::c2LumaFirst<layouts::Order::ofWords>(packed.data(), 0).row(0).load(0));
    layouts::c4<layouts::Order::ofWords>(quadruples.data(), 0, u8{9}).row(0).store(0, pixels);
    for (int x = 0; x < 32; ++x) {
        EXPECT_EQ(int{quadruples[4 * x]}, x + 1) << x;
        EXPECT_EQ(int{quadruples[4 * x + 1]}, 101 + x / 2) << x;
        EXPECT_EQ(int{quadruples[4 * x + 2]}, 151 + x / 2) << x;
        EXPECT_EQ(int{quadruples[4 * x + 3]}, 9) << x;
    }
}

} // namespace
