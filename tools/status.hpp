// Statuses in words.
#pragma once

#include "pyxcc/types.h"

#include <string>

namespace tool
{

/// "pyxErrSize"
std::string_view statusName(PyxStatus status);

/// "pyxErrSize (-6)"
std::string statusText(PyxStatus status);

} // namespace tool
