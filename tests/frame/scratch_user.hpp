// A shared library that takes scratch memory as the conversions do.
#pragma once

#include "pyxcc/types.h"

/// Takes and gives back room for `count` numbers. Whether there was memory.
PYXCC_API bool takeScratch(s32 count);
