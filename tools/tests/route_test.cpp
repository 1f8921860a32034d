#include "convert.hpp"
#include "preview.hpp"
#include "support.hpp"

#include <algorithm>

using namespace tool;
using namespace tool::testing;
using catalog::Element;

namespace
{

struct End {
    std::string_view model, layout;
    Element element = Element::u8;
};

/// An export that is never called.
catalog::Export conversion(std::string_view name, End from, End to, std::string_view variant = "")
{
    catalog::Export entry{};
    entry.name = name;
    entry.source = catalog::sideOf(from.model, from.layout, from.element);
    entry.target = catalog::sideOf(to.model, to.layout, to.element);
    entry.variant = variant;
    return entry;
}

Format format(End end, std::string_view encoding = "")
{
    return {catalog::sideOf(end.model, end.layout, end.element), std::string(encoding)};
}

/// The names along the way, or "no way".
std::string way(const std::vector<catalog::Export>& exports, const Format& from, const Format& to)
{
    const auto route = Graph(exports).find(from, to);
    return route ? describe(*route) : "no way";
}

constexpr End yccC3 = {"YCC", "C3"}, yccP3 = {"YCC", "P3"};

TEST(Route, IsEmptyFromAFormatToItself) { EXPECT_EQ(way({}, rgb(), rgb()), ""); }

TEST(Route, TakesTheExportThatLeadsThere)
{
    EXPECT_EQ(way({conversion("there", {"RGB", "C3"}, yccC3)}, rgb(), format(yccC3)), "there");
}

TEST(Route, DoesNotGoAgainstAnExport)
{
    EXPECT_EQ(way({conversion("there", {"RGB", "C3"}, yccC3)}, format(yccC3), rgb()), "no way");
}

TEST(Route, TakesTheShorterOfTwoWays)
{
    const End a = {"XYZ", "C3"}, b = {"HSV", "C3"}, c = {"HLS", "C3"};
    std::vector<catalog::Export> exports = {conversion("toA", {"RGB", "C3"}, a), conversion("toB", {"RGB", "C3"}, b),
                                            conversion("aToC", a, c), conversion("cToEnd", c, yccC3),
                                            conversion("bToEnd", b, yccC3)};
    EXPECT_EQ(way(exports, rgb(), format(yccC3)), "toB, bToEnd");
    std::ranges::reverse(exports);
    EXPECT_EQ(way(exports, rgb(), format(yccC3)), "toB, bToEnd");
}

TEST(Route, RepacksBeforeAndBehind)
{
    EXPECT_EQ(
        way({conversion("there", {"BGR", "AC4"}, yccC3), conversion("on", yccP3, {"XYZ", "C3"})}, rgb(), format(yccP3)),
        "repacked as BGR AC4 u8, there, repacked as YCC P3 u8");
}

TEST(Route, ChangesTheDepthOfRgbButNotOfOtherModels)
{
    const End wide = {"YCC", "C3", Element::u16};
    const auto exports = {conversion("wide", {"RGB", "C3", Element::u16}, wide), conversion("user", yccC3, wide)};
    EXPECT_EQ(way(exports, rgb(), format(wide)), "repacked as RGB C3 u16, wide");
    EXPECT_EQ(way(exports, rgb(), format(yccC3)), "no way");
}

TEST(Route, DoesNotLoseTheColoursOnTheWay)
{
    const End gray = {"Gray", "C1"}, packed = {"RGB565", "C3", Element::u16};
    const auto through = [](const End& middle) {
        return way({conversion("a", {"RGB", "C3"}, middle), conversion("b", middle, yccC3)}, rgb(), format(yccC3));
    };
    EXPECT_EQ(through(gray), "no way");
    EXPECT_EQ(through(packed), "no way");
    EXPECT_EQ(through({"XYZ", "C3"}), "a, b");
}

TEST(Route, KeepsChromaAsItIsIfItCan)
{
    const End source = {"YCbCr411", "P3"}, other = {"YCbCr420", "P3"};
    std::vector<catalog::Export> exports = {conversion("resample", source, other),
                                            conversion("from420", other, {"RGB", "C3"}),
                                            conversion("from411", source, {"BGR", "C4"})};
    EXPECT_EQ(way(exports, format(source), rgb()), "from411, repacked as RGB C3 u8");
    exports.pop_back();
    EXPECT_EQ(way(exports, format(source), rgb()), "resample, from420");
}

TEST(Route, PrefersPlainConversionsToFilteredAndDitheredOnes)
{
    const End source = {"YCbCr420", "P3"}, target = {"YCbCr", "C3"};
    const std::vector<catalog::Export> exports = {conversion("filtered", source, target, "Filter"),
                                                  conversion("plain", source, {"YCbCr", "P3"})};
    EXPECT_EQ(way(exports, format(source), format(target)), "plain, repacked as YCbCr C3 u8");
    EXPECT_EQ(way({exports[0]}, format(source), format(target)), "filtered");
}

TEST(Route, GoesBackByTheSameEncoding)
{
    const End video = {"YCbCr420", "P3"};
    std::vector<catalog::Export> exports = {conversion("there", {"BGR", "C3"}, video, "709CSC"),
                                            conversion("back", video, {"RGB", "C3"}),
                                            conversion("back709", video, {"BGR", "C3"}, "709CSC")};
    EXPECT_EQ(way(exports, format(video, "709CSC"), rgb()), "back709, repacked as RGB C3 u8");
    EXPECT_EQ(way(exports, format(video), rgb()), "back");
    exports.pop_back();
    EXPECT_EQ(way(exports, format(video, "709CSC"), rgb()), "repacked as YCbCr420 P3 u8, back");
}

TEST(Route, OperationsWithoutAModelWorkOnRgbAndAreNoWay)
{
    const catalog::Export operation = conversion("operation", {"", "AC4", Element::s8}, {"", "C1", Element::bit});
    EXPECT_EQ(nameOf(sourceOf(operation)), "RGB AC4 s8");
    EXPECT_EQ(nameOf(targetOf(operation)), "Gray C1 bit");
    EXPECT_EQ(way({operation}, rgb(), targetOf(operation)), "no way");
}

TEST(Route, ReachesEveryExportOfTheFirstFamilyAndBack)
{
    const Graph graph(catalog::exports());
    int count = 0;
    for (const catalog::Export& entry : catalog::exports()) {
        if (entry.family != catalog::Family::rgbYCbCr) continue;
        ++count;
        for (const Format& file : {rgb(), rgb("C4"), rgb("C3", Element::u16), rgb("C3", Element::f32), gray()}) {
            EXPECT_TRUE(graph.find(file, sourceOf(entry))) << entry.name << " from " << nameOf(file);
        }
        EXPECT_TRUE(wayToPicture(graph, targetOf(entry))) << entry.name;
    }
    EXPECT_EQ(count, 12);
}

TEST(Follow, BringsWhiteToTheTopOfTheStudioRange)
{
    const Format planar = format({"YCbCr", "P3"});
    const auto route = Graph(catalog::exports()).find(rgb(), planar);
    ASSERT_TRUE(route);
    const Image white = imageOf(rgb(), {2, 1}, {255, 255, 255, 255, 255, 255});
    const Image result = follow(*route, white);
    EXPECT_EQ(nameOf(result.format()), "YCbCr P3 u8");
    EXPECT_EQ(result.plane(0)[1], 235);
    EXPECT_EQ(result.plane(1)[1], 128);
    EXPECT_EQ(result.plane(2)[1], 128);
}

TEST(Follow, StopsAtAnErrorButNotAtAWarning)
{
    catalog::Export entry = conversion("export", {"RGB", "C3"}, yccC3);
    const Route route = {{&entry, targetOf(entry)}};
    const Image image(rgb(), {3, 3});
    entry.invoke = [](catalog::Function, const catalog::Invocation&) -> PyxStatus { return pyxWarnOddSize; };
    EXPECT_EQ(nameOf(follow(route, image).format()), "YCC C3 u8");
    entry.invoke = [](catalog::Function, const catalog::Invocation&) -> PyxStatus { return pyxErrSize; };
    EXPECT_NE(failureOf([&] { follow(route, image); }).find("export returns pyxErrSize (-6)"), std::string::npos);
}

// Chroma that changes places on the way there and back makes red blue.
TEST(Follow, BringsRedBackFromEveryFormat)
{
    Image red(rgb(), {16, 8});
    for (int y = 0; y < 8; ++y) {
        for (int x = 0; x < 16; ++x) component(red, 0).set(x, y, 200);
    }
    const Graph graph(catalog::exports());
    int formats = 0;
    for (const catalog::Export& entry : catalog::exports()) {
        const Format format = sourceOf(entry);
        const auto there = graph.find(red.format(), format), back = wayToPicture(graph, format);
        if (!there || !back || componentsOf(format.side).size() < 3) continue;
        const Image picture = eightBit(follow(*back, follow(*there, red)));
        EXPECT_GT(component(picture, 0).at(5, 3), component(picture, 2).at(5, 3) + 50)
            << describe(*there) << "; " << describe(*back);
        ++formats;
    }
    EXPECT_GT(formats, 400);
}

TEST(Measure, TellsStatusAndTraffic)
{
    const catalog::Export* entry = catalog::find("pyxiYCbCrToRGB_8u_P3C4R");
    ASSERT_NE(entry, nullptr);
    Parameters parameters(*entry);
    parameters.set("aval=7");
    const Measured done = measure(*entry, noise(format({"YCbCr", "P3"}), {33, 5}), parameters, 0);
    EXPECT_EQ(done.status, pyxOk);
    EXPECT_EQ(done.bytes, 33 * 5 * (3 + 4));
    EXPECT_GE(done.calls, 3);
    EXPECT_EQ(done.target.plane(0)[32 * 4 + 3], 7);
}

} // namespace
