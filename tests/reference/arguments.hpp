// The tests that conversions make of their arguments.
#pragma once

#include "pyxcc/types.h"

namespace reference
{

template <typename... T> bool anyNull(T*... pointers) { return ((pointers == nullptr) || ...); }

template <typename T> bool anyPlaneNull(T* const* planes, int count = 3)
{
    for (int k = 0; k < count; ++k) {
        if (planes[k] == nullptr) return true;
    }
    return false;
}

inline bool isSmaller(RoiSize roi, int width, int height) { return roi.width < width || roi.height < height; }

template <typename... Step> bool anyStepBelowOne(Step... steps) { return ((steps < 1) || ...); }

} // namespace reference
