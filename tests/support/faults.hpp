// Calls with something wrong about them.
#pragma once

#include "support/scene.hpp"

#include <functional>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace support
{

/// Something wrong with a call.
struct Fault {
    std::string text;
    std::function<void(catalog::Invocation&)> apply;
};

/// All that can be wrong about a call of an export and that it tests.
std::vector<Fault> faultsOf(const catalog::Export& entry);

/// Makes the scene's call on a target of its own with those faults. Tells if the status is not the catalogue's, or what
/// was written.
std::optional<std::string> checkRefusal(const catalog::Export& entry, catalog::Function function, const Scene& scene,
                                        std::span<const Fault> faults);

} // namespace support
