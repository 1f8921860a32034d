// Whole files: read at once, and written so that nobody ever sees a part of one.
#pragma once

#include "pyxcc/types.h"

#include <filesystem>
#include <span>
#include <string_view>
#include <vector>

namespace tool
{

namespace fs = std::filesystem;

using Bytes = std::vector<u8>;

struct File {
    fs::path path;
    Bytes bytes;
};

Bytes readFile(const fs::path& path);

/// Writes all files under names of their own beside the targets, and renames them when all are complete.
void writeFiles(std::span<const File> files);

/// A new directory that appears under its name when commit() is called, and is removed if that does not happen.
class StagedDirectory
{
public:
    explicit StagedDirectory(fs::path target);
    ~StagedDirectory();
    StagedDirectory(const StagedDirectory&) = delete;
    StagedDirectory& operator=(const StagedDirectory&) = delete;

    void write(std::string_view name, std::span<const u8> bytes) const;
    void commit();

private:
    fs::path target_, staged_;
};

} // namespace tool
