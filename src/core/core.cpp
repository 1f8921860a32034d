#include "pyxcc/core.h"

#include <cstdlib>
#include <unistd.h>

#include <algorithm>

void* PYXCC_CALL pyxMalloc(s32 byteCount)
{
    constexpr std::size_t alignment = 64;
    if (byteCount < 1) return nullptr;
    const std::size_t rounded = (static_cast<std::size_t>(byteCount) + alignment - 1) & ~(alignment - 1);
    return std::aligned_alloc(alignment, rounded);
}

void PYXCC_CALL pyxFree(void* memory) { std::free(memory); }

PyxStatus PYXCC_CALL pyxGetMaxCacheSizeB(s32* size)
{
    if (!size) return pyxErrNullPtr;
    long largest = 0;
#if defined(_SC_LEVEL3_CACHE_SIZE)
    for (const int level :
         {_SC_LEVEL1_DCACHE_SIZE, _SC_LEVEL2_CACHE_SIZE, _SC_LEVEL3_CACHE_SIZE, _SC_LEVEL4_CACHE_SIZE}) {
        largest = std::max(largest, sysconf(level));
    }
#endif
    if (largest < 1) return pyxErrBadArg;
    *size = static_cast<s32>(std::min(largest, 0x7fffffffL));
    return pyxOk;
}

u32 PYXCC_CALL pyxGetEnabledCpuFeatures(void)
{
    u32 mask = 0;
    const auto add = [&mask](bool present, u32 bit) { mask |= present ? bit : 0; };
    __builtin_cpu_init();
    add(__builtin_cpu_supports("sse2"), pyxCpuSse2);
    add(__builtin_cpu_supports("sse3"), pyxCpuSse3);
    add(__builtin_cpu_supports("ssse3"), pyxCpuSsse3);
    add(__builtin_cpu_supports("sse4.1"), pyxCpuSse41);
    add(__builtin_cpu_supports("sse4.2"), pyxCpuSse42);
    add(__builtin_cpu_supports("avx"), pyxCpuAvx);
    add(__builtin_cpu_supports("fma"), pyxCpuFma);
    add(__builtin_cpu_supports("avx2"), pyxCpuAvx2);
    return mask;
}
