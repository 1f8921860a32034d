// What is demanded of every export. Each check tells what is wrong, or nothing.
#pragma once

#include "support/subject.hpp"

#include <optional>
#include <string>

namespace conformance
{

using support::Subject;
using Failure = std::optional<std::string>;

/// Every byte of the targets agrees with the reference, for all widths, steps, alignments and kinds of samples.
Failure checkValues(const Subject& subject);

/// Nothing is touched in front of an image or behind it.
Failure checkGuards(const Subject& subject);

/// Wrong arguments yield the status that comes first in the export's order, and nothing is written.
Failure checkFaults(const Subject& subject);

/// The caller's rounding mode stays as it is. Floats follow it, integers do not depend on it.
Failure checkRounding(const Subject& subject);

} // namespace conformance
