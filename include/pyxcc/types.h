/**
 * @file
 * @brief Element types, statuses and image geometry shared by all conversions.
 *
 * An image is a pointer to the first pixel of a region plus a step: the distance in bytes from the start of one row to
 * the start of the next. A step may be zero or negative and need not be a multiple of the sample's size, unless a
 * conversion says otherwise. A planar image is an array of plane pointers with one step, or with one step a plane.
 */
#ifndef PYXCC_TYPES_H
#define PYXCC_TYPES_H

#include <stdint.h>

/** Marks a name that the shared library exports. */
#if defined(__GNUC__)
#define PYXCC_API __attribute__((visibility("default")))
#else
#define PYXCC_API
#endif

/**
 * The calling convention of every export: all arguments on the stack, removed by the callee, on 32-bit x86, and the
 * platform's own convention elsewhere.
 */
#if defined(__i386__) && defined(__GNUC__)
#define PYXCC_CALL __attribute__((stdcall))
#else
#define PYXCC_CALL
#endif

#ifdef __cplusplus
extern "C" {
#endif

typedef uint8_t u8;   /**< unsigned 8-bit sample */
typedef int8_t s8;    /**< signed 8-bit sample */
typedef uint16_t u16; /**< unsigned 16-bit sample */
typedef int16_t s16;  /**< signed 16-bit sample */
typedef uint32_t u32; /**< unsigned 32-bit integer */
typedef int32_t s32;  /**< signed 32-bit integer */
typedef float f32;    /**< IEEE 754 binary32 sample */
typedef double f64;   /**< IEEE 754 binary64 sample */

/**
 * Result of a conversion. Zero is success; a negative value is an error, and nothing was written; a positive value is
 * a warning, and the work was done unless the conversion says otherwise.
 */
typedef s32 PyxStatus;

/** The values of ::PyxStatus. */
enum {
    pyxOk = 0,                /**< done */
    pyxWarnNegativeLevel = 1, /**< the level found in the source is negative; nothing was written */
    pyxWarnOddSize = 35,      /**< the size is off the chroma block; whole blocks were converted */
    pyxErrBadArg = -5,        /**< a mode or pattern argument is outside its set */
    pyxErrSize = -6,          /**< width or height is below the minimum, or not the multiple required */
    pyxErrNullPtr = -8,       /**< an image, array, element or parameter pointer is null */
    pyxErrNoMemory = -9,      /**< scratch memory could not be allocated */
    pyxErrStep = -14,         /**< a step is below 1, in the conversions that test it */
    pyxErrContext = -17,      /**< internal: the noise generator's state is not valid */
    pyxErrRange = -49,        /**< the upper bound of the value range is not above the lower bound */
    pyxErrLevels = -54,       /**< the level count is outside its range */
    pyxErrNoise = -55,        /**< the noise amount is above 100 */
    pyxErrDitherType = -224   /**< the dither type is not one that the conversion knows */
};

/** Size of a region of interest in pixels, passed by value. */
typedef struct RoiSize {
    s32 width;  /**< columns */
    s32 height; /**< rows */
} RoiSize;

/** Place and size of a region within an image in pixels, passed by value. */
typedef struct RoiRect {
    s32 x;      /**< the first column, from 0 */
    s32 y;      /**< the first row, from 0 */
    s32 width;  /**< columns */
    s32 height; /**< rows */
} RoiRect;

#ifdef __cplusplus
}
#endif

#endif
