// What an image looks like.
#pragma once

#include "image.hpp"
#include "route.hpp"

#include <optional>

namespace tool
{

/// The format that shows an image best in a PNG file: with its alpha, in 16 bits or in gray if it has these.
Format pictureFormat(const Format& format);

/// The way from an image's format to one for a PNG file.
std::optional<Route> wayToPicture(const Graph& graph, const Format& format);

/// The largest size of that shape that goes into `box`, at least 1 by 1; `shape` itself if it does.
RoiSize fitted(RoiSize shape, RoiSize box);

/// `image` is interleaved RGB or gray.
Image scaledDown(const Image& image, RoiSize box);

/// With samples of 8 bits; `image` is RGB or gray.
Image eightBit(const Image& image);

/// The components from left to right in gray, each in a tile of that size, with clear gaps between. Where the model
/// fixes no black and white, the smallest and the largest value are shown so.
Image componentTiles(const Image& image, RoiSize tile);

} // namespace tool
