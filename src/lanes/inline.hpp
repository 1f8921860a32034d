#pragma once

/// Lane operations and what is built of them vanish into the row loops, in every build type and at every call depth.
#define PYXCC_INLINE __attribute__((always_inline)) inline

/// The same for a lambda, behind its parameters.
#define PYXCC_INLINE_LAMBDA __attribute__((always_inline))
