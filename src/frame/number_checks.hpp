// Tests of numbers among the arguments.
#pragma once

#include "pyxcc/types.h"

namespace pyxcc::frame
{

/// A number is one of `low` to `high`.
template <class Number> auto within(Number number, Number low, Number high, PyxStatus otherwise)
{
    return [=]() -> PyxStatus { return number >= low && number <= high ? pyxOk : otherwise; };
}

} // namespace pyxcc::frame
