// Finds exports by what the user types.
#pragma once

#include "catalog.hpp"

#include <string>
#include <vector>

namespace tool
{

/// All exports whose name holds `filter`, in capitals or not, or whose family it is. A Failure if there are none.
std::vector<const catalog::Export*> matching(const std::string& filter);

/// The export of exactly that name. A Failure that suggests near names if there is none.
const catalog::Export& named(const std::string& name);

/// How many characters have to be inserted, removed or replaced to make one text of the other.
int editDistance(std::string_view a, std::string_view b);

} // namespace tool
