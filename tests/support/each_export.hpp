// A named test case for each export.
#pragma once

#include "support/subject.hpp"

#include <optional>
#include <string>

namespace support
{

/// Tells what is wrong with an export, or nothing.
using Check = std::optional<std::string> (*)(const Subject& subject);

/// Registers the test `suite`.`export` for each export. To be called before RUN_ALL_TESTS().
void testEachExport(const char* suite, Check check);

} // namespace support
