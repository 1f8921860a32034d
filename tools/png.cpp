#include "image_file.hpp"

#include "failure.hpp"

#include <bit>
#include <csetjmp>
#include <cstdio>
#include <cstring>

#include <png.h>

namespace tool
{

namespace
{

using catalog::Element;

struct ErrorText {
    char text[160] = "";
};

/// Keeps what libpng says and jumps back to guarded().
[[noreturn]] void onError(png_structp png, png_const_charp text)
{
    auto* error = static_cast<ErrorText*>(png_get_error_ptr(png));
    std::snprintf(error->text, sizeof error->text, "%s", text);
    std::longjmp(png_jmpbuf(png), 1);
}

void onWarning(png_structp, png_const_charp) {}

/// Runs `work` and returns false if libpng raised an error in it. An error jumps out of `work` without a word to C++,
/// so that nothing in there may own anything.
template <class Work> bool guarded(png_structp png, Work work)
{
    if (setjmp(png_jmpbuf(png)) != 0) return false;
    work();
    return true;
}

class Reader
{
public:
    explicit Reader(const Bytes& bytes) : bytes_(bytes)
    {
        png_ = png_create_read_struct(PNG_LIBPNG_VER_STRING, &error_, onError, onWarning);
        info_ = png_ != nullptr ? png_create_info_struct(png_) : nullptr;
        if (info_ == nullptr) throw std::bad_alloc();
    }
    ~Reader() { png_destroy_read_struct(&png_, &info_, nullptr); }
    Reader(const Reader&) = delete;
    Reader& operator=(const Reader&) = delete;

    /// Reads up to the pixels, and asks for gray, RGB or RGBA of 8 or 16 bits in the machine's byte order.
    bool readHeader()
    {
        return guarded(png_, [this] {
            png_set_read_fn(png_, this, onRead);
            png_set_user_limits(png_, maxSide, maxSide);
            png_read_info(png_, info_);
            png_set_expand(png_);
            png_set_interlace_handling(png_);
            if (png_get_bit_depth(png_, info_) == 16 && std::endian::native == std::endian::little) png_set_swap(png_);
            const bool alpha = (png_get_color_type(png_, info_) & PNG_COLOR_MASK_ALPHA) != 0;
            if (alpha || png_get_valid(png_, info_, PNG_INFO_tRNS) != 0) png_set_gray_to_rgb(png_);
            png_read_update_info(png_, info_);
        });
    }

    bool readPixels(std::vector<png_bytep>& rows)
    {
        return guarded(png_, [this, pointers = rows.data()] {
            png_read_image(png_, pointers);
            png_read_end(png_, nullptr);
        });
    }

    RoiSize size() const
    {
        return {static_cast<s32>(png_get_image_width(png_, info_)),
                static_cast<s32>(png_get_image_height(png_, info_))};
    }
    Format format() const
    {
        const Element element = png_get_bit_depth(png_, info_) == 16 ? Element::u16 : Element::u8;
        const int channels = png_get_channels(png_, info_);
        if (channels == 1) return gray(element);
        return rgb(channels == 4 ? "C4" : "C3", element);
    }
    const char* error() const { return error_.text; }

private:
    static void onRead(png_structp png, png_bytep to, std::size_t count)
    {
        auto* self = static_cast<Reader*>(png_get_io_ptr(png));
        if (count > self->bytes_.size() - self->at_) png_error(png, "it ends too early");
        std::memcpy(to, self->bytes_.data() + self->at_, count);
        self->at_ += count;
    }

    const Bytes& bytes_;
    std::size_t at_ = 0;
    ErrorText error_;
    png_structp png_ = nullptr;
    png_infop info_ = nullptr;
};

class Writer
{
public:
    Writer()
    {
        png_ = png_create_write_struct(PNG_LIBPNG_VER_STRING, &error_, onError, onWarning);
        info_ = png_ != nullptr ? png_create_info_struct(png_) : nullptr;
        if (info_ == nullptr) throw std::bad_alloc();
    }
    ~Writer() { png_destroy_write_struct(&png_, &info_); }
    Writer(const Writer&) = delete;
    Writer& operator=(const Writer&) = delete;

    bool write(RoiSize size, int depth, int colorType, std::vector<png_bytep>& rows)
    {
        return guarded(png_, [this, size, depth, colorType, pointers = rows.data()] {
            png_set_write_fn(png_, this, onWrite, nullptr);
            png_set_IHDR(png_, info_, static_cast<png_uint_32>(size.width), static_cast<png_uint_32>(size.height),
                         depth, colorType, PNG_INTERLACE_NONE, PNG_COMPRESSION_TYPE_DEFAULT, PNG_FILTER_TYPE_DEFAULT);
            png_write_info(png_, info_);
            if (depth == 16 && std::endian::native == std::endian::little) png_set_swap(png_);
            png_write_image(png_, pointers);
            png_write_end(png_, nullptr);
        });
    }

    const char* error() const { return error_.text; }
    Bytes take() { return std::move(bytes_); }

private:
    static void onWrite(png_structp png, png_bytep from, std::size_t count)
    {
        auto* self = static_cast<Writer*>(png_get_io_ptr(png));
        bool stored = true;
        try {
            self->bytes_.insert(self->bytes_.end(), from, from + count);
        } catch (const std::bad_alloc&) {
            stored = false;
        }
        if (!stored) png_error(png, "out of memory");
    }

    Bytes bytes_;
    ErrorText error_;
    png_structp png_ = nullptr;
    png_infop info_ = nullptr;
};

std::vector<png_bytep> rowsOf(Image& image)
{
    std::vector<png_bytep> rows(static_cast<std::size_t>(image.size().height));
    for (std::size_t y = 0; y < rows.size(); ++y)
        rows[y] = image.plane(0) + y * static_cast<std::size_t>(image.step(0));
    return rows;
}

} // namespace

bool looksLikePng(const Bytes& bytes) { return bytes.size() >= 8 && png_sig_cmp(bytes.data(), 0, 8) == 0; }

Image decodePng(const Bytes& bytes, const std::string& name)
{
    Reader reader(bytes);
    if (!reader.readHeader()) fail(name, " is not a sound PNG file: ", reader.error());
    const RoiSize size = reader.size();
    checkSize(size.width, size.height, name);
    Image image(reader.format(), size);
    std::vector<png_bytep> rows = rowsOf(image);
    if (!reader.readPixels(rows)) fail(name, " is not a sound PNG file: ", reader.error());
    return image;
}

Bytes encodePng(const Image& image)
{
    const int depth = catalog::sizeOf(image.side().element) * 8;
    const int colorType = isGray(image.side())        ? PNG_COLOR_TYPE_GRAY
                          : image.side().samples == 4 ? PNG_COLOR_TYPE_RGB_ALPHA
                                                      : PNG_COLOR_TYPE_RGB;
    Image copy = image; // libpng takes its rows as writable
    std::vector<png_bytep> rows = rowsOf(copy);
    Writer writer;
    if (!writer.write(image.size(), depth, colorType, rows)) fail("cannot make a PNG file: ", writer.error());
    return writer.take();
}

} // namespace tool
