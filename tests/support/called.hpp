// Plain statements, and other functions of the tests, behind the calling convention of the exports.
#pragma once

#include "catalog.hpp"

namespace support
{

/// `Called<f>::call` does what `f` does and is called as an export is.
template <auto function> struct Called;
template <class... A, PyxStatus (*function)(A...)> struct Called<function> {
    static PyxStatus PYXCC_CALL call(A... arguments) { return function(arguments...); }
};

template <auto function> catalog::Function called()
{
    return reinterpret_cast<catalog::Function>(&Called<function>::call);
}

} // namespace support
