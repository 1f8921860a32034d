// Images byte by byte.
#pragma once

#include "support/image.hpp"

#include <optional>
#include <string>

namespace support
{

/// Where the images first differ, margins and gaps between rows included, or nothing. All NaNs are equal, and samples
/// may be `tolerance` off.
std::optional<std::string> firstDifference(const Image& expected, const Image& actual, double tolerance = 0);

} // namespace support
