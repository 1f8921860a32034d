#include "image_file.hpp"

#include "component.hpp"
#include "failure.hpp"

#include <bit>
#include <charconv>
#include <cmath>

namespace tool
{

namespace
{

using catalog::Element;

class Parser
{
public:
    Parser(const Bytes& bytes, const std::string& name) : bytes_(bytes), name_(name) {}

    /// The next word of the header, in front of which comments may stand.
    std::string word()
    {
        skipSpace();
        std::string text;
        while (at_ < bytes_.size() && !isSpace(bytes_[at_]) && text.size() < 32)
            text += static_cast<char>(bytes_[at_++]);
        if (text.empty()) fail(name_, " ends within its header");
        return text;
    }

    template <class Number> Number number()
    {
        const std::string text = word();
        Number value = 0;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
        if (error != std::errc{} || end != text.data() + text.size()) {
            fail(name_, " has '", text, "' in its header where a number belongs");
        }
        return value;
    }

    /// The samples, which begin one character behind the header's last word.
    const u8* samples(std::size_t byteCount)
    {
        ++at_;
        if (at_ > bytes_.size() || bytes_.size() - at_ < byteCount) fail(name_, " ends too early");
        return bytes_.data() + at_;
    }

private:
    static bool isSpace(u8 character) { return character == ' ' || (character >= '\t' && character <= '\r'); }
    void skipSpace()
    {
        bool comment = false;
        for (; at_ < bytes_.size(); ++at_) {
            const u8 character = bytes_[at_];
            if (character == '#') comment = true;
            if (character == '\n') comment = false;
            if (!comment && !isSpace(character)) return;
        }
    }

    const Bytes& bytes_;
    const std::string& name_;
    std::size_t at_ = 0;
};

/// Fills the image with samples that follow on each other; `read` takes the address of one.
template <class Read> void fill(Image& image, const u8* from, int sampleBytes, bool bottomUp, Read read)
{
    const int channels = image.side().samples;
    const int pixelBytes = channels * sampleBytes;
    for (int channel = 0; channel < channels; ++channel) {
        const Component target = component(image, channel);
        for (int y = 0; y < target.size.height; ++y) {
            const int row = bottomUp ? target.size.height - 1 - y : y;
            const u8* at = from + (static_cast<std::size_t>(y) * target.size.width * channels + channel) * sampleBytes;
            for (int x = 0; x < target.size.width; ++x, at += pixelBytes) target.set(x, row, read(at));
        }
    }
}

std::size_t byteCount(RoiSize size, int channels, int sampleBytes)
{
    return static_cast<std::size_t>(size.width) * size.height * channels * sampleBytes;
}

Image decodeFloats(Parser& parser, RoiSize size, bool color, const std::string& name)
{
    const double scale = parser.number<double>();
    if (scale == 0 || !std::isfinite(scale)) fail(name, " has a scale of ", scale);
    const u8* samples = parser.samples(byteCount(size, color ? 3 : 1, 4));
    Image image(color ? rgb("C3", Element::f32) : gray(Element::f32), size);
    // The scale's sign tells the byte order; the lowest row comes first.
    fill(image, samples, 4, true, [little = scale < 0](const u8* at) {
        u32 bits = 0;
        for (int byte = 0; byte < 4; ++byte) bits |= static_cast<u32>(at[byte]) << 8 * (little ? byte : 3 - byte);
        return static_cast<double>(std::bit_cast<f32>(bits));
    });
    return image;
}

Image decodeIntegers(Parser& parser, RoiSize size, bool color, const std::string& name)
{
    const int top = parser.number<int>();
    if (top < 1 || top > 65535) fail(name, " has a largest value of ", top, "; it must be 1 to 65535");
    const bool wide = top > 255;
    const int sampleBytes = wide ? 2 : 1;
    const u8* samples = parser.samples(byteCount(size, color ? 3 : 1, sampleBytes));
    const Element element = wide ? Element::u16 : Element::u8;
    Image image(color ? rgb("C3", element) : gray(element), size);
    const double scale = (wide ? 65535.0 : 255.0) / top;
    fill(image, samples, sampleBytes, false,
         [wide, scale](const u8* at) { return scale * (wide ? at[0] << 8 | at[1] : at[0]); });
    return image;
}

} // namespace

bool looksLikePnm(const Bytes& bytes)
{
    if (bytes.size() < 3 || bytes[0] != 'P') return false;
    return (bytes[1] >= '1' && bytes[1] <= '6') || bytes[1] == 'F' || bytes[1] == 'f';
}

Image decodePnm(const Bytes& bytes, const std::string& name)
{
    Parser parser(bytes, name);
    const std::string kind = parser.word();
    if (kind != "P5" && kind != "P6" && kind != "Pf" && kind != "PF") {
        fail(name, " is a PNM file of kind ", kind, "; the tool reads P5, P6, Pf and PF");
    }
    const int width = parser.number<int>(), height = parser.number<int>();
    checkSize(width, height, name);
    const bool color = kind == "P6" || kind == "PF";
    if (kind[1] == 'f' || kind[1] == 'F') return decodeFloats(parser, {width, height}, color, name);
    return decodeIntegers(parser, {width, height}, color, name);
}

} // namespace tool
