#include "frame/plane_service.hpp"
#include <cstring>
namespace pyxcc::frame
{
PyxStatus copyPlane8u(const u8* src, int srcStep, u8* dst, int dstStep, int width, int height)
{
    if (!src || !dst) return pyxErrNullPtr;
    if (width < 1 || height < 1) return pyxErrSize;
    for (int y = 0; y < height; ++y)
        std::memcpy(dst + static_cast<long>(y) * dstStep, src + static_cast<long>(y) * srcStep, width);
    return pyxOk;
}
void fillPlane8u(u8 value, u8* dst, int dstStep, int width, int height)
{
    for (int y = 0; y < height; ++y) std::memset(dst + static_cast<long>(y) * dstStep, value, width);
}
} // namespace pyxcc::frame
