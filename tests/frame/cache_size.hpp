// A cache whose size the tests tell, in place of the processor's.
#pragma once

#include "pyxcc/types.h"

/// What pyxGetMaxCacheSizeB() tells; 0 for not known.
extern s32 cacheSize;

inline constexpr s32 tinyCache = 1; ///< so that whatever may go past the cache does
