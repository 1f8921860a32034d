// Pictures in files.
#pragma once

#include "files.hpp"
#include "image.hpp"

#include <string>

namespace tool
{

/// Reads a PNG, PPM, PGM or PFM file, told by its first bytes, as RGB C3 or C4 or as gray.
Image readPicture(const fs::path& path);

/// Reads planes one after another with rows end to end, as rawBytes() writes them.
Image readRaw(const fs::path& path, const Format& format, RoiSize size);
Bytes rawBytes(const Image& image);

/// `image` is RGB C3 or C4 or gray, of u8 or u16.
Bytes encodePng(const Image& image);

bool looksLikePng(const Bytes& bytes);
bool looksLikePnm(const Bytes& bytes);

/// `name` is what errors call the file.
Image decodePng(const Bytes& bytes, const std::string& name);
Image decodePnm(const Bytes& bytes, const std::string& name);

/// A Failure if a picture of that size is more than the tool takes.
void checkSize(long long width, long long height, const std::string& name);

} // namespace tool
