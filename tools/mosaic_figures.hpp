// What both conversions of mosaics make of one, against the picture that it was made from.
#pragma once

#include "image.hpp"

#include <string>
#include <vector>

namespace tool
{

struct NamedImage {
    std::string file; ///< as a part of a file's name
    Image image;
    std::string caption;
};

/// Peak signal to noise over all channels, in dB; infinite if the images are the same. Both are RGB C3 of u8.
double psnr(const Image& a, const Image& b);

inline constexpr const char* mosaicFiguresText =
    "A mosaic made of a picture, and what both conversions make of it again: the part in which they differ most, and "
    "their peak signal to noise over all of the picture.";

/// Three of the picture and three of a zone plate: a mosaic and its conversion in one pass and by homogeneity, each a
/// part magnified. None of a picture too small for both.
std::vector<NamedImage> mosaicFigures(const Image& picture);

} // namespace tool
