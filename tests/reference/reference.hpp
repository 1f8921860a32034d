// The plain statement of every conversion: scalar, one pixel at a time, under the name and the signature of the export.
#pragma once

#include "reference/color_twist.hpp"
#include "reference/gamma.hpp"
#include "reference/rgb_ycbcr.hpp"
