/**
 * @file
 * @brief Everything that the library exports.
 */
#ifndef PYXCC_PYXCC_H
#define PYXCC_PYXCC_H

#include "pyxcc/rgb_ycbcr.h"
#include "pyxcc/types.h"
#include "pyxcc/version.h"

#endif
