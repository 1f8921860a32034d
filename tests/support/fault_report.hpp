// Says which call it was that touched memory which it must not touch.
#pragma once

#include <string>

namespace support
{

/// While one lives, a segmentation fault prints its text before it ends the program.
class FaultReport
{
public:
    explicit FaultReport(const std::string& text);
    ~FaultReport();
    FaultReport(const FaultReport&) = delete;
    FaultReport& operator=(const FaultReport&) = delete;
};

} // namespace support
