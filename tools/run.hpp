// One export on one picture.
#pragma once

#include "catalog.hpp"
#include "files.hpp"

#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

namespace tool
{

struct RunOptions {
    fs::path input, output;
    std::optional<RoiSize> rawSize;       ///< the input is raw planes of that size, in the export's source format
    std::vector<std::string> assignments; ///< "name=value"
};

/// Converts, writes and tells about it. An error status of the export is a Failure, and nothing is written.
void run(const catalog::Export& entry, const RunOptions& options, std::ostream& out);

} // namespace tool
