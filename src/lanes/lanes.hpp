// The arithmetic vocabulary: namespace scalar over one value, namespace wide over a register of this build's variant.
#pragma once

#include "lanes/avx2/byte_curve.hpp"
#include "lanes/avx2/byte_sum.hpp"
#include "lanes/avx2/choices.hpp"
#include "lanes/avx2/control_word.hpp"
#include "lanes/avx2/double_width.hpp"
#include "lanes/avx2/doubles.hpp"
#include "lanes/avx2/exact_sum.hpp"
#include "lanes/avx2/floats.hpp"
#include "lanes/avx2/integers.hpp"
#include "lanes/avx2/means.hpp"
#include "lanes/avx2/pairs_of_floats.hpp"
#include "lanes/avx2/pixels.hpp"
#include "lanes/avx2/reciprocal.hpp"
#include "lanes/avx2/samples.hpp"
#include "lanes/scalar.hpp"
#include "lanes/several.hpp"
