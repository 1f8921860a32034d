// What libFuzzer calls. script/fuzz runs it.
#include "fuzz/scripted_call.hpp"

#include <cstdio>
#include <cstdlib>

// NOLINTNEXTLINE(readability-identifier-naming)
extern "C" int LLVMFuzzerTestOneInput(const u8* bytes, std::size_t count)
{
    if (const auto text = fuzz::checkScript({bytes, count})) {
        std::fprintf(stderr, "%s\n", text->c_str());
        std::abort();
    }
    return 0;
}
