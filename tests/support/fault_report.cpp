#include "support/fault_report.hpp"

#include <csignal>
#include <unistd.h>

namespace support
{

namespace
{

const std::string* current = nullptr;
struct sigaction previous;

void write(const std::string& text) { [[maybe_unused]] const auto written = ::write(2, text.data(), text.size()); }

/// Returning repeats the access, which the action in force before us then meets.
void report(int signal)
{
    write("\nmemory was touched that must not be, in the call of ");
    if (current) write(*current);
    write("\n");
    sigaction(signal, &previous, nullptr);
}

} // namespace

FaultReport::FaultReport(const std::string& text)
{
    current = &text;
    struct sigaction action = {};
    action.sa_handler = report;
    sigaction(SIGSEGV, &action, &previous);
}

FaultReport::~FaultReport()
{
    sigaction(SIGSEGV, &previous, nullptr);
    current = nullptr;
}

} // namespace support
