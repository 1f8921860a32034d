// The control word of the vector float unit: rounding mode, exception masks and sticky flags of the calling thread.
#pragma once

#include "lanes/inline.hpp"
#include "pyxcc/types.h"

#include <immintrin.h>

namespace pyxcc::wide
{

PYXCC_INLINE u32 controlWord() { return _mm_getcsr(); }
PYXCC_INLINE void setControlWord(u32 word) { _mm_setcsr(word); }

} // namespace pyxcc::wide
