// The rounding mode of floats.
#pragma once

#include <cfenv>

namespace reference
{

/// Rounds to nearest, ties to even, within a scope. What the scope is left with is the whole environment of before: the
/// mode alone will not do, since std::fegetround() need not know the mode of the vector unit.
class RoundToNearest
{
public:
    RoundToNearest()
    {
        std::fegetenv(&former_);
        std::fesetround(FE_TONEAREST);
    }
    ~RoundToNearest() { std::fesetenv(&former_); }
    RoundToNearest(const RoundToNearest&) = delete;
    RoundToNearest& operator=(const RoundToNearest&) = delete;

private:
    std::fenv_t former_;
};

} // namespace reference
