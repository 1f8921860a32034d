#include "support.hpp"

#include <string>

using namespace tool;
using namespace tool::testing;
using catalog::Element;

namespace
{

Bytes bytesOf(std::string_view text) { return {text.begin(), text.end()}; }

void append(Bytes& bytes, std::initializer_list<int> more)
{
    for (const int byte : more) bytes.push_back(static_cast<u8>(byte));
}

double sample(const Image& image, int channel, int x, int y) { return component(image, channel).at(x, y); }

TEST(Png, ComesBackAsItWas)
{
    for (const Element element : {Element::u8, Element::u16}) {
        for (const Format& format : {gray(element), rgb("C3", element), rgb("C4", element)}) {
            const Image image = noise(format, {37, 11});
            const Image read = decodePng(encodePng(image), "file");
            EXPECT_EQ(nameOf(read.format()), nameOf(format));
            EXPECT_EQ(rawBytes(read), rawBytes(image)) << nameOf(format);
        }
    }
}

TEST(Png, EveryTruncationIsAnError)
{
    const Bytes whole = encodePng(noise(rgb(), {16, 16}));
    for (std::size_t size = 0; size < whole.size(); ++size) {
        const Bytes part(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
        EXPECT_THROW(decodePng(part, "file"), Failure) << size;
    }
}

TEST(Png, DamageIsAnErrorOrAnImageButNoCrash)
{
    const Bytes whole = encodePng(noise(rgb("C4"), {16, 16}));
    int errors = 0;
    for (std::size_t at = 8; at < whole.size(); ++at) {
        for (const int change : {0x01, 0x80, 0xff}) {
            Bytes damaged = whole;
            damaged[at] = static_cast<u8>(damaged[at] ^ change);
            try {
                EXPECT_EQ(rawBytes(decodePng(damaged, "file")).size(), 16u * 16 * 4);
            } catch (const Failure& failure) {
                ++errors;
                EXPECT_TRUE(std::string(failure.what()).starts_with("file is not a sound PNG file")) << failure.what();
            }
        }
    }
    EXPECT_GT(errors, 1000);
}

TEST(Pnm, ReadsGrayWithComments)
{
    Bytes file = bytesOf("P5 # a picture\n2 # wide\n 1\n255\n");
    append(file, {7, 200});
    const Image image = decodePnm(file, "file");
    EXPECT_EQ(nameOf(image.format()), "Gray C1 u8");
    EXPECT_EQ(rawBytes(image), (Bytes{7, 200}));
}

TEST(Pnm, ReadsColorOfSixteenBits)
{
    Bytes file = bytesOf("P6\n1 1\n65535\n");
    append(file, {0x12, 0x34, 0xff, 0xff, 0, 1});
    const Image image = decodePnm(file, "file");
    EXPECT_EQ(nameOf(image.format()), "RGB C3 u16");
    EXPECT_EQ(sample(image, 0, 0, 0), 0x1234);
    EXPECT_EQ(sample(image, 1, 0, 0), 0xffff);
    EXPECT_EQ(sample(image, 2, 0, 0), 1);
}

TEST(Pnm, ScalesSmallRanges)
{
    Bytes file = bytesOf("P5 3 1 15\n");
    append(file, {0, 1, 15});
    EXPECT_EQ(rawBytes(decodePnm(file, "file")), (Bytes{0, 17, 255}));
    file = bytesOf("P5 2 1 1023\n");
    append(file, {0x03, 0xff, 0, 0});
    const Image wide = decodePnm(file, "file");
    EXPECT_EQ(sample(wide, 0, 0, 0), 65535);
    EXPECT_EQ(sample(wide, 0, 1, 0), 0);
}

TEST(Pnm, ReadsFloatsOfBothByteOrdersFromTheBottomUp)
{
    Bytes big = bytesOf("Pf\n1 2\n1.0\n"), little = bytesOf("Pf\n1 2\n-1.0\n");
    append(big, {0x3f, 0x80, 0, 0, 0x3f, 0, 0, 0});
    append(little, {0, 0, 0x80, 0x3f, 0, 0, 0, 0x3f});
    for (const Bytes& file : {big, little}) {
        const Image image = decodePnm(file, "file");
        EXPECT_EQ(nameOf(image.format()), "Gray C1 f32");
        EXPECT_EQ(sample(image, 0, 0, 0), 0.5);
        EXPECT_EQ(sample(image, 0, 0, 1), 1);
    }
    Bytes color = bytesOf("PF\n1 1\n-1\n");
    append(color, {0, 0, 0x80, 0x3f, 0, 0, 0, 0x3f, 0, 0, 0, 0});
    EXPECT_EQ(sample(decodePnm(color, "file"), 1, 0, 0), 0.5);
}

TEST(Pnm, RefusesWhatIsNotSound)
{
    for (const std::string_view file :
         {"P5", "P5 ", "P5 2", "P5 2 2 255", "P5 2 2 255\nabc", "P5 2 2 0\nabcd", "P5 2 2 65536\nabcd", "P5 0 2 255\n",
          "P5 -2 2 255\nabcd", "P5 two 2 255\nabcd", "P5 2x 2 255\nabcd", "P6 1 1 65535\nabcde", "P2 1 1 255\n7",
          "PF 1 1 0\nabcdefghijkl", "Pf 1 1 nan\nabcd", "P5 99999 1 255\n", "P5 32768 32768 255\n",
          "P5 4294967297 1 255\na", "P5 2147483647 2147483647 255\n"}) {
        EXPECT_NE(failureOf([&] { decodePnm(bytesOf(file), "file"); }).find("file"), std::string::npos) << file;
    }
}

TEST(Picture, IsToldByItsFirstBytes)
{
    const Folder folder;
    const Image image = noise(rgb(), {3, 2});
    writeFiles(std::vector<File>{{folder / "a", encodePng(image)}, {folder / "b", bytesOf("P5 1 1 255\n7")}});
    EXPECT_EQ(rawBytes(readPicture(folder / "a")), rawBytes(image));
    EXPECT_EQ(rawBytes(readPicture(folder / "b")), (Bytes{'7'}));
    writeFiles(std::vector<File>{{folder / "c", bytesOf("a text")}, {folder / "d", {}}});
    for (const char* name : {"c", "d"}) {
        EXPECT_NE(failureOf([&] { readPicture(folder / name); }).find("raw planes need --size"), std::string::npos);
    }
    EXPECT_NE(failureOf([&] { readPicture(folder / "none"); }).find("No such file"), std::string::npos);
}

TEST(Raw, ComesBackAsItWasInEveryFormat)
{
    const Folder folder;
    for (const catalog::Export& entry : catalog::exports()) {
        for (const catalog::Side& side : {entry.source, entry.target}) {
            const Image image = noise({side, {}}, {13, 7});
            writeFiles(std::vector<File>{{folder / "raw", rawBytes(image)}});
            EXPECT_EQ(rawBytes(readRaw(folder / "raw", image.format(), {13, 7})), rawBytes(image)) << entry.name;
        }
    }
}

TEST(Raw, HoldsOnePlaneAfterAnother)
{
    Image image({catalog::sideOf("YCbCr420", "P3", Element::u8), {}}, {2, 2});
    image.plane(0)[0] = 1, image.plane(0)[1] = 2;
    image.plane(0)[image.step(0)] = 3, image.plane(0)[image.step(0) + 1] = 4;
    image.plane(1)[0] = 5, image.plane(2)[0] = 6;
    EXPECT_EQ(rawBytes(image), (Bytes{1, 2, 3, 4, 5, 6}));
}

TEST(Raw, HasToHaveTheRightSize)
{
    const Folder folder;
    writeFiles(std::vector<File>{{folder / "raw", Bytes(11)}});
    EXPECT_NE(failureOf([&] { readRaw(folder / "raw", rgb(), {2, 2}); }).find("11 bytes"), std::string::npos);
    EXPECT_NE(failureOf([&] { readRaw(folder / "raw", rgb(), {100000, 2}); }).find("too large"), std::string::npos);
}

} // namespace
