// What the examples share: failures, and the files that pictures come from and go to.
#pragma once

#include <pyxcc/pyxcc.h>

#include <cstddef>
#include <exception>
#include <fstream>
#include <iostream>
#include <stdexcept>
#include <string>
#include <vector>

namespace example
{

[[noreturn]] inline void fail(const std::string& text) { throw std::runtime_error(text); }

/// A negative status is an error, and nothing was written. A positive one is a warning with the work done.
inline void check(PyxStatus status, const char* call)
{
    if (status < 0) fail(std::string(call) + " returns " + std::to_string(status));
}

/// Runs an example's own main function, and prints what it throws.
inline int guarded(int (*body)(const std::vector<std::string>& arguments), int argc, char** argv)
{
    try {
        return body({argv + 1, argv + argc});
    } catch (const std::exception& error) {
        std::cerr << argv[0] << ": " << error.what() << '\n';
        return 1;
    }
}

struct PictureHeader {
    int width = 0, height = 0;
    double scale = 0; ///< the third number
};

/// Reads what PGM and PFM files begin with: two letters and three numbers. The samples follow.
inline PictureHeader readHeader(std::istream& file, const std::string& letters, const std::string& name)
{
    std::string found;
    PictureHeader header;
    const auto next = [&](auto& value) {
        while ((file >> std::ws).peek() == '#') file.ignore(1 << 20, '\n');
        file >> value;
    };
    next(found), next(header.width), next(header.height), next(header.scale);
    if (found != letters || !file) fail(name + " is not a picture of kind " + letters);
    if (header.width < 2 || header.height < 2 || header.width > 16384 || header.height > 16384) {
        fail(name + " must be 2 to 16384 pixels wide and high");
    }
    file.ignore(1);
    return header;
}

inline void readBytes(std::istream& file, void* to, std::size_t count, const std::string& name)
{
    if (!file.read(static_cast<char*>(to), static_cast<std::streamsize>(count))) fail(name + " ends too early");
}

inline void writeFile(const std::string& name, const std::string& header, const std::vector<u8>& bytes)
{
    std::ofstream file(name, std::ios::binary);
    file << header;
    file.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    if (!file.flush()) fail("cannot write " + name);
}

} // namespace example
