// An export in words.
#pragma once

#include "catalog.hpp"

#include <string>

namespace tool
{

/// "RGB C3 u8 -> YCbCr P3 u8"
std::string conversionOf(const catalog::Export& entry);

/// The C prototype, with the usual names of the arguments.
std::string prototypeOf(const catalog::Export& entry);

/// Prototype, both ends, parameters, order of tests, smallest size and statuses, on several lines.
std::string sheetOf(const catalog::Export& entry);

} // namespace tool
