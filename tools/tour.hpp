// A contact sheet: what every export does to a picture.
#pragma once

#include "catalog.hpp"
#include "files.hpp"
#include "image.hpp"

#include <iosfwd>
#include <span>
#include <string>

namespace tool
{

/// Writes index.html and the pictures it shows into a new directory, and tells of its progress. `title` names the
/// picture that is given.
void writeTour(const Image& given, const std::string& title, std::span<const catalog::Export* const> exports,
               const fs::path& directory, std::ostream& progress);

} // namespace tool
