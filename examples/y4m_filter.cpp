// A filter of video streams, to stand in a pipe:
//
//     decoder | y4m_filter sepia | encoder
//     y4m_filter vivid clip.y4m > out.y4m
//
// Reads YUV4MPEG2 with 8-bit 4:2:0, from a file or the standard input, takes every frame to RGB, filters it there and
// takes it back. On a terminal the standard error shows how far it is.
#include <pyxcc/pyxcc.h>

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <charconv>
#include <chrono>
#include <cstdio>
#include <cstring>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace
{

// What it can do with a frame of RGB.

using Matrix = f32[3][4];

/// Saturation S: luma plus S times what a channel is away from it. At 0 all channels are luma.
constexpr Matrix gray = {{0.299f, 0.587f, 0.114f, 0}, {0.299f, 0.587f, 0.114f, 0}, {0.299f, 0.587f, 0.114f, 0}};
constexpr Matrix vivid = {
    {1.3505f, -0.2935f, -0.057f, 0}, {-0.1495f, 1.2065f, -0.057f, 0}, {-0.1495f, -0.2935f, 1.443f, 0}};
constexpr Matrix sepia = {{0.393f, 0.769f, 0.189f, 0}, {0.349f, 0.686f, 0.168f, 0}, {0.272f, 0.534f, 0.131f, 0}};
constexpr Matrix negative = {{-1, 0, 0, 255}, {0, -1, 0, 255}, {0, 0, -1, 255}};

template <const Matrix& matrix> PyxStatus twist(u8* rgb, int step, RoiSize size)
{
    return pyxiColorTwist32f_8u_C3IR(rgb, step, size, matrix);
}

struct Filter {
    std::string_view name, text;
    PyxStatus (*apply)(u8* rgb, int step, RoiSize size);
};

constexpr Filter filters[] = {
    {"gray", "no colours", twist<gray>},
    {"vivid", "half as much colour again", twist<vivid>},
    {"sepia", "an old photograph", twist<sepia>},
    {"negative", "dark for bright", twist<negative>},
    {"brighten", "the gamma curve of video", pyxiGammaFwd_8u_C3IR},
    {"darken", "its inverse", pyxiGammaInv_8u_C3IR},
};

std::string usage()
{
    std::string text = "usage: y4m_filter FILTER [input.y4m] > output.y4m\n\n";
    for (const Filter& filter : filters) {
        text += "  " + std::string(filter.name) + std::string(10 - filter.name.size(), ' ') + std::string(filter.text) +
                '\n';
    }
    return text;
}

// Reading and writing.

[[noreturn]] void fail(const std::string& text) { throw std::runtime_error(text); }

/// Reads up to the end of the line; false if the stream is at its end.
bool readLine(FILE* file, std::string& line)
{
    line.clear();
    int character = 0;
    while ((character = std::getc(file)) != EOF && character != '\n') {
        if (line.size() == 4096) fail("a line of its headers is too long");
        line += static_cast<char>(character);
    }
    if (std::ferror(file)) fail(std::strerror(errno));
    if (character == EOF && !line.empty()) fail("it ends within a header");
    return character != EOF;
}

void put(std::string_view bytes)
{
    if (std::fwrite(bytes.data(), 1, bytes.size(), stdout) != bytes.size()) {
        fail(std::string("cannot write: ") + std::strerror(errno));
    }
}

int lengthIn(std::string_view word)
{
    int length = 0;
    const char* const end = word.data() + word.size();
    const auto result = std::from_chars(word.data() + 1, end, length);
    if (result.ec != std::errc{} || result.ptr != end || length < 1 || length > 16384) {
        fail("its size is not of 1 to 16384 pixels: " + std::string(word));
    }
    return length;
}

/// The size that the first line tells. What this filter cannot do is turned down.
RoiSize parseHeader(const std::string& line)
{
    std::istringstream words(line);
    std::string word;
    RoiSize size = {0, 0};
    if (!(words >> word) || word != "YUV4MPEG2") fail("it is not a YUV4MPEG2 stream");
    while (words >> word) {
        if (word[0] == 'W') size.width = lengthIn(word);
        if (word[0] == 'H') size.height = lengthIn(word);
        const bool known = word == "C420" || word == "C420jpeg" || word == "C420mpeg2" || word == "C420paldv";
        if (word[0] == 'C' && !known) fail("its chroma is not of 8-bit 4:2:0: " + word);
        if (word[0] == 'I' && word != "Ip" && word != "I?") fail("it is interlaced: " + word);
        if (word == "XCOLORRANGE=FULL") fail("its samples are of full range");
    }
    if (size.width == 0 || size.height == 0) fail("its header does not tell a size");
    return size;
}

/// A frame with room for whole blocks of 2 by 2 pixels, as it is those that are converted.
class Frame
{
public:
    explicit Frame(RoiSize shown) : shown_(shown), whole_{(shown.width + 1) & ~1, (shown.height + 1) & ~1}
    {
        const std::size_t pixels = std::size_t{1} * whole_.width * whole_.height;
        samples_.resize(3 * pixels / 2);
        rgb_.resize(3 * pixels);
        for (const std::size_t at : {std::size_t{0}, pixels, 5 * pixels / 4}) planes_.push_back(samples_.data() + at);
    }

    bool read(FILE* file, long number)
    {
        if (!readLine(file, header_)) return false;
        const std::string name = "frame " + std::to_string(number);
        if (header_ != "FRAME" && !header_.starts_with("FRAME ")) fail(name + " does not begin where it should");
        eachRow([&](u8* row, std::size_t length) {
            if (std::fread(row, 1, length, file) != length) fail(name + " is cut short");
        });
        return true;
    }

    void write() const
    {
        put(header_ + '\n');
        eachRow([](const u8* row, std::size_t length) { put({reinterpret_cast<const char*>(row), length}); });
    }

    void filter(const Filter& filter)
    {
        repeatEdges();
        const int step = 3 * whole_.width;
        PyxStatus status = pyxiYCbCr420ToRGB_8u_P3C3R(planes_.data(), steps_, rgb_.data(), step, whole_);
        if (status == pyxOk) status = filter.apply(rgb_.data(), step, whole_);
        if (status == pyxOk) status = pyxiRGBToYCbCr420_8u_C3P3R(rgb_.data(), step, planes_.data(), steps_, whole_);
        if (status != pyxOk) fail("a conversion returns " + std::to_string(status));
    }

private:
    /// Visits the rows as they lie in the stream. Chroma has a sample for a part of a block, too.
    template <class Visit> void eachRow(Visit visit) const
    {
        for (int plane = 0; plane < 3; ++plane) {
            const RoiSize size = plane == 0 ? shown_ : RoiSize{whole_.width / 2, whole_.height / 2};
            for (int y = 0; y < size.height; ++y) {
                visit(planes_[plane] + std::ptrdiff_t{y} * steps_[plane], static_cast<std::size_t>(size.width));
            }
        }
    }

    /// Luma of a column and a row that are not shown.
    void repeatEdges()
    {
        u8* const luma = planes_[0];
        const std::ptrdiff_t step = steps_[0];
        if (whole_.width > shown_.width) {
            for (int y = 0; y < shown_.height; ++y) luma[y * step + shown_.width] = luma[y * step + shown_.width - 1];
        }
        if (whole_.height > shown_.height)
            std::copy_n(luma + (shown_.height - 1) * step, step, luma + shown_.height * step);
    }

    RoiSize shown_, whole_;
    int steps_[3] = {whole_.width, whole_.width / 2, whole_.width / 2};
    std::vector<u8> samples_, rgb_;
    std::vector<u8*> planes_; ///< Y, Cb and Cr within the samples
    std::string header_;
};

/// Shows how far it is, where there is somebody to see it: with a bar if the length of the input is known.
class Progress
{
public:
    explicit Progress(FILE* input) : input_(input), visible_(isatty(STDERR_FILENO) != 0)
    {
        struct stat status = {};
        if (fstat(fileno(input), &status) == 0 && S_ISREG(status.st_mode)) length_ = status.st_size;
    }

    ~Progress()
    {
        if (visible_ && drawn_) std::fputc('\n', stderr);
    }

    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    void show(long frames, bool last = false)
    {
        const auto now = std::chrono::steady_clock::now();
        if (!visible_ || (drawn_ && !last && now - shownAt_ < std::chrono::milliseconds(100))) return;
        const double seconds = std::chrono::duration<double>(now - start_).count();
        std::string bar;
        if (length_ > 0) {
            const double part = std::min(1.0, static_cast<double>(ftello(input_)) / static_cast<double>(length_));
            bar = '[' + std::string(static_cast<std::size_t>(part * barWidth), '#');
            bar.resize(1 + barWidth, '.');
            bar += "] " + std::to_string(static_cast<int>(part * 100)) + " %  ";
        }
        std::fprintf(stderr, "\r%sframe %ld, %.0f a second ", bar.c_str(), frames, frames / std::max(seconds, 1e-3));
        std::fflush(stderr);
        shownAt_ = now;
        drawn_ = true;
    }

private:
    static constexpr std::size_t barWidth = 40;
    FILE* input_;
    bool visible_, drawn_ = false;
    off_t length_ = 0;
    std::chrono::steady_clock::time_point start_ = std::chrono::steady_clock::now(), shownAt_ = start_;
};

void run(const Filter& filter, FILE* input)
{
    std::string header;
    if (!readLine(input, header)) fail("it is empty");
    Frame frame(parseHeader(header));
    put(header + '\n');
    Progress progress(input);
    long frames = 0;
    for (; frame.read(input, frames + 1); ++frames) {
        frame.filter(filter);
        frame.write();
        progress.show(frames + 1);
    }
    if (std::fflush(stdout) != 0) fail(std::string("cannot write: ") + std::strerror(errno));
    progress.show(frames, true);
}

} // namespace

int main(int argc, char** argv)
{
    const std::string_view name = argc > 1 ? argv[1] : "";
    if (name == "-h" || name == "--help") {
        std::fputs(usage().c_str(), stdout);
        return 0;
    }
    const auto* const filter = std::ranges::find(filters, name, &Filter::name);
    if (filter == std::end(filters) || argc > 3) {
        std::fputs(usage().c_str(), stderr);
        return 2;
    }
    const char* const inputName = argc > 2 ? argv[2] : "standard input";
    FILE* const input = argc > 2 ? std::fopen(inputName, "rb") : stdin;
    try {
        if (!input) fail(std::strerror(errno));
        run(*filter, input);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "y4m_filter: %s: %s\n", inputName, error.what());
        return 1;
    }
    return 0;
}
