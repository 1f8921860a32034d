// What a shared library gives to others, read from its file.
#pragma once

#include <string>
#include <vector>

namespace support
{

/// The names that the library which holds `function` defines for others, sorted.
std::vector<std::string> exportedNames(const void* function);

/// Which names are missing and which are too many; empty if none. Both lists are sorted.
std::string difference(const std::vector<std::string>& expected, const std::vector<std::string>& found);

} // namespace support
