// The exports to packed 16-bit pixels as rows of a table: a source, a target, and the plan by which pixels take their
// form. The plain targets and the dithered ones are the same but for their name.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "frame/shared_chroma_forms.hpp"
#include "layouts/shared_chroma.hpp"
#include "packed/inverse_forms.hpp"
#include "packed/models.hpp"

#define PACKED_FROM_PIXELS(name, image, Target, plan)                                                                  \
    PyxStatus PYXCC_CALL name(const u8* src, int srcStep, u16* dst, int dstStep, RoiSize roi)                          \
    {                                                                                                                  \
        using namespace pyxcc;                                                                                         \
        if (const PyxStatus failure = frame::firstFailure(frame::notNull(src, dst), frame::sizeAtLeast(roi, 1, 1)))    \
            return failure;                                                                                            \
        return frame::eachRow(roi, layouts::image(src, srcStep), packed::models::Target(dst, dstStep), plan);          \
    }

#define PACKED_FROM_PLANES(name, steps, walk, image, Target, plan)                                                     \
    PyxStatus PYXCC_CALL name(const u8* const src[3], steps, u16* dst, int dstStep, RoiSize roi)                       \
    {                                                                                                                  \
        using namespace pyxcc;                                                                                         \
        if (const PyxStatus failure = frame::firstFailure(frame::notNull(src, dst), frame::sizeAtLeast(roi, 1, 1),     \
                                                          frame::elementsNotNull<3>(src)))                             \
            return failure;                                                                                            \
        return frame::walk(roi, layouts::image(src, srcStep), packed::models::Target(dst, dstStep), plan);             \
    }

/// Three interleaved samples a pixel.
#define PACKED_FROM_C3(Source, Target, plan) PACKED_FROM_PIXELS(pyxi##Source##To##Target##_8u16u_C3R, c3, Target, plan)

/// Packed pairs of pixels that share their chroma.
#define PACKED_FROM_C2(Source, Target, plan)                                                                           \
    PACKED_FROM_PIXELS(pyxi##Source##To##Target##_8u16u_C2C3R, c2WholePairs, Target, plan)

/// Three planes.
#define PACKED_FROM_P3(Source, Target, plan)                                                                           \
    PACKED_FROM_PLANES(pyxi##Source##To##Target##_8u16u_P3C3R, int srcStep, eachRow, p3, Target, plan)

/// Planes in which two columns of a row share their chroma.
#define PACKED_FROM_P3_OF_PAIRS(Source, Target, plan)                                                                  \
    PACKED_FROM_PLANES(pyxi##Source##To##Target##_8u16u_P3C3R, const int srcStep[3], eachRow, p3<2>, Target, plan)

/// Planes in which two columns of two rows share their chroma.
#define PACKED_FROM_P3_OF_ROW_PAIRS(Source, Target, plan)                                                              \
    PACKED_FROM_PLANES(pyxi##Source##To##Target##_8u16u_P3C3R, const int srcStep[3], eachRowByPairs, p3<2>, Target,    \
                       plan)
