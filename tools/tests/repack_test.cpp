#include "repack.hpp"

#include "support.hpp"

#include <cstring>

using namespace tool;
using namespace tool::testing;
using catalog::Element;

namespace
{

Format format(std::string_view model, std::string_view layout, Element element = Element::u8)
{
    return {catalog::sideOf(model, layout, element), {}};
}

/// The samples of the first row of a plane.
template <class T> std::vector<double> row(const Image& image, int plane, int count)
{
    std::vector<T> samples(static_cast<std::size_t>(count));
    std::memcpy(samples.data(), image.plane(plane), samples.size() * sizeof(T));
    return {samples.begin(), samples.end()};
}

using Samples = std::vector<double>;

const Image twoPixels = imageOf(rgb(), {2, 1}, {10, 20, 30, 40, 50, 60});

TEST(Image, HasRoomForWholeChromaBlocks)
{
    const Image image(format("YCbCr420", "P3"), {5, 5});
    EXPECT_GE(image.step(0), 8);
    EXPECT_GE(image.plane(1) - image.plane(0), 8 * image.step(0));
    EXPECT_GE(image.plane(2) - image.plane(1), 4 * image.step(1));
    EXPECT_EQ(image.tightBytes(), 5u * 5 + 2 * 2 * 2);
}

TEST(Image, HasRowsEndToEndForExportsWithoutSteps)
{
    const Image image(format("YCbCr420", "P3"), {5, 5}, Image::Rows::tight);
    EXPECT_EQ(image.step(0), 5);
    EXPECT_EQ(image.step(1), 2);
}

TEST(Image, IsCroppedToItsUpperLeft)
{
    const Image picture = imageOf(gray(), {3, 2}, {1, 2, 3, 4, 5, 6});
    EXPECT_EQ(rawBytes(cropped(picture, {2, 2})), (Bytes{1, 2, 4, 5}));
}

TEST(Repack, ReversesTheOrderOfChannels)
{
    EXPECT_EQ(row<u8>(repack(twoPixels, format("BGR", "C3")), 0, 6), (Samples{30, 20, 10, 60, 50, 40}));
}

TEST(Repack, AddsAnOpaqueFourthSampleAndTakesItAway)
{
    const Image four = repack(twoPixels, rgb("C4"));
    EXPECT_EQ(row<u8>(four, 0, 8), (Samples{10, 20, 30, 255, 40, 50, 60, 255}));
    EXPECT_EQ(row<u8>(repack(four, rgb()), 0, 6), row<u8>(twoPixels, 0, 6));
}

TEST(Repack, KeepsAlpha)
{
    const Image four = imageOf(rgb("C4"), {1, 1}, {10, 20, 30, 77});
    EXPECT_EQ(row<u8>(repack(four, format("BGR", "P4")), 3, 1), (Samples{77}));
}

TEST(Repack, SplitsIntoPlanesAndBack)
{
    const Image planes = repack(twoPixels, rgb("P3"));
    EXPECT_EQ(row<u8>(planes, 0, 2), (Samples{10, 40}));
    EXPECT_EQ(row<u8>(planes, 1, 2), (Samples{20, 50}));
    EXPECT_EQ(row<u8>(planes, 2, 2), (Samples{30, 60}));
    EXPECT_EQ(row<u8>(repack(planes, rgb()), 0, 6), row<u8>(twoPixels, 0, 6));
}

TEST(Repack, ScalesBlackAndWhiteToEveryDepth)
{
    const Image ends = imageOf(rgb(), {1, 1}, {0, 255, 51});
    EXPECT_EQ(row<u16>(repack(ends, rgb("C3", Element::u16)), 0, 3), (Samples{0, 65535, 13107}));
    EXPECT_EQ(row<s16>(repack(ends, rgb("C3", Element::s16)), 0, 3), (Samples{-32768, 32767, -19661}));
    EXPECT_EQ(row<s8>(repack(ends, rgb("C3", Element::s8)), 0, 3), (Samples{-128, 127, -77}));
    EXPECT_EQ(row<f64>(repack(ends, rgb("C3", Element::f64)), 0, 3), (Samples{0, 1, 0.2}));
    EXPECT_EQ(row<s16>(repack(ends, format("SBGR", "C3", Element::s16)), 0, 3), (Samples{51, 255, 0}));
}

TEST(Repack, ReturnsFromEveryDepth)
{
    const Image picture = noise(rgb(), {5, 3});
    for (const Element element : {Element::u16, Element::s16, Element::s8, Element::f32, Element::f64}) {
        EXPECT_EQ(rawBytes(repack(repack(picture, rgb("C3", element)), rgb())), rawBytes(picture))
            << catalog::nameOf(element);
    }
}

TEST(Repack, ClampsFloatsThatAreNoColours)
{
    Image floats(rgb("C3", Element::f32), {2, 1});
    const f32 samples[] = {-1, 2, std::numeric_limits<f32>::quiet_NaN(), std::numeric_limits<f32>::infinity(), 0.5, 1};
    std::memcpy(floats.plane(0), samples, sizeof samples);
    EXPECT_EQ(row<u8>(repack(floats, rgb()), 0, 6), (Samples{0, 255, 0, 255, 128, 255}));
}

TEST(Repack, WidensTheFieldsOfPackedPixels)
{
    const Image red = imageOf(format("BGR565", "C3", Element::u16), {2, 1}, {0x00, 0xf8, 0x10, 0x84});
    // The second pixel has 16 of 31, 32 of 63 and 16 of 31.
    EXPECT_EQ(row<u8>(repack(red, rgb()), 0, 6), (Samples{255, 0, 0, 132, 130, 132}));
    const Image four = imageOf(format("RGB444", "C3", Element::u16), {1, 1}, {0x84, 0x0f});
    EXPECT_EQ(row<u8>(repack(four, rgb()), 0, 3), (Samples{68, 136, 255}));
}

TEST(Repack, PacksPixels)
{
    const Image colors = imageOf(rgb(), {1, 1}, {255, 0, 132});
    EXPECT_EQ(row<u16>(repack(colors, format("BGR555", "C3", Element::u16)), 0, 1), (Samples{31 * 1024 + 16}));
    EXPECT_EQ(row<u16>(repack(colors, format("RGB565", "C3", Element::u16)), 0, 1), (Samples{31 + 16 * 2048}));
}

TEST(Repack, RearrangesSharedChroma)
{
    const Image packed = imageOf(format("YCbCr422", "C2"), {4, 1}, {1, 11, 2, 21, 3, 12, 4, 22});
    EXPECT_EQ(row<u8>(repack(packed, format("CbYCr422", "C2")), 0, 8), (Samples{11, 1, 21, 2, 12, 3, 22, 4}));
    EXPECT_EQ(row<u8>(repack(packed, format("YCrCb422", "C2")), 0, 8), (Samples{1, 21, 2, 11, 3, 22, 4, 12}));
    const Image planes = repack(packed, format("YCbCr422", "P3"));
    EXPECT_EQ(row<u8>(planes, 0, 4), (Samples{1, 2, 3, 4}));
    EXPECT_EQ(row<u8>(planes, 1, 2), (Samples{11, 12}));
    EXPECT_EQ(row<u8>(planes, 2, 2), (Samples{21, 22}));
}

TEST(Repack, PairsChromaOfPlanes)
{
    Image planes(format("YCbCr420", "P3"), {4, 2});
    planes.plane(1)[0] = 1, planes.plane(1)[1] = 2;
    planes.plane(2)[0] = 3, planes.plane(2)[1] = 4;
    EXPECT_EQ(row<u8>(repack(planes, format("YCbCr420", "P2")), 1, 4), (Samples{1, 3, 2, 4}));
    EXPECT_EQ(row<u8>(repack(planes, format("YCrCb420", "P2")), 1, 4), (Samples{3, 1, 4, 2}));
}

TEST(Repack, ShowsGrayInEveryChannel)
{
    EXPECT_EQ(row<u8>(repack(imageOf(gray(), {1, 1}, {90}), rgb("C4")), 0, 4), (Samples{90, 90, 90, 255}));
}

TEST(Repack, ReadsBitsFromTheTop)
{
    const Image bits = imageOf({catalog::sideOf("Gray", "C1", Element::bit), {}}, {9, 1}, {0xa1, 0x80});
    EXPECT_EQ(row<u8>(repack(bits, gray()), 0, 9), (Samples{255, 0, 255, 0, 0, 0, 0, 255, 255}));
}

TEST(Repack, SeesAsASensorDoes)
{
    const Image picture = imageOf(rgb(), {2, 2}, {10, 20, 30, 11, 21, 31, 12, 22, 32, 13, 23, 33});
    const Image mosaic = repack(picture, format("CFA", "C1"));
    EXPECT_EQ(rawBytes(mosaic), (Bytes{30, 21, 22, 13})); // B G over G R
}

TEST(Repack, LeavesToTheLibraryWhatIsNotItsOwn)
{
    EXPECT_FALSE(canRepack(rgb(), gray()));
    EXPECT_FALSE(canRepack(rgb(), format("YCbCr", "C3")));
    EXPECT_FALSE(canRepack(format("YCbCr422", "P3"), format("YCbCr420", "P3")));
    EXPECT_FALSE(canRepack(format("YCbCr", "C3"), format("YCbCr", "C3", Element::u16)));
    EXPECT_FALSE(canRepack(format("YUV", "C3"), format("YCbCr", "C3")));
    EXPECT_FALSE(canRepack(format("CFA", "C1"), rgb()));
    EXPECT_FALSE(canRepack({catalog::sideOf("YCoCg", "P3", Element::s16), "Rev"}, format("YCoCg", "P3", Element::s16)));
}

} // namespace
