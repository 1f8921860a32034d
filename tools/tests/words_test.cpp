// What the user types, and what the tool says of an export.
#include "describe.hpp"
#include "lookup.hpp"
#include "parameters.hpp"
#include "support.hpp"

#include <cstring>

using namespace tool;
using namespace tool::testing;

namespace
{

TEST(Lookup, CountsEdits)
{
    EXPECT_EQ(editDistance("kitten", "sitting"), 3);
    EXPECT_EQ(editDistance("", "abc"), 3);
    EXPECT_EQ(editDistance("abc", ""), 3);
    EXPECT_EQ(editDistance("abc", "abc"), 0);
}

TEST(Lookup, FindsByPartsOfNamesAndByFamilies)
{
    EXPECT_EQ(matching("rgb-ycbcr").size(), 12u);
    EXPECT_EQ(matching("").size(), catalog::exports().size());
    for (const catalog::Export* entry : matching("tobgr_8U_P3c4")) {
        EXPECT_NE(entry->name.find("ToBGR_8u_P3C4"), std::string_view::npos);
    }
    EXPECT_NE(failureOf([] { matching("nonsense"); }), "");
}

TEST(Lookup, SuggestsNearNames)
{
    EXPECT_EQ(named("pyxiRGBToYCbCr_8u_C3R").name, "pyxiRGBToYCbCr_8u_C3R");
    const auto text = [](const char* name) { return failureOf([name] { named(name); }); };
    EXPECT_NE(text("pyxiRGBToYCbcr_8u_C3R").find("did you mean pyxiRGBToYCbCr_8u_C3R"), std::string::npos);
    EXPECT_NE(text("pyxiRGBToYCbCr_8u_C3").find("did you mean pyxiRGBToYCbCr_8u_C3R"), std::string::npos);
    EXPECT_EQ(text("zzzzzz").find("did you mean"), std::string::npos);
    EXPECT_NE(text("zzzzzz"), "");
}

const catalog::Export& withAlpha() { return named("pyxiYCbCrToRGB_8u_P3C4R"); }

TEST(Parameters, HaveStandardValues) { EXPECT_EQ(Parameters(withAlpha()).arguments()[0].number, 255); }

TEST(Parameters, TakeNewValues)
{
    Parameters parameters(withAlpha());
    parameters.set("aval=7");
    EXPECT_EQ(parameters.arguments()[0].number, 7);
}

TEST(Parameters, RefuseWhatMakesNoSense)
{
    Parameters parameters(withAlpha());
    for (const char* wrong : {"aval", "aval=", "aval=x", "aval=1x", "aval=1,2", "aval=1,", "aval=256", "aval=-1",
                              "aval=1.5", "aval=nan", "aval=inf", "level=1", "=1", ""}) {
        EXPECT_NE(failureOf([&] { parameters.set(wrong); }), "") << wrong;
    }
    EXPECT_EQ(parameters.arguments()[0].number, 255);
    EXPECT_NE(failureOf([] { Parameters(named("pyxiRGBToYCbCr_8u_C3R")).set("aval=1"); }).find("no parameters"),
              std::string::npos);
}

TEST(Parameters, BecomeListsOfTheRightType)
{
    catalog::Export entry{};
    entry.name = "twist";
    entry.parameterCount = 2;
    entry.traits.parameters = {{{"weights", -1, 1, 3, {0.25, 0.5, 0.75}}, {"wide", -9, 9, 2, {1, 2}}}};
    entry.parameterTypes = {{{"f32", true, 0}, {"f64", true, 0}}};
    Parameters parameters(entry);
    parameters.set("wide=-2.5,9");
    EXPECT_NE(failureOf([&] { parameters.set("weights=1,1"); }).find("3 numbers"), std::string::npos);
    f32 weights[3];
    f64 wide[2];
    std::memcpy(weights, parameters.arguments()[0].pointer, sizeof weights);
    std::memcpy(wide, parameters.arguments()[1].pointer, sizeof wide);
    EXPECT_EQ(weights[2], 0.75f);
    EXPECT_EQ(wide[0], -2.5);
    EXPECT_EQ(wide[1], 9);
}

TEST(Describe, WritesPrototypesAsTheHeadersHaveThem)
{
    EXPECT_EQ(prototypeOf(named("pyxiRGBToYCbCr_8u_C3R")),
              "PyxStatus pyxiRGBToYCbCr_8u_C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi);");
    EXPECT_EQ(prototypeOf(named("pyxiRGBToYCbCr_8u_P3R")),
              "PyxStatus pyxiRGBToYCbCr_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], int dstStep, "
              "RoiSize roi);");
    EXPECT_EQ(
        prototypeOf(withAlpha()),
        "PyxStatus pyxiYCbCrToRGB_8u_P3C4R(const u8* const src[3], int srcStep, u8* dst, int dstStep, RoiSize roi, "
        "u8 aval);");
}

TEST(Describe, WritesWhatOtherFamiliesHave)
{
    catalog::Export entry{};
    entry.name = "f";
    entry.source = catalog::sideOf("YCbCr420", "P2", catalog::Element::u8);
    entry.target = catalog::sideOf("RGB565", "C3", catalog::Element::u16);
    entry.source.steps = catalog::Steps::each;
    EXPECT_EQ(prototypeOf(entry),
              "PyxStatus f(const u8* srcY, int srcYStep, const u8* srcCbCr, int srcCbCrStep, u16* dst, "
              "int dstStep, RoiSize roi);");
    EXPECT_EQ(conversionOf(entry), "YCbCr420 P2 u8 -> RGB565 C3 u16");
    entry.source = entry.target = catalog::sideOf("", "P3", catalog::Element::f32);
    entry.inPlace = true;
    entry.parameterCount = 1;
    entry.traits.parameters[0] = {"twist", -9, 9, 12, {}};
    entry.parameterTypes[0] = {"f32", true, 4};
    EXPECT_EQ(prototypeOf(entry),
              "PyxStatus f(f32* const srcDst[3], int srcDstStep, RoiSize roi, const f32 twist[3][4]);");
    EXPECT_EQ(conversionOf(entry), "any P3 f32 in place");
}

TEST(Describe, TellsTestsInTheirOrder)
{
    EXPECT_NE(sheetOf(named("pyxiRGBToYCbCr_8u_C3R")).find("tests       null pointers, size\n"), std::string::npos);
    EXPECT_NE(sheetOf(withAlpha()).find("tests       null pointers, size, null planes\n"), std::string::npos);
    EXPECT_NE(sheetOf(withAlpha()).find("aval: 0 to 255; if not set 255"), std::string::npos);
    EXPECT_NE(sheetOf(withAlpha()).find("pyxErrSize (-6)"), std::string::npos);
}

TEST(Describe, TellsOfPartsOfBlocksAndOfPackedPixels)
{
    EXPECT_NE(sheetOf(named("pyxiYCbCr422ToRGB_8u_P3C3R")).find("Cb ((width+1)/2 x height)"), std::string::npos);
    const std::string sheet = sheetOf(named("pyxiYCbCr422ToBGR565_8u16u_C2C3R"));
    EXPECT_NE(sheet.find("Y Cb Y Cr, 2 bytes a pixel, to the end of a last pair; 0 to 255; a step\n"),
              std::string::npos);
    EXPECT_NE(sheet.find("one 16-bit pixel of the fields B G R from the low bits up; a step, without its low bit\n"),
              std::string::npos);
}

TEST(Describe, NamesTheStatusesOfStepsAndParameters)
{
    catalog::Export entry = named("pyxiRGBToYCbCr_8u_C3R");
    EXPECT_EQ(sheetOf(entry).find("pyxErrStep"), std::string::npos);
    entry.traits.stepsTested = true;
    entry.traits.parameters[0].name = "levels";
    entry.traits.parameters[0].status = pyxErrLevels;
    EXPECT_NE(sheetOf(entry).find("pyxErrStep (-14) for a step below 1, pyxErrLevels (-54) for levels"),
              std::string::npos);
    EXPECT_NE(sheetOf(entry).find("tests       null pointers, size, steps, parameters\n"), std::string::npos);
}

} // namespace
