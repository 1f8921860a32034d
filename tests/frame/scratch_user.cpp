#include "scratch_user.hpp"

#include "frame/scratch.hpp"

bool takeScratch(s32 count)
{
    const auto scratch = pyxcc::frame::allocate<u32>(count);
    return scratch != nullptr;
}
