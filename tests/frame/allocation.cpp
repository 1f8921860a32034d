// A program that puts its own allocator in front of the core library's.
#include "pyxcc/core.h"
#include "scratch_user.hpp"
#include "support/compare.hpp"
#include "support/each_export.hpp"
#include "support/expected_status.hpp"
#include "support/scene.hpp"

#include <gtest/gtest.h>

#include <cstdlib>
#include <vector>

using namespace support;

namespace
{

/// What the library asked of the program since the last reset.
struct Requests {
    std::vector<s32> sizes;
    int given = 0, returned = 0;
    bool fail = false;
};

Requests requests;

} // namespace

void* PYXCC_CALL pyxMalloc(s32 byteCount)
{
    requests.sizes.push_back(byteCount);
    if (requests.fail || byteCount < 1) return nullptr;
    ++requests.given;
    return std::aligned_alloc(64, (static_cast<std::size_t>(byteCount) + 63) / 64 * 64);
}

void PYXCC_CALL pyxFree(void* memory)
{
    requests.returned += memory != nullptr;
    std::free(memory);
}

namespace
{

/// Large enough for every conversion that takes scratch memory to do so.
constexpr RoiSize large = {234, 117};

std::optional<std::string> checkAllocation(const Subject& subject)
{
    const catalog::Export& entry = *subject.entry;
    const Scene scene(entry, {.seed = seedOf(entry.name, 0), .roi = legalSize(entry, large)});
    const Image target = scene.target();
    const catalog::Invocation call = scene.invocation(target);
    requests = {};
    if (entry.call(call) != expectedStatus(entry, call)) return "the call failed with memory at hand";
    if (requests.sizes.empty() == entry.traits.allocates) return "the catalogue is wrong about scratch memory";
    if (requests.given != requests.returned) return "scratch memory was not given back";
    return std::nullopt;
}

std::optional<std::string> checkFailingAllocation(const Subject& subject)
{
    const catalog::Export& entry = *subject.entry;
    const Scene scene(entry, {.seed = seedOf(entry.name, 0), .roi = legalSize(entry, large)});
    const Image target = scene.target();
    const catalog::Invocation call = scene.invocation(target);
    const PyxStatus expected = entry.traits.allocates ? pyxErrNoMemory : expectedStatus(entry, call);
    requests = {.sizes = {}, .fail = true};
    const PyxStatus found = entry.call(call);
    if (found != expected) return "status " + std::to_string(found) + " instead of " + std::to_string(expected);
    if (found != pyxErrNoMemory) return std::nullopt;
    return firstDifference(scene.target(), target);
}

TEST(Scratch, ComesFromTheProgram)
{
    requests = {};
    EXPECT_TRUE(takeScratch(300));
    EXPECT_EQ(requests.sizes, std::vector<s32>{1200});
    EXPECT_EQ(requests.given, 1);
    EXPECT_EQ(requests.returned, 1);
}

TEST(Scratch, FailsWhenTheProgramHasNone)
{
    requests = {.sizes = {}, .fail = true};
    EXPECT_FALSE(takeScratch(300));
    EXPECT_EQ(requests.sizes.size(), 1U);
    EXPECT_EQ(requests.returned, 0);
}

TEST(Scratch, CountsThatCannotBeAreNotAskedFor)
{
    requests = {};
    for (const s32 count : {0, -1, -0x7fffffff, 0x20000000, 0x7fffffff}) EXPECT_FALSE(takeScratch(count)) << count;
    EXPECT_TRUE(requests.sizes.empty());
}

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    testEachExport("Allocation", checkAllocation);
    testEachExport("FailingAllocation", checkFailingAllocation);
    return RUN_ALL_TESTS();
}
