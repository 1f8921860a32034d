// Reads an export's name: pyxi Source To Target [_variant] _depths _layouts [R].
#pragma once

#include "catalog.hpp"

namespace catalog::detail
{

struct Naming {
    Side source;
    Side target;
    std::string variant;
    bool inPlace = false;
    bool stepless = false;
};

Naming readName(std::string_view name);

} // namespace catalog::detail
