// Scratch memory, taken from the core library and given back to it within a call.
#pragma once

#include "pyxcc/core.h"

#include <memory>

namespace pyxcc::frame
{

struct GiveBack {
    void operator()(void* memory) const { pyxFree(memory); }
};

template <class T> using Scratch = std::unique_ptr<T[], GiveBack>;

/// `count` elements, or null for a count below 1 and when memory is exhausted.
template <class T> Scratch<T> allocate(s32 count)
{
    if (count < 1 || count > 0x7fffffff / static_cast<s32>(sizeof(T))) return nullptr;
    return Scratch<T>(static_cast<T*>(pyxMalloc(count * static_cast<s32>(sizeof(T)))));
}

} // namespace pyxcc::frame
