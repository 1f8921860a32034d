#include "run.hpp"

#include "support.hpp"

#include <sstream>

using namespace tool;
using namespace tool::testing;

namespace
{

/// An export from RGB to a model that the library does not know the way back from.
catalog::Export exportThat(PyxStatus (*invoke)(catalog::Function, const catalog::Invocation&))
{
    catalog::Export entry{};
    entry.name = "export";
    entry.source = catalog::sideOf("RGB", "C3", catalog::Element::u8);
    entry.target = catalog::sideOf("ABC", "P3", catalog::Element::u8);
    entry.invoke = invoke;
    return entry;
}

class Run : public ::testing::Test
{
protected:
    void SetUp() override { writeFiles(std::vector<File>{{folder / "in.png", encodePng(noise(rgb(), {4, 3}))}}); }

    std::string run(const catalog::Export& entry, std::string_view output)
    {
        std::ostringstream out;
        tool::run(entry, {folder / "in.png", folder / output, std::nullopt, {}}, out);
        return out.str();
    }

    Folder folder;
};

TEST_F(Run, WritesNothingWhenTheExportReturnsAnError)
{
    const auto entry = exportThat([](auto, const auto&) -> PyxStatus { return pyxErrSize; });
    EXPECT_EQ(failureOf([&] { run(entry, "out.png"); }), "export returns pyxErrSize (-6) at 4x3");
    EXPECT_EQ(folder.count(), 1u);
}

TEST_F(Run, TellsAWarningAndWrites)
{
    const auto entry = exportThat([](auto, const auto&) -> PyxStatus { return pyxWarnOddSize; });
    EXPECT_NE(run(entry, "out.png").find("status   pyxWarnOddSize (35)\n"), std::string::npos);
    EXPECT_EQ(folder.count(), 2u);
}

TEST_F(Run, ShowsComponentsWhereNoWayLeadsBack)
{
    const auto entry = exportThat([](auto, const catalog::Invocation& call) -> PyxStatus {
        for (int plane = 0; plane < 3; ++plane) *static_cast<u8*>(call.target[plane]) = static_cast<u8>(10 + plane);
        return pyxOk;
    });
    EXPECT_NE(run(entry, "out.raw").find("the components in gray"), std::string::npos);
    const Bytes planes = readFile(folder / "out.raw");
    ASSERT_EQ(planes.size(), 4u * 3 * 3);
    EXPECT_EQ(planes[0], 10);
    EXPECT_EQ(planes[12], 11);
    EXPECT_EQ(planes[24], 12);
    const Image tiles = readPicture(folder / "out.raw.png");
    EXPECT_EQ(tiles.size().width, 3 * 4 + 2);
    EXPECT_EQ(component(tiles, 0).at(5, 0), 11);
}

} // namespace
