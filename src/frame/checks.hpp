// Argument tests, declared in the order in which they are made:
//
//     if (const PyxStatus failure = firstFailure(notNull(src, dst), sizeAtLeast(roi, 1, 1))) return failure;
//
// A test is made only if those before it have passed, so elements are read of arrays that are known not to be null.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::frame
{

/// None of the pointers is null: images, plane arrays and parameters.
template <class... T> auto notNull(const T*... pointers)
{
    return [=]() -> PyxStatus { return ((pointers != nullptr) && ...) ? pyxOk : pyxErrNullPtr; };
}

/// None of the first `Count` elements of a plane array is null.
template <int Count, class T> auto elementsNotNull(T* const* planes)
{
    return [=]() -> PyxStatus {
        for (int i = 0; i < Count; ++i) {
            if (!planes[i]) return pyxErrNullPtr;
        }
        return pyxOk;
    };
}

inline auto sizeAtLeast(RoiSize roi, int width, int height)
{
    return [=]() -> PyxStatus { return roi.width >= width && roi.height >= height ? pyxOk : pyxErrSize; };
}

/// At least one block of `width` by `height` pixels, and whole ones only.
inline auto wholeBlocks(RoiSize roi, int width, int height)
{
    return [=]() -> PyxStatus {
        const bool whole = roi.width % width == 0 && roi.height % height == 0;
        return roi.width >= width && roi.height >= height && whole ? pyxOk : pyxErrSize;
    };
}

template <class... Step> auto stepsAtLeast1(Step... steps)
{
    return [=]() -> PyxStatus { return ((steps >= 1) && ...) ? pyxOk : pyxErrStep; };
}

/// The result of the first test that fails, or pyxOk.
template <class... Test> PyxStatus firstFailure(const Test&... tests)
{
    PyxStatus status = pyxOk;
    static_cast<void>((((status = tests()) == pyxOk) && ...));
    return status;
}

/// What work that is done returns: a warning if the size is off blocks of width x height.
inline PyxStatus warnIfOff(RoiSize roi, int width, int height)
{
    return roi.width % width == 0 && roi.height % height == 0 ? pyxOk : pyxWarnOddSize;
}

} // namespace pyxcc::frame
