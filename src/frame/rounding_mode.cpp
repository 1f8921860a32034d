// Not inline, so that no compiler moves float operations past a change of the mode.
#include "frame/rounding_mode.hpp"

#include "lanes/lanes.hpp"

namespace pyxcc::frame
{

u32 saveRoundMode(u32 mode)
{
    const u32 word = wide::controlWord();
    if ((word & roundingField) != mode) wide::setControlWord((word & ~roundingField) | mode);
    return word;
}

void restoreRoundMode(u32 word) { wide::setControlWord(word); }

} // namespace pyxcc::frame
