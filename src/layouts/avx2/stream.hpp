// Stores that go past the cache. A thread that has made them ends with fenceStreams().
#pragma once

#include "lanes/avx2/integers.hpp"

namespace pyxcc::layouts
{

/// Writes 32 samples at an address that is a multiple of 32.
PYXCC_INLINE void streamSamples(u8* p, wide::U8 samples)
{
    _mm256_stream_si256(reinterpret_cast<__m256i*>(p), samples.v);
}

PYXCC_INLINE void fenceStreams() { _mm_sfence(); }

} // namespace pyxcc::layouts
