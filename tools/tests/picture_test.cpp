// The test card, previews and the page that shows them.
#include "preview.hpp"
#include "sheet.hpp"
#include "support.hpp"
#include "test_card.hpp"

#include <array>

using namespace tool;
using namespace tool::testing;
using catalog::Element;

namespace
{

using Color = std::array<int, 3>;

Color colorAt(const Image& image, int x, int y)
{
    const u8* pixel = image.plane(0) + std::ptrdiff_t{y} * image.step(0) + std::ptrdiff_t{x} * image.side().samples;
    return {pixel[0], pixel[1], pixel[2]};
}

TEST(TestCard, BeginsWithBarsOfFallingBrightness)
{
    const Image card = testCard({960, 640});
    const std::array<Color, 8> bars = {{{255, 255, 255},
                                        {255, 255, 0},
                                        {0, 255, 255},
                                        {0, 255, 0},
                                        {255, 0, 255},
                                        {255, 0, 0},
                                        {0, 0, 255},
                                        {0, 0, 0}}};
    for (int bar = 0; bar < 8; ++bar) EXPECT_EQ(colorAt(card, bar * 120 + 60, 10), bars[static_cast<std::size_t>(bar)]);
}

TEST(TestCard, HasARampThatNeverFalls)
{
    const Image card = testCard({960, 640});
    const int y = 150;
    for (int x = 1; x < 960; ++x) {
        const Color before = colorAt(card, x - 1, y), here = colorAt(card, x, y);
        EXPECT_GE(here[0], before[0]);
        EXPECT_EQ(here[0], here[1]);
        EXPECT_EQ(here[1], here[2]);
    }
    EXPECT_EQ(colorAt(card, 0, y)[0], 0);
    EXPECT_EQ(colorAt(card, 959, y)[0], 255);
}

TEST(TestCard, LeavesNoGaps)
{
    // The last corner of each panel but the bars, the ramps and the rings.
    const Image card = testCard({960, 640});
    EXPECT_EQ(colorAt(card, 364, 421)[1], 0);                 // the hues end in black
    EXPECT_EQ(colorAt(card, 0, 205), (Color{255, 254, 254})); // and begin in white
    EXPECT_EQ(colorAt(card, 364, 639), (Color{255, 255, 0})); // the yellow ramp
    EXPECT_EQ(colorAt(card, 959, 421), (Color{54, 36, 28}));  // the darkest skin
    EXPECT_EQ(colorAt(card, 730, 205), (Color{255, 224, 204}));
    const Color last = colorAt(card, 959, 639), beside = colorAt(card, 958, 639);
    EXPECT_EQ(last[0] + beside[0], 255); // black and white in turns
}

TEST(TestCard, FillsEverySize)
{
    for (const RoiSize size : {RoiSize{1, 1}, {1, 50}, {50, 1}, {17, 13}, {1920, 1080}}) {
        const Image card = testCard(size);
        EXPECT_EQ(card.size().width, size.width);
        EXPECT_EQ(card.size().height, size.height);
    }
}

TEST(Preview, FitsShapesIntoABox)
{
    const auto fit = [](RoiSize shape) {
        const RoiSize size = fitted(shape, {480, 720});
        return std::pair(size.width, size.height);
    };
    EXPECT_EQ(fit({960, 640}), std::pair(480, 320));
    EXPECT_EQ(fit({100, 1440}), std::pair(50, 720));
    EXPECT_EQ(fit({100, 100}), std::pair(100, 100));
    EXPECT_EQ(fit({30000, 1}), std::pair(480, 1));
}

TEST(Preview, TakesTheMeanOfWhatAPixelCovers)
{
    const Image small = scaledDown(imageOf(gray(), {4, 2}, {0, 100, 10, 10, 100, 200, 30, 30}), {2, 2});
    EXPECT_EQ(rawBytes(small), (Bytes{100, 20}));
}

TEST(Preview, ShowsComponentsSideBySide)
{
    const Image image = imageOf(rgb(), {1, 1}, {10, 20, 30});
    const Image tiles = componentTiles(image, {64, 32});
    EXPECT_EQ(tiles.size().width, 3 * 64 + 2 * 2);
    EXPECT_EQ(tiles.size().height, 32);
    EXPECT_EQ(colorAt(tiles, 0, 0), (Color{10, 10, 10}));
    EXPECT_EQ(colorAt(tiles, 66, 31), (Color{20, 20, 20}));
    EXPECT_EQ(colorAt(tiles, 195, 0), (Color{30, 30, 30}));
    EXPECT_EQ(tiles.plane(0)[63 * 4 + 3], 255);
    EXPECT_EQ(tiles.plane(0)[64 * 4 + 3], 0); // a gap
}

TEST(Preview, StretchesValuesWithoutABlackAndAWhite)
{
    Image image({catalog::sideOf("YCoCg", "P3", Element::s16), {}}, {2, 1});
    component(image, 1).set(0, 0, -40);
    component(image, 1).set(1, 0, 60);
    const Image tiles = componentTiles(image, {2, 1});
    EXPECT_EQ(colorAt(tiles, 3, 0), (Color{0, 0, 0}));
    EXPECT_EQ(colorAt(tiles, 4, 0), (Color{255, 255, 255}));
    EXPECT_EQ(colorAt(tiles, 0, 0), (Color{128, 128, 128})); // a component that is the same all over
}

TEST(Preview, KeepsAlphaDepthAndGrayOfPictures)
{
    const auto shown = [](const Format& format) { return nameOf(pictureFormat(format)); };
    EXPECT_EQ(shown(rgb("C4")), "RGB C4 u8");
    EXPECT_EQ(shown(rgb("AC4")), "RGB C3 u8");
    EXPECT_EQ(shown(rgb("P3", Element::u16)), "RGB C3 u16");
    EXPECT_EQ(shown(gray(Element::u16)), "Gray C1 u16");
    EXPECT_EQ(shown({catalog::sideOf("RGB565", "C3", Element::u16), {}}), "RGB C3 u8");
    EXPECT_EQ(shown({catalog::sideOf("YCC", "C3", Element::u16), {}}), "RGB C3 u8");
}

Sheet smallSheet()
{
    Card card;
    card.entry = &catalog::exports().front();
    card.picture = {"a<b.png", {3, 2}};
    card.called = true;
    card.seconds = 0.0025;
    card.bytes = 5e6;
    return {"a <title> & \"more\"", {"picture.png", {3, 2}}, {5, 3}, {3, 2}, {{&catalog::families().front(), {card}}}};
}

TEST(Sheet, EscapesWhatTheUserNamed)
{
    const std::string page = html(smallSheet());
    EXPECT_NE(page.find("a &lt;title&gt; &amp; &quot;more&quot;"), std::string::npos);
    EXPECT_NE(page.find("src=\"a&lt;b.png\""), std::string::npos);
    EXPECT_EQ(page.find("<title>a <title>"), std::string::npos);
}

TEST(Sheet, TellsWhichPartOfThePictureWasTaken)
{
    Sheet sheet = smallSheet();
    EXPECT_NE(html(sheet).find("5 × 3, of which 3 × 2 in whole blocks</p>"), std::string::npos);
    sheet.size = sheet.given;
    EXPECT_NE(html(sheet).find("5 × 3</p>"), std::string::npos);
}

TEST(Sheet, NeedsNothingFromElsewhere)
{
    const std::string page = html(smallSheet());
    for (const char* outside : {"http:", "https:", "@import", "<link", "src=\"/", "url("}) {
        EXPECT_EQ(page.find(outside), std::string::npos) << outside;
    }
}

TEST(Sheet, TellsTimeAndRate)
{
    const std::string page = html(smallSheet());
    EXPECT_NE(page.find("2.50 ms"), std::string::npos);
    EXPECT_NE(page.find("2.00 GB/s"), std::string::npos);
    EXPECT_NE(page.find("loading=\"lazy\""), std::string::npos);
    EXPECT_EQ(timeText(12.3e-6), "12.3 µs");
    EXPECT_EQ(timeText(1.5), "1.50 s");
}

} // namespace
