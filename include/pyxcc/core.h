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
    pyxCpuSse2 = 1 << 0,  /**< SSE2 */
    pyxCpuSse3 = 1 << 1,  /**< SSE3 */
    pyxCpuSsse3 = 1 << 2, /**< SSSE3 */
    pyxCpuSse41 = 1 << 3, /**< SSE4.1 */
    pyxCpuSse42 = 1 << 4, /**< SSE4.2 */
    pyxCpuAvx = 1 << 5,   /**< AVX */
    pyxCpuFma = 1 << 6,   /**< FMA */
    pyxCpuAvx2 = 1 << 7   /**< AVX2 */
};

/**
 * Allocates memory. Safe to call from several threads at once.
 *
 * @param byteCount size in bytes
 * @return memory aligned to 64 bytes, or null for a count below 1 and when memory is exhausted
 */
PYXCC_API void* PYXCC_CALL pyxMalloc(s32 byteCount);

/**
 * Frees memory. Safe to call from several threads at once.
 *
 * @param memory what pyxMalloc() returned, or null
 */
PYXCC_API void PYXCC_CALL pyxFree(void* memory);

/**
 * Finds the size of the processor's largest cache.
 *
 * @param size takes the size in bytes
 * @return ::pyxOk, or an error if it is not known
 */
PYXCC_API PyxStatus PYXCC_CALL pyxGetMaxCacheSizeB(s32* size);

/**
 * Finds what the processor and the operating system offer.
 *
 * @return the mask of the features that programs may use, of bits like ::pyxCpuAvx2
 */
PYXCC_API u32 PYXCC_CALL pyxGetEnabledCpuFeatures(void);

#ifdef __cplusplus
}
#endif

#endif
