// The images of one call, of the copy that it is measured against, and their sizes.
#pragma once

#include "catalog.hpp"

#include <cstddef>
#include <cstdlib>
#include <memory>
#include <vector>

namespace bench
{

struct Free {
    void operator()(void* memory) const { std::free(memory); }
};

/// Memory aligned to 64 bytes.
using Buffer = std::unique_ptr<std::byte[], Free>;

/// `bytes` bytes, all written to, so that no page is first touched while time is taken.
Buffer allocate(std::size_t bytes);

/// A call with tight images of its own.
struct Workload {
    std::vector<Buffer> planes;
    std::vector<Buffer> lists; ///< parameters that are pointers
    catalog::Invocation call;
    std::size_t bytes =
        0; ///< of source and target: all that the layouts hold, a fourth channel that is not read included
};

/// Parameters have their standard values, or those of a variant.
Workload prepare(const catalog::Export& entry, const catalog::Variant* variant, RoiSize roi);

} // namespace bench
