/**
 * @file
 * @brief The core library `pyxcore`: what the conversions ask of the platform.
 *
 * The conversion library calls these by name through the dynamic linker, so that a program may put its own in front.
 */
#ifndef PYXCC_CORE_H
#define PYXCC_CORE_H

#include "pyxcc/types.h"

#ifdef __cplusplus
extern "C" {
#endif

/** Bits of the mask that pyxGetEnabledCpuFeatures() returns. */
enum {
    pyxCpuSse2 = 1 << 0,
    pyxCpuSse3 = 1 << 1,
    pyxCpuSsse3 = 1 << 2,
    pyxCpuSse41 = 1 << 3,
    pyxCpuSse42 = 1 << 4,
    pyxCpuAvx = 1 << 5,
    pyxCpuFma = 1 << 6,
    pyxCpuAvx2 = 1 << 7
};

/**
 * Allocates `byteCount` bytes aligned to 64 bytes. Returns null for a count below 1 and when memory is exhausted.
 * Safe to call from several threads at once.
 */
PYXCC_API void* PYXCC_CALL pyxMalloc(s32 byteCount);

/** Frees what pyxMalloc() returned; null is allowed. */
PYXCC_API void PYXCC_CALL pyxFree(void* memory);

/** Stores the size in bytes of the processor's largest cache in `*size`. Returns ::pyxOk, or an error if not known. */
PYXCC_API PyxStatus PYXCC_CALL pyxGetMaxCacheSizeB(s32* size);

/** Returns the mask of the processor features that programs may use. */
PYXCC_API u32 PYXCC_CALL pyxGetEnabledCpuFeatures(void);

#ifdef __cplusplus
}
#endif

#endif
