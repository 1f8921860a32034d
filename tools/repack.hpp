// What the tool itself can do to bring an image into another format, so that a picture can reach every export: another
// order or arrangement of the same components, another depth of RGB and gray, gray as RGB, RGB as a sensor's mosaic.
#pragma once

#include "image.hpp"

namespace tool
{

bool canRepack(const Format& from, const Format& to);
Image repack(const Image& from, const Format& to);

} // namespace tool
