// An export beside its plain statement.
#pragma once

#include "catalog.hpp"

#include <span>

namespace support
{

struct Subject {
    const catalog::Export* entry;
    catalog::Function function;  ///< what is tested
    catalog::Function reference; ///< the plain statement, which tells what is right
};

/// All exports of the library.
std::span<const Subject> subjects();

/// An export with another function in place of the library's.
Subject substitute(std::string_view name, catalog::Function function);

} // namespace support
