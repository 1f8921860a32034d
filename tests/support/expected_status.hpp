// What an export has to return, by the catalogue.
#pragma once

#include "catalog.hpp"

namespace support
{

/// The error of the first check that fails, else the warning that the size asks for, else pyxOk.
PyxStatus expectedStatus(const catalog::Export& entry, const catalog::Invocation& call);

} // namespace support
