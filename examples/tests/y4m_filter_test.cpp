#include "program.hpp"

#include <pty.h>
#include <sys/wait.h>
#include <unistd.h>

namespace
{

using Y4mFilter = example::Program;

const std::string header = "YUV4MPEG2 W6 H4 F25:1 Ip A1:1 C420jpeg Xcomment\n";

/// Rows of one value each, and chroma of one value.
std::string frame(std::string_view luma, int width, int height, char cb, char cr)
{
    std::string bytes;
    for (int y = 0; y < height; ++y) bytes.append(width, luma[y % luma.size()]);
    const int chroma = (width + 1) / 2 * ((height + 1) / 2);
    return bytes.append(chroma, cb).append(chroma, cr);
}

int byteAt(const std::string& bytes, std::size_t at) { return static_cast<unsigned char>(bytes.at(at)); }

// Luma of grays stays but for rounding, and chroma of anything becomes neutral.
TEST_F(Y4mFilter, GrayHasNoColours)
{
    const std::string first = "FRAME\n" + frame("\x10\x50\x90\xeb", 6, 4, '\x80', '\x80');
    const std::string red = "FRAME Ip\n" + frame("\x52", 6, 4, '\x5a', '\xf0');
    writeFile("in.y4m", header + first + red);
    const std::string out = run("bin/y4m_filter gray in.y4m");
    ASSERT_EQ(status, 0) << errors;
    EXPECT_EQ(errors, "");
    ASSERT_EQ(out.size(), header.size() + first.size() + red.size());
    ASSERT_TRUE(out.starts_with(header + "FRAME\n"));

    const std::string frames = out.substr(header.size() + 6);
    constexpr int luma[] = {0x10, 0x50, 0x90, 0xeb};
    for (int i = 0; i < 24; ++i) EXPECT_NEAR(byteAt(frames, i), luma[i / 6], 1) << i;
    for (int i = 24; i < 36; ++i) EXPECT_EQ(byteAt(frames, i), 128) << i;
    EXPECT_EQ(frames.substr(36, 9), "FRAME Ip\n");
    // Red has a luma of 0.299 * 255 = 76.2 in RGB, which is 16 + 76.2 * 219 / 255 = 81.5.
    for (int i = 45; i < 45 + 24; ++i) EXPECT_NEAR(byteAt(frames, i), 81.5, 1.5) << i;
    for (int i = 45 + 24; i < 45 + 36; ++i) EXPECT_EQ(byteAt(frames, i), 128) << i;
}

// White is 16 + 219 and black 16.
TEST_F(Y4mFilter, NegativeOfBlackAndWhite)
{
    writeFile("in.y4m", header + "FRAME\n" + frame("\x10\x10\xeb\xeb", 6, 4, '\x80', '\x80'));
    const std::string out = run("bin/y4m_filter negative < in.y4m");
    ASSERT_EQ(status, 0) << errors;
    for (int i = 0; i < 12; ++i) EXPECT_NEAR(byteAt(out, header.size() + 6 + i), 235, 1) << i;
    for (int i = 12; i < 24; ++i) EXPECT_NEAR(byteAt(out, header.size() + 6 + i), 16, 1) << i;
}

// Luma 126 is (126 - 16) * 255 / 219 = 128.1 in RGB. The curve makes 180.5 of 128, and its inverse 66.1 (67.2 of 129).
TEST_F(Y4mFilter, BrighterAndDarker)
{
    writeFile("in.y4m", header + "FRAME\n" + frame("\x7e", 6, 4, '\x80', '\x80'));
    EXPECT_NEAR(byteAt(run("bin/y4m_filter brighten in.y4m"), header.size() + 6), 16 + 180.5 * 219 / 255, 1.5);
    EXPECT_NEAR(byteAt(run("bin/y4m_filter darken in.y4m"), header.size() + 6), 16 + 66.1 * 219 / 255, 1.5);
}

// Chroma is half as far again from neutral; gray stays as it is.
TEST_F(Y4mFilter, VividColours)
{
    writeFile("in.y4m", header + "FRAME\n" + frame("\x80", 6, 4, '\x8a', '\x76'));
    const std::string out = run("bin/y4m_filter vivid in.y4m");
    ASSERT_EQ(status, 0) << errors;
    EXPECT_NEAR(byteAt(out, header.size() + 6), 0x80, 1.5);
    EXPECT_NEAR(byteAt(out, header.size() + 6 + 24), 128 + 15, 1.5);
    EXPECT_NEAR(byteAt(out, header.size() + 6 + 30), 128 - 15, 1.5);
}

// Of an odd size every sample is converted, those of the last column and row too.
TEST_F(Y4mFilter, OddSizes)
{
    const std::string odd = "YUV4MPEG2 H3 W5\n";
    writeFile("in.y4m", odd + "FRAME\n" + frame("\xeb", 5, 3, '\x80', '\x80'));
    const std::string out = run("bin/y4m_filter negative in.y4m");
    ASSERT_EQ(status, 0) << errors;
    ASSERT_EQ(out.size(), odd.size() + 6 + 15 + 6 + 6);
    for (int i = 0; i < 15; ++i) EXPECT_NEAR(byteAt(out, odd.size() + 6 + i), 16, 1) << i;
    for (int i = 15; i < 27; ++i) EXPECT_EQ(byteAt(out, odd.size() + 6 + i), 128) << i;
}

TEST_F(Y4mFilter, StandsInAPipe)
{
    const std::string stream = header + "FRAME\n" + frame("\x20\x60", 6, 4, '\x80', '\x80');
    writeFile("in.y4m", stream);
    const std::string out = run("cat in.y4m | bin/y4m_filter negative | bin/y4m_filter negative | cat");
    EXPECT_EQ(status, 0);
    ASSERT_EQ(out.size(), stream.size());
    for (std::size_t i = header.size() + 6; i < out.size(); ++i) EXPECT_NEAR(byteAt(out, i), byteAt(stream, i), 2) << i;
    writeFile("none.y4m", header);
    EXPECT_EQ(run("bin/y4m_filter gray none.y4m"), header);
}

TEST_F(Y4mFilter, TellsWhatIsWrongWithAStream)
{
    const std::string body = "FRAME\n" + frame("\x20", 6, 4, '\x80', '\x80');
    const std::pair<std::string, const char*> broken[] = {
        {"", "it is empty"},
        {"RIFF....AVI \n", "it is not a YUV4MPEG2 stream"},
        {"\n", "it is not a YUV4MPEG2 stream"},
        {"YUV4MPEG2 W6 H4", "it ends within a header"},
        {"YUV4MPEG2 " + std::string(5000, 'X'), "a line of its headers is too long"},
        {"YUV4MPEG2 W6\n", "its header does not tell a size"},
        {"YUV4MPEG2 H4\n", "its header does not tell a size"},
        {"YUV4MPEG2 W0 H4\n", "its size is not of 1 to 16384 pixels: W0"},
        {"YUV4MPEG2 W6 H-4\n", "its size is not of 1 to 16384 pixels: H-4"},
        {"YUV4MPEG2 W H4\n", "its size is not of 1 to 16384 pixels: W"},
        {"YUV4MPEG2 W6x H4\n", "its size is not of 1 to 16384 pixels: W6x"},
        {"YUV4MPEG2 W99999999999999999999 H4\n", "its size is not of 1 to 16384 pixels: W99999999999999999999"},
        {"YUV4MPEG2 W6 H4 C444\n", "its chroma is not of 8-bit 4:2:0: C444"},
        {"YUV4MPEG2 W6 H4 C420p10\n", "its chroma is not of 8-bit 4:2:0: C420p10"},
        {"YUV4MPEG2 W6 H4 It\n", "it is interlaced: It"},
        {"YUV4MPEG2 W6 H4 XCOLORRANGE=FULL\n", "its samples are of full range"},
        {header + "GRAME\n", "frame 1 does not begin where it should"},
        {header + "FRAMES\n", "frame 1 does not begin where it should"},
        {header + "FRAME", "it ends within a header"},
        {header + "FRAME\n", "frame 1 is cut short"},
        {header + body + body.substr(0, body.size() - 1), "frame 2 is cut short"},
        {header + body + "x" + body, "frame 2 does not begin where it should"},
    };
    for (const auto& [stream, message] : broken) {
        writeFile("in.y4m", stream);
        run("bin/y4m_filter gray in.y4m");
        EXPECT_EQ(status, 1) << stream;
        EXPECT_EQ(errors, std::string("y4m_filter: in.y4m: ") + message + "\n") << stream;
    }
}

TEST_F(Y4mFilter, OtherFailures)
{
    writeFile("in.y4m", header + "FRAME\n" + frame("\x20", 6, 4, '\x80', '\x80'));
    run("bin/y4m_filter gray missing.y4m");
    EXPECT_EQ(status, 1);
    EXPECT_EQ(errors, "y4m_filter: missing.y4m: No such file or directory\n");
    run("bin/y4m_filter gray < /dev/null");
    EXPECT_EQ(errors, "y4m_filter: standard input: it is empty\n");
    run("bin/y4m_filter gray in.y4m > /dev/full");
    EXPECT_EQ(status, 1);
    EXPECT_EQ(errors, "y4m_filter: in.y4m: cannot write: No space left on device\n");
    for (const auto* const arguments : {"", "grey in.y4m", "gray in.y4m out.y4m"}) {
        run(std::string("bin/y4m_filter ") + arguments);
        EXPECT_EQ(status, 2) << arguments;
        EXPECT_TRUE(errors.starts_with("usage: y4m_filter FILTER [input.y4m] > output.y4m\n")) << arguments;
    }
    const std::string help = run("bin/y4m_filter --help");
    EXPECT_EQ(status, 0);
    EXPECT_NE(help.find("\n  sepia     an old photograph\n"), std::string::npos);
}

/// What a command shows on a terminal that is its standard error.
std::string shownOnTerminal(const std::string& command)
{
    int terminal = -1;
    const pid_t child = forkpty(&terminal, nullptr, nullptr, nullptr);
    if (child == 0) {
        execl("/bin/sh", "sh", "-c", command.c_str(), nullptr);
        _exit(127);
    }
    std::string shown;
    char bytes[256];
    for (ssize_t count = 0; (count = read(terminal, bytes, sizeof bytes)) > 0;) shown.append(bytes, count);
    close(terminal);
    waitpid(child, nullptr, 0);
    return shown;
}

TEST_F(Y4mFilter, ShowsProgressOnATerminal)
{
    std::string stream = header;
    for (int i = 0; i < 3; ++i) stream += "FRAME\n" + frame("\x20", 6, 4, '\x80', '\x80');
    writeFile("in.y4m", stream);
    const std::string go = "cd '" + folder.string() + "' && ";
    const std::string ofFile = shownOnTerminal(go + "bin/y4m_filter gray < in.y4m > out.y4m");
    EXPECT_NE(ofFile.find("\r[" + std::string(40, '#') + "] 100 %  frame 3, "), std::string::npos) << ofFile;
    EXPECT_TRUE(ofFile.ends_with("\n"));
    const std::string ofPipe = shownOnTerminal(go + "cat in.y4m | bin/y4m_filter gray > out.y4m");
    EXPECT_NE(ofPipe.find("\rframe 3, "), std::string::npos) << ofPipe;
    EXPECT_EQ(ofPipe.find('['), std::string::npos) << ofPipe;
    EXPECT_EQ(readFile("out.y4m").size(), stream.size());
}

} // namespace
