// The four rounding modes of floats.
#pragma once

#include <cfenv>

namespace forms
{

inline constexpr int roundingModes[] = {FE_TONEAREST, FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO};

/// Does the work under a rounding mode.
template <class Work> void roundingBy(int mode, const Work& work)
{
    const int former = std::fegetround();
    std::fesetround(mode);
    work();
    std::fesetround(former);
}

} // namespace forms
