#include "files.hpp"

#include "failure.hpp"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>
#include <unistd.h>

namespace tool
{

namespace
{

struct Close {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using Handle = std::unique_ptr<std::FILE, Close>;

[[noreturn]] void failFor(std::string_view what, const fs::path& path, int error)
{
    fail("cannot ", what, " ", path.string(), ": ", std::strerror(error));
}

fs::path stagedName(const fs::path& target)
{
    fs::path name = target;
    name += ".part" + std::to_string(getpid());
    return name;
}

/// Writes a file that is not there yet, or leaves none; errors speak of `shown`.
void writeNew(const fs::path& path, const fs::path& shown, std::span<const u8> bytes)
{
    Handle file(std::fopen(path.c_str(), "wbx"));
    if (!file) failFor("write", shown, errno);
    const bool written = bytes.empty() || std::fwrite(bytes.data(), bytes.size(), 1, file.get()) == 1;
    if (written && std::fclose(file.release()) == 0) return;
    const int error = errno;
    std::error_code ignored;
    fs::remove(path, ignored);
    failFor("write", shown, error);
}

void moveTo(const fs::path& from, const fs::path& to)
{
    std::error_code error;
    fs::rename(from, to, error);
    if (error) failFor("write", to, error.value());
}

/// A file on its way to its name.
class StagedFile
{
public:
    explicit StagedFile(const File& file) : target_(file.path), staged_(stagedName(file.path))
    {
        std::error_code error;
        const fs::file_status status = fs::status(target_, error);
        if (fs::exists(status) && !fs::is_regular_file(status)) {
            fail("cannot write ", target_.string(), ": it exists and is not a file");
        }
        writeNew(staged_, target_, file.bytes);
    }
    StagedFile(const StagedFile&) = delete;
    StagedFile& operator=(const StagedFile&) = delete;
    ~StagedFile()
    {
        std::error_code error;
        fs::remove(staged_, error); // does nothing once it has been renamed
    }
    void commit() const { moveTo(staged_, target_); }

private:
    fs::path target_, staged_;
};

} // namespace

Bytes readFile(const fs::path& path)
{
    std::error_code error;
    if (fs::is_directory(path, error)) failFor("read", path, EISDIR);
    const Handle file(std::fopen(path.c_str(), "rb"));
    if (!file) failFor("read", path, errno);
    Bytes bytes;
    constexpr std::size_t chunk = 1 << 20, most = std::size_t{1} << 31;
    for (std::size_t got = chunk; got == chunk;) {
        const std::size_t size = bytes.size();
        if (size > most) fail("cannot read ", path.string(), ": it is too large");
        bytes.resize(size + chunk);
        got = std::fread(bytes.data() + size, 1, chunk, file.get());
        bytes.resize(size + got);
    }
    if (std::ferror(file.get()) != 0) failFor("read", path, errno);
    return bytes;
}

void writeFiles(std::span<const File> files)
{
    std::vector<std::unique_ptr<StagedFile>> staged;
    for (const File& file : files) staged.push_back(std::make_unique<StagedFile>(file));
    for (const auto& file : staged) file->commit();
}

StagedDirectory::StagedDirectory(fs::path target) : target_(std::move(target))
{
    if (!target_.has_filename()) target_ = target_.parent_path(); // a slash at the end
    std::error_code error;
    if (fs::exists(fs::symlink_status(target_, error))) fail("cannot make ", target_.string(), ": it exists already");
    staged_ = stagedName(target_);
    if (!fs::create_directory(staged_, error)) {
        failFor("make", target_, error ? error.value() : EEXIST);
    }
}

StagedDirectory::~StagedDirectory()
{
    std::error_code error;
    fs::remove_all(staged_, error);
}

void StagedDirectory::write(std::string_view name, std::span<const u8> bytes) const
{
    writeNew(staged_ / name, target_ / name, bytes);
}

void StagedDirectory::commit() { moveTo(staged_, target_); }

} // namespace tool
