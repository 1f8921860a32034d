#include "status.hpp"

#include <algorithm>
#include <utility>

namespace tool
{

namespace
{

#define STATUS(name)                                                                                                   \
    {                                                                                                                  \
        name, #name                                                                                                    \
    }
constexpr std::pair<PyxStatus, std::string_view> statuses[] = {
    STATUS(pyxOk),
    STATUS(pyxWarnNegativeLevel),
    STATUS(pyxWarnOddSize),
    STATUS(pyxErrBadArg),
    STATUS(pyxErrSize),
    STATUS(pyxErrNullPtr),
    STATUS(pyxErrNoMemory),
    STATUS(pyxErrStep),
    STATUS(pyxErrContext),
    STATUS(pyxErrRange),
    STATUS(pyxErrLevels),
    STATUS(pyxErrNoise),
    STATUS(pyxErrDitherType),
};
#undef STATUS

} // namespace

std::string_view statusName(PyxStatus status)
{
    const auto known = std::ranges::find(statuses, status, &std::pair<PyxStatus, std::string_view>::first);
    return known == std::end(statuses) ? "an unknown status" : known->second;
}

std::string statusText(PyxStatus status)
{
    return std::string(statusName(status)) + " (" + std::to_string(status) + ")";
}

} // namespace tool
