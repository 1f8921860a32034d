// A call by a script: bytes that choose the export, its images, its parameters and what is wrong about them.
#pragma once

#include "support/subject.hpp"

#include <optional>
#include <span>
#include <string>

namespace fuzz
{

/// The export that a script calls.
const support::Subject& subjectOf(std::span<const u8> script);

/// Makes the call with the library and with the reference. Tells in what they differ, or what was touched that must not
/// be; nothing if all is well.
std::optional<std::string> checkScript(std::span<const u8> script);

/// The same for that subject, by the script's remaining choices.
std::optional<std::string> checkScript(const support::Subject& subject, std::span<const u8> script);

} // namespace fuzz
