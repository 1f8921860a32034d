// Rows of samples, written down the way that they are thought of.
#pragma once

#include "pyxcc/types.h"

#include <initializer_list>
#include <vector>

namespace edge
{

using Samples = std::vector<u8>;

/// The samples of a pixel, `count` times over.
inline Samples repeated(std::initializer_list<u8> pixel, int count)
{
    Samples row;
    for (int i = 0; i < count; ++i) {
        for (const u8 sample : pixel) row.push_back(sample);
    }
    return row;
}

/// One row after the other.
inline Samples operator+(Samples first, const Samples& second)
{
    first.insert(first.end(), second.begin(), second.end());
    return first;
}

} // namespace edge
